<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="de" sourcelanguage="en">
<context>
    <name>KeysWindow</name>
    <message>
        <source>Read on, at the end the next page</source>
        <translation>Weiterlesen, am Ende auf der nächsten Seite</translation>
    </message>
    <message>
        <source>Read back, at the top the page before</source>
        <translation>Zurücklesen, oben auf der Seite davor</translation>
    </message>
    <message>
        <source>Scroll a little</source>
        <translation>Ein wenig verschieben</translation>
    </message>
    <message>
        <source>Top and bottom of the page</source>
        <translation>Anfang und Ende der Seite</translation>
    </message>
    <message>
        <source>Scale under the pointer</source>
        <translation>Vergrößern und verkleinern, wo der Zeiger steht</translation>
    </message>
    <message>
        <source>Scroll sideways</source>
        <translation>Zur Seite verschieben</translation>
    </message>
    <message>
        <source>Select texts</source>
        <translation>Texte auswählen</translation>
    </message>
    <message>
        <source>Menu of the pages</source>
        <translation>Menü der Seiten</translation>
    </message>
    <message>
        <source>Close what is open, end what runs, then leave</source>
        <translation>Offenes schließen, Laufendes beenden, dann das Fenster schließen</translation>
    </message>
    <message>
        <source>Keys</source>
        <translation>Tasten</translation>
    </message>
    <message>
        <source>What they do</source>
        <translation>Was sie tun</translation>
    </message>
</context>
<context>
    <name>ToolMeanings</name>
    <message>
        <source>Fonts, colours and grid lines of the report</source>
        <translation>Schriften, Farben und Gitterlinien des Berichts</translation>
    </message>
    <message>
        <source>Read the table again</source>
        <translation>Die Tabelle neu einlesen</translation>
    </message>
    <message>
        <source>Show the pages twice as large</source>
        <translation>Die Seiten doppelt so groß zeigen</translation>
    </message>
    <message>
        <source>Show the pages half as large</source>
        <translation>Die Seiten halb so groß zeigen</translation>
    </message>
    <message>
        <source>Go to the first page</source>
        <translation>Zur ersten Seite</translation>
    </message>
    <message>
        <source>Go back a page</source>
        <translation>Eine Seite zurück</translation>
    </message>
    <message>
        <source>Go on to the next page</source>
        <translation>Weiter zur nächsten Seite</translation>
    </message>
    <message>
        <source>Go to the last page</source>
        <translation>Zur letzten Seite</translation>
    </message>
    <message>
        <source>Show all pages, or six of a long report</source>
        <translation>Alle Seiten zeigen, bei langen Berichten sechs</translation>
    </message>
    <message>
        <source>Show one page</source>
        <translation>Eine Seite zeigen</translation>
    </message>
    <message>
        <source>Drag the pages with the mouse</source>
        <translation>Die Seiten mit der Maus verschieben</translation>
    </message>
    <message>
        <source>Print all pages or some</source>
        <translation>Alle oder einige Seiten drucken</translation>
    </message>
    <message>
        <source>Paper, margins, header and footer</source>
        <translation>Papier, Ränder, Kopf- und Fußzeile</translation>
    </message>
    <message>
        <source>Fill the window with one page</source>
        <translation>Das Fenster mit einer Seite füllen</translation>
    </message>
    <message>
        <source>Show two pages</source>
        <translation>Zwei Seiten zeigen</translation>
    </message>
    <message>
        <source>Scale of the pages: pick one or type it</source>
        <translation>Maßstab der Seiten: auswählen oder eintippen</translation>
    </message>
    <message>
        <source>Go to a page: pick one or type its number</source>
        <translation>Zu einer Seite: auswählen oder die Nummer eintippen</translation>
    </message>
    <message>
        <source>Close the preview</source>
        <translation>Die Vorschau schließen</translation>
    </message>
    <message>
        <source>Show four pages</source>
        <translation>Vier Seiten zeigen</translation>
    </message>
    <message>
        <source>Name and version</source>
        <translation>Name und Version</translation>
    </message>
    <message>
        <source>Open saved pages</source>
        <translation>Gespeicherte Seiten öffnen</translation>
    </message>
    <message>
        <source>Save the pages to a file</source>
        <translation>Die Seiten in einer Datei speichern</translation>
    </message>
    <message>
        <source>Throw all pages away</source>
        <translation>Alle Seiten verwerfen</translation>
    </message>
    <message>
        <source>Larger text and columns</source>
        <translation>Text und Spalten größer</translation>
    </message>
    <message>
        <source>Smaller text and columns</source>
        <translation>Text und Spalten kleiner</translation>
    </message>
