<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="zh_CN" sourcelanguage="en">
<context>
    <name>KeysWindow</name>
    <message>
        <source>Read on, at the end the next page</source>
        <translation>向下阅读，到页尾时转到下一页</translation>
    </message>
    <message>
        <source>Read back, at the top the page before</source>
        <translation>向上阅读，到页首时转到上一页</translation>
    </message>
    <message>
        <source>Scroll a little</source>
        <translation>滚动少许</translation>
    </message>
    <message>
        <source>Top and bottom of the page</source>
        <translation>页首和页尾</translation>
    </message>
    <message>
        <source>Scale under the pointer</source>
        <translation>以指针处为中心缩放</translation>
    </message>
    <message>
        <source>Scroll sideways</source>
        <translation>左右滚动</translation>
    </message>
    <message>
        <source>Select texts</source>
        <translation>选择文字</translation>
    </message>
    <message>
        <source>Menu of the pages</source>
        <translation>页面菜单</translation>
    </message>
    <message>
        <source>Close what is open, end what runs, then leave</source>
        <translation>关闭打开的部分，结束正在进行的操作，然后退出</translation>
    </message>
    <message>
        <source>Keys</source>
        <translation>快捷键</translation>
    </message>
    <message>
        <source>What they do</source>
        <translation>作用</translation>
    </message>
</context>
<context>
    <name>ToolMeanings</name>
    <message>
        <source>Fonts, colours and grid lines of the report</source>
        <translation>报表的字体、颜色和网格线</translation>
    </message>
    <message>
        <source>Read the table again</source>
        <translation>重新读取表格</translation>
    </message>
    <message>
        <source>Show the pages twice as large</source>
        <translation>将页面放大一倍显示</translation>
    </message>
    <message>
        <source>Show the pages half as large</source>
        <translation>将页面缩小一半显示</translation>
    </message>
    <message>
        <source>Go to the first page</source>
        <translation>转到首页</translation>
    </message>
    <message>
        <source>Go back a page</source>
        <translation>转到上一页</translation>
    </message>
    <message>
        <source>Go on to the next page</source>
        <translation>转到下一页</translation>
    </message>
    <message>
        <source>Go to the last page</source>
        <translation>转到末页</translation>
    </message>
    <message>
        <source>Show all pages, or six of a long report</source>
        <translation>显示所有页面，长报表则显示六页</translation>
    </message>
    <message>
        <source>Show one page</source>
        <translation>显示一页</translation>
    </message>
    <message>
        <source>Drag the pages with the mouse</source>
        <translation>用鼠标拖动页面</translation>
    </message>
    <message>
        <source>Print all pages or some</source>
        <translation>打印全部或部分页面</translation>
    </message>
    <message>
        <source>Paper, margins, header and footer</source>
        <translation>纸张、页边距、页眉和页脚</translation>
    </message>
    <message>
        <source>Fill the window with one page</source>
        <translation>用一页填满窗口</translation>
    </message>
    <message>
        <source>Show two pages</source>
        <translation>显示两页</translation>
    </message>
    <message>
        <source>Scale of the pages: pick one or type it</source>
        <translation>页面比例：选择或输入</translation>
    </message>
    <message>
        <source>Go to a page: pick one or type its number</source>
        <translation>转到某页：选择或输入页码</translation>
    </message>
    <message>
        <source>Close the preview</source>
        <translation>关闭预览</translation>
    </message>
    <message>
        <source>Show four pages</source>
        <translation>显示四页</translation>
    </message>
    <message>
        <source>Name and version</source>
        <translation>名称和版本</translation>
    </message>
    <message>
        <source>Open saved pages</source>
        <translation>打开已保存的页面</translation>
    </message>
    <message>
        <source>Save the pages to a file</source>
        <translation>将页面保存到文件</translation>
    </message>
    <message>
        <source>Throw all pages away</source>
        <translation>清除所有页面</translation>
    </message>
    <message>
        <source>Larger text and columns</source>
        <translation>放大文字和列</translation>
    </message>
    <message>
        <source>Smaller text and columns</source>
        <translation>缩小文字和列</translation>
    </message>
