<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="en" sourcelanguage="en">
<context>
    <name>KeysWindow</name>
    <message>
        <source>Read on, at the end the next page</source>
        <translation>Read on, at the end the next page</translation>
    </message>
    <message>
        <source>Read back, at the top the page before</source>
        <translation>Read back, at the top the page before</translation>
    </message>
    <message>
        <source>Scroll a little</source>
        <translation>Scroll a little</translation>
    </message>
    <message>
        <source>Top and bottom of the page</source>
        <translation>Top and bottom of the page</translation>
    </message>
    <message>
        <source>Scale under the pointer</source>
        <translation>Scale under the pointer</translation>
    </message>
    <message>
        <source>Scroll sideways</source>
        <translation>Scroll sideways</translation>
    </message>
    <message>
        <source>Select texts</source>
        <translation>Select texts</translation>
    </message>
    <message>
        <source>Menu of the pages</source>
        <translation>Menu of the pages</translation>
    </message>
    <message>
        <source>Close what is open, end what runs, then leave</source>
        <translation>Close what is open, end what runs, then leave</translation>
    </message>
    <message>
        <source>Keys</source>
        <translation>Keys</translation>
    </message>
    <message>
        <source>What they do</source>
        <translation>What they do</translation>
    </message>
</context>
<context>
    <name>Phrase</name>
    <message>
        <source>no report was built yet</source>
        <translation>no report was built yet</translation>
    </message>
    <message>
        <source>nobody opens the preview window</source>
        <translation>nobody opens the preview window</translation>
    </message>
    <message>
        <source>doPreview was given no grid</source>
        <translation>doPreview was given no grid</translation>
    </message>
    <message>
        <source>%1 was given where a plain value is wanted</source>
        <translation>%1 was given where a plain value is wanted</translation>
    </message>
    <message>
        <source>%1 was given where a number is wanted</source>
        <translation>%1 was given where a number is wanted</translation>
    </message>
    <message>
        <source>no grid was given</source>
        <translation>no grid was given</translation>
    </message>
    <message>
        <source>%1 was given where a grid is wanted</source>
        <translation>%1 was given where a grid is wanted</translation>
    </message>
    <message>
        <source>page</source>
        <translation>page</translation>
    </message>
    <message>
        <source>a document holds at most %1 pages</source>
        <translation>a document holds at most %1 pages</translation>
    </message>
    <message>
        <source>on page %1 line</source>
        <translation>on page %1 line</translation>
    </message>
    <message>
        <source>on page %1 text</source>
        <translation>on page %1 text</translation>
    </message>
    <message>
        <source>a font of %1 points is too large to be measured; choose a smaller size</source>
        <translation>a font of %1 points is too large to be measured; choose a smaller size</translation>
    </message>
    <message>
        <source>a text of more than 4294967295 characters cannot be recorded</source>
        <translation>a text of more than 4294967295 characters cannot be recorded</translation>
    </message>
    <message>
        <source>paper of %1 by %2 twips cannot be written; each side is 1 to %3 twips (200 inches)</source>
        <translation>paper of %1 by %2 twips cannot be written; each side is 1 to %3 twips (200 inches)</translation>
    </message>
    <message>
        <source>the document has no page to write</source>
        <translation>the document has no page to write</translation>
    </message>
    <message>
        <source>there is no memory for an image of %1 by %2 pixels; choose a lower resolution</source>
        <translation>there is no memory for an image of %1 by %2 pixels; choose a lower resolution</translation>
    </message>
    <message>
        <source>an image of %1 by %2 pixels (%3 per inch) cannot be made; it has 1 to %4, so choose another resolution</source>
        <translation>an image of %1 by %2 pixels (%3 per inch) cannot be made; it has 1 to %4, so choose another resolution</translation>
    </message>
    <message>
        <source>the font %1 is damaged</source>
        <translation>the font %1 is damaged</translation>
    </message>
    <message>
        <source>the font %1 may not be embedded</source>
        <translation>the font %1 may not be embedded</translation>
    </message>
    <message>
        <source>the font %1 is a variable or coloured font</source>
        <translation>the font %1 is a variable or coloured font</translation>
    </message>
    <message>
        <source>the font %1 has no outlines of a kind that can be embedded</source>
        <translation>the font %1 has no outlines of a kind that can be embedded</translation>
    </message>
    <message>
        <source>the grid is gone</source>
        <translation>the grid is gone</translation>
    </message>
    <message>
        <source>%1 is past what the member holds</source>
        <translation>%1 is past what the member holds</translation>
    </message>
    <message>
        <source>an object is no plain value</source>
        <translation>an object is no plain value</translation>
    </message>
    <message>
        <source>&quot;%1&quot; is no %2</source>
        <translation>&quot;%1&quot; is no %2</translation>
    </message>
    <message>
        <source>column</source>
        <translation>column</translation>
    </message>
    <message>
        <source>the grid&apos;s model is gone</source>
        <translation>the grid&apos;s model is gone</translation>
    </message>
    <message>
        <source>row</source>
        <translation>row</translation>
    </message>
    <message>
        <source>the grid has lost rows</source>
        <translation>the grid has lost rows</translation>
    </message>
    <message>
        <source>member number</source>
        <translation>member number</translation>
    </message>
    <message>
        <source>the object is gone</source>
        <translation>the object is gone</translation>
    </message>
    <message>
        <source>the list has changed</source>
        <translation>the list has changed</translation>
    </message>
    <message>
        <source>a row of %1 cells; there are %2 columns</source>
        <translation>a row of %1 cells; there are %2 columns</translation>
    </message>
    <message>
        <source>row %1 holds more than 4294967295 characters</source>
        <translation>row %1 holds more than 4294967295 characters</translation>
    </message>
    <message>
        <source>there is no printer</source>
        <translation>there is no printer</translation>
    </message>
    <message>
        <source>there is no printer %1</source>
        <translation>there is no printer %1</translation>
    </message>
    <message>
        <source>the printer %1 takes no jobs</source>
        <translation>the printer %1 takes no jobs</translation>
    </message>
    <message>
        <source>no column of the grid is wide enough to be printed</source>
        <translation>no column of the grid is wide enough to be printed</translation>
    </message>
    <message>
        <source>%1 is no document file</source>
        <translation>%1 is no document file</translation>
    </message>
    <message>
        <source>%1 holds more than %2 bytes</source>
        <translation>%1 holds more than %2 bytes</translation>
    </message>
    <message>
        <source>an index is missing</source>
        <translation>an index is missing</translation>
    </message>
    <message>
        <source>index %1</source>
        <translation>index %1</translation>
    </message>
    <message>
        <source>%1 is past what a single-precision number holds</source>
        <translation>%1 is past what a single-precision number holds</translation>
    </message>
    <message>
        <source>&quot;%1&quot; is no whole number between -32768 and 32767</source>
        <translation>&quot;%1&quot; is no whole number between -32768 and 32767</translation>
    </message>
    <message>
        <source>this Qt has no converter for GB18030</source>
        <translation>this Qt has no converter for GB18030</translation>
    </message>
    <message>
        <source>row %1, column %2 holds %3 characters, at most %4 can be printed</source>
        <translation>row %1, column %2 holds %3 characters, at most %4 can be printed</translation>
    </message>
    <message>
        <source>Invalid procedure call or argument</source>
        <translation>Invalid procedure call or argument</translation>
    </message>
    <message>
        <source>Overflow</source>
        <translation>Overflow</translation>
    </message>
    <message>
        <source>Subscript out of range</source>
        <translation>Subscript out of range</translation>
    </message>
    <message>
        <source>Division by zero</source>
        <translation>Division by zero</translation>
    </message>
    <message>
        <source>Type mismatch</source>
        <translation>Type mismatch</translation>
    </message>
    <message>
        <source>File not found</source>
        <translation>File not found</translation>
    </message>
    <message>
        <source>The file cannot be written</source>
        <translation>The file cannot be written</translation>
    </message>
    <message>
        <source>Disk full</source>
        <translation>Disk full</translation>
    </message>
    <message>
        <source>Permission denied</source>
        <translation>Permission denied</translation>
    </message>
    <message>
        <source>Object variable not set</source>
        <translation>Object variable not set</translation>
    </message>
    <message>
        <source>Object doesn&apos;t support this property or method</source>
        <translation>Object doesn&apos;t support this property or method</translation>
    </message>
    <message>
        <source>Cancel was selected</source>
        <translation>Cancel was selected</translation>
    </message>
    <message>
        <source>Error</source>
        <translation>Error</translation>
    </message>
    <message>
        <source>%1 %2; there is %3</source>
        <translation>%1 %2; there is %3</translation>
    </message>
    <message>
        <source>%1 %2; there are %3</source>
        <translation>%1 %2; there are %3</translation>
    </message>
    <message>
        <source>%1 is not between %2 and %3</source>
        <translation>%1 is not between %2 and %3</translation>
    </message>
    <message>
        <source>an object is no number</source>
        <translation>an object is no number</translation>
    </message>
    <message>
        <source>an object was expected</source>
        <translation>an object was expected</translation>
    </message>
    <message>
        <source>a row set was expected</source>
        <translation>a row set was expected</translation>
    </message>
    <message>
        <source>an object has no text</source>
        <translation>an object has no text</translation>
    </message>
    <message>
        <source>the page list names too many pages; write fewer ranges</source>
        <translation>the page list names too many pages; write fewer ranges</translation>
    </message>
    <message>
        <source>The pages are %1, the printer&apos;s sheet is %2 (%3): what does not fit on it is lost.</source>
        <translation>The pages are %1, the printer&apos;s sheet is %2 (%3): what does not fit on it is lost.</translation>
    </message>
    <message>
        <source>The pages are %1, the printer&apos;s sheet is %2 (%3).</source>
        <translation>The pages are %1, the printer&apos;s sheet is %2 (%3).</translation>
    </message>
    <message>
        <source>after %1 of %2 pages</source>
        <translation>after %1 of %2 pages</translation>
    </message>
    <message>
        <source>the print system does not answer (nothing came within %1 seconds)</source>
        <translation>the print system does not answer (nothing came within %1 seconds)</translation>
    </message>
    <message>
        <source>no room for the document in %1</source>
        <translation>no room for the document in %1</translation>
    </message>
    <message>
        <source>the document could not be ended</source>
        <translation>the document could not be ended</translation>
    </message>
    <message>
        <source>the document could not be begun</source>
        <translation>the document could not be begun</translation>
    </message>
    <message>
        <source>the printer rejects jobs</source>
        <translation>the printer rejects jobs</translation>
    </message>
    <message>
        <source>the printer is stopped</source>
        <translation>the printer is stopped</translation>
    </message>
    <message>
        <source>the print system does not answer (%1)</source>
        <translation>the print system does not answer (%1)</translation>
    </message>
    <message>
        <source>the print system did not take the document (%1)</source>
        <translation>the print system did not take the document (%1)</translation>
    </message>
    <message>
        <source>there is no such printer</source>
        <translation>there is no such printer</translation>
    </message>
    <message>
        <source>field</source>
        <translation>field</translation>
    </message>
    <message>
        <source>the grid prints no column &quot;%1&quot;; there are: %2</source>
        <translation>the grid prints no column &quot;%1&quot;; there are: %2</translation>
    </message>
    <message>
        <source>this grid does not tell which of its rows are marked</source>
        <translation>this grid does not tell which of its rows are marked</translation>
    </message>
    <message>
        <source>no row of the grid is marked; mark rows, or print all</source>
        <translation>no row of the grid is marked; mark rows, or print all</translation>
    </message>
    <message>
        <source>more than %1 columns are printed; leave some out</source>
        <translation>more than %1 columns are printed; leave some out</translation>
    </message>
    <message>
        <source>the grid has %1 columns, at most %2 can be read</source>
        <translation>the grid has %1 columns, at most %2 can be read</translation>
    </message>
    <message>
        <source>the grid prints %1 columns now, the report was built with %2; preview it anew</source>
        <translation>the grid prints %1 columns now, the report was built with %2; preview it anew</translation>
    </message>
    <message>
        <source>the data grid has more columns than fields</source>
        <translation>the data grid has more columns than fields</translation>
    </message>
    <message>
        <source>m_PrintObj names no kind of grid</source>
        <translation>m_PrintObj names no kind of grid</translation>
    </message>
    <message>
        <source>the data source never comes to its first record</source>
        <translation>the data source never comes to its first record</translation>
    </message>
    <message>
        <source>the colour %1 of the font %2 is not between 0 and %3</source>
        <translation>the colour %1 of the font %2 is not between 0 and %3</translation>
    </message>
    <message>
        <source>the report needs about %1 pages, a document holds %2; print rows 1 to %3, or leave out columns</source>
        <translation>the report needs about %1 pages, a document holds %2; print rows 1 to %3, or leave out columns</translation>
    </message>
    <message>
        <source>not even the first rows fit on the %1 pages that a document holds; choose larger paper, or leave out columns</source>
        <translation>not even the first rows fit on the %1 pages that a document holds; choose larger paper, or leave out columns</translation>
    </message>
    <message>
        <source>1 is portrait and 2 is landscape</source>
        <translation>1 is portrait and 2 is landscape</translation>
    </message>
    <message>
        <source>the number of a paper is a whole number, such as 9</source>
        <translation>the number of a paper is a whole number, such as 9</translation>
    </message>
    <message>
        <source>this margin is at most %1 mm</source>
        <translation>this margin is at most %1 mm</translation>
    </message>
    <message>
        <source>a sheet is wider than 0 and no wider than %1 mm</source>
        <translation>a sheet is wider than 0 and no wider than %1 mm</translation>
    </message>
    <message>
        <source>a sheet is higher than 0 and no higher than %1 mm</source>
        <translation>a sheet is higher than 0 and no higher than %1 mm</translation>
    </message>
    <message>
        <source>a colour is a number from 0 to %1</source>
        <translation>a colour is a number from 0 to %1</translation>
    </message>
    <message>
        <source>a font size is a number of points above 0, at most %1</source>
        <translation>a font size is a number of points above 0, at most %1</translation>
    </message>
    <message>
        <source>%1 in %2</source>
        <translation>%1 in %2</translation>
    </message>
    <message>
        <source>%1 and %2 more settings</source>
        <translation>%1 and %2 more settings</translation>
    </message>
    <message>
        <source>%1 and %2</source>
        <translation>%1 and %2</translation>
    </message>
    <message>
        <source>%1 is missing</source>
        <translation>%1 is missing</translation>
    </message>
    <message>
        <source>%1 are missing</source>
        <translation>%1 are missing</translation>
    </message>
    <message>
        <source>the margins leave no room on the sheet; they are printed larger than stored, 1.6 times at the top, 1.8 times at the bottom and 1.2 times at the sides.</source>
        <translation>the margins leave no room on the sheet; they are printed larger than stored, 1.6 times at the top, 1.8 times at the bottom and 1.2 times at the sides.</translation>
    </message>
    <message>
        <source>%1 begins with a byte-order mark, which belongs to another encoding; settings are written in GB18030.</source>
        <translation>%1 begins with a byte-order mark, which belongs to another encoding; settings are written in GB18030.</translation>
    </message>
    <message>
        <source>%1; restore the defaults</source>
        <translation>%1; restore the defaults</translation>
    </message>
    <message>
        <source>%1; correct it in %2 or restore the defaults</source>
        <translation>%1; correct it in %2 or restore the defaults</translation>
    </message>
    <message>
        <source>%1, which holds paper, margins and style; restore the defaults</source>
        <translation>%1, which holds paper, margins and style; restore the defaults</translation>
    </message>
    <message>
        <source>a cell holds an object</source>
        <translation>a cell holds an object</translation>
    </message>
    <message>
        <source>fields %1 to</source>
        <translation>fields %1 to</translation>
    </message>
    <message>
        <source>a Sorvane was expected</source>
        <translation>a Sorvane was expected</translation>
    </message>
    <message>
        <source>an object of the library cannot be handed to a script&apos;s grid</source>
        <translation>an object of the library cannot be handed to a script&apos;s grid</translation>
    </message>
    <message>
        <source>Item needs an index</source>
        <translation>Item needs an index</translation>
    </message>
    <message>
        <source>a symbol is no value</source>
        <translation>a symbol is no value</translation>
    </message>
    <message>
        <source>only an array takes an index</source>
        <translation>only an array takes an index</translation>
    </message>
    <message>
        <source>item</source>
        <translation>item</translation>
    </message>
    <message>
        <source>this is a picture, not a table</source>
        <translation>this is a picture, not a table</translation>
    </message>
    <message>
        <source>this is a packed file; unpack it first, for example with: gunzip -c FILE</source>
        <translation>this is a packed file; unpack it first, for example with: gunzip -c FILE</translation>
    </message>
    <message>
        <source>this is an HTML or XML document, not a table; save its table as CSV</source>
        <translation>this is an HTML or XML document, not a table; save its table as CSV</translation>
    </message>
    <message>
        <source>this is a PDF file; take the file that it was made from, or save its table as CSV</source>
        <translation>this is a PDF file; take the file that it was made from, or save its table as CSV</translation>
    </message>
    <message>
        <source>this is a ZIP archive; unpack it first</source>
        <translation>this is a ZIP archive; unpack it first</translation>
    </message>
    <message>
        <source>this is a program, not a table</source>
        <translation>this is a program, not a table</translation>
    </message>
    <message>
        <source>this is a Parquet file; save its table as CSV</source>
        <translation>this is a Parquet file; save its table as CSV</translation>
    </message>
    <message>
        <source>this is a text document, not a table; save its table as CSV</source>
        <translation>this is a text document, not a table; save its table as CSV</translation>
    </message>
    <message>
        <source>more than %1 values in a row</source>
        <translation>more than %1 values in a row</translation>
    </message>
    <message>
        <source>the file is empty</source>
        <translation>the file is empty</translation>
    </message>
    <message>
        <source>%1 and others</source>
        <translation>%1 and others</translation>
    </message>
    <message>
        <source>the row at line %1 may be several rows glued together: a quoted value goes on over a line break, and the row has not as many values as the titles</source>
        <translation>the row at line %1 may be several rows glued together: a quoted value goes on over a line break, and the row has not as many values as the titles</translation>
    </message>
    <message>
        <source>the rows at lines %1 may be several rows glued together: a quoted value goes on over a line break, and the row has not as many values as the titles</source>
        <translation>the rows at lines %1 may be several rows glued together: a quoted value goes on over a line break, and the row has not as many values as the titles</translation>
    </message>
    <message>
        <source>a tab</source>
        <translation>a tab</translation>
    </message>
    <message>
        <source>%1 of %2 rows have not as many values as the titles, the first at line %3; is this a table with %4 between its values?</source>
        <translation>%1 of %2 rows have not as many values as the titles, the first at line %3; is this a table with %4 between its values?</translation>
    </message>
    <message>
        <source>the encoding was guessed to be %1; name another one if letters look wrong</source>
        <translation>the encoding was guessed to be %1; name another one if letters look wrong</translation>
    </message>
    <message>
        <source>a table is an array of objects, [{&quot;name&quot;: value, …}, …], or one object a line</source>
        <translation>a table is an array of objects, [{&quot;name&quot;: value, …}, …], or one object a line</translation>
    </message>
    <message>
        <source>more than %1 different names</source>
        <translation>more than %1 different names</translation>
    </message>
    <message>
        <source>this is no JSON: %1</source>
        <translation>this is no JSON: %1</translation>
    </message>
    <message>
        <source>this office file has to be converted by LibreOffice, which is not installed; install libreoffice-calc, or save the file as .xlsx, .ods or CSV</source>
        <translation>this office file has to be converted by LibreOffice, which is not installed; install libreoffice-calc, or save the file as .xlsx, .ods or CSV</translation>
    </message>
    <message>
        <source>LibreOffice could not convert this file; save it as .xlsx, .ods or CSV</source>
        <translation>LibreOffice could not convert this file; save it as .xlsx, .ods or CSV</translation>
    </message>
    <message>
        <source>a cell past the end of its sheet</source>
        <translation>a cell past the end of its sheet</translation>
    </message>
    <message>
        <source>the sheet is empty</source>
        <translation>the sheet is empty</translation>
    </message>
    <message>
        <source>no sheet %1; the file has: %2</source>
        <translation>no sheet %1; the file has: %2</translation>
    </message>
    <message>
        <source>the office file is damaged; open it in its program and save it again, or save it as CSV</source>
        <translation>the office file is damaged; open it in its program and save it again, or save it as CSV</translation>
    </message>
    <message>
        <source>give one statement only</source>
        <translation>give one statement only</translation>
    </message>
    <message>
        <source>the database cannot be copied to read its log: %1</source>
        <translation>the database cannot be copied to read its log: %1</translation>
    </message>
    <message>
        <source>this is no SQLite database</source>
        <translation>this is no SQLite database</translation>
    </message>
    <message>
        <source>the database has no table</source>
        <translation>the database has no table</translation>
    </message>
    <message>
        <source>name one of the database&apos;s tables: %1</source>
        <translation>name one of the database&apos;s tables: %1</translation>
    </message>
    <message>
        <source>no table %1; the database has: %2</source>
        <translation>no table %1; the database has: %2</translation>
    </message>
    <message>
        <source>the statement is no query; give a SELECT</source>
        <translation>the statement is no query; give a SELECT</translation>
    </message>
    <message>
        <source>the statement answers no rows; give a SELECT</source>
        <translation>the statement answers no rows; give a SELECT</translation>
    </message>
    <message>
        <source>bytes that are neither UTF-8 nor GB18030 text; name the encoding</source>
        <translation>bytes that are neither UTF-8 nor GB18030 text; name the encoding</translation>
    </message>
    <message>
        <source>line %1: %2</source>
        <translation>line %1: %2</translation>
    </message>
    <message>
        <source>unknown encoding %1; known are UTF-8, GB18030, GBK, Big5, UTF-16 and ISO-8859-1, among others</source>
        <translation>unknown encoding %1; known are UTF-8, GB18030, GBK, Big5, UTF-16 and ISO-8859-1, among others</translation>
    </message>
    <message>
        <source>bytes that are no %1</source>
        <translation>bytes that are no %1</translation>
    </message>
    <message>
        <source>bytes that are no %1, which the file&apos;s mark says it is</source>
        <translation>bytes that are no %1, which the file&apos;s mark says it is</translation>
    </message>
    <message>
        <source>the office file holds more than 2 GB</source>
        <translation>the office file holds more than 2 GB</translation>
    </message>
    <message>
        <source>%1 OK will save nothing.</source>
        <translation>%1 OK will save nothing.</translation>
    </message>
    <message>
        <source>%1 is empty: OK keeps the stored one.</source>
        <translation>%1 is empty: OK keeps the stored one.</translation>
    </message>
    <message>
        <source>%1 &quot;%2&quot; lacks its unit, as in &quot;210mm&quot;: OK will save nothing of all three tabs.</source>
        <translation>%1 &quot;%2&quot; lacks its unit, as in &quot;210mm&quot;: OK will save nothing of all three tabs.</translation>
    </message>
    <message>
        <source>%1 must be above 0: OK will store it, and no page can be laid out.</source>
        <translation>%1 must be above 0: OK will store it, and no page can be laid out.</translation>
    </message>
    <message>
        <source>%1 is at most %2: OK will store it, and no page can be built until it is smaller.</source>
        <translation>%1 is at most %2: OK will store it, and no page can be built until it is smaller.</translation>
    </message>
    <message>
        <source>%1 %2 is printed as %3</source>
        <translation>%1 %2 is printed as %3</translation>
    </message>
    <message>
        <source>%1; a margin is at most %2 here. OK will store it, and no page can be built until it is smaller.</source>
        <translation>%1; a margin is at most %2 here. OK will store it, and no page can be built until it is smaller.</translation>
    </message>
    <message>
        <source>%1 0 mm is printed as 20 mm.</source>
        <translation>%1 0 mm is printed as 20 mm.</translation>
    </message>
    <message>
        <source>%1 lies outside the sheet. OK will store it all the same.</source>
        <translation>%1 lies outside the sheet. OK will store it all the same.</translation>
    </message>
    <message>
        <source>%1, and the sheet is %2 high</source>
        <translation>%1, and the sheet is %2 high</translation>
    </message>
    <message>
        <source>%1, and the sheet is %2 wide</source>
        <translation>%1, and the sheet is %2 wide</translation>
    </message>
    <message>
        <source>%1: it lies outside. OK will store it all the same.</source>
        <translation>%1: it lies outside. OK will store it all the same.</translation>
    </message>
    <message>
        <source>%1: there is no room left for a row. OK will store it all the same.</source>
        <translation>%1: there is no room left for a row. OK will store it all the same.</translation>
    </message>
    <message>
        <source>%1: there is no room left for a column. OK will store it all the same.</source>
        <translation>%1: there is no room left for a column. OK will store it all the same.</translation>
    </message>
    <message>
        <source>no grid is previewed</source>
        <translation>no grid is previewed</translation>
    </message>
    <message>
        <source>There are %1 more like this.</source>
        <translation>There are %1 more like this.</translation>
    </message>
    <message>
        <source>The pages could not be built.</source>
        <translation>The pages could not be built.</translation>
    </message>
    <message>
        <source>%1: the name must end in .pdf, .png or .svg</source>
        <translation>%1: the name must end in .pdf, .png or .svg</translation>
    </message>
    <message>
        <source>%1 character has no glyph in any installed font and shows as a hollow box (%2)</source>
        <translation>%1 character has no glyph in any installed font and shows as a hollow box (%2)</translation>
    </message>
    <message>
        <source>%1 characters have no glyph in any installed font and show as hollow boxes (%2)</source>
        <translation>%1 characters have no glyph in any installed font and show as hollow boxes (%2)</translation>
    </message>
    <message>
        <source>%1; install %2</source>
        <translation>%1; install %2</translation>
    </message>
    <message>
        <source>the paper has no width</source>
        <translation>the paper has no width</translation>
    </message>
    <message>
        <source>the paper has no width or no height</source>
        <translation>the paper has no width or no height</translation>
    </message>
    <message>
        <source>the window has no room for a page</source>
        <translation>the window has no room for a page</translation>
    </message>
    <message>
        <source>the pages cannot be shown any smaller</source>
        <translation>the pages cannot be shown any smaller</translation>
    </message>
    <message>
        <source>a scale of 0 shows nothing</source>
        <translation>a scale of 0 shows nothing</translation>
    </message>
    <message>
        <source>a scale of %1 is too small</source>
        <translation>a scale of %1 is too small</translation>
    </message>
    <message>
        <source>this is an Arrow file; save its table as CSV</source>
        <translation>this is an Arrow file; save its table as CSV</translation>
    </message>
    <message>
        <source>%1 is no picture</source>
        <translation>%1 is no picture</translation>
    </message>
    <message>
        <source>%1; what stands before it is shown</source>
        <translation>%1; what stands before it is shown</translation>
    </message>
    <message>
        <source>%1 is damaged: %2</source>
        <translation>%1 is damaged: %2</translation>
    </message>
    <message>
        <source>row %1 of a table of %2 columns makes more than %3 cells; take fewer rows or columns</source>
        <translation>row %1 of a table of %2 columns makes more than %3 cells; take fewer rows or columns</translation>
    </message>
    <message>
        <source>a zero byte; this is no text file, unless in UTF-16: then name UTF-16LE or UTF-16BE as its encoding</source>
        <translation>a zero byte; this is no text file, unless in UTF-16: then name UTF-16LE or UTF-16BE as its encoding</translation>
    </message>
    <message>
        <source>the number %1 is too large; write it in quotation marks</source>
        <translation>the number %1 is too large; write it in quotation marks</translation>
    </message>
    <message>
        <source>the sheet holds more than %1 cells; save the part that is wanted as CSV</source>
        <translation>the sheet holds more than %1 cells; save the part that is wanted as CSV</translation>
    </message>
    <message>
        <source>the sheet holds more than %1 characters; save the part that is wanted as CSV</source>
        <translation>the sheet holds more than %1 characters; save the part that is wanted as CSV</translation>
    </message>
    <message>
        <source>%1 goes on after 4 GB; save it to a file and name that</source>
        <translation>%1 goes on after 4 GB; save it to a file and name that</translation>
    </message>
    <message>
        <source>a line holds more than %1 bytes</source>
        <translation>a line holds more than %1 bytes</translation>
    </message>
    <message>
        <source>it goes on after %1 bytes, which is the most that is read of what is no ordinary file</source>
        <translation>it goes on after %1 bytes, which is the most that is read of what is no ordinary file</translation>
    </message>
    <message>
        <source>pictures cannot be kept in %1: %2</source>
        <translation>pictures cannot be kept in %1: %2</translation>
    </message>
    <message>
        <source>the grid has %1 rows; the %2 pages that a document holds take %3 of them at most, so print fewer rows</source>
        <translation>the grid has %1 rows; the %2 pages that a document holds take %3 of them at most, so print fewer rows</translation>
    </message>
    <message>
        <source>no object of the file has a name, so there is no column; %1</source>
        <translation>no object of the file has a name, so there is no column; %1</translation>
    </message>
    <message>
        <source>the statement leaves a value open (?, :name or $name); write the value</source>
        <translation>the statement leaves a value open (?, :name or $name); write the value</translation>
    </message>
    <message>
        <source>all that the sheet holds is hidden</source>
        <translation>all that the sheet holds is hidden</translation>
    </message>
    <message>
        <source>Sum</source>
        <translation>Sum</translation>
    </message>
    <message>
        <source>Count</source>
        <translation>Count</translation>
    </message>
    <message>
        <source>Mean</source>
        <translation>Mean</translation>
    </message>
    <message>
        <source>Minimum</source>
        <translation>Minimum</translation>
    </message>
    <message>
        <source>Maximum</source>
        <translation>Maximum</translation>
    </message>
    <message>
        <source>Total</source>
        <translation>Total</translation>
    </message>
    <message>
        <source>the file cannot be copied into %1 to be converted: %2</source>
        <translation>the file cannot be copied into %1 to be converted: %2</translation>
    </message>
    <message>
        <source>value %1 of the row holds more than %2 bytes; leave it out, or shorten it</source>
        <translation>value %1 of the row holds more than %2 bytes; leave it out, or shorten it</translation>
    </message>
    <message>
        <source>a value holds more than %1 bytes; leave it out, or shorten it</source>
        <translation>a value holds more than %1 bytes; leave it out, or shorten it</translation>
    </message>
    <message>
        <source>the value behind byte %1 holds more than %2 bytes; leave it out, or shorten it</source>
        <translation>the value behind byte %1 holds more than %2 bytes; leave it out, or shorten it</translation>
    </message>
    <message>
        <source>take the array out of it, for example with: jq %1</source>
        <translation>take the array out of it, for example with: jq %1</translation>
    </message>
    <message>
        <source>take one of its arrays out of it, for example with jq and one of: %1</source>
        <translation>take one of its arrays out of it, for example with jq and one of: %1</translation>
    </message>
    <message>
        <source>make rows of its objects, for example with: jq &apos;[.[]]&apos;</source>
        <translation>make rows of its objects, for example with: jq &apos;[.[]]&apos;</translation>
    </message>
    <message>
        <source>it holds no array of objects, but %1</source>
        <translation>it holds no array of objects, but %1</translation>
    </message>
    <message>
        <source>the file is one object; %1; %2</source>
        <translation>the file is one object; %1; %2</translation>
    </message>
    <message>
        <source>%1 is a link that leads to no file</source>
        <translation>%1 is a link that leads to no file</translation>
    </message>