</context>
<context>
    <name>pelloric::qt::AboutBox</name>
    <message>
        <source>About</source>
        <translation>Über</translation>
    </message>
    <message>
        <source>Print preview and printing of grids.</source>
        <translation>Druckvorschau und Druck von Tabellen.</translation>
    </message>
</context>
<context>
    <name>pelloric::qt::BackScreen</name>
    <message>
        <source>Pages</source>
        <translation>Seiten</translation>
    </message>
</context>
<context>
    <name>pelloric::qt::CanvasAreas</name>
    <message>
        <source>Hand cursor</source>
        <translation>Handzeiger</translation>
    </message>
    <message>
        <source>Picture</source>
        <translation>Bild</translation>
    </message>
    <message>
        <source>Horizontal scroll bar</source>
        <translation>Waagerechter Rollbalken</translation>
    </message>
    <message>
        <source>Vertical scroll bar</source>
        <translation>Senkrechter Rollbalken</translation>
    </message>
</context>
<context>
    <name>pelloric::qt::FileBox</name>
    <message>
        <source>Folder</source>
        <translation>Ordner</translation>
    </message>
    <message>
        <source>Kind of files</source>
        <translation>Art der Dateien</translation>
    </message>
</context>
<context>
    <name>pelloric::qt::FindBar</name>
    <message>
        <source>Previous place (Shift+F3)</source>
        <translation>Vorherige Stelle (Umschalt+F3)</translation>
    </message>
    <message>
        <source>Next place (F3)</source>
        <translation>Nächste Stelle (F3)</translation>
    </message>
    <message>
        <source>Close (Esc)</source>
        <translation>Schließen (Esc)</translation>
    </message>
    <message>
        <source>Find</source>
        <translation>Suchen</translation>
    </message>
    <message>
        <source>Text to find</source>
        <translation>Gesuchter Text</translation>
    </message>
    <message>
        <source>Find on the pages</source>
        <translation>Auf den Seiten suchen</translation>
    </message>
    <message>
        <source>Not found</source>
        <translation>Nicht gefunden</translation>
    </message>
    <message>
        <source>Searching…</source>
        <translation>Suche läuft …</translation>
    </message>
    <message>
        <source>%L1 found</source>
        <translation>%L1 gefunden</translation>
    </message>
    <message>
        <source>%L1 of %L2</source>
        <translation>%L1 von %L2</translation>
    </message>
</context>
<context>
    <name>pelloric::qt::FontChooser</name>
    <message>
        <source>Font</source>
        <translation>Schrift</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>OK</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Abbrechen</translation>
    </message>
    <message>
        <source>Font:</source>
        <translation>Schriftart:</translation>
    </message>
    <message>
        <source>Size:</source>
        <translation>Größe:</translation>
    </message>
    <message>
        <source>Effects</source>
        <translation>Auszeichnung</translation>
    </message>
    <message>
        <source>Bold</source>
        <translation>Fett</translation>
    </message>
    <message>
        <source>Italic</source>
        <translation>Kursiv</translation>
    </message>
    <message>
        <source>Strikeout</source>
        <translation>Durchgestrichen</translation>
    </message>
    <message>
        <source>Underline</source>
        <translation>Unterstrichen</translation>
    </message>
    <message>
        <source>Color:</source>
        <translation>Farbe:</translation>
    </message>
    <message>
        <source>Sample</source>
        <translation>Muster</translation>
    </message>
</context>
<context>
    <name>pelloric::qt::GridStyleDialog</name>
    <message>
        <source>Fonts</source>
        <translation>Schriften</translation>
    </message>
</context>
<context>
    <name>pelloric::qt::Kestrane</name>
    <message>
        <source>Print preview</source>
        <translation>Druckvorschau</translation>
    </message>
