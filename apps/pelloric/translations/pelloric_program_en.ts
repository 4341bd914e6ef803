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
    <name>Phrase</name>
    <message>
        <source>Unknown option &apos;%1&apos;.</source>
        <translation>Unknown option &apos;%1&apos;.</translation>
    </message>
    <message>
        <source>Missing value after &apos;%1&apos;.</source>
        <translation>Missing value after &apos;%1&apos;.</translation>
    </message>
    <message>
        <source>Unexpected value after &apos;%1&apos;.</source>
        <translation>Unexpected value after &apos;%1&apos;.</translation>
    </message>
    <message>
        <source>%1; check that the folder exists and takes files</source>
        <translation>%1; check that the folder exists and takes files</translation>
    </message>
    <message>
        <source>%1; make room on the disk, or choose another one</source>
        <translation>%1; make room on the disk, or choose another one</translation>
    </message>
    <message>
        <source>%1; check your rights to the file and its folder</source>
        <translation>%1; check your rights to the file and its folder</translation>
    </message>
    <message>
        <source>%1; check the name and that you may read it</source>
        <translation>%1; check the name and that you may read it</translation>
    </message>
    <message>
        <source>one argument too many: %1; quote names with blanks</source>
        <translation>one argument too many: %1; quote names with blanks</translation>
    </message>
    <message>
        <source>%1 takes a whole number from %2 to %3, not &quot;%4&quot;</source>
        <translation>%1 takes a whole number from %2 to %3, not &quot;%4&quot;</translation>
    </message>
    <message>
        <source>%1 takes a number from %2 to %3, not &quot;%4&quot;</source>
        <translation>%1 takes a number from %2 to %3, not &quot;%4&quot;</translation>
    </message>
    <message>
        <source>where the sample tables are</source>
        <translation>where the sample tables are</translation>
    </message>
    <message>
        <source>walk through by itself, without a display, and leave what it shows in OUT</source>
        <translation>walk through by itself, without a display, and leave what it shows in OUT</translation>
    </message>
    <message>
        <source>write what the preview window shows to a file, a line for each change</source>
        <translation>write what the preview window shows to a file, a line for each change</translation>
    </message>
    <message>
        <source>the sample tables are not found; name their folder with --samples</source>
        <translation>the sample tables are not found; name their folder with --samples</translation>
    </message>
    <message>
        <source>%1; check the folder of temporary files</source>
        <translation>%1; check the folder of temporary files</translation>
    </message>
    <message>
        <source>Shows one form with a flex grid, a list view and a data grid on sample
tables, each with its host code and a button that previews it; tables of
your own can be opened beside them. What its dialogs change is forgotten.
</source>
        <translation>Shows one form with a flex grid, a list view and a data grid on sample
