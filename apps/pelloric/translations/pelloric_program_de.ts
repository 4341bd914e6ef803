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
    <name>Phrase</name>
    <message>
        <source>Unknown option &apos;%1&apos;.</source>
        <translation>Unbekannte Option „%1“.</translation>
    </message>
    <message>
        <source>Missing value after &apos;%1&apos;.</source>
        <translation>Nach „%1“ fehlt der Wert.</translation>
    </message>
    <message>
        <source>Unexpected value after &apos;%1&apos;.</source>
        <translation>Unerwarteter Wert nach „%1“.</translation>
    </message>
    <message>
        <source>%1; check that the folder exists and takes files</source>
        <translation>%1; prüfen Sie, ob es den Ordner gibt und er Dateien annimmt</translation>
    </message>
    <message>
        <source>%1; make room on the disk, or choose another one</source>
        <translation>%1; schaffen Sie Platz auf dem Datenträger, oder wählen Sie einen anderen</translation>
    </message>
    <message>
        <source>%1; check your rights to the file and its folder</source>
        <translation>%1; prüfen Sie Ihre Rechte an der Datei und ihrem Ordner</translation>
    </message>
    <message>
        <source>%1; check the name and that you may read it</source>
        <translation>%1; prüfen Sie den Namen, und ob Sie die Datei lesen dürfen</translation>
    </message>
    <message>
        <source>one argument too many: %1; quote names with blanks</source>
        <translation>ein Argument zu viel: %1; setzen Sie Namen mit Leerzeichen in Anführungszeichen</translation>
    </message>
    <message>
        <source>%1 takes a whole number from %2 to %3, not &quot;%4&quot;</source>
        <translation>%1 verlangt eine ganze Zahl von %2 bis %3, nicht „%4“</translation>
    </message>
    <message>
        <source>%1 takes a number from %2 to %3, not &quot;%4&quot;</source>
        <translation>%1 verlangt eine Zahl von %2 bis %3, nicht „%4“</translation>
    </message>
    <message>
        <source>where the sample tables are</source>
        <translation>wo die Beispieltabellen liegen</translation>
    </message>
    <message>
        <source>walk through by itself, without a display, and leave what it shows in OUT</source>
        <translation>von selbst durchlaufen, ohne Anzeige, und das Gezeigte in OUT ablegen</translation>
    </message>
    <message>
        <source>write what the preview window shows to a file, a line for each change</source>
        <translation>in eine Datei schreiben, was das Vorschaufenster zeigt, eine Zeile je Änderung</translation>
    </message>
    <message>
        <source>the sample tables are not found; name their folder with --samples</source>
        <translation>die Beispieltabellen sind nicht zu finden; nennen Sie ihren Ordner mit --samples</translation>
    </message>
    <message>
        <source>%1; check the folder of temporary files</source>
        <translation>%1; prüfen Sie den Ordner für temporäre Dateien</translation>
    </message>
    <message>
        <source>Shows one form with a flex grid, a list view and a data grid on sample
tables, each with its host code and a button that previews it; tables of
your own can be opened beside them. What its dialogs change is forgotten.
</source>
        <translation>Zeigt ein Formular mit einem Flex Grid, einer Listenansicht und einem Data Grid auf
