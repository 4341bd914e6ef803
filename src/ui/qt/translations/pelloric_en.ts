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