</context>
<context>
    <name>pelloric::qt::NoticeStrip</name>
    <message>
        <source>Page &amp;Setup...</source>
        <translation>&amp;Seite einrichten …</translation>
    </message>
    <message>
        <source>Change paper, margins, header and footer</source>
        <translation>Papier, Ränder, Kopf- und Fußzeile ändern</translation>
    </message>
    <message>
        <source>&amp;Design Report...</source>
        <translation>Bericht &amp;gestalten …</translation>
    </message>
    <message>
        <source>Change fonts, colours and grid lines</source>
        <translation>Schriften, Farben und Gitterlinien ändern</translation>
    </message>
    <message>
        <source>Restore De&amp;faults</source>
        <translation>S&amp;tandardwerte wiederherstellen</translation>
    </message>
    <message>
        <source>Give every setting that is missing or cannot be used its default value; the old file is kept beside</source>
        <translation>Jeder Einstellung, die fehlt oder nicht zu gebrauchen ist, ihren Standardwert geben; die alte Datei bleibt daneben liegen</translation>
    </message>
    <message>
        <source>Notice</source>
        <translation>Hinweis</translation>
    </message>
    <message>
        <source>Hide this notice</source>
        <translation>Diesen Hinweis ausblenden</translation>
    </message>
</context>
<context>
    <name>pelloric::qt::OptionsPanel</name>
    <message>
        <source>Report Options</source>
        <translation>Berichtsoptionen</translation>
    </message>
    <message>
        <source>Look</source>
        <translation>Aussehen</translation>
    </message>
    <message>
        <source>Cells &amp;as the view shows them</source>
        <translation>Zellen wie in der &amp;Ansicht</translation>
    </message>
    <message>
        <source>Width</source>
        <translation>Breite</translation>
    </message>
    <message>
        <source>As it is, in bands</source>
        <translation>Wie sie ist, in Bändern</translation>
    </message>
    <message>
        <source>Turn, then shrink</source>
        <translation>Drehen, dann verkleinern</translation>
    </message>
    <message>
        <source>Shrink to pages across</source>
        <translation>Auf Seiten nebeneinander verkleinern</translation>
    </message>
    <message>
        <source>Across, then down</source>
        <translation>Erst quer, dann abwärts</translation>
    </message>
    <message>
        <source>Down, then across</source>
        <translation>Erst abwärts, dann quer</translation>
    </message>
    <message>
        <source>&amp;Fit:</source>
        <translation>An&amp;passen:</translation>
    </message>
    <message>
        <source>Pages a&amp;cross:</source>
        <translation>Seiten &amp;nebeneinander:</translation>
    </message>
    <message>
        <source>&amp;Key columns:</source>
        <translation>&amp;Kopfspalten:</translation>
    </message>
    <message>
        <source>Page or&amp;der:</source>
        <translation>&amp;Reihenfolge:</translation>
    </message>
    <message>
        <source>Rows and Columns</source>
        <translation>Zeilen und Spalten</translation>
    </message>
    <message>
        <source>All</source>
        <translation>Alle</translation>
    </message>
    <message>
        <source>Selected in the view</source>
        <translation>In der Ansicht ausgewählte</translation>
    </message>
    <message>
        <source>Range</source>
        <translation>Bereich</translation>
    </message>
    <message>
        <source>all, or titles: Name, Price</source>
        <translation>alle, oder Titel: Name, Preis</translation>
    </message>
    <message>
        <source>&amp;Rows:</source>
        <translation>&amp;Zeilen:</translation>
    </message>
    <message>
        <source>From:</source>
        <translation>Von:</translation>
    </message>
    <message>
        <source>&amp;To:</source>
        <translation>&amp;Bis:</translation>
    </message>
    <message>
        <source>Co&amp;lumns:</source>
        <translation>&amp;Spalten:</translation>
    </message>
    <message>
        <source>Groups and Totals</source>
        <translation>Gruppen und Summen</translation>
    </message>
    <message>
        <source>titles: Country</source>
        <translation>Titel: Land</translation>
    </message>
    <message>
        <source>K&amp;eep groups on a page</source>
        <translation>Gruppen auf einer Seite &amp;halten</translation>
    </message>
    <message>
        <source>Sum</source>
        <translation>Summe</translation>
    </message>
    <message>
        <source>Count</source>
        <translation>Anzahl</translation>
    </message>
    <message>
        <source>Mean</source>
        <translation>Mittelwert</translation>
    </message>
    <message>
        <source>Minimum</source>
        <translation>Kleinster Wert</translation>
    </message>
    <message>
        <source>Maximum</source>
        <translation>Größter Wert</translation>
    </message>
    <message>
        <source>titles: Price</source>
        <translation>Titel: Preis</translation>
    </message>
    <message>
        <source>Group b&amp;y:</source>
        <translation>&amp;Gruppieren nach:</translation>
    </message>
    <message>
        <source>T&amp;otal:</source>
        <translation>S&amp;umme:</translation>
    </message>
    <message>
        <source>of col&amp;umns:</source>
        <translation>der Spa&amp;lten:</translation>
    </message>
    <message>
        <source>Watermark and Logo</source>
        <translation>Wasserzeichen und Logo</translation>
    </message>
    <message>
        <source>a text, such as Draft</source>
        <translation>ein Text, etwa Entwurf</translation>
    </message>
    <message>
        <source>or a picture file</source>
        <translation>oder eine Bilddatei</translation>
    </message>
    <message>
        <source>A&amp;bove the table</source>
        <translation>Über der &amp;Tabelle</translation>
    </message>
    <message>
        <source>a picture file</source>
        <translation>eine Bilddatei</translation>
    </message>
    <message>
        <source>Left</source>
        <translation>Links</translation>
    </message>
    <message>
        <source>Centre</source>
        <translation>Mitte</translation>
    </message>
    <message>
        <source>Right</source>
        <translation>Rechts</translation>
    </message>
    <message>
        <source>Text:</source>
        <translation>Text:</translation>
    </message>
    <message>
        <source>&amp;Picture:</source>
        <translation>B&amp;ild:</translation>
    </message>
    <message>
        <source>Picture of the watermark</source>
        <translation>Bild des Wasserzeichens</translation>
    </message>
    <message>
        <source>Opac&amp;ity:</source>
        <translation>&amp;Deckkraft:</translation>
    </message>
    <message>
        <source>Lo&amp;go:</source>
        <translation>Lo&amp;go:</translation>
    </message>
    <message>
        <source>Picture of the logo</source>
        <translation>Bild des Logos</translation>
    </message>
    <message>
        <source>&amp;Slot:</source>
        <translation>Pl&amp;atz:</translation>
    </message>
    <message>
        <source>Choose: %1</source>
        <translation>Wählen: %1</translation>
    </message>
    <message>
        <source>Choose a file</source>
        <translation>Eine Datei wählen</translation>
    </message>
    <message>
        <source>Pictures (*.png *.jpg *.jpeg *.bmp *.gif *.svg)</source>
        <translation>Bilder (*.png *.jpg *.jpeg *.bmp *.gif *.svg)</translation>
    </message>
    <message>
        <source>The table fits as it is.</source>
        <translation>Die Tabelle passt, wie sie ist.</translation>
    </message>
    <message>
        <source>The table fits on turned paper.</source>
        <translation>Die Tabelle passt auf gedrehtes Papier.</translation>
    </message>
    <message>
        <source>Shrunk to %1 % on turned paper.</source>
        <translation>Auf %1 % verkleinert, auf gedrehtem Papier.</translation>
    </message>
    <message>
        <source>Shrunk to %1 %.</source>
        <translation>Auf %1 % verkleinert.</translation>
    </message>
    <message>
        <source>Too wide to be shrunk: printed in bands.</source>
        <translation>Zum Verkleinern zu breit: in Bändern gedruckt.</translation>
    </message>