Beispieltabellen, jeweils mit dem Code und einem Knopf für die Vorschau; eigene
Tabellen lassen sich daneben öffnen. Was die Dialoge ändern, wird vergessen.
</translation>
    </message>
    <message>
        <source>the preview window did not close</source>
        <translation>das Vorschaufenster hat sich nicht geschlossen</translation>
    </message>
    <message>
        <source>%1 was not written</source>
        <translation>%1 wurde nicht geschrieben</translation>
    </message>
    <message>
        <source>%1 cannot be written</source>
        <translation>%1 kann nicht geschrieben werden</translation>
    </message>
    <message>
        <source>the preview window is not open</source>
        <translation>das Vorschaufenster ist nicht offen</translation>
    </message>
    <message>
        <source>there is no tool %1</source>
        <translation>es gibt kein Werkzeug %1</translation>
    </message>
    <message>
        <source>the saved document has other pages</source>
        <translation>das gespeicherte Dokument hat andere Seiten</translation>
    </message>
    <message>
        <source>%1 cannot be read; name the folder of the samples with --samples</source>
        <translation>%1 kann nicht gelesen werden; nennen Sie den Ordner der Beispiele mit --samples</translation>
    </message>
    <message>
        <source>where to: a name that ends in .pdf, .png, .svg or .ostl; a folder; or -</source>
        <translation>wohin: ein Name, der auf .pdf, .png, .svg oder .ostl endet; ein Ordner; oder -</translation>
    </message>
    <message>
        <source>several inputs into one file, one behind the other</source>
        <translation>mehrere Eingaben in eine Datei, eine hinter der anderen</translation>
    </message>
    <message>
        <source>pdf, png, svg or ostl, for a folder or - (pdf)</source>
        <translation>pdf, png, svg oder ostl, für einen Ordner oder - (pdf)</translation>
    </message>
    <message>
        <source>only these pages: 1,3,5-12</source>
        <translation>nur diese Seiten: 1,3,5-12</translation>
    </message>
    <message>
        <source>pixels an inch of .png images (150)</source>
        <translation>Pixel je Zoll von .png-Bildern (150)</translation>
    </message>
    <message>
        <source>pages of .png images made at a time (one for each processor)</source>
        <translation>gleichzeitig gemachte Seiten von .png-Bildern (eine je Prozessor)</translation>
    </message>
    <message>
        <source>a .pdf file that says its tables, for readers who do not see it</source>
        <translation>eine .pdf-Datei, die ihre Tabellen vorliest, für Leser, die sie nicht sehen</translation>
    </message>
    <message>
        <source>a .pdf file for archives (PDF/A-2b)</source>
        <translation>eine .pdf-Datei für Archive (PDF/A-2b)</translation>
    </message>
    <message>
        <source>of the texts of a .pdf file: zh-CN (the locale&apos;s)</source>
        <translation>die Sprache der Texte einer .pdf-Datei: zh-CN (die der Umgebung)</translation>
    </message>
    <message>
        <source>%1; its characters are drawn as shapes</source>
        <translation>%1; ihre Zeichen werden als Formen gezeichnet</translation>
    </message>
    <message>
        <source>a document file holds %1 pages; the last %2 were left out</source>
        <translation>eine Dokumentdatei fasst %1 Seiten; die letzten %2 wurden weggelassen</translation>
    </message>
    <message>
        <source>a document file holds no pictures; watermark and logo were left out</source>
        <translation>eine Dokumentdatei fasst keine Bilder; Wasserzeichen und Logo wurden weggelassen</translation>
    </message>
    <message>
        <source>--format takes pdf, png, svg or ostl, not &quot;%1&quot;</source>
        <translation>--format verlangt pdf, png, svg oder ostl, nicht „%1“</translation>
    </message>
    <message>
        <source>%1: the name must end in .pdf, .png, .svg or .ostl</source>
        <translation>%1: der Name muss auf .pdf, .png, .svg oder .ostl enden</translation>
    </message>
    <message>
        <source>say where to export to: -o OUT.pdf, .png, .svg or .ostl</source>
        <translation>sagen Sie, wohin exportiert wird: -o OUT.pdf, .png, .svg oder .ostl</translation>
    </message>
    <message>
        <source>%1 is one input more; several go into a folder, or with --join into one file, and %2 is no folder; quote names with blanks</source>
        <translation>%1 ist eine weitere Eingabe; mehrere kommen in einen Ordner, oder mit --join in eine Datei, und %2 ist kein Ordner; setzen Sie Namen mit Leerzeichen in Anführungszeichen</translation>
    </message>
    <message>
        <source>--pages is for .pdf, .png and .svg; a document file holds all</source>
        <translation>--pages ist für .pdf, .png und .svg; eine Dokumentdatei enthält alle</translation>
    </message>
    <message>
        <source>--dpi is for .png images</source>
        <translation>--dpi ist für .png-Bilder</translation>
    </message>
    <message>
        <source>--jobs is for .png images</source>
        <translation>--jobs ist für .png-Bilder</translation>
    </message>
    <message>
        <source>--%1 is for .pdf files</source>
        <translation>--%1 ist für .pdf-Dateien</translation>
    </message>
    <message>
        <source>-o - and --json both want the standard output</source>
        <translation>-o - und --json wollen beide die Standardausgabe</translation>
    </message>
    <message>
        <source>Writing</source>
        <translation>Schreiben</translation>
    </message>
    <message>
        <source>%1 is the file that is read; export to another one</source>
        <translation>%1 ist die Datei, die gelesen wird; exportieren Sie in eine andere</translation>
    </message>
    <message>
        <source>%1 has pages of another size; --join wants one size</source>
        <translation>%1 hat Seiten anderer Größe; --join verlangt eine Größe</translation>
    </message>
    <message>
        <source>several pages as .%1 do not go into one output; name a file, or a page with --pages</source>
        <translation>mehrere Seiten als .%1 passen nicht in eine Ausgabe; nennen Sie eine Datei, oder eine Seite mit --pages</translation>
    </message>
    <message>
        <source>FILE is a CSV or TSV file, whose first row holds the titles, a JSON file, an .xlsx or
.ods file (file.xlsx:Sheet), an SQLite database (db.sqlite:table, or db.sqlite with
--query), or a saved document (.ostl).
Pages look as the default settings and the options say; --settings takes others.
</source>
        <translation>FILE ist eine CSV- oder TSV-Datei, deren erste Zeile die Titel enthält, eine JSON-Datei, eine
.xlsx- oder .ods-Datei (datei.xlsx:Blatt), eine SQLite-Datenbank (db.sqlite:tabelle, oder
db.sqlite mit --query) oder ein gespeichertes Dokument (.ostl).
Seiten sehen aus, wie es die Vorgaben und die Optionen sagen; --settings nimmt andere.
</translation>
    </message>
    <message>
        <source>Several pages as .png or .svg become OUT-001, OUT-002 and so on.
FILE - is the standard input, OUT - the standard output. Several FILEs become one
file each in the folder OUT, or with --join one file.
</source>
        <translation>Mehrere Seiten als .png oder .svg werden OUT-001, OUT-002 und so weiter.