</context>
<context>
    <name>ToolMeanings</name>
    <message>
        <source>Fonts, colours and grid lines of the report</source>
        <translation>Fonts, colours and grid lines of the report</translation>
    </message>
    <message>
        <source>Read the table again</source>
        <translation>Read the table again</translation>
    </message>
    <message>
        <source>Show the pages twice as large</source>
        <translation>Show the pages twice as large</translation>
    </message>
    <message>
        <source>Show the pages half as large</source>
        <translation>Show the pages half as large</translation>
    </message>
    <message>
        <source>Go to the first page</source>
        <translation>Go to the first page</translation>
    </message>
    <message>
        <source>Go back a page</source>
        <translation>Go back a page</translation>
    </message>
    <message>
        <source>Go on to the next page</source>
        <translation>Go on to the next page</translation>
    </message>
    <message>
        <source>Go to the last page</source>
        <translation>Go to the last page</translation>
    </message>
    <message>
        <source>Show all pages, or six of a long report</source>
        <translation>Show all pages, or six of a long report</translation>
    </message>
    <message>
        <source>Show one page</source>
        <translation>Show one page</translation>
    </message>
    <message>
        <source>Drag the pages with the mouse</source>
        <translation>Drag the pages with the mouse</translation>
    </message>
    <message>
        <source>Print all pages or some</source>
        <translation>Print all pages or some</translation>
    </message>
    <message>
        <source>Paper, margins, header and footer</source>
        <translation>Paper, margins, header and footer</translation>
    </message>
    <message>
        <source>Fill the window with one page</source>
        <translation>Fill the window with one page</translation>
    </message>
    <message>
        <source>Show two pages</source>
        <translation>Show two pages</translation>
    </message>
    <message>
        <source>Scale of the pages: pick one or type it</source>
        <translation>Scale of the pages: pick one or type it</translation>
    </message>
    <message>
        <source>Go to a page: pick one or type its number</source>
        <translation>Go to a page: pick one or type its number</translation>
    </message>
    <message>
        <source>Close the preview</source>
        <translation>Close the preview</translation>
    </message>
    <message>
        <source>Show four pages</source>
        <translation>Show four pages</translation>
    </message>
    <message>
        <source>Name and version</source>
        <translation>Name and version</translation>
    </message>
    <message>
        <source>Open saved pages</source>
        <translation>Open saved pages</translation>
    </message>
    <message>
        <source>Save the pages to a file</source>
        <translation>Save the pages to a file</translation>
    </message>
    <message>
        <source>Throw all pages away</source>
        <translation>Throw all pages away</translation>
    </message>
    <message>
        <source>Larger text and columns</source>
        <translation>Larger text and columns</translation>
    </message>
    <message>
        <source>Smaller text and columns</source>
        <translation>Smaller text and columns</translation>
    </message>
