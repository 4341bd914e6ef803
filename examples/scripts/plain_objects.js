// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

// Hands the three kinds of grids over as plain objects and reads the pages back:
//   pelloric run examples/scripts/plain_objects.js

const rows = [["Fruit", "Price", "Origin"], ["Apple", 1.2, "Jork"], ["梨", 2.35, "莱阳"]];
const widths = [2400, 1400, 2000]; // twips

const flexGrid = {
    Cols: 3,
    Rows: rows.length,
    ColWidth(i, width) {
        if (width === undefined)
            return widths[i];
        widths[i] = width;
    },
    TextMatrix: (row, column) => rows[row][column],
};

const listView = {
    ColumnHeaders: rows[0].map((title, i) => ({ Text: title, Width: widths[i] })),
    ListItems: rows.slice(1).map((row) => ({ Text: row[0], SubItems: (position) => row[position] })),
};

let record = 0;
const dataGrid = {
    DataSource: {
        RecordCount: rows.length - 1,
        AbsolutePosition(position) {
            if (position === undefined)
                return record;
            record = position;
        },
        Fields: rows[0].map((title, i) => ({
            Name: title,
            get Value() { return rows[record][i]; },
        })),
    },
    Columns: widths.map((width) => ({ Width: width })),
    col: 0,
};

const canvas = new Sorvane();
const grids = [
    [PrintObjKind.MSFlexGrid, flexGrid],
    [PrintObjKind.ListView, listView],
    [PrintObjKind.datagrid, dataGrid],
];
for (const [kind, grid] of grids) {
    canvas.m_PrintObj = kind;
    canvas.doPreview(grid);
    print(kind, texts(canvas, 0).map((text) => text.Str + " @" + text.pt.x).join(", "));
}
canvas.SaveFile("fruit.ostl");
print("saved fruit.ostl,", lines(canvas, 0).length, "lines on page 1");