tables, each with its host code and a button that previews it; tables of
your own can be opened beside them. What its dialogs change is forgotten.
</translation>
    </message>
    <message>
        <source>the preview window did not close</source>
        <translation>the preview window did not close</translation>
    </message>
    <message>
        <source>%1 was not written</source>
        <translation>%1 was not written</translation>
    </message>
    <message>
        <source>%1 cannot be written</source>
        <translation>%1 cannot be written</translation>
    </message>
    <message>
        <source>the preview window is not open</source>
        <translation>the preview window is not open</translation>
    </message>
    <message>
        <source>there is no tool %1</source>
        <translation>there is no tool %1</translation>
    </message>
    <message>
        <source>the saved document has other pages</source>
        <translation>the saved document has other pages</translation>
    </message>
    <message>
        <source>%1 cannot be read; name the folder of the samples with --samples</source>
        <translation>%1 cannot be read; name the folder of the samples with --samples</translation>
    </message>
    <message>
        <source>where to: a name that ends in .pdf, .png, .svg or .ostl; a folder; or -</source>
        <translation>where to: a name that ends in .pdf, .png, .svg or .ostl; a folder; or -</translation>
    </message>
    <message>
        <source>several inputs into one file, one behind the other</source>
        <translation>several inputs into one file, one behind the other</translation>
    </message>
    <message>
        <source>pdf, png, svg or ostl, for a folder or - (pdf)</source>
        <translation>pdf, png, svg or ostl, for a folder or - (pdf)</translation>
    </message>
    <message>
        <source>only these pages: 1,3,5-12</source>
        <translation>only these pages: 1,3,5-12</translation>
    </message>
    <message>
        <source>pixels an inch of .png images (150)</source>
        <translation>pixels an inch of .png images (150)</translation>
    </message>
    <message>
        <source>pages of .png images made at a time (one for each processor)</source>
        <translation>pages of .png images made at a time (one for each processor)</translation>
    </message>
    <message>
        <source>a .pdf file that says its tables, for readers who do not see it</source>
        <translation>a .pdf file that says its tables, for readers who do not see it</translation>
    </message>
    <message>
        <source>a .pdf file for archives (PDF/A-2b)</source>
        <translation>a .pdf file for archives (PDF/A-2b)</translation>
    </message>
    <message>
        <source>of the texts of a .pdf file: zh-CN (the locale&apos;s)</source>
        <translation>of the texts of a .pdf file: zh-CN (the locale&apos;s)</translation>
    </message>
    <message>
        <source>%1; its characters are drawn as shapes</source>
        <translation>%1; its characters are drawn as shapes</translation>
    </message>
    <message>
        <source>a document file holds %1 pages; the last %2 were left out</source>
        <translation>a document file holds %1 pages; the last %2 were left out</translation>
    </message>
    <message>
        <source>a document file holds no pictures; watermark and logo were left out</source>
        <translation>a document file holds no pictures; watermark and logo were left out</translation>
    </message>
    <message>
        <source>--format takes pdf, png, svg or ostl, not &quot;%1&quot;</source>
        <translation>--format takes pdf, png, svg or ostl, not &quot;%1&quot;</translation>
    </message>
    <message>
        <source>%1: the name must end in .pdf, .png, .svg or .ostl</source>
        <translation>%1: the name must end in .pdf, .png, .svg or .ostl</translation>
    </message>
    <message>
        <source>say where to export to: -o OUT.pdf, .png, .svg or .ostl</source>
        <translation>say where to export to: -o OUT.pdf, .png, .svg or .ostl</translation>
    </message>
    <message>
        <source>%1 is one input more; several go into a folder, or with --join into one file, and %2 is no folder; quote names with blanks</source>
        <translation>%1 is one input more; several go into a folder, or with --join into one file, and %2 is no folder; quote names with blanks</translation>
    </message>
    <message>
        <source>--pages is for .pdf, .png and .svg; a document file holds all</source>
        <translation>--pages is for .pdf, .png and .svg; a document file holds all</translation>
    </message>
    <message>
        <source>--dpi is for .png images</source>
        <translation>--dpi is for .png images</translation>
    </message>
    <message>
        <source>--jobs is for .png images</source>
        <translation>--jobs is for .png images</translation>
    </message>
    <message>
        <source>--%1 is for .pdf files</source>
        <translation>--%1 is for .pdf files</translation>
    </message>
    <message>
        <source>-o - and --json both want the standard output</source>
        <translation>-o - and --json both want the standard output</translation>
    </message>
    <message>
        <source>Writing</source>
        <translation>Writing</translation>
    </message>
    <message>
        <source>%1 is the file that is read; export to another one</source>
        <translation>%1 is the file that is read; export to another one</translation>
    </message>
    <message>
        <source>%1 has pages of another size; --join wants one size</source>
        <translation>%1 has pages of another size; --join wants one size</translation>
    </message>
    <message>
        <source>several pages as .%1 do not go into one output; name a file, or a page with --pages</source>
        <translation>several pages as .%1 do not go into one output; name a file, or a page with --pages</translation>
    </message>
    <message>
        <source>FILE is a CSV or TSV file, whose first row holds the titles, a JSON file, an .xlsx or
.ods file (file.xlsx:Sheet), an SQLite database (db.sqlite:table, or db.sqlite with
--query), or a saved document (.ostl).
Pages look as the default settings and the options say; --settings takes others.
</source>
        <translation>FILE is a CSV or TSV file, whose first row holds the titles, a JSON file, an .xlsx or
.ods file (file.xlsx:Sheet), an SQLite database (db.sqlite:table, or db.sqlite with
--query), or a saved document (.ostl).
Pages look as the default settings and the options say; --settings takes others.
</translation>
    </message>
    <message>
        <source>Several pages as .png or .svg become OUT-001, OUT-002 and so on.
FILE - is the standard input, OUT - the standard output. Several FILEs become one
file each in the folder OUT, or with --join one file.
</source>
        <translation>Several pages as .png or .svg become OUT-001, OUT-002 and so on.