</context>
<context>
    <name>pelloric::qt::AboutBox</name>
    <message>
        <source>About</source>
        <translation>About</translation>
    </message>
    <message>
        <source>Print preview and printing of grids.</source>
        <translation>Print preview and printing of grids.</translation>
    </message>
</context>
<context>
    <name>pelloric::qt::BackScreen</name>
    <message>
        <source>Pages</source>
        <translation>Pages</translation>
    </message>
</context>
<context>
    <name>pelloric::qt::CanvasAreas</name>
    <message>
        <source>Hand cursor</source>
        <translation>Hand cursor</translation>
    </message>
    <message>
        <source>Picture</source>
        <translation>Picture</translation>
    </message>
    <message>
        <source>Horizontal scroll bar</source>
        <translation>Horizontal scroll bar</translation>
    </message>
    <message>
        <source>Vertical scroll bar</source>
        <translation>Vertical scroll bar</translation>
    </message>
</context>
<context>
    <name>pelloric::qt::FileBox</name>
    <message>
        <source>Folder</source>
        <translation>Folder</translation>
    </message>
    <message>
        <source>Kind of files</source>
        <translation>Kind of files</translation>
    </message>
</context>
<context>
    <name>pelloric::qt::FindBar</name>
    <message>
        <source>Previous place (Shift+F3)</source>
        <translation>Previous place (Shift+F3)</translation>
    </message>
    <message>
        <source>Next place (F3)</source>
        <translation>Next place (F3)</translation>
    </message>
    <message>
        <source>Close (Esc)</source>
        <translation>Close (Esc)</translation>
    </message>
    <message>
        <source>Find</source>
        <translation>Find</translation>
    </message>
    <message>
        <source>Text to find</source>
        <translation>Text to find</translation>
    </message>
    <message>
        <source>Find on the pages</source>
        <translation>Find on the pages</translation>
    </message>
    <message>
        <source>Not found</source>
        <translation>Not found</translation>
    </message>
    <message>
        <source>Searching…</source>
        <translation>Searching…</translation>
    </message>
    <message>
        <source>%L1 found</source>
        <translation>%L1 found</translation>
    </message>
    <message>
        <source>%L1 of %L2</source>
        <translation>%L1 of %L2</translation>
    </message>