</context>
<context>
    <name>pelloric::qt::AboutBox</name>
    <message>
        <source>About</source>
        <translation>关于</translation>
    </message>
    <message>
        <source>Print preview and printing of grids.</source>
        <translation>表格的打印预览与打印。</translation>
    </message>
</context>
<context>
    <name>pelloric::qt::BackScreen</name>
    <message>
        <source>Pages</source>
        <translation>页面</translation>
    </message>
</context>
<context>
    <name>pelloric::qt::CanvasAreas</name>
    <message>
        <source>Hand cursor</source>
        <translation>手形光标</translation>
    </message>
    <message>
        <source>Picture</source>
        <translation>图片</translation>
    </message>
    <message>
        <source>Horizontal scroll bar</source>
        <translation>水平滚动条</translation>
    </message>
    <message>
        <source>Vertical scroll bar</source>
        <translation>垂直滚动条</translation>
    </message>
</context>
<context>
    <name>pelloric::qt::FileBox</name>
    <message>
        <source>Folder</source>
        <translation>文件夹</translation>
    </message>
    <message>
        <source>Kind of files</source>
        <translation>文件类型</translation>
    </message>
</context>
<context>
    <name>pelloric::qt::FindBar</name>
    <message>
        <source>Previous place (Shift+F3)</source>
        <translation>上一处 (Shift+F3)</translation>
    </message>
    <message>
        <source>Next place (F3)</source>
        <translation>下一处 (F3)</translation>
    </message>
    <message>
        <source>Close (Esc)</source>
        <translation>关闭 (Esc)</translation>
    </message>
    <message>
        <source>Find</source>
        <translation>查找</translation>
    </message>
    <message>
        <source>Text to find</source>
        <translation>要查找的文字</translation>
    </message>
    <message>
        <source>Find on the pages</source>
        <translation>在页面中查找</translation>
    </message>
    <message>
        <source>Not found</source>
        <translation>未找到</translation>
    </message>
    <message>
        <source>Searching…</source>
        <translation>正在查找…</translation>
    </message>
    <message>
        <source>%L1 found</source>
        <translation>找到 %L1 处</translation>
    </message>
    <message>
        <source>%L1 of %L2</source>
        <translation>第 %L1 处，共 %L2 处</translation>
    </message>
</context>
<context>
    <name>pelloric::qt::FontChooser</name>
    <message>
        <source>Font</source>
        <translation>字体</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>确定</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>取消</translation>
    </message>
    <message>
        <source>Font:</source>
        <translation>字体：</translation>
    </message>
    <message>
        <source>Size:</source>
        <translation>大小：</translation>
    </message>
    <message>
        <source>Effects</source>
        <translation>效果</translation>
    </message>
    <message>
        <source>Bold</source>
        <translation>粗体</translation>
    </message>
    <message>
        <source>Italic</source>
        <translation>斜体</translation>
    </message>
    <message>
        <source>Strikeout</source>
        <translation>删除线</translation>
    </message>
    <message>
        <source>Underline</source>
        <translation>下划线</translation>
    </message>
    <message>
        <source>Color:</source>
        <translation>颜色：</translation>
    </message>
    <message>
        <source>Sample</source>
        <translation>示例</translation>
    </message>
</context>
<context>
    <name>pelloric::qt::GridStyleDialog</name>
    <message>
        <source>Fonts</source>
        <translation>字体</translation>
    </message>
</context>
<context>
    <name>pelloric::qt::Kestrane</name>
    <message>
        <source>Print preview</source>
        <translation>打印预览</translation>
    </message>