FILE - is the standard input, OUT - the standard output. Several FILEs become one
file each in the folder OUT, or with --join one file.
</translation>
    </message>
    <message>
        <source>no font is installed, so no text can be drawn; install fonts-dejavu-core, and fonts-arphic-uming for Chinese texts</source>
        <translation>no font is installed, so no text can be drawn; install fonts-dejavu-core, and fonts-arphic-uming for Chinese texts</translation>
    </message>
    <message>
        <source>the font %1 is not installed; %2 is taken instead</source>
        <translation>the font %1 is not installed; %2 is taken instead</translation>
    </message>
    <message>
        <source>write the manual page of the program</source>
        <translation>write the manual page of the program</translation>
    </message>
    <message>
        <source>Previews, exports and prints tables.

</source>
        <translation>Previews, exports and prints tables.

</translation>
    </message>
    <message>
        <source>
&quot;pelloric help COMMAND&quot; says more, &quot;pelloric --version&quot; the version.
</source>
        <translation>
&quot;pelloric help COMMAND&quot; says more, &quot;pelloric --version&quot; the version.
</translation>
    </message>
    <message>
        <source>no command %1; see &quot;pelloric help&quot;</source>
        <translation>no command %1; see &quot;pelloric help&quot;</translation>
    </message>
    <message>
        <source>Shows all kinds of grids on sample tables</source>
        <translation>Shows all kinds of grids on sample tables</translation>
    </message>
    <message>
        <source>Shows a table in the preview window</source>
        <translation>Shows a table in the preview window</translation>
    </message>
    <message>
        <source>Shows a saved document in the preview window</source>
        <translation>Shows a saved document in the preview window</translation>
    </message>
    <message>
        <source>Writes tables as PDF, PNG, SVG or a document file</source>
        <translation>Writes tables as PDF, PNG, SVG or a document file</translation>
    </message>
    <message>
        <source>Runs a script that drives the controls by name</source>
        <translation>Runs a script that drives the controls by name</translation>
    </message>
    <message>
        <source>Prints a table or a document file</source>
        <translation>Prints a table or a document file</translation>
    </message>
    <message>
        <source>Lists the printers</source>
        <translation>Lists the printers</translation>
    </message>
    <message>
        <source>Shows or restores the settings file</source>
        <translation>Shows or restores the settings file</translation>
    </message>
    <message>
        <source>Writes the completion of a shell: bash, zsh or fish</source>
        <translation>Writes the completion of a shell: bash, zsh or fish</translation>
    </message>
    <message>
        <source>Explains the commands</source>
        <translation>Explains the commands</translation>
    </message>
    <message>
        <source>usage: pelloric %1; for example: %2; &quot;pelloric help %3&quot; says more</source>
        <translation>usage: pelloric %1; for example: %2; &quot;pelloric help %3&quot; says more</translation>
    </message>
    <message>
        <source>say what to do, for example &quot;pelloric export table.csv -o table.pdf&quot;; see &quot;pelloric help&quot;</source>
        <translation>say what to do, for example &quot;pelloric export table.csv -o table.pdf&quot;; see &quot;pelloric help&quot;</translation>
    </message>
    <message>
        <source>there is not enough memory for this table</source>
        <translation>there is not enough memory for this table</translation>
    </message>
    <message>
        <source>%1: there is no such file</source>
        <translation>%1: there is no such file</translation>
    </message>
    <message>
        <source>FILE is a document file (.ostl) that the preview window or
&quot;pelloric export&quot; has saved.
</source>
        <translation>FILE is a document file (.ostl) that the preview window or
&quot;pelloric export&quot; has saved.
</translation>
    </message>
    <message>
        <source>tell nothing but errors</source>
        <translation>tell nothing but errors</translation>
    </message>
    <message>
        <source>tell what was made in JSON, one object a line</source>
        <translation>tell what was made in JSON, one object a line</translation>
    </message>
    <message>
        <source>%1 is a saved document; show it with &quot;pelloric open&quot;</source>
        <translation>%1 is a saved document; show it with &quot;pelloric open&quot;</translation>
    </message>
    <message>
        <source>FILE is a CSV or TSV file, whose first row holds the titles, a JSON file, an .xlsx or
.ods file (file.xlsx:Sheet), or an SQLite database (db.sqlite:table, or db.sqlite with
--query). Pages look as your settings say, which the window&apos;s dialogs
change; --defaults does without them. With one of the options for
headers, paper and so on, what the dialogs change is not kept.
</source>
        <translation>FILE is a CSV or TSV file, whose first row holds the titles, a JSON file, an .xlsx or