</context>
<context>
    <name>pelloric::qt::FontChooser</name>
    <message>
        <source>Font</source>
        <translation>Font</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>OK</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Cancel</translation>
    </message>
    <message>
        <source>Font:</source>
        <translation>Font:</translation>
    </message>
    <message>
        <source>Size:</source>
        <translation>Size:</translation>
    </message>
    <message>
        <source>Effects</source>
        <translation>Effects</translation>
    </message>
    <message>
        <source>Bold</source>
        <translation>Bold</translation>
    </message>
    <message>
        <source>Italic</source>
        <translation>Italic</translation>
    </message>
    <message>
        <source>Strikeout</source>
        <translation>Strikeout</translation>
    </message>
    <message>
        <source>Underline</source>
        <translation>Underline</translation>
    </message>
    <message>
        <source>Color:</source>
        <translation>Color:</translation>
    </message>
    <message>
        <source>Sample</source>
        <translation>Sample</translation>
    </message>
</context>
<context>
    <name>pelloric::qt::GridStyleDialog</name>
    <message>
        <source>Fonts</source>
        <translation>Fonts</translation>
    </message>
</context>
<context>
    <name>pelloric::qt::Kestrane</name>
    <message>
        <source>Print preview</source>
        <translation>Print preview</translation>
    </message>