FILE - ist die Standardeingabe, OUT - die Standardausgabe. Mehrere FILE werden je eine
Datei im Ordner OUT, oder mit --join eine einzige.
</translation>
    </message>
    <message>
        <source>no font is installed, so no text can be drawn; install fonts-dejavu-core, and fonts-arphic-uming for Chinese texts</source>
        <translation>keine Schrift ist installiert, also kann kein Text gezeichnet werden; installieren Sie fonts-dejavu-core, und fonts-arphic-uming für chinesische Texte</translation>
    </message>
    <message>
        <source>the font %1 is not installed; %2 is taken instead</source>
        <translation>die Schrift %1 ist nicht installiert; stattdessen wird %2 genommen</translation>
    </message>
    <message>
        <source>write the manual page of the program</source>
        <translation>die Handbuchseite des Programms schreiben</translation>
    </message>
    <message>
        <source>Previews, exports and prints tables.

</source>
        <translation>Zeigt Tabellen in der Vorschau, exportiert und druckt sie.

</translation>
    </message>
    <message>
        <source>
&quot;pelloric help COMMAND&quot; says more, &quot;pelloric --version&quot; the version.
</source>
        <translation>
„pelloric help BEFEHL“ sagt mehr, „pelloric --version“ die Version.
</translation>
    </message>
    <message>
        <source>no command %1; see &quot;pelloric help&quot;</source>
        <translation>kein Befehl %1; siehe „pelloric help“</translation>
    </message>
    <message>
        <source>Shows all kinds of grids on sample tables</source>
        <translation>Zeigt alle Arten von Gittern an Beispieltabellen</translation>
    </message>
    <message>
        <source>Shows a table in the preview window</source>
        <translation>Zeigt eine Tabelle im Vorschaufenster</translation>
    </message>
    <message>
        <source>Shows a saved document in the preview window</source>
        <translation>Zeigt ein gespeichertes Dokument im Vorschaufenster</translation>
    </message>
    <message>
        <source>Writes tables as PDF, PNG, SVG or a document file</source>
        <translation>Schreibt Tabellen als PDF, PNG, SVG oder Dokumentdatei</translation>
    </message>
    <message>
        <source>Runs a script that drives the controls by name</source>
        <translation>Führt ein Skript aus, das die Steuerelemente beim Namen anspricht</translation>
    </message>
    <message>
        <source>Prints a table or a document file</source>
        <translation>Druckt eine Tabelle oder eine Dokumentdatei</translation>
    </message>
    <message>
        <source>Lists the printers</source>
        <translation>Listet die Drucker auf</translation>
    </message>
    <message>
        <source>Shows or restores the settings file</source>
        <translation>Zeigt die Einstellungsdatei oder stellt sie wieder her</translation>
    </message>
    <message>
        <source>Writes the completion of a shell: bash, zsh or fish</source>
        <translation>Schreibt die Vervollständigung einer Shell: bash, zsh oder fish</translation>
    </message>
    <message>
        <source>Explains the commands</source>
        <translation>Erklärt die Befehle</translation>
    </message>
    <message>
        <source>usage: pelloric %1; for example: %2; &quot;pelloric help %3&quot; says more</source>
        <translation>Aufruf: pelloric %1; zum Beispiel: %2; „pelloric help %3“ sagt mehr</translation>
    </message>
    <message>
        <source>say what to do, for example &quot;pelloric export table.csv -o table.pdf&quot;; see &quot;pelloric help&quot;</source>
        <translation>sagen Sie, was zu tun ist, zum Beispiel „pelloric export table.csv -o table.pdf“; siehe „pelloric help“</translation>
    </message>
    <message>
        <source>there is not enough memory for this table</source>
        <translation>für diese Tabelle reicht der Speicher nicht</translation>
    </message>
    <message>
        <source>%1: there is no such file</source>
        <translation>%1: diese Datei gibt es nicht</translation>
    </message>
    <message>
        <source>FILE is a document file (.ostl) that the preview window or
&quot;pelloric export&quot; has saved.
</source>
        <translation>FILE ist eine Dokumentdatei (.ostl), die das Vorschaufenster oder
„pelloric export“ gespeichert hat.
</translation>
    </message>
    <message>
        <source>tell nothing but errors</source>
        <translation>nichts als Fehler melden</translation>
    </message>
    <message>
        <source>tell what was made in JSON, one object a line</source>
        <translation>in JSON melden, was gemacht wurde, ein Objekt je Zeile</translation>
    </message>
    <message>
        <source>%1 is a saved document; show it with &quot;pelloric open&quot;</source>
        <translation>%1 ist ein gespeichertes Dokument; zeigen Sie es mit „pelloric open“</translation>
    </message>
    <message>
        <source>FILE is a CSV or TSV file, whose first row holds the titles, a JSON file, an .xlsx or
.ods file (file.xlsx:Sheet), or an SQLite database (db.sqlite:table, or db.sqlite with
--query). Pages look as your settings say, which the window&apos;s dialogs
change; --defaults does without them. With one of the options for
headers, paper and so on, what the dialogs change is not kept.
</source>
        <translation>FILE ist eine CSV- oder TSV-Datei, deren erste Zeile die Titel enthält, eine JSON-Datei, eine
