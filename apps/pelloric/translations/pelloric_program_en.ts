<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="en" sourcelanguage="en">
<context>
    <name>DemoGrids</name>
    <message>
        <source>Class</source>
        <translation>Class</translation>
    </message>
    <message>
        <source>Measure</source>
        <translation>Measure</translation>
    </message>
    <message>
        <source>Least</source>
        <translation>Least</translation>
    </message>
    <message>
        <source>Median</source>
        <translation>Median</translation>
    </message>
    <message>
        <source>Most</source>
        <translation>Most</translation>
    </message>
    <message>
        <source>Zone</source>
        <translation>Zone</translation>
    </message>
    <message>
        <source>Country</source>
        <translation>Country</translation>
    </message>
    <message>
        <source>Coordinates</source>
        <translation>Coordinates</translation>
    </message>
</context>
<context>
    <name>pelloric::app::DemoWindow</name>
    <message>
        <source>Tables</source>
        <translation>Tables</translation>
    </message>
    <message>
        <source>Pelloric Demonstration</source>
        <translation>Pelloric Demonstration</translation>
    </message>
    <message>
        <source>&amp;Flex Grid</source>
        <translation>&amp;Flex Grid</translation>
    </message>
    <message>
        <source>A table widget: 178 wines in 15 columns, more than one sheet is wide.</source>
        <translation>A table widget: 178 wines in 15 columns, more than one sheet is wide.</translation>
    </message>
    <message>
        <source>&amp;List View</source>
        <translation>&amp;List View</translation>
    </message>
    <message>
        <source>A tree widget in report mode: the countries of the world in English and Chinese.</source>
        <translation>A tree widget in report mode: the countries of the world in English and Chinese.</translation>
    </message>
    <message>
        <source>&amp;Data Grid</source>
        <translation>&amp;Data Grid</translation>
    </message>
    <message>
        <source>A table view on an SQL table: time zones and their places.</source>
        <translation>A table view on an SQL table: time zones and their places.</translation>
    </message>
    <message>
        <source>Choose a table, say how it is to look, and preview it.</source>
        <translation>Choose a table, say how it is to look, and preview it.</translation>
    </message>
    <message>
        <source>&amp;Open your own table…</source>
        <translation>&amp;Open your own table…</translation>
    </message>
    <message>
        <source>A CSV or TSV file, or a table of an SQLite database</source>
        <translation>A CSV or TSV file, or a table of an SQLite database</translation>
    </message>
    <message>
        <source>Report</source>
        <translation>Report</translation>
    </message>
    <message>
        <source>Col&amp;umn titles</source>
        <translation>Col&amp;umn titles</translation>
    </message>
    <message>
        <source>&amp;Merge equal cells</source>
        <translation>&amp;Merge equal cells</translation>
    </message>
    <message>
        <source>Of the flex grid; row 0 holds its titles</source>
        <translation>Of the flex grid; row 0 holds its titles</translation>
    </message>
    <message>
        <source>First row</source>
        <translation>First row</translation>
    </message>
    <message>
        <source>First &amp;row:</source>
        <translation>First &amp;row:</translation>
    </message>
    <message>
        <source>Foot&amp;er:</source>
        <translation>Foot&amp;er:</translation>
    </message>
    <message>
        <source>&amp;Preview</source>
        <translation>&amp;Preview</translation>
    </message>
    <message>
        <source>Host code:</source>
        <translation>Host code:</translation>
    </message>
    <message>
        <source>Host code</source>
        <translation>Host code</translation>
    </message>
    <message>
        <source>&amp;Copy</source>
        <translation>&amp;Copy</translation>
    </message>
    <message>
        <source>Copies the code to the clipboard</source>
        <translation>Copies the code to the clipboard</translation>
    </message>
    <message>
        <source>A table of your own: %1.</source>
        <translation>A table of your own: %1.</translation>
    </message>
    <message>
        <source>&amp;Spans</source>
        <translation>&amp;Spans</translation>
    </message>
    <message>
        <source>A table widget with spans, ticks and colours, printed as it is shown.</source>
        <translation>A table widget with spans, ticks and colours, printed as it is shown.</translation>
    </message>
    <message>
        <source>Classes of wines</source>
        <translation>Classes of wines</translation>
    </message>
    <message>
        <source>&amp;Tree</source>
        <translation>&amp;Tree</translation>
    </message>
    <message>
        <source>A tree widget with branches, icons and ticks, printed as it is shown.</source>
        <translation>A tree widget with branches, icons and ticks, printed as it is shown.</translation>
    </message>
    <message>
        <source>Time zones</source>
        <translation>Time zones</translation>
    </message>
    <message>
        <source>As sho&amp;wn</source>
        <translation>As sho&amp;wn</translation>
    </message>
    <message>
        <source>Cells look as the view shows them; F4 in the preview offers more</source>
        <translation>Cells look as the view shows them; F4 in the preview offers more</translation>
    </message>
</context>
<context>
    <name>pelloric::app::OwnTable</name>
    <message>
        <source>Open Your Own Table</source>
        <translation>Open Your Own Table</translation>
    </message>
    <message>
        <source>Table of the database:</source>
        <translation>Table of the database:</translation>
    </message>
    <message>
        <source>Table of the database</source>
        <translation>Table of the database</translation>
    </message>
    <message>
        <source>Tables (*.csv *.tsv *.txt *.sqlite *.db *.sqlite3);;All files (*)</source>
        <translation>Tables (*.csv *.tsv *.txt *.sqlite *.db *.sqlite3);;All files (*)</translation>
    </message>
</context>
</TS>