</context>
<context>
    <name>pelloric::qt::NoticeStrip</name>
    <message>
        <source>Page &amp;Setup...</source>
        <translation>页面设置(&amp;S)...</translation>
    </message>
    <message>
        <source>Change paper, margins, header and footer</source>
        <translation>更改纸张、页边距、页眉和页脚</translation>
    </message>
    <message>
        <source>&amp;Design Report...</source>
        <translation>设计报表(&amp;D)...</translation>
    </message>
    <message>
        <source>Change fonts, colours and grid lines</source>
        <translation>更改字体、颜色和网格线</translation>
    </message>
    <message>
        <source>Restore De&amp;faults</source>
        <translation>恢复默认值(&amp;F)</translation>
    </message>
    <message>
        <source>Give every setting that is missing or cannot be used its default value; the old file is kept beside</source>
        <translation>将缺少或无法使用的设置恢复为默认值；旧文件保留在旁边</translation>
    </message>
    <message>
        <source>Notice</source>
        <translation>提示信息</translation>
    </message>
    <message>
        <source>Hide this notice</source>
        <translation>隐藏此提示</translation>
    </message>
</context>
<context>
    <name>pelloric::qt::OptionsPanel</name>
    <message>
        <source>Report Options</source>
        <translation>报表选项</translation>
    </message>
    <message>
        <source>Look</source>
        <translation>外观</translation>
    </message>
    <message>
        <source>Cells &amp;as the view shows them</source>
        <translation>单元格与视图一致(&amp;A)</translation>
    </message>
    <message>
        <source>Width</source>
        <translation>宽度</translation>
    </message>
    <message>
        <source>As it is, in bands</source>
        <translation>保持原宽，分栏打印</translation>
    </message>
    <message>
        <source>Turn, then shrink</source>
        <translation>先横向，再缩小</translation>
    </message>
    <message>
        <source>Shrink to pages across</source>
        <translation>缩小到指定页宽</translation>
    </message>
    <message>
        <source>Across, then down</source>
        <translation>先横后竖</translation>
    </message>
    <message>
        <source>Down, then across</source>
        <translation>先竖后横</translation>
    </message>
    <message>
        <source>&amp;Fit:</source>
        <translation>适应(&amp;F)：</translation>
    </message>
    <message>
        <source>Pages a&amp;cross:</source>
        <translation>横向页数(&amp;C)：</translation>
    </message>
    <message>
        <source>&amp;Key columns:</source>
        <translation>重复列数(&amp;K)：</translation>
    </message>
    <message>
        <source>Page or&amp;der:</source>
        <translation>页序(&amp;D)：</translation>
    </message>
    <message>
        <source>Rows and Columns</source>
        <translation>行和列</translation>
    </message>
    <message>
        <source>All</source>
        <translation>全部</translation>
    </message>
    <message>
        <source>Selected in the view</source>
        <translation>视图中选中的行</translation>
    </message>
    <message>
        <source>Range</source>
        <translation>范围</translation>
    </message>
    <message>
        <source>all, or titles: Name, Price</source>
        <translation>全部，或标题：名称, 价格</translation>
    </message>
    <message>
        <source>&amp;Rows:</source>
        <translation>行(&amp;R)：</translation>
    </message>
    <message>
        <source>From:</source>
        <translation>从：</translation>
    </message>
    <message>
        <source>&amp;To:</source>
        <translation>到(&amp;T)：</translation>
    </message>
    <message>
        <source>Co&amp;lumns:</source>
        <translation>列(&amp;L)：</translation>
    </message>
    <message>
        <source>Groups and Totals</source>
        <translation>分组与合计</translation>
    </message>
    <message>
        <source>titles: Country</source>
        <translation>标题：国家</translation>
    </message>
    <message>
        <source>K&amp;eep groups on a page</source>
        <translation>同组行保持在一页(&amp;E)</translation>
    </message>
    <message>
        <source>Sum</source>
        <translation>合计</translation>
    </message>
    <message>
        <source>Count</source>
        <translation>计数</translation>
    </message>
    <message>
        <source>Mean</source>
        <translation>平均值</translation>
    </message>
    <message>
        <source>Minimum</source>
        <translation>最小值</translation>
    </message>
    <message>
        <source>Maximum</source>
        <translation>最大值</translation>
    </message>
    <message>
        <source>titles: Price</source>
        <translation>标题：价格</translation>
    </message>
    <message>
        <source>Group b&amp;y:</source>
        <translation>分组依据(&amp;Y)：</translation>
    </message>
    <message>
        <source>T&amp;otal:</source>
        <translation>汇总(&amp;O)：</translation>
    </message>
    <message>
        <source>of col&amp;umns:</source>
        <translation>汇总列(&amp;U)：</translation>
    </message>
    <message>
        <source>Watermark and Logo</source>
        <translation>水印与徽标</translation>
    </message>
    <message>
        <source>a text, such as Draft</source>
        <translation>文字，如“草稿”</translation>
    </message>
    <message>
        <source>or a picture file</source>
        <translation>或图片文件</translation>
    </message>
    <message>
        <source>A&amp;bove the table</source>
        <translation>置于表格之上(&amp;B)</translation>
    </message>
    <message>
        <source>a picture file</source>
        <translation>图片文件</translation>
    </message>
    <message>
        <source>Left</source>
        <translation>左</translation>
    </message>
    <message>
        <source>Centre</source>
        <translation>中</translation>
    </message>
    <message>
        <source>Right</source>
        <translation>右</translation>
    </message>
    <message>
        <source>Text:</source>
        <translation>文字：</translation>
    </message>
    <message>
        <source>&amp;Picture:</source>
        <translation>图片(&amp;P)：</translation>
    </message>
    <message>
        <source>Picture of the watermark</source>
        <translation>水印图片</translation>
    </message>
    <message>
        <source>Opac&amp;ity:</source>
        <translation>不透明度(&amp;I)：</translation>
    </message>
    <message>
        <source>Lo&amp;go:</source>
        <translation>徽标(&amp;G)：</translation>
    </message>
    <message>
        <source>Picture of the logo</source>
        <translation>徽标图片</translation>
    </message>
    <message>
        <source>&amp;Slot:</source>
        <translation>位置(&amp;S)：</translation>
    </message>
    <message>
        <source>Choose: %1</source>
        <translation>选择：%1</translation>
    </message>
    <message>
        <source>Choose a file</source>
        <translation>选择文件</translation>
    </message>
    <message>
        <source>Pictures (*.png *.jpg *.jpeg *.bmp *.gif *.svg)</source>
        <translation>图片 (*.png *.jpg *.jpeg *.bmp *.gif *.svg)</translation>
    </message>
    <message>
        <source>The table fits as it is.</source>
        <translation>表格无需调整即可放下。</translation>
    </message>
    <message>
        <source>The table fits on turned paper.</source>
        <translation>表格在横向纸上可以放下。</translation>
    </message>
    <message>
        <source>Shrunk to %1 % on turned paper.</source>
        <translation>已在横向纸上缩小到 %1 %。</translation>
    </message>
    <message>
        <source>Shrunk to %1 %.</source>
        <translation>已缩小到 %1 %。</translation>
    </message>
    <message>
        <source>Too wide to be shrunk: printed in bands.</source>
        <translation>表格太宽，无法缩小：分栏打印。</translation>
    </message>