.xlsx- oder .ods-Datei (datei.xlsx:Blatt) oder eine SQLite-Datenbank (db.sqlite:tabelle, oder
db.sqlite mit --query).
Seiten sehen aus, wie es Ihre Einstellungen sagen, die die Dialoge des Fensters
ändern; --defaults kommt ohne sie aus. Mit einer der Optionen für Kopfzeilen, Papier
und so weiter wird nicht behalten, was die Dialoge ändern.
</translation>
    </message>
    <message>
        <source>where to: a name of &quot;pelloric printers&quot; (the current one)</source>
        <translation>wohin: ein Name aus „pelloric printers“ (der jetzige Drucker)</translation>
    </message>
    <message>
        <source>whole copies, one after the other (1)</source>
        <translation>ganze Exemplare, eines nach dem anderen (1)</translation>
    </message>
    <message>
        <source>no printer &quot;%1&quot;; see &quot;pelloric printers&quot;</source>
        <translation>kein Drucker „%1“; siehe „pelloric printers“</translation>
    </message>
    <message>
        <source>Printing</source>
        <translation>Drucken</translation>
    </message>
    <message>
        <source>%1: %2 page sent
</source>
        <translation>%1: %2 Seite gesendet
</translation>
    </message>
    <message>
        <source>%1: %2 pages sent
</source>
        <translation>%1: %2 Seiten gesendet
</translation>
    </message>
    <message>
        <source>Every page is a job of its own, one-sided, on the paper it was laid out for.
</source>
        <translation>Jede Seite ist ein eigener Auftrag, einseitig, auf dem Papier, für das sie aufgebaut ist.
</translation>
    </message>
    <message>
        <source>also list the papers, each with its code and size</source>
        <translation>auch die Papiere auflisten, jedes mit Nummer und Größe</translation>
    </message>
    <message>
        <source>ready</source>
        <translation>bereit</translation>
    </message>
    <message>
        <source>The printer with the star is used when none is named.
</source>
        <translation>Der Drucker mit dem Stern wird genommen, wenn keiner genannt ist.
</translation>
    </message>
    <message>
        <source>Laying out</source>
        <translation>Seitenaufbau</translation>
    </message>
    <message>
        <source>--widths names %1 columns; the table has %2</source>
        <translation>--widths nennt %1 Spalten; die Tabelle hat %2</translation>
    </message>
    <message>
        <source>--as-shown does nothing here: only cells of office files have looks</source>
        <translation>--as-shown bewirkt hier nichts: nur Zellen von Office-Dateien haben ein Aussehen</translation>
    </message>
    <message>
        <source>no column is wide enough to be printed; give other --widths</source>
        <translation>keine Spalte ist breit genug, um gedruckt zu werden; geben Sie andere --widths an</translation>
    </message>
    <message>
        <source>--%1 does not apply to a saved document, whose pages are laid out</source>
        <translation>--%1 gilt nicht für ein gespeichertes Dokument, dessen Seiten schon aufgebaut sind</translation>
    </message>
    <message>
        <source>%1 is no document file</source>
        <translation>%1 ist keine Dokumentdatei</translation>
    </message>
    <message>
        <source>--pages %1 names no page; the document has %2 (write 1,3,5-12)</source>
        <translation>--pages %1 nennt keine Seite; das Dokument hat %2 (schreiben Sie 1,3,5-12)</translation>
    </message>
    <message>
        <source>the default settings, whatever the user&apos;s are</source>
        <translation>die Vorgaben, was auch immer die Einstellungen des Benutzers sind</translation>
    </message>
    <message>
        <source>the settings of this file; the default ones for those it lacks</source>
        <translation>die Einstellungen dieser Datei; Vorgaben für die, die ihr fehlen</translation>
    </message>
    <message>
        <source>title of the file, and centred above every page</source>
        <translation>Titel der Datei, und mittig über jeder Seite</translation>
    </message>
    <message>
        <source>A2 to A6, B5, Letter, Legal, Tabloid, 8k, 16k, 10x15cm, 4x6in</source>
        <translation>A2 bis A6, B5, Letter, Legal, Tabloid, 8k, 16k, 10x15cm, 4x6in</translation>
    </message>
    <message>
        <source>top,right,bottom,left, or one for all: 10mm, 1.5cm or 0.5in</source>
        <translation>oben,rechts,unten,links, oder einer für alle: 10mm, 1.5cm oder 0.5in</translation>
    </message>
    <message>
        <source>the paper&apos;s long side lies below</source>
        <translation>die lange Seite des Papiers liegt unten</translation>
    </message>
    <message>
        <source>the paper stands upright</source>
        <translation>das Papier steht aufrecht</translation>
    </message>
    <message>
        <source>print equal neighbouring cells once</source>
        <translation>gleiche Nachbarzellen einmal drucken</translation>
    </message>
    <message>
        <source>leave out the row of column titles</source>
        <translation>die Zeile der Spaltentitel weglassen</translation>
    </message>
    <message>
        <source>the face of all texts</source>
        <translation>die Schrift aller Texte</translation>
    </message>
    <message>
        <source>the size of the cells&apos; texts: points</source>
        <translation>die Größe der Texte in den Zellen: Punkt</translation>
    </message>
    <message>
        <source>widths of the columns: twips (1440 an inch); 0 leaves one out</source>
        <translation>Breiten der Spalten: Twips (1440 je Zoll); 0 lässt eine weg</translation>
    </message>
    <message>
        <source>unknown paper &quot;%1&quot;; take one of %2, or a size such as 100x150mm or 4x6in</source>
        <translation>unbekanntes Papier „%1“; nehmen Sie eines von %2, oder eine Größe wie 100x150mm oder 4x6in</translation>
    </message>
    <message>
        <source>--paper takes lengths from %1 to %2 mm, not &quot;%3&quot;</source>
        <translation>--paper verlangt Längen von %1 bis %2 mm, nicht „%3“</translation>
    </message>
    <message>
        <source>take either --landscape or --portrait, not both</source>
        <translation>nehmen Sie entweder --landscape oder --portrait, nicht beides</translation>
    </message>
    <message>
        <source>%1 Correct it in the file, or do without: --defaults</source>
        <translation>%1 Berichtigen Sie dies in der Datei, oder verzichten Sie darauf: --defaults</translation>
    </message>
    <message>
        <source>%1 holds no setting; &quot;pelloric settings --path&quot; names yours</source>
        <translation>%1 enthält keine Einstellung; „pelloric settings --path“ nennt Ihre Datei</translation>
    </message>
    <message>
        <source>take either --defaults or --settings, not both</source>
        <translation>nehmen Sie entweder --defaults oder --settings, nicht beides</translation>
    </message>
    <message>
        <source>say which script to run</source>
        <translation>sagen Sie, welches Skript ausgeführt werden soll</translation>
    </message>
    <message>
        <source>The script finds Sorvane and Kestrane, the records and enumerations of their interface,