</context>
<context>
    <name>pelloric::qt::NoticeStrip</name>
    <message>
        <source>Page &amp;Setup...</source>
        <translation>Page &amp;Setup...</translation>
    </message>
    <message>
        <source>Change paper, margins, header and footer</source>
        <translation>Change paper, margins, header and footer</translation>
    </message>
    <message>
        <source>&amp;Design Report...</source>
        <translation>&amp;Design Report...</translation>
    </message>
    <message>
        <source>Change fonts, colours and grid lines</source>
        <translation>Change fonts, colours and grid lines</translation>
    </message>
    <message>
        <source>Restore De&amp;faults</source>
        <translation>Restore De&amp;faults</translation>
    </message>
    <message>
        <source>Give every setting that is missing or cannot be used its default value; the old file is kept beside</source>
        <translation>Give every setting that is missing or cannot be used its default value; the old file is kept beside</translation>
    </message>
    <message>
        <source>Notice</source>
        <translation>Notice</translation>
    </message>
    <message>
        <source>Hide this notice</source>
        <translation>Hide this notice</translation>
    </message>
</context>
<context>
    <name>pelloric::qt::OptionsPanel</name>
    <message>
        <source>Report Options</source>
        <translation>Report Options</translation>
    </message>
    <message>
        <source>Look</source>
        <translation>Look</translation>
    </message>
    <message>
        <source>Cells &amp;as the view shows them</source>
        <translation>Cells &amp;as the view shows them</translation>
    </message>
    <message>
        <source>Width</source>
        <translation>Width</translation>
    </message>
    <message>
        <source>As it is, in bands</source>
        <translation>As it is, in bands</translation>
    </message>
    <message>
        <source>Turn, then shrink</source>
        <translation>Turn, then shrink</translation>
    </message>
    <message>
        <source>Shrink to pages across</source>
        <translation>Shrink to pages across</translation>
    </message>
    <message>
        <source>Across, then down</source>
        <translation>Across, then down</translation>
    </message>
    <message>
        <source>Down, then across</source>
        <translation>Down, then across</translation>
    </message>
    <message>
        <source>&amp;Fit:</source>
        <translation>&amp;Fit:</translation>
    </message>
    <message>
        <source>Pages a&amp;cross:</source>
        <translation>Pages a&amp;cross:</translation>
    </message>
    <message>
        <source>&amp;Key columns:</source>
        <translation>&amp;Key columns:</translation>
    </message>
    <message>
        <source>Page or&amp;der:</source>
        <translation>Page or&amp;der:</translation>
    </message>
    <message>
        <source>Rows and Columns</source>
        <translation>Rows and Columns</translation>
    </message>
    <message>
        <source>All</source>
        <translation>All</translation>
    </message>
    <message>
        <source>Selected in the view</source>
        <translation>Selected in the view</translation>
    </message>
    <message>
        <source>Range</source>
        <translation>Range</translation>
    </message>
    <message>
        <source>all, or titles: Name, Price</source>
        <translation>all, or titles: Name, Price</translation>
    </message>
    <message>
        <source>&amp;Rows:</source>
        <translation>&amp;Rows:</translation>
    </message>
    <message>
        <source>From:</source>
        <translation>From:</translation>
    </message>
    <message>
        <source>&amp;To:</source>
        <translation>&amp;To:</translation>
    </message>
    <message>
        <source>Co&amp;lumns:</source>
        <translation>Co&amp;lumns:</translation>
    </message>
    <message>
        <source>Groups and Totals</source>
        <translation>Groups and Totals</translation>
    </message>
    <message>
        <source>titles: Country</source>
        <translation>titles: Country</translation>
    </message>
    <message>
        <source>K&amp;eep groups on a page</source>
        <translation>K&amp;eep groups on a page</translation>
    </message>
    <message>
        <source>Sum</source>
        <translation>Sum</translation>
    </message>
    <message>
        <source>Count</source>
        <translation>Count</translation>
    </message>
    <message>
        <source>Mean</source>
        <translation>Mean</translation>
    </message>
    <message>
        <source>Minimum</source>
        <translation>Minimum</translation>
    </message>
    <message>
        <source>Maximum</source>
        <translation>Maximum</translation>
    </message>
    <message>
        <source>titles: Price</source>
        <translation>titles: Price</translation>
    </message>
    <message>
        <source>Group b&amp;y:</source>
        <translation>Group b&amp;y:</translation>
    </message>
    <message>
        <source>T&amp;otal:</source>
        <translation>T&amp;otal:</translation>
    </message>
    <message>
        <source>of col&amp;umns:</source>
        <translation>of col&amp;umns:</translation>
    </message>
    <message>
        <source>Watermark and Logo</source>
        <translation>Watermark and Logo</translation>
    </message>
    <message>
        <source>a text, such as Draft</source>
        <translation>a text, such as Draft</translation>
    </message>
    <message>
        <source>or a picture file</source>
        <translation>or a picture file</translation>
    </message>
    <message>
        <source>A&amp;bove the table</source>
        <translation>A&amp;bove the table</translation>
    </message>
    <message>
        <source>a picture file</source>
        <translation>a picture file</translation>
    </message>
    <message>
        <source>Left</source>
        <translation>Left</translation>
    </message>
    <message>
        <source>Centre</source>
        <translation>Centre</translation>
    </message>
    <message>
        <source>Right</source>
        <translation>Right</translation>
    </message>
    <message>
        <source>Text:</source>
        <translation>Text:</translation>
    </message>
    <message>
        <source>&amp;Picture:</source>
        <translation>&amp;Picture:</translation>
    </message>
    <message>
        <source>Picture of the watermark</source>
        <translation>Picture of the watermark</translation>
    </message>
    <message>
        <source>Opac&amp;ity:</source>
        <translation>Opac&amp;ity:</translation>
    </message>
    <message>
        <source>Lo&amp;go:</source>
        <translation>Lo&amp;go:</translation>
    </message>
    <message>
        <source>Picture of the logo</source>
        <translation>Picture of the logo</translation>
    </message>
    <message>
        <source>&amp;Slot:</source>
        <translation>&amp;Slot:</translation>
    </message>
    <message>
        <source>Choose: %1</source>
        <translation>Choose: %1</translation>
    </message>
    <message>
        <source>Choose a file</source>
        <translation>Choose a file</translation>
    </message>
    <message>
        <source>Pictures (*.png *.jpg *.jpeg *.bmp *.gif *.svg)</source>
        <translation>Pictures (*.png *.jpg *.jpeg *.bmp *.gif *.svg)</translation>
    </message>
    <message>
        <source>The table fits as it is.</source>
        <translation>The table fits as it is.</translation>
    </message>
    <message>
        <source>The table fits on turned paper.</source>
        <translation>The table fits on turned paper.</translation>
    </message>
    <message>
        <source>Shrunk to %1 % on turned paper.</source>
        <translation>Shrunk to %1 % on turned paper.</translation>
    </message>
    <message>
        <source>Shrunk to %1 %.</source>
        <translation>Shrunk to %1 %.</translation>
    </message>
    <message>
        <source>Too wide to be shrunk: printed in bands.</source>
        <translation>Too wide to be shrunk: printed in bands.</translation>
    </message>
    <message>
        <source>Too wide to be shrunk: its columns are narrowed.</source>
        <translation>Too wide to be shrunk: its columns are narrowed.</translation>
    </message>
    <message>
        <source>Pages across: %1.</source>
        <translation>Pages across: %1.</translation>
    </message>