</context>
<context>
    <name>pelloric::qt::PageFiles</name>
    <message>
        <source>PDF document</source>
        <translation>PDF 文档</translation>
    </message>
    <message>
        <source>PNG pictures</source>
        <translation>PNG 图片</translation>
    </message>
    <message>
        <source>SVG drawings</source>
        <translation>SVG 图形</translation>
    </message>
    <message>
        <source>report</source>
        <translation>报表</translation>
    </message>
    <message>
        <source>Save as PDF</source>
        <translation>另存为 PDF</translation>
    </message>
</context>
<context>
    <name>pelloric::qt::PageSetupDialog</name>
    <message>
        <source>Papers</source>
        <translation>纸张</translation>
    </message>
    <message>
        <source>These are the standard papers: %1.</source>
        <translation>以下是标准纸张：%1。</translation>
    </message>
</context>
<context>
    <name>pelloric::qt::PageSketch</name>
    <message>
        <source>Sketch of the page with its margins</source>
        <translation>页面及页边距示意图</translation>
    </message>
</context>
<context>
    <name>pelloric::qt::PageStrip</name>
    <message>
        <source>Page %1</source>
        <translation>第 %1 页</translation>
    </message>
    <message>
        <source>Pictures of the pages</source>
        <translation>页面缩略图</translation>
    </message>