.ods file (file.xlsx:Sheet), or an SQLite database (db.sqlite:table, or db.sqlite with
--query). Pages look as your settings say, which the window&apos;s dialogs
change; --defaults does without them. With one of the options for
headers, paper and so on, what the dialogs change is not kept.
</translation>
    </message>
    <message>
        <source>where to: a name of &quot;pelloric printers&quot; (the current one)</source>
        <translation>where to: a name of &quot;pelloric printers&quot; (the current one)</translation>
    </message>
    <message>
        <source>whole copies, one after the other (1)</source>
        <translation>whole copies, one after the other (1)</translation>
    </message>
    <message>
        <source>no printer &quot;%1&quot;; see &quot;pelloric printers&quot;</source>
        <translation>no printer &quot;%1&quot;; see &quot;pelloric printers&quot;</translation>
    </message>
    <message>
        <source>Printing</source>
        <translation>Printing</translation>
    </message>
    <message>
        <source>%1: %2 page sent
</source>
        <translation>%1: %2 page sent
</translation>
    </message>
    <message>
        <source>%1: %2 pages sent
</source>
        <translation>%1: %2 pages sent
</translation>
    </message>
    <message>
        <source>Every page is a job of its own, one-sided, on the paper it was laid out for.
</source>
        <translation>Every page is a job of its own, one-sided, on the paper it was laid out for.
</translation>
    </message>
    <message>
        <source>also list the papers, each with its code and size</source>
        <translation>also list the papers, each with its code and size</translation>
    </message>
    <message>
        <source>ready</source>
        <translation>ready</translation>
    </message>
    <message>
        <source>The printer with the star is used when none is named.
</source>
        <translation>The printer with the star is used when none is named.
</translation>
    </message>
    <message>
        <source>Laying out</source>
        <translation>Laying out</translation>
    </message>
    <message>
        <source>--widths names %1 columns; the table has %2</source>
        <translation>--widths names %1 columns; the table has %2</translation>
    </message>
    <message>
        <source>--as-shown does nothing here: only cells of office files have looks</source>
        <translation>--as-shown does nothing here: only cells of office files have looks</translation>
    </message>
    <message>
        <source>no column is wide enough to be printed; give other --widths</source>
        <translation>no column is wide enough to be printed; give other --widths</translation>
    </message>
    <message>
        <source>--%1 does not apply to a saved document, whose pages are laid out</source>
        <translation>--%1 does not apply to a saved document, whose pages are laid out</translation>
    </message>
    <message>
        <source>%1 is no document file</source>
        <translation>%1 is no document file</translation>
    </message>
    <message>
        <source>--pages %1 names no page; the document has %2 (write 1,3,5-12)</source>
        <translation>--pages %1 names no page; the document has %2 (write 1,3,5-12)</translation>
    </message>
    <message>
        <source>the default settings, whatever the user&apos;s are</source>
        <translation>the default settings, whatever the user&apos;s are</translation>
    </message>
    <message>
        <source>the settings of this file; the default ones for those it lacks</source>
        <translation>the settings of this file; the default ones for those it lacks</translation>
    </message>
    <message>
        <source>title of the file, and centred above every page</source>
        <translation>title of the file, and centred above every page</translation>
    </message>
    <message>
        <source>A2 to A6, B5, Letter, Legal, Tabloid, 8k, 16k, 10x15cm, 4x6in</source>
        <translation>A2 to A6, B5, Letter, Legal, Tabloid, 8k, 16k, 10x15cm, 4x6in</translation>
    </message>
    <message>
        <source>top,right,bottom,left, or one for all: 10mm, 1.5cm or 0.5in</source>
        <translation>top,right,bottom,left, or one for all: 10mm, 1.5cm or 0.5in</translation>
    </message>
    <message>
        <source>the paper&apos;s long side lies below</source>
        <translation>the paper&apos;s long side lies below</translation>
    </message>
    <message>
        <source>the paper stands upright</source>
        <translation>the paper stands upright</translation>
    </message>
    <message>
        <source>print equal neighbouring cells once</source>
        <translation>print equal neighbouring cells once</translation>
    </message>
    <message>
        <source>leave out the row of column titles</source>
        <translation>leave out the row of column titles</translation>
    </message>
    <message>
        <source>the face of all texts</source>
        <translation>the face of all texts</translation>
    </message>
    <message>
        <source>the size of the cells&apos; texts: points</source>
        <translation>the size of the cells&apos; texts: points</translation>
    </message>
    <message>
        <source>widths of the columns: twips (1440 an inch); 0 leaves one out</source>
        <translation>widths of the columns: twips (1440 an inch); 0 leaves one out</translation>
    </message>
    <message>
        <source>unknown paper &quot;%1&quot;; take one of %2, or a size such as 100x150mm or 4x6in</source>
        <translation>unknown paper &quot;%1&quot;; take one of %2, or a size such as 100x150mm or 4x6in</translation>
    </message>
    <message>
        <source>--paper takes lengths from %1 to %2 mm, not &quot;%3&quot;</source>
        <translation>--paper takes lengths from %1 to %2 mm, not &quot;%3&quot;</translation>
    </message>
    <message>
        <source>take either --landscape or --portrait, not both</source>
        <translation>take either --landscape or --portrait, not both</translation>
    </message>
    <message>
        <source>%1 Correct it in the file, or do without: --defaults</source>
        <translation>%1 Correct it in the file, or do without: --defaults</translation>
    </message>
    <message>
        <source>%1 holds no setting; &quot;pelloric settings --path&quot; names yours</source>
        <translation>%1 holds no setting; &quot;pelloric settings --path&quot; names yours</translation>
    </message>
    <message>
        <source>take either --defaults or --settings, not both</source>
        <translation>take either --defaults or --settings, not both</translation>
    </message>
    <message>
        <source>say which script to run</source>
        <translation>say which script to run</translation>
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
        <translation>The script finds Sorvane and Kestrane, the records and enumerations of their interface,
