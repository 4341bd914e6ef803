// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

// Previews a CSV file and walks all display modes, a picture of each:
//   pelloric run examples/scripts/display_modes.js samples/time-zones.tsv out

const [file = "samples/time-zones.tsv", folder = "."] = args;

const canvas = new Sorvane();
canvas.resize(900, 640);
canvas.strSCliectRect = "full"; // while it is "small" no page is painted
canvas.m_PrintObj = PrintObjKind.MSFlexGrid;
canvas.doPreview(csv(file));
print(file, "has", canvas.Totalpages, "pages of", canvas.myWidth, "x", canvas.myHeight, "twips");

const modes = {
    "one": () => canvas.showPage(),
    "whole": () => canvas.showWholePage(),
    "two": () => { canvas.SetShowStyle(2, 0, 1); canvas.showMuliPage(2); },
    "four": () => { canvas.SetShowStyle(4, 0, 3); canvas.showMuliPage(4); },
    "six": () => { canvas.SetShowStyle(6, 0, 5); canvas.showMuliPage(6); },
    "all": () => { canvas.SetShowStyle(0, 0, 0); canvas.showAllPage(); },
};

for (const [name, show] of Object.entries(modes)) {
    show();
    const picture = folder + "/mode-" + name + ".png";
    canvas.grab(picture);
    print(name.padEnd(6), "mode", canvas.WindowOrderStyle(), "divisor", canvas.DispScale.toFixed(3), picture);
}

if (messages.length > 0) {
    print("message boxes:", JSON.stringify(messages));
    exit(1);
}