</context>
<context>
    <name>pelloric::qt::PageSurface</name>
    <message>
        <source>Page surface %1</source>
        <translation>页面区域 %1</translation>
    </message>
</context>
<context>
    <name>pelloric::qt::PageTextsTab</name>
    <message>
        <source>Left</source>
        <translation>左</translation>
    </message>
    <message>
        <source>Center</source>
        <translation>中</translation>
    </message>
    <message>
        <source>Right</source>
        <translation>右</translation>
    </message>
    <message>
        <source>Header left</source>
        <translation>页眉左侧</translation>
    </message>
    <message>
        <source>Header center</source>
        <translation>页眉中间</translation>
    </message>
    <message>
        <source>Header right</source>
        <translation>页眉右侧</translation>
    </message>
    <message>
        <source>Footer left</source>
        <translation>页脚左侧</translation>
    </message>
    <message>
        <source>Footer center</source>
        <translation>页脚中间</translation>
    </message>
    <message>
        <source>Footer right</source>
        <translation>页脚右侧</translation>
    </message>
    <message>
        <source>Header font</source>
        <translation>页眉字体</translation>
    </message>
    <message>
        <source>Footer font</source>
        <translation>页脚字体</translation>
    </message>
    <message>
        <source>Change the header font</source>
        <translation>更改页眉字体</translation>
    </message>
    <message>
        <source>Change the footer font</source>
        <translation>更改页脚字体</translation>
    </message>
    <message>
        <source>The Menu key or Alt+Down opens the fields</source>
        <translation>按菜单键或 Alt+向下键打开字段列表</translation>
    </message>
    <message>
        <source>Put in a field</source>
        <translation>插入字段</translation>
    </message>
</context>
<context>
    <name>pelloric::qt::PreviewToolbar</name>
    <message>
        <source>Tools</source>
        <translation>工具</translation>
    </message>
</context>
<context>
    <name>pelloric::qt::PreviewWindow</name>
    <message>
        <source>Printing was ended: %1 of %2 pages were sent.</source>
        <translation>打印已结束：共 %2 页，已发送 %1 页。</translation>
    </message>
    <message>
        <source>Saving the pages…</source>
        <translation>正在保存页面…</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>取消</translation>
    </message>
</context>
<context>
    <name>pelloric::qt::PrintOptionsDialog</name>
    <message>
        <source>No page is named yet, so nothing would be printed.</source>
        <translation>尚未指定页码，不会打印任何内容。</translation>
    </message>
    <message>
        <source>None of these pages exists: the last one is %1.</source>
        <translation>这些页都不存在：最后一页是第 %1 页。</translation>
    </message>
    <message>
        <source>This names no page, so nothing would be printed.</source>
        <translation>没有指定任何页，不会打印任何内容。</translation>
    </message>
    <message>
        <source>These are more pages than can be printed.</source>
        <translation>页数超出可打印的范围。</translation>
    </message>
    <message>
        <source>Without a copy nothing would be printed.</source>
        <translation>份数为零，不会打印任何内容。</translation>
    </message>
    <message>
        <source>These are more copies than can be printed.</source>
        <translation>份数超出可打印的范围。</translation>
    </message>
    <message>
        <source>Save as PDF instead...</source>
        <translation>改为另存为 PDF...</translation>
    </message>
    <message>
        <source>There is no printer.</source>
        <translation>没有打印机。</translation>
    </message>
    <message>
        <source>No printers can be listed: %1.</source>
        <translation>无法列出打印机：%1。</translation>
    </message>
    <message>
        <source>Page range</source>
        <translation>页码范围</translation>
    </message>
    <message>
        <source>Pages sent</source>
        <translation>已发送的页</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>取消</translation>
    </message>
    <message>
        <source>Ends printing after the page that is being sent (Escape)</source>
        <translation>发送完当前页后结束打印 (Esc)</translation>
    </message>
    <message>
        <source>%1 of %2 pages sent</source>
        <translation>已发送 %1 页，共 %2 页</translation>
    </message>