</context>
<context>
    <name>pelloric::qt::PageFiles</name>
    <message>
        <source>PDF document</source>
        <translation>PDF-Dokument</translation>
    </message>
    <message>
        <source>PNG pictures</source>
        <translation>PNG-Bilder</translation>
    </message>
    <message>
        <source>SVG drawings</source>
        <translation>SVG-Zeichnungen</translation>
    </message>
    <message>
        <source>report</source>
        <translation>Bericht</translation>
    </message>
    <message>
        <source>Save as PDF</source>
        <translation>Als PDF speichern</translation>
    </message>
</context>
<context>
    <name>pelloric::qt::PageSetupDialog</name>
    <message>
        <source>Papers</source>
        <translation>Papiere</translation>
    </message>
    <message>
        <source>These are the standard papers: %1.</source>
        <translation>Dies sind die üblichen Papiere: %1.</translation>
    </message>
</context>
<context>
    <name>pelloric::qt::PageSketch</name>
    <message>
        <source>Sketch of the page with its margins</source>
        <translation>Skizze der Seite mit ihren Rändern</translation>
    </message>
</context>
<context>
    <name>pelloric::qt::PageStrip</name>
    <message>
        <source>Page %1</source>
        <translation>Seite %1</translation>
    </message>
    <message>
        <source>Pictures of the pages</source>
        <translation>Bilder der Seiten</translation>
    </message>