args, messages, print(...), exit(status), csv(path), sqlite(path, tableOrQuery),
lines(canvas, page), texts(canvas, page), placePicture(canvas, page, picture) and
wait(milliseconds). A control also has grab(path) and resize(width, height).
Kestrane.doPreview builds in the preview window, whose canvas previewCanvas() is. Nothing
is shown, unless --window stands before SCRIPT: then the program goes on until the window
is closed.
An exception that it does not catch ends the program with status 1.
</source>
        <translation>Das Skript findet Sorvane und Kestrane, die Sätze und Aufzählungen ihrer Schnittstelle,
args, messages, print(...), exit(status), csv(path), sqlite(path, tableOrQuery),
lines(canvas, page), texts(canvas, page), placePicture(canvas, page, picture) und
wait(milliseconds). Ein Steuerelement hat auch grab(path) und resize(width, height).
Kestrane.doPreview baut im Vorschaufenster auf, dessen Leinwand previewCanvas() ist.
Nichts wird gezeigt, es sei denn, --window steht vor SCRIPT: dann läuft das Programm,
bis das Fenster geschlossen wird.
Eine Ausnahme, die es nicht fängt, beendet das Programm mit Status 1.
</translation>
    </message>
    <message>
        <source>only say where the file is</source>
        <translation>nur sagen, wo die Datei liegt</translation>
    </message>
    <message>
        <source>put the default settings back</source>
        <translation>die Vorgaben wiederherstellen</translation>
    </message>
    <message>
        <source>only rows whose column NAME holds TEXT</source>
        <translation>nur Zeilen, deren Spalte NAME den TEXT enthält</translation>
    </message>
    <message>
        <source>cells have the fonts, colours and alignment of the office file</source>
        <translation>Zellen haben Schriften, Farben und Ausrichtung der Office-Datei</translation>
    </message>
    <message>
        <source>turn the paper, then shrink, until the table is as wide as one page</source>
        <translation>das Papier drehen, dann verkleinern, bis die Tabelle so breit wie eine Seite ist</translation>
    </message>
    <message>
        <source>shrink until the table is at most N pages wide</source>
        <translation>verkleinern, bis die Tabelle höchstens N Seiten breit ist</translation>
    </message>
    <message>
        <source>columns to repeat at the left of every page</source>
        <translation>Spalten, die links auf jeder Seite wiederholt werden</translation>
    </message>
    <message>
        <source>all rows of the first columns come before the next columns</source>
        <translation>alle Zeilen der ersten Spalten kommen vor den nächsten Spalten</translation>
    </message>
    <message>
        <source>rows with equal texts in these columns stay on one page</source>
        <translation>Zeilen mit gleichen Texten in diesen Spalten bleiben auf einer Seite</translation>
    </message>
    <message>
        <source>totals of columns; F is sum, count, mean, min or max</source>
        <translation>Summen von Spalten; F ist sum, count, mean, min oder max</translation>
    </message>
    <message>
        <source>a faint text across every page</source>
        <translation>ein blasser Text quer über jede Seite</translation>
    </message>
    <message>
        <source>a faint picture in the middle of every page</source>
        <translation>ein blasses Bild in der Mitte jeder Seite</translation>
    </message>
    <message>
        <source>of the watermark, 1 to 100 (15)</source>
        <translation>Deckkraft des Wasserzeichens, 1 bis 100 (15)</translation>
    </message>
    <message>
        <source>the watermark lies above the table, not behind it</source>
        <translation>das Wasserzeichen liegt über der Tabelle, nicht dahinter</translation>
    </message>
    <message>
        <source>a picture at the top of every page</source>
        <translation>ein Bild oben auf jeder Seite</translation>
    </message>
    <message>
        <source>where the logo stands: left, center or right (left)</source>
        <translation>wo das Logo steht: left, center oder right (left)</translation>
    </message>
    <message>
        <source>--total takes sum, count, mean, min or max, a colon and a column, such as sum:Price, not &quot;%1&quot;</source>
        <translation>--total verlangt sum, count, mean, min oder max, einen Doppelpunkt und eine Spalte, wie sum:Price, nicht „%1“</translation>
    </message>
    <message>
        <source>--logo-at takes left, center or right, not &quot;%1&quot;</source>
        <translation>--logo-at verlangt left, center oder right, nicht „%1“</translation>
    </message>
    <message>
        <source>--%1 says something about --%2, which is not given</source>
        <translation>--%1 sagt etwas über --%2, das nicht angegeben ist</translation>
    </message>
    <message>
        <source>--watermark and --watermark-image exclude each other</source>
        <translation>--watermark und --watermark-image schließen einander aus</translation>
    </message>
    <message>
        <source>--where takes a column, &quot;=&quot; and a text, not &quot;%1&quot;</source>
        <translation>--where verlangt eine Spalte, „=“ und einen Text, nicht „%1“</translation>
    </message>
    <message>
        <source>only these columns, in this order; #3 is the third</source>
        <translation>nur diese Spalten, in dieser Reihenfolge; #3 ist die dritte</translation>
    </message>
    <message>
        <source>sort the rows by these columns; NAME:desc downwards</source>
        <translation>die Zeilen nach diesen Spalten sortieren; NAME:desc absteigend</translation>
    </message>
    <message>
        <source>only these rows, from 1, after sorting; 100- and -100 work, too</source>
        <translation>nur diese Zeilen, ab 1, nach dem Sortieren; auch 100- und -100</translation>
    </message>
    <message>
        <source>--%1: there is no column &quot;%2&quot;; the table has %3</source>
        <translation>--%1: es gibt keine Spalte „%2“; die Tabelle hat %3</translation>
    </message>
    <message>
        <source>--rows takes a range such as 1-100, not &quot;%1&quot;</source>
        <translation>--rows verlangt einen Bereich wie 1-100, nicht „%1“</translation>
    </message>
    <message>
        <source>--rows %1 names no row; the table has %2</source>
        <translation>--rows %1 nennt keine Zeile; die Tabelle hat %2</translation>
    </message>
    <message>
        <source>what to take of a database: a SELECT statement</source>
        <translation>was aus einer Datenbank genommen wird: eine SELECT-Anweisung</translation>
    </message>
    <message>
        <source>of a text file; else found out</source>
        <translation>einer Textdatei; sonst wird sie herausgefunden</translation>
    </message>
    <message>
        <source>between the values of a CSV file, or tab; else found out</source>
        <translation>zwischen den Werten einer CSV-Datei, oder tab; sonst wird es herausgefunden</translation>
    </message>
    <message>
        <source>a quote in a CSV file is a character like any other</source>
        <translation>ein Anführungszeichen in einer CSV-Datei ist ein Zeichen wie jedes andere</translation>
    </message>
    <message>
        <source>standard input</source>
        <translation>Standardeingabe</translation>
    </message>
    <message>
        <source>%1 is a folder; name a file in it</source>
        <translation>%1 ist ein Ordner; nennen Sie eine Datei darin</translation>
    </message>
    <message>
        <source>%1 is a device; name a file</source>
        <translation>%1 ist ein Gerät; nennen Sie eine Datei</translation>
    </message>
    <message>
        <source>%1: you may not read this file</source>
        <translation>%1: Sie dürfen diese Datei nicht lesen</translation>
    </message>
    <message>
        <source>--encoding is for CSV and TSV files, not databases</source>
        <translation>--encoding ist für CSV- und TSV-Dateien, nicht für Datenbanken</translation>
    </message>
    <message>
        <source>take either a table or --query, not both</source>
        <translation>nehmen Sie entweder eine Tabelle oder --query, nicht beides</translation>
    </message>
    <message>
        <source>Reading</source>
        <translation>Lesen</translation>
    </message>
    <message>
        <source>--delimiter takes one ASCII character, or &quot;tab&quot;, not &quot;%1&quot;</source>
        <translation>--delimiter verlangt ein ASCII-Zeichen oder „tab“, nicht „%1“</translation>
    </message>
    <message>
        <source>--query is for databases; %1 is none</source>
        <translation>--query ist für Datenbanken; %1 ist keine</translation>
    </message>
    <message>
        <source>of hints, tips and errors (the locale&apos;s): de, en, zh_CN, or system; the rest has one wording</source>
        <translation>von Hinweisen, Tipps und Fehlern (die der Umgebung): de, en, zh_CN oder system; der Rest hat einen Wortlaut</translation>
    </message>
    <message>
        <source>--language %1: there are de, en, zh_CN, and system</source>
        <translation>--language %1: es gibt de, en, zh_CN und system</translation>
    </message>
    <message>
        <source>there is no display to show windows on; &quot;pelloric export&quot; and &quot;pelloric demo --walk OUT&quot; need none</source>
        <translation>es gibt keine Anzeige für Fenster; „pelloric export“ und „pelloric demo --walk OUT“ brauchen keine</translation>
    </message>
    <message>
        <source>a document file holds no icons of cells; they were left out</source>
        <translation>eine Dokumentdatei fasst keine Symbole von Zellen; sie wurden weggelassen</translation>
    </message>
    <message>
        <source>a document file has no code for some characters; %1 of its texts show &quot;?&quot; for them</source>
        <translation>eine Dokumentdatei hat für manche Zeichen keinen Code; %1 ihrer Texte zeigen „?“ dafür</translation>
    </message>
    <message>
        <source>1 cell</source>
        <translation>1 Zelle</translation>
    </message>
    <message>
        <source>%1 cells</source>
        <translation>%1 Zellen</translation>
    </message>
    <message>
        <source>no row is printed: --where %1 holds for none</source>
        <translation>keine Zeile wird gedruckt: --where %1 gilt für keine</translation>
    </message>
    <message>
        <source>the total of %1 leaves out %2, being no numbers</source>
        <translation>die Summe von %1 lässt %2 aus, die keine Zahlen sind</translation>
    </message>
    <message>
        <source>%1 is a pipe; a saved document is read from a file, so save it to one and name that</source>
        <translation>%1 ist eine Pipe; ein gespeichertes Dokument wird aus einer Datei gelesen, speichern Sie es also in eine und nennen Sie diese</translation>
    </message>
    <message>
        <source>--margins takes one length of %1 mm or more and at most %2 mm, or four (top,right,bottom,left), not &quot;%3&quot;</source>
        <translation>--margins nimmt eine Länge von mindestens %1 mm und höchstens %2 mm, oder vier (oben,rechts,unten,links), nicht &quot;%3&quot;</translation>
    </message>
    <message>
        <source>%1 cannot be kept in %2: %3; name another folder in TMPDIR, or save it to a file and name that</source>
        <translation>%1 kann nicht in %2 aufbewahrt werden: %3; nennen Sie einen anderen Ordner in TMPDIR, oder speichern Sie es in eine Datei und nennen Sie diese</translation>
    </message>
    <message>
        <source>%1 cannot be read: %2</source>
        <translation>%1 kann nicht gelesen werden: %2</translation>
    </message>
    <message>
        <source>%1 goes on after %2 GB, which is the most that is taken of a pipe; save it to a file and name that, or hand over fewer rows</source>
        <translation>%1 geht nach %2 GB noch weiter, und mehr wird aus einer Pipe nicht genommen; speichern Sie es in eine Datei und nennen Sie diese, oder übergeben Sie weniger Zeilen</translation>
    </message>
    <message>
        <source>%1 does not fit into %2, where it is kept while it is read; make room there, or name another folder in TMPDIR</source>
        <translation>%1 passt nicht in %2, wo es beim Lesen aufbewahrt wird; schaffen Sie dort Platz, oder nennen Sie einen anderen Ordner in TMPDIR</translation>
    </message>
    <message>
        <source>%1 is a socket; name a file</source>
        <translation>%1 ist ein Socket; nennen Sie eine Datei</translation>
    </message>
    <message>
        <source>%1 takes %2, not &quot;%3&quot;: %4</source>
        <translation>%1 nimmt %2, nicht &quot;%3&quot;: %4</translation>
    </message>
    <message>
        <source>%1: the folder cannot be made: %2</source>
        <translation>%1: der Ordner kann nicht angelegt werden: %2</translation>
    </message>
    <message>
        <source>--%1 names no column, only &quot;%2&quot;</source>
        <translation>--%1 nennt keine Spalte, nur &quot;%2&quot;</translation>
    </message>
    <message>
        <source>%1 is no SQLite database and no office file, so it has no table &quot;%2&quot;</source>
        <translation>%1 ist weder eine SQLite-Datenbank noch eine Office-Datei und hat daher keine Tabelle &quot;%2&quot;</translation>
    </message>
    <message>
        <source>the stack may hold %1 KB only; allow %2 at least: ulimit -s 8192</source>
        <translation>der Stapel darf nur %1 KB haben; mindestens %2 erlauben: ulimit -s 8192</translation>
    </message>
    <message>
        <source>only %1 files may be open; allow %2 at least: ulimit -n 1024</source>
        <translation>nur %1 Dateien dürfen offen sein; mindestens %2 erlauben: ulimit -n 1024</translation>
    </message>
    <message>
        <source>hidden rows and columns of an office sheet, too</source>
        <translation>auch verborgene Zeilen und Spalten eines Tabellenblatts</translation>
    </message>
    <message>
        <source>1 hidden row</source>
        <translation>1 verborgene Zeile</translation>
    </message>
    <message>
        <source>%1 hidden rows</source>
        <translation>%1 verborgene Zeilen</translation>
    </message>
    <message>
        <source>1 hidden column</source>
        <translation>1 verborgene Spalte</translation>
    </message>
    <message>
        <source>%1 hidden columns</source>
        <translation>%1 verborgene Spalten</translation>
    </message>
    <message>
        <source>%1 and %2</source>
        <translation>%1 und %2</translation>
    </message>
    <message>
        <source>%1: left out are %2; --hidden takes them, too</source>
        <translation>%1: ausgelassen sind %2; --hidden nimmt auch sie</translation>
    </message>
    <message>
        <source>A NAME that holds a comma stands in double quotes, as in a CSV file:
--columns &apos;Item,&quot;Price, net&quot;&apos;.
</source>
        <translation>Ein NAME mit Komma steht in doppelten Anführungszeichen, wie in einer CSV-Datei:
--columns &apos;Artikel,&quot;Preis, netto&quot;&apos;.
</translation>
    </message>
    <message>
        <source>standard output cannot be written: %1</source>
        <translation>die Standardausgabe kann nicht geschrieben werden: %1</translation>
    </message>
    <message>
        <source>Everything was done.</source>
        <translation>Alles ist getan.</translation>
    </message>
    <message>
        <source>It failed; standard error says why in one line.</source>
        <translation>Es ist misslungen; die Standardfehlerausgabe sagt in einer Zeile, warum.</translation>
    </message>
    <message>
        <source>The program was called in a wrong way.</source>
        <translation>Das Programm wurde falsch aufgerufen.</translation>
    </message>
    <message>
        <source>It was ended by Ctrl+C or a signal.</source>
        <translation>Es wurde durch Strg+C oder ein Signal beendet.</translation>
    </message>
    <message>
        <source>User Commands</source>
        <translation>Dienstprogramme für Benutzer</translation>
    </message>
    <message>
        <source>NAME</source>
        <translation>BEZEICHNUNG</translation>
    </message>
    <message>
        <source>previews, exports and prints tables</source>
        <translation>zeigt, exportiert und druckt Tabellen</translation>
    </message>
    <message>
        <source>SYNOPSIS</source>
        <translation>ÜBERSICHT</translation>
    </message>
    <message>
        <source>DESCRIPTION</source>
        <translation>BESCHREIBUNG</translation>
    </message>
    <message>
        <source>Lays tables out into pages with header, titles, grid lines and footer, and shows, prints or saves them.</source>
        <translation>Verteilt Tabellen auf Seiten mit Kopfzeile, Titeln, Gitterlinien und Fußzeile und zeigt, druckt oder speichert sie.</translation>
    </message>
    <message>
        <source>COMMANDS</source>
        <translation>BEFEHLE</translation>
    </message>
    <message>
        <source>EXIT STATUS</source>
        <translation>EXIT-STATUS</translation>
    </message>
    <message>
        <source>FILES</source>
        <translation>DATEIEN</translation>
    </message>
    <message>
        <source>Paper, margins, texts and styles; see &quot;pelloric settings&quot;.</source>
        <translation>Papier, Ränder, Texte und Stile; siehe „pelloric settings“.</translation>
    </message>
    <message>
        <source>no completion for the shell %1; take bash, zsh or fish</source>
        <translation>keine Vervollständigung für die Shell %1; es gibt bash, zsh und fish</translation>
    </message>
    <message>
        <source>For bash: source &lt;(pelloric completion bash)