args, messages, print(...), exit(status), csv(path), sqlite(path, tableOrQuery),
lines(canvas, page), texts(canvas, page), placePicture(canvas, page, picture) and
wait(milliseconds). A control also has grab(path) and resize(width, height).
Kestrane.doPreview builds in the preview window, whose canvas previewCanvas() is. Nothing
is shown, unless --window stands before SCRIPT: then the program goes on until the window
is closed.
An exception that it does not catch ends the program with status 1.
</translation>
    </message>
    <message>
        <source>only say where the file is</source>
        <translation>only say where the file is</translation>
    </message>
    <message>
        <source>put the default settings back</source>
        <translation>put the default settings back</translation>
    </message>
    <message>
        <source>only rows whose column NAME holds TEXT</source>
        <translation>only rows whose column NAME holds TEXT</translation>
    </message>
    <message>
        <source>cells have the fonts, colours and alignment of the office file</source>
        <translation>cells have the fonts, colours and alignment of the office file</translation>
    </message>
    <message>
        <source>turn the paper, then shrink, until the table is as wide as one page</source>
        <translation>turn the paper, then shrink, until the table is as wide as one page</translation>
    </message>
    <message>
        <source>shrink until the table is at most N pages wide</source>
        <translation>shrink until the table is at most N pages wide</translation>
    </message>
    <message>
        <source>columns to repeat at the left of every page</source>
        <translation>columns to repeat at the left of every page</translation>
    </message>
    <message>
        <source>all rows of the first columns come before the next columns</source>
        <translation>all rows of the first columns come before the next columns</translation>
    </message>
    <message>
        <source>rows with equal texts in these columns stay on one page</source>
        <translation>rows with equal texts in these columns stay on one page</translation>
    </message>
    <message>
        <source>totals of columns; F is sum, count, mean, min or max</source>
        <translation>totals of columns; F is sum, count, mean, min or max</translation>
    </message>
    <message>
        <source>a faint text across every page</source>
        <translation>a faint text across every page</translation>
    </message>
    <message>
        <source>a faint picture in the middle of every page</source>
        <translation>a faint picture in the middle of every page</translation>
    </message>
    <message>
        <source>of the watermark, 1 to 100 (15)</source>
        <translation>of the watermark, 1 to 100 (15)</translation>
    </message>
    <message>
        <source>the watermark lies above the table, not behind it</source>
        <translation>the watermark lies above the table, not behind it</translation>
    </message>
    <message>
        <source>a picture at the top of every page</source>
        <translation>a picture at the top of every page</translation>
    </message>
    <message>
        <source>where the logo stands: left, center or right (left)</source>
        <translation>where the logo stands: left, center or right (left)</translation>
    </message>
    <message>
        <source>--total takes sum, count, mean, min or max, a colon and a column, such as sum:Price, not &quot;%1&quot;</source>
        <translation>--total takes sum, count, mean, min or max, a colon and a column, such as sum:Price, not &quot;%1&quot;</translation>
    </message>
    <message>
        <source>--logo-at takes left, center or right, not &quot;%1&quot;</source>
        <translation>--logo-at takes left, center or right, not &quot;%1&quot;</translation>
    </message>
    <message>
        <source>--%1 says something about --%2, which is not given</source>
        <translation>--%1 says something about --%2, which is not given</translation>
    </message>
    <message>
        <source>--watermark and --watermark-image exclude each other</source>
        <translation>--watermark and --watermark-image exclude each other</translation>
    </message>
    <message>
        <source>--where takes a column, &quot;=&quot; and a text, not &quot;%1&quot;</source>
        <translation>--where takes a column, &quot;=&quot; and a text, not &quot;%1&quot;</translation>
    </message>
    <message>
        <source>only these columns, in this order; #3 is the third</source>
        <translation>only these columns, in this order; #3 is the third</translation>
    </message>
    <message>
        <source>sort the rows by these columns; NAME:desc downwards</source>
        <translation>sort the rows by these columns; NAME:desc downwards</translation>
    </message>
    <message>
        <source>only these rows, from 1, after sorting; 100- and -100 work, too</source>
        <translation>only these rows, from 1, after sorting; 100- and -100 work, too</translation>
    </message>
    <message>
        <source>--%1: there is no column &quot;%2&quot;; the table has %3</source>
        <translation>--%1: there is no column &quot;%2&quot;; the table has %3</translation>
    </message>
    <message>
        <source>--rows takes a range such as 1-100, not &quot;%1&quot;</source>
        <translation>--rows takes a range such as 1-100, not &quot;%1&quot;</translation>
    </message>
    <message>
        <source>--rows %1 names no row; the table has %2</source>
        <translation>--rows %1 names no row; the table has %2</translation>
    </message>
    <message>
        <source>what to take of a database: a SELECT statement</source>
        <translation>what to take of a database: a SELECT statement</translation>
    </message>
    <message>
        <source>of a text file; else found out</source>
        <translation>of a text file; else found out</translation>
    </message>
    <message>
        <source>between the values of a CSV file, or tab; else found out</source>
        <translation>between the values of a CSV file, or tab; else found out</translation>
    </message>
    <message>
        <source>a quote in a CSV file is a character like any other</source>
        <translation>a quote in a CSV file is a character like any other</translation>
    </message>
    <message>
        <source>standard input</source>
        <translation>standard input</translation>
    </message>
    <message>
        <source>%1 is a folder; name a file in it</source>
        <translation>%1 is a folder; name a file in it</translation>
    </message>
    <message>
        <source>%1 is a device; name a file</source>
        <translation>%1 is a device; name a file</translation>
    </message>
    <message>
        <source>%1: you may not read this file</source>
        <translation>%1: you may not read this file</translation>
    </message>
    <message>
        <source>--encoding is for CSV and TSV files, not databases</source>
        <translation>--encoding is for CSV and TSV files, not databases</translation>
    </message>
    <message>
        <source>take either a table or --query, not both</source>
        <translation>take either a table or --query, not both</translation>
    </message>
    <message>
        <source>Reading</source>
        <translation>Reading</translation>
    </message>
    <message>
        <source>--delimiter takes one ASCII character, or &quot;tab&quot;, not &quot;%1&quot;</source>
        <translation>--delimiter takes one ASCII character, or &quot;tab&quot;, not &quot;%1&quot;</translation>
    </message>
    <message>
        <source>--query is for databases; %1 is none</source>
        <translation>--query is for databases; %1 is none</translation>
    </message>
    <message>
        <source>of hints, tips and errors (the locale&apos;s): de, en, zh_CN, or system; the rest has one wording</source>
        <translation>of hints, tips and errors (the locale&apos;s): de, en, zh_CN, or system; the rest has one wording</translation>
    </message>
    <message>
        <source>--language %1: there are de, en, zh_CN, and system</source>
        <translation>--language %1: there are de, en, zh_CN, and system</translation>
    </message>
    <message>
        <source>there is no display to show windows on; &quot;pelloric export&quot; and &quot;pelloric demo --walk OUT&quot; need none</source>
        <translation>there is no display to show windows on; &quot;pelloric export&quot; and &quot;pelloric demo --walk OUT&quot; need none</translation>
    </message>
    <message>
        <source>a document file holds no icons of cells; they were left out</source>
        <translation>a document file holds no icons of cells; they were left out</translation>
    </message>
    <message>
        <source>a document file has no code for some characters; %1 of its texts show &quot;?&quot; for them</source>
        <translation>a document file has no code for some characters; %1 of its texts show &quot;?&quot; for them</translation>
    </message>
    <message>
        <source>1 cell</source>
        <translation>1 cell</translation>
    </message>
    <message>
        <source>%1 cells</source>
        <translation>%1 cells</translation>
    </message>
    <message>
        <source>no row is printed: --where %1 holds for none</source>
        <translation>no row is printed: --where %1 holds for none</translation>
    </message>
    <message>
        <source>the total of %1 leaves out %2, being no numbers</source>
        <translation>the total of %1 leaves out %2, being no numbers</translation>
    </message>
    <message>
        <source>%1 is a pipe; a saved document is read from a file, so save it to one and name that</source>
        <translation>%1 is a pipe; a saved document is read from a file, so save it to one and name that</translation>
    </message>
    <message>
        <source>--margins takes one length of %1 mm or more and at most %2 mm, or four (top,right,bottom,left), not &quot;%3&quot;</source>
        <translation>--margins takes one length of %1 mm or more and at most %2 mm, or four (top,right,bottom,left), not &quot;%3&quot;</translation>
    </message>
    <message>
        <source>%1 cannot be kept in %2: %3; name another folder in TMPDIR, or save it to a file and name that</source>
        <translation>%1 cannot be kept in %2: %3; name another folder in TMPDIR, or save it to a file and name that</translation>
    </message>
    <message>
        <source>%1 cannot be read: %2</source>
        <translation>%1 cannot be read: %2</translation>
    </message>
    <message>
        <source>%1 goes on after %2 GB, which is the most that is taken of a pipe; save it to a file and name that, or hand over fewer rows</source>
        <translation>%1 goes on after %2 GB, which is the most that is taken of a pipe; save it to a file and name that, or hand over fewer rows</translation>
    </message>
    <message>
        <source>%1 does not fit into %2, where it is kept while it is read; make room there, or name another folder in TMPDIR</source>
        <translation>%1 does not fit into %2, where it is kept while it is read; make room there, or name another folder in TMPDIR</translation>
    </message>
    <message>
        <source>%1 is a socket; name a file</source>
        <translation>%1 is a socket; name a file</translation>
    </message>
    <message>
        <source>%1 takes %2, not &quot;%3&quot;: %4</source>
        <translation>%1 takes %2, not &quot;%3&quot;: %4</translation>
    </message>
    <message>
        <source>%1: the folder cannot be made: %2</source>
        <translation>%1: the folder cannot be made: %2</translation>
    </message>
    <message>
        <source>--%1 names no column, only &quot;%2&quot;</source>
        <translation>--%1 names no column, only &quot;%2&quot;</translation>
    </message>
    <message>
        <source>%1 is no SQLite database and no office file, so it has no table &quot;%2&quot;</source>
        <translation>%1 is no SQLite database and no office file, so it has no table &quot;%2&quot;</translation>
    </message>
    <message>
        <source>the stack may hold %1 KB only; allow %2 at least: ulimit -s 8192</source>
        <translation>the stack may hold %1 KB only; allow %2 at least: ulimit -s 8192</translation>
    </message>
    <message>
        <source>only %1 files may be open; allow %2 at least: ulimit -n 1024</source>
        <translation>only %1 files may be open; allow %2 at least: ulimit -n 1024</translation>
    </message>
    <message>
        <source>hidden rows and columns of an office sheet, too</source>
        <translation>hidden rows and columns of an office sheet, too</translation>
    </message>
    <message>
        <source>1 hidden row</source>
        <translation>1 hidden row</translation>
    </message>
    <message>
        <source>%1 hidden rows</source>
        <translation>%1 hidden rows</translation>
    </message>
    <message>
        <source>1 hidden column</source>
        <translation>1 hidden column</translation>
    </message>
    <message>
        <source>%1 hidden columns</source>
        <translation>%1 hidden columns</translation>
    </message>
    <message>
        <source>%1 and %2</source>
        <translation>%1 and %2</translation>
    </message>
    <message>
        <source>%1: left out are %2; --hidden takes them, too</source>
        <translation>%1: left out are %2; --hidden takes them, too</translation>
    </message>
    <message>
        <source>A NAME that holds a comma stands in double quotes, as in a CSV file:
--columns &apos;Item,&quot;Price, net&quot;&apos;.
</source>
        <translation>A NAME that holds a comma stands in double quotes, as in a CSV file:
--columns &apos;Item,&quot;Price, net&quot;&apos;.
</translation>
    </message>
    <message>
        <source>standard output cannot be written: %1</source>
        <translation>standard output cannot be written: %1</translation>
    </message>
    <message>
        <source>Everything was done.</source>
        <translation>Everything was done.</translation>
    </message>
    <message>
        <source>It failed; standard error says why in one line.</source>
        <translation>It failed; standard error says why in one line.</translation>
    </message>
    <message>
        <source>The program was called in a wrong way.</source>
        <translation>The program was called in a wrong way.</translation>
    </message>
    <message>
        <source>It was ended by Ctrl+C or a signal.</source>
        <translation>It was ended by Ctrl+C or a signal.</translation>
    </message>
    <message>
        <source>User Commands</source>
        <translation>User Commands</translation>
    </message>
    <message>
        <source>NAME</source>
        <translation>NAME</translation>
    </message>
    <message>
        <source>previews, exports and prints tables</source>
        <translation>previews, exports and prints tables</translation>
    </message>
    <message>
        <source>SYNOPSIS</source>
        <translation>SYNOPSIS</translation>
    </message>
    <message>
        <source>DESCRIPTION</source>
        <translation>DESCRIPTION</translation>
    </message>
    <message>
        <source>Lays tables out into pages with header, titles, grid lines and footer, and shows, prints or saves them.</source>
        <translation>Lays tables out into pages with header, titles, grid lines and footer, and shows, prints or saves them.</translation>
    </message>
    <message>
        <source>COMMANDS</source>
        <translation>COMMANDS</translation>
    </message>
    <message>
        <source>EXIT STATUS</source>
        <translation>EXIT STATUS</translation>
    </message>
    <message>
        <source>FILES</source>
        <translation>FILES</translation>
    </message>
    <message>
        <source>Paper, margins, texts and styles; see &quot;pelloric settings&quot;.</source>
        <translation>Paper, margins, texts and styles; see &quot;pelloric settings&quot;.</translation>
    </message>
    <message>
        <source>no completion for the shell %1; take bash, zsh or fish</source>
        <translation>no completion for the shell %1; take bash, zsh or fish</translation>
    </message>
    <message>
        <source>For bash: source &lt;(pelloric completion bash)