</context>
<context>
    <name>pelloric::qt::PageSurface</name>
    <message>
        <source>Page surface %1</source>
        <translation>Seitenfläche %1</translation>
    </message>
</context>
<context>
    <name>pelloric::qt::PageTextsTab</name>
    <message>
        <source>Left</source>
        <translation>Links</translation>
    </message>
    <message>
        <source>Center</source>
        <translation>Mitte</translation>
    </message>
    <message>
        <source>Right</source>
        <translation>Rechts</translation>
    </message>
    <message>
        <source>Header left</source>
        <translation>Kopfzeile links</translation>
    </message>
    <message>
        <source>Header center</source>
        <translation>Kopfzeile Mitte</translation>
    </message>
    <message>
        <source>Header right</source>
        <translation>Kopfzeile rechts</translation>
    </message>
    <message>
        <source>Footer left</source>
        <translation>Fußzeile links</translation>
    </message>
    <message>
        <source>Footer center</source>
        <translation>Fußzeile Mitte</translation>
    </message>
    <message>
        <source>Footer right</source>
        <translation>Fußzeile rechts</translation>
    </message>
    <message>
        <source>Header font</source>
        <translation>Schrift der Kopfzeile</translation>
    </message>
    <message>
        <source>Footer font</source>
        <translation>Schrift der Fußzeile</translation>
    </message>
    <message>
        <source>Change the header font</source>
        <translation>Schrift der Kopfzeile ändern</translation>
    </message>
    <message>
        <source>Change the footer font</source>
        <translation>Schrift der Fußzeile ändern</translation>
    </message>
    <message>
        <source>The Menu key or Alt+Down opens the fields</source>
        <translation>Die Menütaste oder Alt+Abwärts öffnet die Felder</translation>
    </message>
    <message>
        <source>Put in a field</source>
        <translation>Ein Feld einfügen</translation>
    </message>
</context>
<context>
    <name>pelloric::qt::PreviewToolbar</name>
    <message>
        <source>Tools</source>
        <translation>Werkzeuge</translation>
    </message>
</context>
<context>
    <name>pelloric::qt::PreviewWindow</name>
    <message>
        <source>Printing was ended: %1 of %2 pages were sent.</source>
        <translation>Der Druck wurde beendet: %1 von %2 Seiten wurden gesendet.</translation>
    </message>
    <message>
        <source>Saving the pages…</source>
        <translation>Seiten werden gespeichert …</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Abbrechen</translation>
    </message>
</context>
<context>
    <name>pelloric::qt::PrintOptionsDialog</name>
    <message>
        <source>No page is named yet, so nothing would be printed.</source>
        <translation>Noch ist keine Seite genannt, es würde nichts gedruckt.</translation>
    </message>
    <message>
        <source>None of these pages exists: the last one is %1.</source>
        <translation>Keine dieser Seiten gibt es: Die letzte ist %1.</translation>
    </message>
    <message>
        <source>This names no page, so nothing would be printed.</source>
        <translation>Das nennt keine Seite, es würde nichts gedruckt.</translation>
    </message>
    <message>
        <source>These are more pages than can be printed.</source>
        <translation>Das sind mehr Seiten, als gedruckt werden können.</translation>
    </message>
    <message>
        <source>Without a copy nothing would be printed.</source>
        <translation>Ohne ein Exemplar würde nichts gedruckt.</translation>
    </message>
    <message>
        <source>These are more copies than can be printed.</source>
        <translation>Das sind mehr Exemplare, als gedruckt werden können.</translation>
    </message>
    <message>
        <source>Save as PDF instead...</source>
        <translation>Stattdessen als PDF speichern …</translation>
    </message>
    <message>
        <source>There is no printer.</source>
        <translation>Es gibt keinen Drucker.</translation>
    </message>
    <message>
        <source>No printers can be listed: %1.</source>
        <translation>Drucker lassen sich nicht auflisten: %1.</translation>
    </message>
    <message>
        <source>Page range</source>
        <translation>Seitenbereich</translation>
    </message>
    <message>
        <source>Pages sent</source>
        <translation>Gesendete Seiten</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Abbrechen</translation>
    </message>
    <message>
        <source>Ends printing after the page that is being sent (Escape)</source>
        <translation>Beendet den Druck nach der Seite, die gerade gesendet wird (Esc)</translation>
    </message>
    <message>
        <source>%1 of %2 pages sent</source>
        <translation>%1 von %2 Seiten gesendet</translation>
    </message>
