// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

// Fields, properties, errors with their numbers, events and message boxes:
//   pelloric run examples/scripts/errors_and_events.js

const canvas = new Sorvane();
canvas.Click.connect((button) => print("clicked with button", button));

canvas.intLeft = 2.5; // halves round to even
print("intLeft", canvas.intLeft, "Currentpage", canvas.Currentpage);

canvas.DispScale = 2; // written as a scale, read as the divisor
print("DispScale reads", canvas.DispScale);

for (const attempt of [() => { canvas.intTop = 70000; }, () => { canvas.DispScale = 0; },
    () => canvas.OpenFile("no such file.ostl"), () => canvas.Minimum()]) {
    try {
        attempt();
    } catch (error) {
        print("error", error.number + ":", error.message, "in line", error.lineNumber);
    }
}

canvas.Currentpage = 2; // beyond the last page: a message box, and nothing changes
print(messages.map((message) => message.text).join(", "));

const facade = new Kestrane();
facade.MarvenStartRow = 3;
print("MarvenStartRow", facade.MarvenStartRow, "ShowHeader", facade.ShowHeader);