</context>
<context>
    <name>pelloric::qt::PageFiles</name>
    <message>
        <source>PDF document</source>
        <translation>PDF document</translation>
    </message>
    <message>
        <source>PNG pictures</source>
        <translation>PNG pictures</translation>
    </message>
    <message>
        <source>SVG drawings</source>
        <translation>SVG drawings</translation>
    </message>
    <message>
        <source>report</source>
        <translation>report</translation>
    </message>
    <message>
        <source>Save as PDF</source>
        <translation>Save as PDF</translation>
    </message>
</context>
<context>
    <name>pelloric::qt::PageSetupDialog</name>
    <message>
        <source>Papers</source>
        <translation>Papers</translation>
    </message>
    <message>
        <source>These are the standard papers: %1.</source>
        <translation>These are the standard papers: %1.</translation>
    </message>
</context>
<context>
    <name>pelloric::qt::PageSketch</name>
    <message>
        <source>Sketch of the page with its margins</source>
        <translation>Sketch of the page with its margins</translation>
    </message>
</context>
<context>
    <name>pelloric::qt::PageStrip</name>
    <message>
        <source>Page %1</source>
        <translation>Page %1</translation>
    </message>
    <message>
        <source>Pictures of the pages</source>
        <translation>Pictures of the pages</translation>
    </message>