</context>
<context>
    <name>pelloric::qt::ProgressArea</name>
    <message>
        <source>Progress area</source>
        <translation>进度区域</translation>
    </message>
    <message>
        <source>Progress</source>
        <translation>进度</translation>
    </message>
</context>
<context>
    <name>pelloric::qt::ReaderTools</name>
    <message>
        <source>Save as PDF</source>
        <translation>另存为 PDF</translation>
    </message>
    <message>
        <source>Page Width</source>
        <translation>页宽</translation>
    </message>
    <message>
        <source>Page in View</source>
        <translation>整页</translation>
    </message>
    <message>
        <source>Fill the Window</source>
        <translation>填满窗口</translation>
    </message>
    <message>
        <source>One Page</source>
        <translation>一页</translation>
    </message>
    <message>
        <source>Two Pages</source>
        <translation>两页</translation>
    </message>
    <message>
        <source>Four Pages</source>
        <translation>四页</translation>
    </message>
    <message>
        <source>More Pages</source>
        <translation>多页</translation>
    </message>
    <message>
        <source>Find…</source>
        <translation>查找…</translation>
    </message>
    <message>
        <source>Next Place</source>
        <translation>下一处</translation>
    </message>
    <message>
        <source>Previous Place</source>
        <translation>上一处</translation>
    </message>
    <message>
        <source>Select Page</source>
        <translation>选择整页</translation>
    </message>
    <message>
        <source>Copy</source>
        <translation>复制</translation>
    </message>
    <message>
        <source>Pictures of the Pages</source>
        <translation>页面缩略图</translation>
    </message>
    <message>
        <source>Report Options</source>
        <translation>报表选项</translation>
    </message>
    <message>
        <source>Keys</source>
        <translation>快捷键</translation>
    </message>
</context>
<context>
    <name>pelloric::qt::ReplaceBox</name>
    <message>
        <source>Replace Files</source>
        <translation>替换文件</translation>
    </message>
    <message>
        <source>%1 already exists.</source>
        <translation>%1 已存在。</translation>
    </message>
    <message>
        <source>%1 files already exist, such as %2.</source>
        <translation>已有 %1 个文件存在，例如 %2。</translation>
    </message>
    <message>
        <source>Every page becomes a file of its own. Do you want to replace what is there?</source>
        <translation>每一页都会成为一个单独的文件。要替换已有的文件吗？</translation>
    </message>
    <message>
        <source>&amp;Replace</source>
        <translation>替换(&amp;R)</translation>
    </message>
</context>
<context>
    <name>pelloric::qt::ReportTools</name>
    <message>
        <source>The file holds the pages without watermark, logo and icons; save them as PDF to keep those.</source>
        <translation>文件中的页面不含水印、徽标和图标；另存为 PDF 可保留它们。</translation>
    </message>
</context>
<context>
    <name>pelloric::qt::Sorvane</name>
    <message>
        <source>Page preview</source>
        <translation>页面预览</translation>
    </message>
</context>
<context>
    <name>pelloric::qt::StartIcon</name>
    <message>
        <source>No document</source>
        <translation>没有文档</translation>
    </message>
    <message>
        <source>Nothing to preview yet</source>
        <translation>暂无预览内容</translation>
    </message>
</context>
</TS>