For zsh: pelloric completion zsh &gt; a folder of $fpath, as _pelloric
For fish: pelloric completion fish | source
</source>
        <translation>Für bash: source &lt;(pelloric completion bash)
Für zsh: pelloric completion zsh &gt; in einen Ordner von $fpath, als _pelloric
Für fish: pelloric completion fish | source
</translation>
    </message>
    <message>
        <source>above every page, at the left</source>
        <translation>über jeder Seite, links</translation>
    </message>
    <message>
        <source>above every page, in the middle</source>
        <translation>über jeder Seite, in der Mitte</translation>
    </message>
    <message>
        <source>above every page, at the right</source>
        <translation>über jeder Seite, rechts</translation>
    </message>
    <message>
        <source>below every page, at the left</source>
        <translation>unter jeder Seite, links</translation>
    </message>
    <message>
        <source>below every page, in the middle</source>
        <translation>unter jeder Seite, in der Mitte</translation>
    </message>
    <message>
        <source>below every page, at the right</source>
        <translation>unter jeder Seite, rechts</translation>
    </message>
    <message>
        <source>The texts above and below every page may hold one of the fields [Date Printed],
[Time Printed], [Date &amp; Time Printed], [Page # of Pages #], [Total Pages] and [Page #].
</source>
        <translation>Die Texte über und unter jeder Seite dürfen eines der Felder [Date Printed],
[Time Printed], [Date &amp; Time Printed], [Page # of Pages #], [Total Pages] und [Page #] enthalten.
</translation>
    </message>
    <message>
        <source>%1; settings files are smaller</source>
        <translation>%1; Einstellungsdateien sind kleiner</translation>
    </message>
    <message>
        <source>the script nests values deeper than its stack holds</source>
        <translation>das Skript verschachtelt Werte tiefer, als sein Stapel fasst</translation>
    </message>
    <message>
        <source>%1 is a file; say what to do with it: pelloric %2 %1</source>
        <translation>%1 ist eine Datei; sagen Sie, was mit ihr geschehen soll: pelloric %2 %1</translation>
    </message>
    <message>
        <source>an argument is missing</source>
        <translation>ein Argument fehlt</translation>
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