</context>
<context>
    <name>pelloric::qt::ProgressArea</name>
    <message>
        <source>Progress area</source>
        <translation>Fortschrittsbereich</translation>
    </message>
    <message>
        <source>Progress</source>
        <translation>Fortschritt</translation>
    </message>
</context>
<context>
    <name>pelloric::qt::ReaderTools</name>
    <message>
        <source>Save as PDF</source>
        <translation>Als PDF speichern</translation>
    </message>
    <message>
        <source>Page Width</source>
        <translation>Seitenbreite</translation>
    </message>
    <message>
        <source>Page in View</source>
        <translation>Ganze Seite</translation>
    </message>
    <message>
        <source>Fill the Window</source>
        <translation>Fenster füllen</translation>
    </message>
    <message>
        <source>One Page</source>
        <translation>Eine Seite</translation>
    </message>
    <message>
        <source>Two Pages</source>
        <translation>Zwei Seiten</translation>
    </message>
    <message>
        <source>Four Pages</source>
        <translation>Vier Seiten</translation>
    </message>
    <message>
        <source>More Pages</source>
        <translation>Mehr Seiten</translation>
    </message>
    <message>
        <source>Find…</source>
        <translation>Suchen …</translation>
    </message>
    <message>
        <source>Next Place</source>
        <translation>Nächste Stelle</translation>
    </message>
    <message>
        <source>Previous Place</source>
        <translation>Vorherige Stelle</translation>
    </message>
    <message>
        <source>Select Page</source>
        <translation>Seite auswählen</translation>
    </message>
    <message>
        <source>Copy</source>
        <translation>Kopieren</translation>
    </message>
    <message>
        <source>Pictures of the Pages</source>
        <translation>Bilder der Seiten</translation>
    </message>
    <message>
        <source>Report Options</source>
        <translation>Berichtsoptionen</translation>
    </message>
    <message>
        <source>Keys</source>
        <translation>Tasten</translation>
    </message>
</context>
<context>
    <name>pelloric::qt::ReplaceBox</name>
    <message>
        <source>Replace Files</source>
        <translation>Dateien ersetzen</translation>
    </message>
    <message>
        <source>%1 already exists.</source>
        <translation>%1 gibt es schon.</translation>
    </message>
    <message>
        <source>%1 files already exist, such as %2.</source>
        <translation>%1 Dateien gibt es schon, zum Beispiel %2.</translation>
    </message>
    <message>
        <source>Every page becomes a file of its own. Do you want to replace what is there?</source>
        <translation>Jede Seite wird eine eigene Datei. Soll ersetzt werden, was schon da ist?</translation>
    </message>
    <message>
        <source>&amp;Replace</source>
        <translation>E&amp;rsetzen</translation>
    </message>
</context>
<context>
    <name>pelloric::qt::ReportTools</name>
    <message>
        <source>The file holds the pages without watermark, logo and icons; save them as PDF to keep those.</source>
        <translation>Die Datei enthält die Seiten ohne Wasserzeichen, Logo und Symbole; als PDF gespeichert bleiben sie erhalten.</translation>
    </message>
</context>
<context>
    <name>pelloric::qt::Sorvane</name>
    <message>
        <source>Page preview</source>
        <translation>Seitenvorschau</translation>
    </message>
</context>
<context>
    <name>pelloric::qt::StartIcon</name>
    <message>
        <source>No document</source>
        <translation>Kein Dokument</translation>
    </message>
    <message>
        <source>Nothing to preview yet</source>
        <translation>Noch nichts anzuzeigen</translation>
    </message>
</context>
</TS>