For zsh: pelloric completion zsh &gt; a folder of $fpath, as _pelloric
For fish: pelloric completion fish | source
</source>
        <translation>For bash: source &lt;(pelloric completion bash)
For zsh: pelloric completion zsh &gt; a folder of $fpath, as _pelloric
For fish: pelloric completion fish | source
</translation>
    </message>
    <message>
        <source>above every page, at the left</source>
        <translation>above every page, at the left</translation>
    </message>
    <message>
        <source>above every page, in the middle</source>
        <translation>above every page, in the middle</translation>
    </message>
    <message>
        <source>above every page, at the right</source>
        <translation>above every page, at the right</translation>
    </message>
    <message>
        <source>below every page, at the left</source>
        <translation>below every page, at the left</translation>
    </message>
    <message>
        <source>below every page, in the middle</source>
        <translation>below every page, in the middle</translation>
    </message>
    <message>
        <source>below every page, at the right</source>
        <translation>below every page, at the right</translation>
    </message>
    <message>
        <source>The texts above and below every page may hold one of the fields [Date Printed],
[Time Printed], [Date &amp; Time Printed], [Page # of Pages #], [Total Pages] and [Page #].
</source>
        <translation>The texts above and below every page may hold one of the fields [Date Printed],
[Time Printed], [Date &amp; Time Printed], [Page # of Pages #], [Total Pages] and [Page #].
</translation>
    </message>
    <message>
        <source>%1; settings files are smaller</source>
        <translation>%1; settings files are smaller</translation>
    </message>
    <message>
        <source>the script nests values deeper than its stack holds</source>
        <translation>the script nests values deeper than its stack holds</translation>
    </message>
    <message>
        <source>%1 is a file; say what to do with it: pelloric %2 %1</source>
        <translation>%1 is a file; say what to do with it: pelloric %2 %1</translation>
    </message>
    <message>
        <source>an argument is missing</source>
        <translation>an argument is missing</translation>
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