</context>
<context>
    <name>pelloric::qt::PageSurface</name>
    <message>
        <source>Page surface %1</source>
        <translation>Page surface %1</translation>
    </message>
</context>
<context>
    <name>pelloric::qt::PageTextsTab</name>
    <message>
        <source>Left</source>
        <translation>Left</translation>
    </message>
    <message>
        <source>Center</source>
        <translation>Center</translation>
    </message>
    <message>
        <source>Right</source>
        <translation>Right</translation>
    </message>
    <message>
        <source>Header left</source>
        <translation>Header left</translation>
    </message>
    <message>
        <source>Header center</source>
        <translation>Header center</translation>
    </message>
    <message>
        <source>Header right</source>
        <translation>Header right</translation>
    </message>
    <message>
        <source>Footer left</source>
        <translation>Footer left</translation>
    </message>
    <message>
        <source>Footer center</source>
        <translation>Footer center</translation>
    </message>
    <message>
        <source>Footer right</source>
        <translation>Footer right</translation>
    </message>
    <message>
        <source>Header font</source>
        <translation>Header font</translation>
    </message>
    <message>
        <source>Footer font</source>
        <translation>Footer font</translation>
    </message>
    <message>
        <source>Change the header font</source>
        <translation>Change the header font</translation>
    </message>
    <message>
        <source>Change the footer font</source>
        <translation>Change the footer font</translation>
    </message>
    <message>
        <source>The Menu key or Alt+Down opens the fields</source>
        <translation>The Menu key or Alt+Down opens the fields</translation>
    </message>
    <message>
        <source>Put in a field</source>
        <translation>Put in a field</translation>
    </message>
