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
    <name>Phrase</name>
    <message>
        <source>no report was built yet</source>
        <translation>es wurde noch kein Bericht aufgebaut</translation>
    </message>
    <message>
        <source>nobody opens the preview window</source>
        <translation>niemand öffnet das Vorschaufenster</translation>
    </message>
    <message>
        <source>doPreview was given no grid</source>
        <translation>doPreview hat kein Gitter bekommen</translation>
    </message>
    <message>
        <source>%1 was given where a plain value is wanted</source>
        <translation>%1 wurde übergeben, verlangt ist ein einfacher Wert</translation>
    </message>
    <message>
        <source>%1 was given where a number is wanted</source>
        <translation>%1 wurde übergeben, verlangt ist eine Zahl</translation>
    </message>
    <message>
        <source>no grid was given</source>
        <translation>es wurde kein Gitter übergeben</translation>
    </message>
    <message>
        <source>%1 was given where a grid is wanted</source>
        <translation>%1 wurde übergeben, verlangt ist ein Gitter</translation>
    </message>
    <message>
        <source>page</source>
        <translation>Seite</translation>
    </message>
    <message>
        <source>a document holds at most %1 pages</source>
        <translation>ein Dokument fasst höchstens %1 Seiten</translation>
    </message>
    <message>
        <source>on page %1 line</source>
        <translation>auf Seite %1 Linie</translation>
    </message>
    <message>
        <source>on page %1 text</source>
        <translation>auf Seite %1 Text</translation>
    </message>
    <message>
        <source>a font of %1 points is too large to be measured; choose a smaller size</source>
        <translation>eine Schrift von %1 Punkt ist zu groß, um gemessen zu werden; wählen Sie eine kleinere</translation>
    </message>
    <message>
        <source>a text of more than 4294967295 characters cannot be recorded</source>
        <translation>ein Text von mehr als 4294967295 Zeichen kann nicht aufgenommen werden</translation>
    </message>
    <message>
        <source>paper of %1 by %2 twips cannot be written; each side is 1 to %3 twips (200 inches)</source>
        <translation>Papier von %1 mal %2 Twips kann nicht geschrieben werden; jede Seite ist 1 bis %3 Twips lang (200 Zoll)</translation>
    </message>
    <message>
        <source>the document has no page to write</source>
        <translation>das Dokument hat keine Seite, die geschrieben werden könnte</translation>
    </message>
    <message>
        <source>there is no memory for an image of %1 by %2 pixels; choose a lower resolution</source>
        <translation>für ein Bild von %1 mal %2 Pixeln reicht der Speicher nicht; wählen Sie eine niedrigere Auflösung</translation>
    </message>
    <message>
        <source>an image of %1 by %2 pixels (%3 per inch) cannot be made; it has 1 to %4, so choose another resolution</source>
        <translation>ein Bild von %1 mal %2 Pixeln (%3 je Zoll) kann nicht gemacht werden; es hat 1 bis %4, wählen Sie also eine andere Auflösung</translation>
    </message>
    <message>
        <source>the font %1 is damaged</source>
        <translation>die Schrift %1 ist beschädigt</translation>
    </message>
    <message>
        <source>the font %1 may not be embedded</source>
        <translation>die Schrift %1 darf nicht eingebettet werden</translation>
    </message>
    <message>
        <source>the font %1 is a variable or coloured font</source>
        <translation>die Schrift %1 ist eine variable oder farbige Schrift</translation>
    </message>
    <message>
        <source>the font %1 has no outlines of a kind that can be embedded</source>
        <translation>die Schrift %1 hat keine Umrisse, die eingebettet werden können</translation>
    </message>
    <message>
        <source>the grid is gone</source>
        <translation>das Gitter gibt es nicht mehr</translation>
    </message>
    <message>
        <source>%1 is past what the member holds</source>
        <translation>%1 ist mehr, als das Element fasst</translation>
    </message>
    <message>
        <source>an object is no plain value</source>
        <translation>ein Objekt ist kein einfacher Wert</translation>
    </message>
    <message>
        <source>&quot;%1&quot; is no %2</source>
        <translation>„%1“ ist kein %2</translation>
    </message>
    <message>
        <source>column</source>
        <translation>Spalte</translation>
    </message>
    <message>
        <source>the grid&apos;s model is gone</source>
        <translation>das Modell des Gitters gibt es nicht mehr</translation>
    </message>
    <message>
        <source>row</source>
        <translation>Zeile</translation>
    </message>
    <message>
        <source>the grid has lost rows</source>
        <translation>das Gitter hat Zeilen verloren</translation>
    </message>
    <message>
        <source>member number</source>
        <translation>Element Nummer</translation>
    </message>
    <message>
        <source>the object is gone</source>
        <translation>das Objekt gibt es nicht mehr</translation>
    </message>
    <message>
        <source>the list has changed</source>
        <translation>die Liste hat sich geändert</translation>
    </message>
    <message>
        <source>a row of %1 cells; there are %2 columns</source>
        <translation>eine Zeile von %1 Zellen; es gibt %2 Spalten</translation>
    </message>
    <message>
        <source>row %1 holds more than 4294967295 characters</source>
        <translation>Zeile %1 enthält mehr als 4294967295 Zeichen</translation>
    </message>
    <message>
        <source>there is no printer</source>
        <translation>es gibt keinen Drucker</translation>
    </message>
    <message>
        <source>there is no printer %1</source>
        <translation>es gibt keinen Drucker %1</translation>
    </message>
    <message>
        <source>the printer %1 takes no jobs</source>
        <translation>der Drucker %1 nimmt keine Aufträge an</translation>
    </message>
    <message>
        <source>no column of the grid is wide enough to be printed</source>
        <translation>keine Spalte des Gitters ist breit genug, um gedruckt zu werden</translation>
    </message>
    <message>
        <source>%1 is no document file</source>
        <translation>%1 ist keine Dokumentdatei</translation>
    </message>
    <message>
        <source>%1 holds more than %2 bytes</source>
        <translation>%1 enthält mehr als %2 Byte</translation>
    </message>
    <message>
        <source>an index is missing</source>
        <translation>ein Index fehlt</translation>
    </message>
    <message>
        <source>index %1</source>
        <translation>Index %1</translation>
    </message>
    <message>
        <source>%1 is past what a single-precision number holds</source>
        <translation>%1 ist mehr, als eine Zahl einfacher Genauigkeit fasst</translation>
    </message>
    <message>
        <source>&quot;%1&quot; is no whole number between -32768 and 32767</source>
        <translation>„%1“ ist keine ganze Zahl zwischen -32768 und 32767</translation>
    </message>
    <message>
        <source>this Qt has no converter for GB18030</source>
        <translation>dieses Qt kann GB18030 nicht umwandeln</translation>
    </message>
    <message>
        <source>row %1, column %2 holds %3 characters, at most %4 can be printed</source>
        <translation>Zeile %1, Spalte %2 enthält %3 Zeichen, höchstens %4 können gedruckt werden</translation>
    </message>
    <message>
        <source>Invalid procedure call or argument</source>
        <translation>Ungültiger Aufruf oder ungültiges Argument</translation>
    </message>
    <message>
        <source>Overflow</source>
        <translation>Überlauf</translation>
    </message>
    <message>
        <source>Subscript out of range</source>
        <translation>Index außerhalb des Bereichs</translation>
    </message>
    <message>
        <source>Division by zero</source>
        <translation>Division durch null</translation>
    </message>
    <message>
        <source>Type mismatch</source>
        <translation>Typen unverträglich</translation>
    </message>
    <message>
        <source>File not found</source>
        <translation>Datei nicht gefunden</translation>
    </message>
    <message>
        <source>The file cannot be written</source>
        <translation>Die Datei kann nicht geschrieben werden</translation>
    </message>
    <message>
        <source>Disk full</source>
        <translation>Datenträger voll</translation>
    </message>
    <message>
        <source>Permission denied</source>
        <translation>Zugriff verweigert</translation>
    </message>
    <message>
        <source>Object variable not set</source>
        <translation>Objektvariable nicht gesetzt</translation>
    </message>
    <message>
        <source>Object doesn&apos;t support this property or method</source>
        <translation>Objekt unterstützt diese Eigenschaft oder Methode nicht</translation>
    </message>
    <message>
        <source>Cancel was selected</source>
        <translation>Abbrechen wurde gewählt</translation>
    </message>
    <message>
        <source>Error</source>
        <translation>Fehler</translation>
    </message>
    <message>
        <source>%1 %2; there is %3</source>
        <translation>%1 %2; es gibt %3</translation>
    </message>
    <message>
        <source>%1 %2; there are %3</source>
        <translation>%1 %2; es gibt %3</translation>
    </message>
    <message>
        <source>%1 is not between %2 and %3</source>
        <translation>%1 liegt nicht zwischen %2 und %3</translation>
    </message>
    <message>
        <source>an object is no number</source>
        <translation>ein Objekt ist keine Zahl</translation>
    </message>
    <message>
        <source>an object was expected</source>
        <translation>ein Objekt wurde erwartet</translation>
    </message>
    <message>
        <source>a row set was expected</source>
        <translation>eine Zeilenmenge wurde erwartet</translation>
    </message>
    <message>
        <source>an object has no text</source>
        <translation>ein Objekt hat keinen Text</translation>
    </message>
    <message>
        <source>the page list names too many pages; write fewer ranges</source>
        <translation>die Seitenliste nennt zu viele Seiten; schreiben Sie weniger Bereiche</translation>
    </message>
    <message>
        <source>The pages are %1, the printer&apos;s sheet is %2 (%3): what does not fit on it is lost.</source>
        <translation>Die Seiten sind %1 groß, das Blatt des Druckers ist %2 (%3): Was nicht darauf passt, geht verloren.</translation>
    </message>
    <message>
        <source>The pages are %1, the printer&apos;s sheet is %2 (%3).</source>
        <translation>Die Seiten sind %1 groß, das Blatt des Druckers ist %2 (%3).</translation>
    </message>
    <message>
        <source>after %1 of %2 pages</source>
        <translation>nach %1 von %2 Seiten</translation>
    </message>
    <message>
        <source>the print system does not answer (nothing came within %1 seconds)</source>
        <translation>das Drucksystem antwortet nicht (%1 Sekunden lang kam nichts)</translation>
    </message>
    <message>
        <source>no room for the document in %1</source>
        <translation>kein Platz für das Dokument in %1</translation>
    </message>
    <message>
        <source>the document could not be ended</source>
        <translation>das Dokument konnte nicht beendet werden</translation>
    </message>
    <message>
        <source>the document could not be begun</source>
        <translation>das Dokument konnte nicht begonnen werden</translation>
    </message>
    <message>
        <source>the printer rejects jobs</source>
        <translation>der Drucker weist Aufträge ab</translation>
    </message>
    <message>
        <source>the printer is stopped</source>
        <translation>der Drucker ist angehalten</translation>
    </message>
    <message>
        <source>the print system does not answer (%1)</source>
        <translation>das Drucksystem antwortet nicht (%1)</translation>
    </message>
    <message>
        <source>the print system did not take the document (%1)</source>
        <translation>das Drucksystem hat das Dokument nicht angenommen (%1)</translation>
    </message>
    <message>
        <source>there is no such printer</source>
        <translation>diesen Drucker gibt es nicht</translation>
    </message>
    <message>
        <source>field</source>
        <translation>Feld</translation>
    </message>
    <message>
        <source>the grid prints no column &quot;%1&quot;; there are: %2</source>
        <translation>das Gitter druckt keine Spalte „%1“; es gibt: %2</translation>
    </message>
    <message>
        <source>this grid does not tell which of its rows are marked</source>
        <translation>dieses Gitter sagt nicht, welche seiner Zeilen markiert sind</translation>
    </message>
    <message>
        <source>no row of the grid is marked; mark rows, or print all</source>
        <translation>keine Zeile des Gitters ist markiert; markieren Sie Zeilen, oder drucken Sie alle</translation>
    </message>
    <message>
        <source>more than %1 columns are printed; leave some out</source>
        <translation>mehr als %1 Spalten werden gedruckt; lassen Sie welche weg</translation>
    </message>
    <message>
        <source>the grid has %1 columns, at most %2 can be read</source>
        <translation>das Gitter hat %1 Spalten, höchstens %2 können gelesen werden</translation>
    </message>
    <message>
        <source>the grid prints %1 columns now, the report was built with %2; preview it anew</source>
        <translation>das Gitter druckt jetzt %1 Spalten, der Bericht hat %2; öffnen Sie die Vorschau neu</translation>
    </message>
    <message>
        <source>the data grid has more columns than fields</source>
        <translation>das Datengitter hat mehr Spalten als Felder</translation>
    </message>
    <message>
        <source>m_PrintObj names no kind of grid</source>
        <translation>m_PrintObj nennt keine Art von Gitter</translation>
    </message>
    <message>
        <source>the data source never comes to its first record</source>
        <translation>die Datenquelle kommt nie zu ihrem ersten Datensatz</translation>
    </message>
    <message>
        <source>the colour %1 of the font %2 is not between 0 and %3</source>
        <translation>die Farbe %1 der Schrift %2 liegt nicht zwischen 0 und %3</translation>
    </message>
    <message>
        <source>the report needs about %1 pages, a document holds %2; print rows 1 to %3, or leave out columns</source>
        <translation>der Bericht braucht etwa %1 Seiten, ein Dokument fasst %2; drucken Sie die Zeilen 1 bis %3, oder lassen Sie Spalten weg</translation>
    </message>
    <message>
        <source>not even the first rows fit on the %1 pages that a document holds; choose larger paper, or leave out columns</source>
        <translation>nicht einmal die ersten Zeilen passen auf die %1 Seiten, die ein Dokument fasst; wählen Sie größeres Papier, oder lassen Sie Spalten weg</translation>
    </message>
    <message>
        <source>1 is portrait and 2 is landscape</source>
        <translation>1 ist Hochformat und 2 ist Querformat</translation>
    </message>
    <message>
        <source>the number of a paper is a whole number, such as 9</source>
        <translation>die Nummer eines Papiers ist eine ganze Zahl, etwa 9</translation>
    </message>
    <message>
        <source>this margin is at most %1 mm</source>
        <translation>dieser Rand ist höchstens %1 mm</translation>
    </message>
    <message>
        <source>a sheet is wider than 0 and no wider than %1 mm</source>
        <translation>ein Blatt ist breiter als 0 und höchstens %1 mm breit</translation>
    </message>
    <message>
        <source>a sheet is higher than 0 and no higher than %1 mm</source>
        <translation>ein Blatt ist höher als 0 und höchstens %1 mm hoch</translation>
    </message>
    <message>
        <source>a colour is a number from 0 to %1</source>
        <translation>eine Farbe ist eine Zahl von 0 bis %1</translation>
    </message>
    <message>
        <source>a font size is a number of points above 0, at most %1</source>
        <translation>eine Schriftgröße ist eine Zahl von Punkten über 0, höchstens %1</translation>
    </message>
    <message>
        <source>%1 in %2</source>
        <translation>%1 in %2</translation>
    </message>
    <message>
        <source>%1 and %2 more settings</source>
        <translation>%1 und %2 weitere Einstellungen</translation>
    </message>
    <message>
        <source>%1 and %2</source>
        <translation>%1 und %2</translation>
    </message>
    <message>
        <source>%1 is missing</source>
        <translation>%1 fehlt</translation>
    </message>
    <message>
        <source>%1 are missing</source>
        <translation>%1 fehlen</translation>
    </message>
    <message>
        <source>the margins leave no room on the sheet; they are printed larger than stored, 1.6 times at the top, 1.8 times at the bottom and 1.2 times at the sides.</source>
        <translation>die Ränder lassen auf dem Blatt keinen Platz; sie werden größer gedruckt als gespeichert, oben das 1,6fache, unten das 1,8fache und an den Seiten das 1,2fache.</translation>
    </message>
    <message>
        <source>%1 begins with a byte-order mark, which belongs to another encoding; settings are written in GB18030.</source>
        <translation>%1 beginnt mit einem Byte-Order-Mark, das zu einer anderen Kodierung gehört; Einstellungen sind in GB18030 geschrieben.</translation>
    </message>
    <message>
        <source>%1; restore the defaults</source>
        <translation>%1; stellen Sie die Standardwerte wieder her</translation>
    </message>
    <message>
        <source>%1; correct it in %2 or restore the defaults</source>
        <translation>%1; berichtigen Sie dies in „%2“, oder stellen Sie die Standardwerte wieder her</translation>
    </message>
    <message>
        <source>%1, which holds paper, margins and style; restore the defaults</source>
        <translation>%1 mit Papier, Rändern und Stil; stellen Sie die Standardwerte wieder her</translation>
    </message>
    <message>
        <source>a cell holds an object</source>
        <translation>eine Zelle enthält ein Objekt</translation>
    </message>
    <message>
        <source>fields %1 to</source>
        <translation>Felder %1 bis</translation>
    </message>
    <message>
        <source>a Sorvane was expected</source>
        <translation>ein Sorvane wurde erwartet</translation>
    </message>
    <message>
        <source>an object of the library cannot be handed to a script&apos;s grid</source>
        <translation>ein Objekt der Bibliothek kann nicht an das Gitter eines Skripts gegeben werden</translation>
    </message>
    <message>
        <source>Item needs an index</source>
        <translation>Item braucht einen Index</translation>
    </message>
    <message>
        <source>a symbol is no value</source>
        <translation>ein Symbol ist kein Wert</translation>
    </message>
    <message>
        <source>only an array takes an index</source>
        <translation>nur ein Array nimmt einen Index</translation>
    </message>
    <message>
        <source>item</source>
        <translation>Eintrag</translation>
    </message>
    <message>
        <source>this is a picture, not a table</source>
        <translation>das ist ein Bild, keine Tabelle</translation>
    </message>
    <message>
        <source>this is a packed file; unpack it first, for example with: gunzip -c FILE</source>
        <translation>das ist eine gepackte Datei; entpacken Sie sie zuerst, zum Beispiel mit: gunzip -c DATEI</translation>
    </message>
    <message>
        <source>this is an HTML or XML document, not a table; save its table as CSV</source>
        <translation>das ist ein HTML- oder XML-Dokument, keine Tabelle; speichern Sie seine Tabelle als CSV</translation>
    </message>
    <message>
        <source>this is a PDF file; take the file that it was made from, or save its table as CSV</source>
        <translation>das ist eine PDF-Datei; nehmen Sie die Datei, aus der sie gemacht wurde, oder speichern Sie ihre Tabelle als CSV</translation>
    </message>
    <message>
        <source>this is a ZIP archive; unpack it first</source>
        <translation>das ist ein ZIP-Archiv; entpacken Sie es zuerst</translation>
    </message>
    <message>
        <source>this is a program, not a table</source>
        <translation>das ist ein Programm, keine Tabelle</translation>
    </message>
    <message>
        <source>this is a Parquet file; save its table as CSV</source>
        <translation>das ist eine Parquet-Datei; speichern Sie ihre Tabelle als CSV</translation>
    </message>
    <message>
        <source>this is a text document, not a table; save its table as CSV</source>
        <translation>das ist ein Textdokument, keine Tabelle; speichern Sie seine Tabelle als CSV</translation>
    </message>
    <message>
        <source>more than %1 values in a row</source>
        <translation>mehr als %1 Werte in einer Zeile</translation>
    </message>
    <message>
        <source>the file is empty</source>
        <translation>die Datei ist leer</translation>
    </message>
    <message>
        <source>%1 and others</source>
        <translation>%1 und andere</translation>
    </message>
    <message>
        <source>the row at line %1 may be several rows glued together: a quoted value goes on over a line break, and the row has not as many values as the titles</source>
        <translation>die Zeile bei Dateizeile %1 besteht vielleicht aus mehreren aneinandergeklebten: Ein Wert in Anführungszeichen geht über einen Zeilenumbruch, und die Zeile hat nicht so viele Werte wie die Titelzeile</translation>
    </message>
    <message>
        <source>the rows at lines %1 may be several rows glued together: a quoted value goes on over a line break, and the row has not as many values as the titles</source>
        <translation>die Zeilen bei den Dateizeilen %1 bestehen vielleicht aus mehreren aneinandergeklebten: Ein Wert in Anführungszeichen geht über einen Zeilenumbruch, und die Zeile hat nicht so viele Werte wie die Titelzeile</translation>
    </message>
    <message>
        <source>a tab</source>
        <translation>einem Tabulator</translation>
    </message>
    <message>
        <source>%1 of %2 rows have not as many values as the titles, the first at line %3; is this a table with %4 between its values?</source>
        <translation>%1 von %2 Zeilen haben nicht so viele Werte wie die Titelzeile, die erste bei Dateizeile %3; ist das eine Tabelle mit %4 zwischen den Werten?</translation>
    </message>
    <message>
        <source>the encoding was guessed to be %1; name another one if letters look wrong</source>
        <translation>die Kodierung wurde als %1 erraten; nennen Sie eine andere, wenn Buchstaben falsch aussehen</translation>
    </message>
    <message>
        <source>a table is an array of objects, [{&quot;name&quot;: value, …}, …], or one object a line</source>
        <translation>eine Tabelle ist ein Array von Objekten, [{&quot;Name&quot;: Wert, …}, …], oder ein Objekt je Zeile</translation>
    </message>
    <message>
        <source>more than %1 different names</source>
        <translation>mehr als %1 verschiedene Namen</translation>
    </message>
    <message>
        <source>this is no JSON: %1</source>
        <translation>das ist kein JSON: %1</translation>
    </message>
    <message>
        <source>this office file has to be converted by LibreOffice, which is not installed; install libreoffice-calc, or save the file as .xlsx, .ods or CSV</source>
        <translation>diese Office-Datei muss von LibreOffice umgewandelt werden, das nicht installiert ist; installieren Sie libreoffice-calc, oder speichern Sie die Datei als .xlsx, .ods oder CSV</translation>
    </message>
    <message>
        <source>LibreOffice could not convert this file; save it as .xlsx, .ods or CSV</source>
        <translation>LibreOffice konnte diese Datei nicht umwandeln; speichern Sie sie als .xlsx, .ods oder CSV</translation>
    </message>
    <message>
        <source>a cell past the end of its sheet</source>
        <translation>eine Zelle hinter dem Ende ihres Blatts</translation>
    </message>
    <message>
        <source>the sheet is empty</source>
        <translation>das Blatt ist leer</translation>
    </message>
    <message>
        <source>no sheet %1; the file has: %2</source>
        <translation>kein Blatt %1; die Datei hat: %2</translation>
    </message>
    <message>
        <source>the office file is damaged; open it in its program and save it again, or save it as CSV</source>
        <translation>die Office-Datei ist beschädigt; öffnen Sie sie in ihrem Programm und speichern Sie sie neu, oder speichern Sie sie als CSV</translation>
    </message>
    <message>
        <source>give one statement only</source>
        <translation>geben Sie nur eine Anweisung an</translation>
    </message>
    <message>
        <source>the database cannot be copied to read its log: %1</source>
        <translation>die Datenbank kann nicht kopiert werden, um ihr Protokoll zu lesen: %1</translation>
    </message>
    <message>
        <source>this is no SQLite database</source>
        <translation>das ist keine SQLite-Datenbank</translation>
    </message>
    <message>
        <source>the database has no table</source>
        <translation>die Datenbank hat keine Tabelle</translation>
    </message>
    <message>
        <source>name one of the database&apos;s tables: %1</source>
        <translation>nennen Sie eine der Tabellen der Datenbank: %1</translation>
    </message>
    <message>
        <source>no table %1; the database has: %2</source>
        <translation>keine Tabelle %1; die Datenbank hat: %2</translation>
    </message>
    <message>
        <source>the statement is no query; give a SELECT</source>
        <translation>die Anweisung ist keine Abfrage; geben Sie ein SELECT an</translation>
    </message>
    <message>
        <source>the statement answers no rows; give a SELECT</source>
        <translation>die Anweisung liefert keine Zeilen; geben Sie ein SELECT an</translation>
    </message>
    <message>
        <source>bytes that are neither UTF-8 nor GB18030 text; name the encoding</source>
        <translation>Bytes, die weder UTF-8 noch GB18030 sind; nennen Sie die Kodierung</translation>
    </message>
    <message>
        <source>line %1: %2</source>
        <translation>Zeile %1: %2</translation>
    </message>
    <message>
        <source>unknown encoding %1; known are UTF-8, GB18030, GBK, Big5, UTF-16 and ISO-8859-1, among others</source>
        <translation>unbekannte Kodierung %1; bekannt sind unter anderem UTF-8, GB18030, GBK, Big5, UTF-16 und ISO-8859-1</translation>
    </message>
    <message>
        <source>bytes that are no %1</source>
        <translation>Bytes, die kein %1 sind</translation>
    </message>
    <message>
        <source>bytes that are no %1, which the file&apos;s mark says it is</source>
        <translation>Bytes, die kein %1 sind, wie es die Marke der Datei sagt</translation>
    </message>
    <message>
        <source>the office file holds more than 2 GB</source>
        <translation>die Office-Datei enthält mehr als 2 GB</translation>
    </message>
    <message>
        <source>%1 OK will save nothing.</source>
        <translation>%1 OK wird nichts speichern.</translation>
    </message>
    <message>
        <source>%1 is empty: OK keeps the stored one.</source>
        <translation>%1 ist leer: OK behält den gespeicherten Wert.</translation>
    </message>
    <message>
        <source>%1 &quot;%2&quot; lacks its unit, as in &quot;210mm&quot;: OK will save nothing of all three tabs.</source>
        <translation>%1 „%2“ fehlt die Einheit, wie in „210mm“: OK wird von allen drei Reitern nichts speichern.</translation>
    </message>
    <message>
        <source>%1 must be above 0: OK will store it, and no page can be laid out.</source>
        <translation>%1 muss über 0 liegen: OK wird den Wert speichern, und keine Seite kann aufgebaut werden.</translation>
    </message>
    <message>
        <source>%1 is at most %2: OK will store it, and no page can be built until it is smaller.</source>
        <translation>%1 ist höchstens %2: OK wird den Wert speichern, und keine Seite kann aufgebaut werden, bis er kleiner ist.</translation>
    </message>
    <message>
        <source>%1 %2 is printed as %3</source>
        <translation>%1 %2 wird als %3 gedruckt</translation>
    </message>
    <message>
        <source>%1; a margin is at most %2 here. OK will store it, and no page can be built until it is smaller.</source>
        <translation>%1; ein Rand ist hier höchstens %2. OK wird den Wert speichern, und keine Seite kann aufgebaut werden, bis er kleiner ist.</translation>
    </message>
    <message>
        <source>%1 0 mm is printed as 20 mm.</source>
        <translation>%1 0 mm wird als 20 mm gedruckt.</translation>
    </message>
    <message>
        <source>%1 lies outside the sheet. OK will store it all the same.</source>
        <translation>%1 liegt außerhalb des Blatts. OK wird den Wert trotzdem speichern.</translation>
    </message>
    <message>
        <source>%1, and the sheet is %2 high</source>
        <translation>%1, und das Blatt ist %2 hoch</translation>
    </message>
    <message>
        <source>%1, and the sheet is %2 wide</source>
        <translation>%1, und das Blatt ist %2 breit</translation>
    </message>
    <message>
        <source>%1: it lies outside. OK will store it all the same.</source>
        <translation>%1: Der Rand liegt außerhalb. OK wird den Wert trotzdem speichern.</translation>
    </message>
    <message>
        <source>%1: there is no room left for a row. OK will store it all the same.</source>
        <translation>%1: Für eine Zeile bleibt kein Platz. OK wird den Wert trotzdem speichern.</translation>
    </message>
    <message>
        <source>%1: there is no room left for a column. OK will store it all the same.</source>
        <translation>%1: Für eine Spalte bleibt kein Platz. OK wird den Wert trotzdem speichern.</translation>
    </message>
    <message>
        <source>no grid is previewed</source>
        <translation>kein Gitter ist in der Vorschau</translation>
    </message>
    <message>
        <source>There are %1 more like this.</source>
        <translation>Es gibt %1 weitere dieser Art.</translation>
    </message>
    <message>
        <source>The pages could not be built.</source>
        <translation>Die Seiten konnten nicht aufgebaut werden.</translation>
    </message>
    <message>
        <source>%1: the name must end in .pdf, .png or .svg</source>
        <translation>%1: der Name muss auf .pdf, .png oder .svg enden</translation>
    </message>
    <message>
        <source>%1 character has no glyph in any installed font and shows as a hollow box (%2)</source>
        <translation>%1 Zeichen hat in keiner installierten Schrift ein Bild und erscheint als leeres Kästchen (%2)</translation>
    </message>
    <message>
        <source>%1 characters have no glyph in any installed font and show as hollow boxes (%2)</source>
        <translation>%1 Zeichen haben in keiner installierten Schrift ein Bild und erscheinen als leere Kästchen (%2)</translation>
    </message>
    <message>
        <source>%1; install %2</source>
        <translation>%1; installieren Sie %2</translation>
    </message>
    <message>
        <source>the paper has no width</source>
        <translation>das Papier hat keine Breite</translation>
    </message>
    <message>
        <source>the paper has no width or no height</source>
        <translation>das Papier hat keine Breite oder keine Höhe</translation>
    </message>
    <message>
        <source>the window has no room for a page</source>
        <translation>das Fenster hat keinen Platz für eine Seite</translation>
    </message>
    <message>
        <source>the pages cannot be shown any smaller</source>
        <translation>die Seiten können nicht noch kleiner gezeigt werden</translation>
    </message>
    <message>
        <source>a scale of 0 shows nothing</source>
        <translation>ein Maßstab von 0 zeigt nichts</translation>
    </message>
    <message>
        <source>a scale of %1 is too small</source>
        <translation>ein Maßstab von %1 ist zu klein</translation>
    </message>
    <message>
        <source>this is an Arrow file; save its table as CSV</source>
        <translation>das ist eine Arrow-Datei; speichern Sie ihre Tabelle als CSV</translation>
    </message>
    <message>
        <source>%1 is no picture</source>
        <translation>%1 ist kein Bild</translation>
    </message>
    <message>
        <source>%1; what stands before it is shown</source>
        <translation>%1; was davor steht, wird gezeigt</translation>
    </message>
    <message>
        <source>%1 is damaged: %2</source>
        <translation>%1 ist beschädigt: %2</translation>
    </message>
    <message>
        <source>row %1 of a table of %2 columns makes more than %3 cells; take fewer rows or columns</source>
        <translation>Zeile %1 einer Tabelle mit %2 Spalten ergibt mehr als %3 Zellen; nehmen Sie weniger Zeilen oder Spalten</translation>
    </message>
    <message>
        <source>a zero byte; this is no text file, unless in UTF-16: then name UTF-16LE or UTF-16BE as its encoding</source>
        <translation>ein Nullbyte; dies ist keine Textdatei, es sei denn in UTF-16: nennen Sie dann UTF-16LE oder UTF-16BE als Kodierung</translation>
    </message>
    <message>
        <source>the number %1 is too large; write it in quotation marks</source>
        <translation>die Zahl %1 ist zu groß; schreiben Sie sie in Anführungszeichen</translation>
    </message>
    <message>
        <source>the sheet holds more than %1 cells; save the part that is wanted as CSV</source>
        <translation>das Blatt enthält mehr als %1 Zellen; speichern Sie den gewünschten Teil als CSV</translation>
    </message>
    <message>
        <source>the sheet holds more than %1 characters; save the part that is wanted as CSV</source>
        <translation>das Blatt enthält mehr als %1 Zeichen; speichern Sie den gewünschten Teil als CSV</translation>
    </message>
    <message>
        <source>%1 goes on after 4 GB; save it to a file and name that</source>
        <translation>%1 geht nach 4 GB noch weiter; speichern Sie es in eine Datei und nennen Sie diese</translation>
    </message>
    <message>
        <source>a line holds more than %1 bytes</source>
        <translation>eine Zeile hat mehr als %1 Bytes</translation>
    </message>
    <message>
        <source>it goes on after %1 bytes, which is the most that is read of what is no ordinary file</source>
        <translation>nach %1 Bytes geht es weiter; mehr wird nicht gelesen, wo es keine gewöhnliche Datei ist</translation>
    </message>
    <message>
        <source>pictures cannot be kept in %1: %2</source>
        <translation>in %1 können keine Bilder abgelegt werden: %2</translation>
    </message>
    <message>
        <source>the grid has %1 rows; the %2 pages that a document holds take %3 of them at most, so print fewer rows</source>
        <translation>das Gitter hat %1 Zeilen; auf die %2 Seiten, die ein Dokument hat, passen höchstens %3, also weniger Zeilen drucken</translation>
    </message>
    <message>
        <source>no object of the file has a name, so there is no column; %1</source>
        <translation>kein Objekt der Datei hat einen Namen, also gibt es keine Spalte; %1</translation>
    </message>
    <message>
        <source>the statement leaves a value open (?, :name or $name); write the value</source>
        <translation>die Anweisung lässt einen Wert offen (?, :name oder $name); den Wert selbst schreiben</translation>
    </message>
    <message>
        <source>all that the sheet holds is hidden</source>
        <translation>alles, was das Blatt enthält, ist verborgen</translation>
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
        <source>Total</source>
        <translation>Gesamt</translation>
    </message>
    <message>
        <source>the file cannot be copied into %1 to be converted: %2</source>
        <translation>die Datei kann zum Umwandeln nicht nach %1 kopiert werden: %2</translation>
    </message>
    <message>
        <source>value %1 of the row holds more than %2 bytes; leave it out, or shorten it</source>
        <translation>Wert %1 der Zeile hat mehr als %2 Bytes; weglassen oder kürzen</translation>
    </message>
    <message>
        <source>a value holds more than %1 bytes; leave it out, or shorten it</source>
        <translation>ein Wert hat mehr als %1 Bytes; weglassen oder kürzen</translation>
    </message>
    <message>
        <source>the value behind byte %1 holds more than %2 bytes; leave it out, or shorten it</source>
        <translation>der Wert hinter Byte %1 hat mehr als %2 Bytes; weglassen oder kürzen</translation>
    </message>
    <message>
        <source>take the array out of it, for example with: jq %1</source>
        <translation>nehmen Sie das Array heraus, zum Beispiel mit: jq %1</translation>
    </message>
    <message>
        <source>take one of its arrays out of it, for example with jq and one of: %1</source>
        <translation>nehmen Sie eines der Arrays heraus, zum Beispiel mit jq und einem von: %1</translation>
    </message>
    <message>
        <source>make rows of its objects, for example with: jq &apos;[.[]]&apos;</source>
        <translation>machen Sie Zeilen aus seinen Objekten, zum Beispiel mit: jq &apos;[.[]]&apos;</translation>
    </message>
    <message>
        <source>it holds no array of objects, but %1</source>
        <translation>es enthält kein Array von Objekten, sondern %1</translation>
    </message>
    <message>
        <source>the file is one object; %1; %2</source>
        <translation>die Datei ist ein einziges Objekt; %1; %2</translation>
    </message>
    <message>
        <source>%1 is a link that leads to no file</source>
        <translation>%1 ist ein Verweis, der zu keiner Datei führt</translation>
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
    <message>
        <source>Too wide to be shrunk: its columns are narrowed.</source>
        <translation>Zum Verkleinern zu breit: Spalten schmaler gemacht.</translation>
    </message>
    <message>
        <source>Pages across: %1.</source>
        <translation>Seiten nebeneinander: %1.</translation>
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
    <message>
        <source>The font %1 is not installed; %2 is taken instead.</source>
        <translation>Die Schrift %1 ist nicht installiert; stattdessen wird %2 genommen.</translation>
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
    <message>
        <source>Cells of %1 that show no number and that its total leaves out: %2.</source>
        <translation>Zellen von %1, die keine Zahl zeigen und in der Summe fehlen: %2.</translation>
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
