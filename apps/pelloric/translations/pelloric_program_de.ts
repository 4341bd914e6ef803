<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="de" sourcelanguage="en">
<context>
    <name>DemoGrids</name>
    <message>
        <source>Class</source>
        <translation>Klasse</translation>
    </message>
    <message>
        <source>Measure</source>
        <translation>Messwert</translation>
    </message>
    <message>
        <source>Least</source>
        <translation>Kleinster</translation>
    </message>
    <message>
        <source>Median</source>
        <translation>Mittlerer</translation>
    </message>
    <message>
        <source>Most</source>
        <translation>Größter</translation>
    </message>
    <message>
        <source>Zone</source>
        <translation>Zone</translation>
    </message>
    <message>
        <source>Country</source>
        <translation>Land</translation>
    </message>
    <message>
        <source>Coordinates</source>
        <translation>Koordinaten</translation>
    </message>
</context>
<context>
    <name>pelloric::app::DemoWindow</name>
    <message>
        <source>Tables</source>
        <translation>Tabellen</translation>
    </message>
    <message>
        <source>Pelloric Demonstration</source>
        <translation>Pelloric-Vorführung</translation>
    </message>
    <message>
        <source>&amp;Flex Grid</source>
        <translation>&amp;Flex-Gitter</translation>
    </message>
    <message>
        <source>A table widget: 178 wines in 15 columns, more than one sheet is wide.</source>
        <translation>Eine Tabelle: 178 Weine in 15 Spalten, breiter als ein Blatt.</translation>
    </message>
    <message>
        <source>&amp;List View</source>
        <translation>&amp;Listenansicht</translation>
    </message>
    <message>
        <source>A tree widget in report mode: the countries of the world in English and Chinese.</source>
        <translation>Eine Baumansicht als Liste: die Länder der Welt auf Englisch und Chinesisch.</translation>
    </message>
    <message>
        <source>&amp;Data Grid</source>
        <translation>&amp;Datengitter</translation>
    </message>
    <message>
        <source>A table view on an SQL table: time zones and their places.</source>
        <translation>Eine Tabellenansicht einer SQL-Tabelle: Zeitzonen und ihre Orte.</translation>
    </message>
    <message>
        <source>Choose a table, say how it is to look, and preview it.</source>
        <translation>Tabelle auswählen, Aussehen festlegen, Vorschau öffnen.</translation>
    </message>
    <message>
        <source>&amp;Open your own table…</source>
        <translation>&amp;Eigene Tabelle öffnen …</translation>
    </message>
    <message>
        <source>A CSV or TSV file, or a table of an SQLite database</source>
        <translation>Eine CSV- oder TSV-Datei oder eine Tabelle einer SQLite-Datenbank</translation>
    </message>
    <message>
        <source>Report</source>
        <translation>Bericht</translation>
    </message>
    <message>
        <source>Col&amp;umn titles</source>
        <translation>Spalten&amp;titel</translation>
    </message>
    <message>
        <source>&amp;Merge equal cells</source>
        <translation>&amp;Gleiche Zellen verbinden</translation>
    </message>
    <message>
        <source>Of the flex grid; row 0 holds its titles</source>
        <translation>Des Flex-Gitters; Zeile 0 enthält seine Titel</translation>
    </message>
    <message>
        <source>First row</source>
        <translation>Erste Zeile</translation>
    </message>
    <message>
        <source>First &amp;row:</source>
        <translation>E&amp;rste Zeile:</translation>
    </message>
    <message>
        <source>Foot&amp;er:</source>
        <translation>F&amp;ußzeile:</translation>
    </message>
    <message>
        <source>&amp;Preview</source>
        <translation>&amp;Vorschau</translation>
    </message>
    <message>
        <source>Host code:</source>
        <translation>Code der Anwendung:</translation>
    </message>
    <message>
        <source>Host code</source>
        <translation>Code der Anwendung</translation>
    </message>
    <message>
        <source>&amp;Copy</source>
        <translation>&amp;Kopieren</translation>
    </message>
    <message>
        <source>Copies the code to the clipboard</source>
        <translation>Kopiert den Code in die Zwischenablage</translation>
    </message>
    <message>
        <source>A table of your own: %1.</source>
        <translation>Eine eigene Tabelle: %1.</translation>
    </message>
    <message>
        <source>&amp;Spans</source>
        <translation>&amp;Verbundene Zellen</translation>
    </message>
    <message>
        <source>A table widget with spans, ticks and colours, printed as it is shown.</source>
        <translation>Eine Tabelle mit verbundenen Zellen, Häkchen und Farben, gedruckt wie gezeigt.</translation>
    </message>
    <message>
        <source>Classes of wines</source>
        <translation>Klassen der Weine</translation>
    </message>
    <message>
        <source>&amp;Tree</source>
        <translation>&amp;Baum</translation>
    </message>
    <message>
        <source>A tree widget with branches, icons and ticks, printed as it is shown.</source>
        <translation>Ein Baum mit Ästen, Symbolen und Häkchen, gedruckt wie gezeigt.</translation>
    </message>
    <message>
        <source>Time zones</source>
        <translation>Zeitzonen</translation>
    </message>
    <message>
        <source>As sho&amp;wn</source>
        <translation>&amp;Wie gezeigt</translation>
    </message>
    <message>
        <source>Cells look as the view shows them; F4 in the preview offers more</source>
        <translation>Zellen sehen aus wie in der Ansicht; F4 in der Vorschau bietet mehr</translation>
    </message>
</context>
<context>
    <name>pelloric::app::OwnTable</name>
    <message>
        <source>Open Your Own Table</source>
        <translation>Eigene Tabelle öffnen</translation>
    </message>
    <message>
        <source>Table of the database:</source>
        <translation>Tabelle der Datenbank:</translation>
    </message>
    <message>
        <source>Table of the database</source>
        <translation>Tabelle der Datenbank</translation>
    </message>
    <message>
        <source>Tables (*.csv *.tsv *.txt *.sqlite *.db *.sqlite3);;All files (*)</source>
        <translation>Tabellen (*.csv *.tsv *.txt *.sqlite *.db *.sqlite3);;Alle Dateien (*)</translation>
    </message>
</context>
</TS>