</context>
<context>
    <name>pelloric::qt::PreviewToolbar</name>
    <message>
        <source>Tools</source>
        <translation>Tools</translation>
    </message>
</context>
<context>
    <name>pelloric::qt::PreviewWindow</name>
    <message>
        <source>Printing was ended: %1 of %2 pages were sent.</source>
        <translation>Printing was ended: %1 of %2 pages were sent.</translation>
    </message>
    <message>
        <source>Saving the pages…</source>
        <translation>Saving the pages…</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Cancel</translation>
    </message>
    <message>
        <source>The font %1 is not installed; %2 is taken instead.</source>
        <translation>The font %1 is not installed; %2 is taken instead.</translation>
    </message>
</context>
<context>
    <name>pelloric::qt::PrintOptionsDialog</name>
    <message>
        <source>No page is named yet, so nothing would be printed.</source>
        <translation>No page is named yet, so nothing would be printed.</translation>
    </message>
    <message>
        <source>None of these pages exists: the last one is %1.</source>
        <translation>None of these pages exists: the last one is %1.</translation>
    </message>
    <message>
        <source>This names no page, so nothing would be printed.</source>
        <translation>This names no page, so nothing would be printed.</translation>
    </message>
    <message>
        <source>These are more pages than can be printed.</source>
        <translation>These are more pages than can be printed.</translation>
    </message>
    <message>
        <source>Without a copy nothing would be printed.</source>
        <translation>Without a copy nothing would be printed.</translation>
    </message>
    <message>
        <source>These are more copies than can be printed.</source>
        <translation>These are more copies than can be printed.</translation>
    </message>
    <message>
        <source>Save as PDF instead...</source>
        <translation>Save as PDF instead...</translation>
    </message>
    <message>
        <source>There is no printer.</source>
        <translation>There is no printer.</translation>
    </message>
    <message>
        <source>No printers can be listed: %1.</source>
        <translation>No printers can be listed: %1.</translation>
    </message>
    <message>
        <source>Page range</source>
        <translation>Page range</translation>
    </message>
    <message>
        <source>Pages sent</source>
        <translation>Pages sent</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Cancel</translation>
    </message>
    <message>
        <source>Ends printing after the page that is being sent (Escape)</source>
        <translation>Ends printing after the page that is being sent (Escape)</translation>
    </message>
    <message>
        <source>%1 of %2 pages sent</source>
        <translation>%1 of %2 pages sent</translation>
    </message>
</context>
<context>
    <name>pelloric::qt::ProgressArea</name>
    <message>
        <source>Progress area</source>
        <translation>Progress area</translation>
    </message>
    <message>
        <source>Progress</source>
        <translation>Progress</translation>
    </message>
</context>
<context>
    <name>pelloric::qt::ReaderTools</name>
    <message>
        <source>Save as PDF</source>
        <translation>Save as PDF</translation>
    </message>
    <message>
        <source>Page Width</source>
        <translation>Page Width</translation>
    </message>
    <message>
        <source>Page in View</source>
        <translation>Page in View</translation>
    </message>
    <message>
        <source>Fill the Window</source>
        <translation>Fill the Window</translation>
    </message>
    <message>
        <source>One Page</source>
        <translation>One Page</translation>
    </message>
    <message>
        <source>Two Pages</source>
        <translation>Two Pages</translation>
    </message>
    <message>
        <source>Four Pages</source>
        <translation>Four Pages</translation>
    </message>
    <message>
        <source>More Pages</source>
        <translation>More Pages</translation>
    </message>
    <message>
        <source>Find…</source>
        <translation>Find…</translation>
    </message>
    <message>
        <source>Next Place</source>
        <translation>Next Place</translation>
    </message>
    <message>
        <source>Previous Place</source>
        <translation>Previous Place</translation>
    </message>
    <message>
        <source>Select Page</source>
        <translation>Select Page</translation>
    </message>
    <message>
        <source>Copy</source>
        <translation>Copy</translation>
    </message>
    <message>
        <source>Pictures of the Pages</source>
        <translation>Pictures of the Pages</translation>
    </message>
    <message>
        <source>Report Options</source>
        <translation>Report Options</translation>
    </message>
    <message>
        <source>Keys</source>
        <translation>Keys</translation>
    </message>
</context>
<context>
    <name>pelloric::qt::ReplaceBox</name>
    <message>
        <source>Replace Files</source>
        <translation>Replace Files</translation>
    </message>
    <message>
        <source>%1 already exists.</source>
        <translation>%1 already exists.</translation>
    </message>
    <message>
        <source>%1 files already exist, such as %2.</source>
        <translation>%1 files already exist, such as %2.</translation>
    </message>
    <message>
        <source>Every page becomes a file of its own. Do you want to replace what is there?</source>
        <translation>Every page becomes a file of its own. Do you want to replace what is there?</translation>
    </message>
    <message>
        <source>&amp;Replace</source>
        <translation>&amp;Replace</translation>
    </message>
</context>
<context>
    <name>pelloric::qt::ReportTools</name>
    <message>
        <source>The file holds the pages without watermark, logo and icons; save them as PDF to keep those.</source>
        <translation>The file holds the pages without watermark, logo and icons; save them as PDF to keep those.</translation>
    </message>
    <message>
        <source>Cells of %1 that show no number and that its total leaves out: %2.</source>
        <translation>Cells of %1 that show no number and that its total leaves out: %2.</translation>
    </message>
</context>
<context>
    <name>pelloric::qt::Sorvane</name>
    <message>
        <source>Page preview</source>
        <translation>Page preview</translation>
    </message>
</context>
<context>
    <name>pelloric::qt::StartIcon</name>
    <message>
        <source>No document</source>
        <translation>No document</translation>
    </message>
    <message>
        <source>Nothing to preview yet</source>
        <translation>Nothing to preview yet</translation>
    </message>
</context>
</TS>
