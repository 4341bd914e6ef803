<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="zh_CN" sourcelanguage="en">
<context>
    <name>DemoGrids</name>
    <message>
        <source>Class</source>
        <translation>类别</translation>
    </message>
    <message>
        <source>Measure</source>
        <translation>指标</translation>
    </message>
    <message>
        <source>Least</source>
        <translation>最小</translation>
    </message>
    <message>
        <source>Median</source>
        <translation>中位</translation>
    </message>
    <message>
        <source>Most</source>
        <translation>最大</translation>
    </message>
    <message>
        <source>Zone</source>
        <translation>时区</translation>
    </message>
    <message>
        <source>Country</source>
        <translation>国家</translation>
    </message>
    <message>
        <source>Coordinates</source>
        <translation>坐标</translation>
    </message>
</context>
<context>
    <name>Phrase</name>
    <message>
        <source>Unknown option &apos;%1&apos;.</source>
        <translation>未知选项“%1”。</translation>
    </message>
    <message>
        <source>Missing value after &apos;%1&apos;.</source>
        <translation>“%1”之后缺少值。</translation>
    </message>
    <message>
        <source>Unexpected value after &apos;%1&apos;.</source>
        <translation>“%1”之后有多余的值。</translation>
    </message>
    <message>
        <source>%1; check that the folder exists and takes files</source>
        <translation>%1；请检查文件夹是否存在、是否可写</translation>
    </message>
    <message>
        <source>%1; make room on the disk, or choose another one</source>
        <translation>%1；请腾出磁盘空间，或选择其他磁盘</translation>
    </message>
    <message>
        <source>%1; check your rights to the file and its folder</source>
        <translation>%1；请检查您对文件及其文件夹的权限</translation>
    </message>
    <message>
        <source>%1; check the name and that you may read it</source>
        <translation>%1；请检查名称以及您是否可以读取它</translation>
    </message>
    <message>
        <source>one argument too many: %1; quote names with blanks</source>
        <translation>多了一个参数：%1；含空格的名称请加引号</translation>
    </message>
    <message>
        <source>%1 takes a whole number from %2 to %3, not &quot;%4&quot;</source>
        <translation>%1 需要 %2 到 %3 之间的整数，而不是“%4”</translation>
    </message>
    <message>
        <source>%1 takes a number from %2 to %3, not &quot;%4&quot;</source>
        <translation>%1 需要 %2 到 %3 之间的数，而不是“%4”</translation>
    </message>
    <message>
        <source>where the sample tables are</source>
        <translation>示例表格所在的文件夹</translation>
    </message>
    <message>
        <source>walk through by itself, without a display, and leave what it shows in OUT</source>
        <translation>无需显示器自动演示，并把所显示的内容存入 OUT</translation>
    </message>
    <message>
        <source>write what the preview window shows to a file, a line for each change</source>
        <translation>把预览窗口显示的内容写入文件，每次变化一行</translation>
    </message>
    <message>
        <source>the sample tables are not found; name their folder with --samples</source>
        <translation>找不到示例表格；请用 --samples 指定其文件夹</translation>
    </message>
    <message>
        <source>%1; check the folder of temporary files</source>
        <translation>%1；请检查临时文件夹</translation>
    </message>
    <message>
        <source>Shows one form with a flex grid, a list view and a data grid on sample
tables, each with its host code and a button that previews it; tables of
your own can be opened beside them. What its dialogs change is forgotten.
</source>
        <translation>显示一个窗体，其中的表格、列表视图和数据表格使用示例数据，各附宿主代码和
预览按钮；也可以打开自己的表格。对话框所作的更改不会保留。
</translation>
    </message>
    <message>
        <source>the preview window did not close</source>
        <translation>预览窗口没有关闭</translation>
    </message>
    <message>
        <source>%1 was not written</source>
        <translation>没有写出 %1</translation>
    </message>
    <message>
        <source>%1 cannot be written</source>
        <translation>无法写入 %1</translation>
    </message>
    <message>
        <source>the preview window is not open</source>
        <translation>预览窗口没有打开</translation>
    </message>
    <message>
        <source>there is no tool %1</source>
        <translation>没有工具 %1</translation>
    </message>
    <message>
        <source>the saved document has other pages</source>
        <translation>保存的文档页面不同</translation>
    </message>
    <message>
        <source>%1 cannot be read; name the folder of the samples with --samples</source>
        <translation>无法读取 %1；请用 --samples 指定示例文件夹</translation>
    </message>
    <message>
        <source>where to: a name that ends in .pdf, .png, .svg or .ostl; a folder; or -</source>
        <translation>输出到：以 .pdf、.png、.svg 或 .ostl 结尾的文件名；文件夹；或 -</translation>
    </message>
    <message>
        <source>several inputs into one file, one behind the other</source>
        <translation>把多个输入依次合并到一个文件</translation>
    </message>
    <message>
        <source>pdf, png, svg or ostl, for a folder or - (pdf)</source>
        <translation>pdf、png、svg 或 ostl，用于文件夹或 -（pdf）</translation>
    </message>
    <message>
        <source>only these pages: 1,3,5-12</source>
        <translation>仅这些页：1,3,5-12</translation>
    </message>
    <message>
        <source>pixels an inch of .png images (150)</source>
        <translation>.png 图像每英寸的像素数（150）</translation>
    </message>
    <message>
        <source>pages of .png images made at a time (one for each processor)</source>
        <translation>同时生成的 .png 页数（每个处理器一页）</translation>
    </message>
    <message>
        <source>a .pdf file that says its tables, for readers who do not see it</source>
        <translation>带标签的 .pdf 文件，供看不见的读者使用</translation>
    </message>
    <message>
        <source>a .pdf file for archives (PDF/A-2b)</source>
        <translation>用于存档的 .pdf 文件（PDF/A-2b）</translation>
    </message>
    <message>
        <source>of the texts of a .pdf file: zh-CN (the locale&apos;s)</source>
        <translation>.pdf 文件中文字的语言：zh-CN（默认为区域设置）</translation>
    </message>
    <message>
        <source>%1; its characters are drawn as shapes</source>
        <translation>%1；其字符将绘制为图形</translation>
    </message>
    <message>
        <source>a document file holds %1 pages; the last %2 were left out</source>
        <translation>文档文件最多 %1 页；最后 %2 页已略去</translation>
    </message>
    <message>
        <source>a document file holds no pictures; watermark and logo were left out</source>
        <translation>文档文件不含图片；水印和徽标已略去</translation>
    </message>
    <message>
        <source>--format takes pdf, png, svg or ostl, not &quot;%1&quot;</source>
        <translation>--format 只接受 pdf、png、svg 或 ostl，而不是“%1”</translation>
    </message>
    <message>
        <source>%1: the name must end in .pdf, .png, .svg or .ostl</source>
        <translation>%1：文件名必须以 .pdf、.png、.svg 或 .ostl 结尾</translation>
    </message>
    <message>
        <source>say where to export to: -o OUT.pdf, .png, .svg or .ostl</source>
        <translation>请指定导出到哪里：-o OUT.pdf、.png、.svg 或 .ostl</translation>
    </message>
    <message>
        <source>%1 is one input more; several go into a folder, or with --join into one file, and %2 is no folder; quote names with blanks</source>
        <translation>%1 是另一个输入；多个输入须放入文件夹，或用 --join 合并为一个文件，而 %2 不是文件夹；含空格的名称请加引号</translation>
    </message>
    <message>
        <source>--pages is for .pdf, .png and .svg; a document file holds all</source>
        <translation>--pages 用于 .pdf、.png 和 .svg；文档文件包含所有页</translation>
    </message>
    <message>
        <source>--dpi is for .png images</source>
        <translation>--dpi 用于 .png 图像</translation>
    </message>
    <message>
        <source>--jobs is for .png images</source>
        <translation>--jobs 用于 .png 图像</translation>
    </message>
    <message>
        <source>--%1 is for .pdf files</source>
        <translation>--%1 用于 .pdf 文件</translation>
    </message>
    <message>
        <source>-o - and --json both want the standard output</source>
        <translation>-o - 和 --json 都要使用标准输出</translation>
    </message>
    <message>
        <source>Writing</source>
        <translation>正在写入</translation>
    </message>
    <message>
        <source>%1 is the file that is read; export to another one</source>
        <translation>%1 就是要读取的文件；请导出到另一个文件</translation>
    </message>
    <message>
        <source>%1 has pages of another size; --join wants one size</source>
        <translation>%1 的页面大小不同；--join 要求大小一致</translation>
    </message>
    <message>
        <source>several pages as .%1 do not go into one output; name a file, or a page with --pages</source>
        <translation>多页 .%1 不能写入同一个输出；请指定文件，或用 --pages 指定一页</translation>
    </message>
    <message>
        <source>FILE is a CSV or TSV file, whose first row holds the titles, a JSON file, an .xlsx or
.ods file (file.xlsx:Sheet), an SQLite database (db.sqlite:table, or db.sqlite with
--query), or a saved document (.ostl).
Pages look as the default settings and the options say; --settings takes others.
</source>
        <translation>FILE 可以是 CSV 或 TSV 文件（第一行为标题）、JSON 文件、.xlsx 或 .ods 文件
（文件.xlsx:工作表）、SQLite 数据库（db.sqlite:表，或 db.sqlite 加 --query），或保存的文档（.ostl）。
页面外观由默认设置和选项决定；--settings 使用其他设置。
</translation>
    </message>
    <message>
        <source>Several pages as .png or .svg become OUT-001, OUT-002 and so on.
FILE - is the standard input, OUT - the standard output. Several FILEs become one
file each in the folder OUT, or with --join one file.
</source>
        <translation>多页 .png 或 .svg 依次成为 OUT-001、OUT-002 等。
FILE 为 - 时是标准输入，OUT 为 - 时是标准输出。多个 FILE 各成为文件夹 OUT 中的
一个文件，或用 --join 合并为一个文件。
</translation>
    </message>
    <message>
        <source>no font is installed, so no text can be drawn; install fonts-dejavu-core, and fonts-arphic-uming for Chinese texts</source>
        <translation>没有安装任何字体，无法绘制文字；请安装 fonts-dejavu-core，中文请安装 fonts-arphic-uming</translation>
    </message>
    <message>
        <source>the font %1 is not installed; %2 is taken instead</source>
        <translation>未安装字体 %1；改用 %2</translation>
    </message>
    <message>
        <source>write the manual page of the program</source>
        <translation>输出程序的手册页</translation>
    </message>
    <message>
        <source>Previews, exports and prints tables.

</source>
        <translation>预览、导出和打印表格。

</translation>
    </message>
    <message>
        <source>
&quot;pelloric help COMMAND&quot; says more, &quot;pelloric --version&quot; the version.
</source>
        <translation>
“pelloric help 命令”给出更多说明，“pelloric --version”显示版本。
</translation>
    </message>
    <message>
        <source>no command %1; see &quot;pelloric help&quot;</source>
        <translation>没有命令 %1；请看“pelloric help”</translation>
    </message>
    <message>
        <source>Shows all kinds of grids on sample tables</source>
        <translation>用示例数据展示各种表格</translation>
    </message>
    <message>
        <source>Shows a table in the preview window</source>
        <translation>在预览窗口中显示表格</translation>
    </message>
    <message>
        <source>Shows a saved document in the preview window</source>
        <translation>在预览窗口中显示保存的文档</translation>
    </message>
    <message>
        <source>Writes tables as PDF, PNG, SVG or a document file</source>
        <translation>把表格写成 PDF、PNG、SVG 或文档文件</translation>
    </message>
    <message>
        <source>Runs a script that drives the controls by name</source>
        <translation>运行按名称驱动控件的脚本</translation>
    </message>
    <message>
        <source>Prints a table or a document file</source>
        <translation>打印表格或文档文件</translation>
    </message>
    <message>
        <source>Lists the printers</source>
        <translation>列出打印机</translation>
    </message>
    <message>
        <source>Shows or restores the settings file</source>
        <translation>显示或恢复设置文件</translation>
    </message>
    <message>
        <source>Writes the completion of a shell: bash, zsh or fish</source>
        <translation>输出 shell 的补全：bash、zsh 或 fish</translation>
    </message>
    <message>
        <source>Explains the commands</source>
        <translation>说明各个命令</translation>
    </message>
    <message>
        <source>usage: pelloric %1; for example: %2; &quot;pelloric help %3&quot; says more</source>
        <translation>用法：pelloric %1；例如：%2；“pelloric help %3”给出更多说明</translation>
    </message>
    <message>
        <source>say what to do, for example &quot;pelloric export table.csv -o table.pdf&quot;; see &quot;pelloric help&quot;</source>
        <translation>请说明要做什么，例如“pelloric export table.csv -o table.pdf”；请看“pelloric help”</translation>
    </message>
    <message>
        <source>there is not enough memory for this table</source>
        <translation>内存不足以容纳此表格</translation>
    </message>
    <message>
        <source>%1: there is no such file</source>
        <translation>%1：没有这个文件</translation>
    </message>
    <message>
        <source>FILE is a document file (.ostl) that the preview window or
&quot;pelloric export&quot; has saved.
</source>
        <translation>FILE 是预览窗口或“pelloric export”保存的文档文件（.ostl）。
</translation>
    </message>
    <message>
        <source>tell nothing but errors</source>
        <translation>只报告错误</translation>
    </message>
    <message>
        <source>tell what was made in JSON, one object a line</source>
        <translation>用 JSON 报告结果，每行一个对象</translation>
    </message>
    <message>
        <source>%1 is a saved document; show it with &quot;pelloric open&quot;</source>
        <translation>%1 是保存的文档；请用“pelloric open”显示</translation>
    </message>
    <message>
        <source>FILE is a CSV or TSV file, whose first row holds the titles, a JSON file, an .xlsx or
.ods file (file.xlsx:Sheet), or an SQLite database (db.sqlite:table, or db.sqlite with
--query). Pages look as your settings say, which the window&apos;s dialogs
change; --defaults does without them. With one of the options for
headers, paper and so on, what the dialogs change is not kept.
</source>
        <translation>FILE 可以是 CSV 或 TSV 文件（第一行为标题）、JSON 文件、.xlsx 或 .ods 文件
（文件.xlsx:工作表）、SQLite 数据库（db.sqlite:表，或 db.sqlite 加 --query）。
页面外观由您的设置决定，窗口的对话框可以更改这些设置；--defaults 不使用它们。
使用页眉、纸张等选项时，对话框所作的更改不会保留。
</translation>
    </message>
    <message>
        <source>where to: a name of &quot;pelloric printers&quot; (the current one)</source>
        <translation>打印到：“pelloric printers”列出的名称（默认为当前打印机）</translation>
    </message>
    <message>
        <source>whole copies, one after the other (1)</source>
        <translation>整份的份数，依次打印（1）</translation>
    </message>
    <message>
        <source>no printer &quot;%1&quot;; see &quot;pelloric printers&quot;</source>
        <translation>没有打印机“%1”；请看“pelloric printers”</translation>
    </message>
    <message>
        <source>Printing</source>
        <translation>正在打印</translation>
    </message>
    <message>
        <source>%1: %2 page sent
</source>
        <translation>%1：已发送 %2 页
</translation>
    </message>
    <message>
        <source>%1: %2 pages sent
</source>
        <translation>%1：已发送 %2 页
</translation>
    </message>
    <message>
        <source>Every page is a job of its own, one-sided, on the paper it was laid out for.
</source>
        <translation>每页是一个单独的任务，单面打印在为它排版的纸张上。
</translation>
    </message>
    <message>
        <source>also list the papers, each with its code and size</source>
        <translation>同时列出纸张及其编号和大小</translation>
    </message>
    <message>
        <source>ready</source>
        <translation>就绪</translation>
    </message>
    <message>
        <source>The printer with the star is used when none is named.
</source>
        <translation>未指定打印机时使用带星号的打印机。
</translation>
    </message>
    <message>
        <source>Laying out</source>
        <translation>正在排版</translation>
    </message>
    <message>
        <source>--widths names %1 columns; the table has %2</source>
        <translation>--widths 给出了 %1 列；表格有 %2 列</translation>
    </message>
    <message>
        <source>--as-shown does nothing here: only cells of office files have looks</source>
        <translation>--as-shown 在此无效：只有办公文件的单元格带有外观</translation>
    </message>
    <message>
        <source>no column is wide enough to be printed; give other --widths</source>
        <translation>没有一列宽到可以打印；请给出其他 --widths</translation>
    </message>
    <message>
        <source>--%1 does not apply to a saved document, whose pages are laid out</source>
        <translation>--%1 不适用于保存的文档，其页面已排好</translation>
    </message>
    <message>
        <source>%1 is no document file</source>
        <translation>%1 不是文档文件</translation>
    </message>
    <message>
        <source>--pages %1 names no page; the document has %2 (write 1,3,5-12)</source>
        <translation>--pages %1 没有对应的页；文档有 %2 页（请写成 1,3,5-12）</translation>
    </message>
    <message>
        <source>the default settings, whatever the user&apos;s are</source>
        <translation>使用默认设置，不管用户的设置如何</translation>
    </message>
    <message>
        <source>the settings of this file; the default ones for those it lacks</source>
        <translation>使用此文件的设置；缺少的用默认值</translation>
    </message>
    <message>
        <source>title of the file, and centred above every page</source>
        <translation>文件的标题，并居中显示在每页上方</translation>
    </message>
    <message>
        <source>A2 to A6, B5, Letter, Legal, Tabloid, 8k, 16k, 10x15cm, 4x6in</source>
        <translation>A2 到 A6、B5、Letter、Legal、Tabloid、8k、16k、10x15cm、4x6in</translation>
    </message>
    <message>
        <source>top,right,bottom,left, or one for all: 10mm, 1.5cm or 0.5in</source>
        <translation>上,右,下,左，或一个值用于四边：10mm、1.5cm 或 0.5in</translation>
    </message>
    <message>
        <source>the paper&apos;s long side lies below</source>
        <translation>纸张横放</translation>
    </message>
    <message>
        <source>the paper stands upright</source>
        <translation>纸张竖放</translation>
    </message>
    <message>
        <source>print equal neighbouring cells once</source>
        <translation>相邻的相同单元格只打印一次</translation>
    </message>
    <message>
        <source>leave out the row of column titles</source>
        <translation>不打印列标题行</translation>
    </message>
    <message>
        <source>the face of all texts</source>
        <translation>所有文字的字体</translation>
    </message>
    <message>
        <source>the size of the cells&apos; texts: points</source>
        <translation>单元格文字的字号：磅</translation>
    </message>
    <message>
        <source>widths of the columns: twips (1440 an inch); 0 leaves one out</source>
        <translation>各列的宽度：缇（每英寸 1440）；0 表示略去</translation>
    </message>
    <message>
        <source>unknown paper &quot;%1&quot;; take one of %2, or a size such as 100x150mm or 4x6in</source>
        <translation>未知的纸张“%1”；请用 %2 之一，或 100x150mm、4x6in 这样的尺寸</translation>
    </message>
    <message>
        <source>--paper takes lengths from %1 to %2 mm, not &quot;%3&quot;</source>
        <translation>--paper 的边长为 %1 到 %2 mm，而不是“%3”</translation>
    </message>
    <message>
        <source>take either --landscape or --portrait, not both</source>
        <translation>--landscape 和 --portrait 只能用一个</translation>
    </message>
    <message>
        <source>%1 Correct it in the file, or do without: --defaults</source>
        <translation>%1 请在文件中更正，或不使用它：--defaults</translation>
    </message>
    <message>
        <source>%1 holds no setting; &quot;pelloric settings --path&quot; names yours</source>
        <translation>%1 中没有设置；“pelloric settings --path”给出您的设置文件</translation>
    </message>
    <message>
        <source>take either --defaults or --settings, not both</source>
        <translation>--defaults 和 --settings 只能用一个</translation>
    </message>
    <message>
        <source>say which script to run</source>
        <translation>请指定要运行的脚本</translation>
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
        <translation>脚本可以使用 Sorvane 和 Kestrane、其接口的记录和枚举、
args、messages、print(...)、exit(status)、csv(path)、sqlite(path, tableOrQuery)、
lines(canvas, page)、texts(canvas, page)、placePicture(canvas, page, picture) 和
wait(milliseconds)。控件还有 grab(path) 和 resize(width, height)。
Kestrane.doPreview 在预览窗口中生成页面，其画布为 previewCanvas()。默认不显示任何
窗口；SCRIPT 之前有 --window 时显示窗口，程序运行到窗口关闭为止。
未捕获的异常使程序以状态 1 结束。
</translation>
    </message>
    <message>
        <source>only say where the file is</source>
        <translation>只给出文件的位置</translation>
    </message>
    <message>
        <source>put the default settings back</source>
        <translation>恢复默认设置</translation>
    </message>
    <message>
        <source>only rows whose column NAME holds TEXT</source>
        <translation>仅列 NAME 的内容为 TEXT 的行</translation>
    </message>
    <message>
        <source>cells have the fonts, colours and alignment of the office file</source>
        <translation>单元格使用办公文件的字体、颜色和对齐方式</translation>
    </message>
    <message>
        <source>turn the paper, then shrink, until the table is as wide as one page</source>
        <translation>先旋转纸张再缩小，直到表格与一页同宽</translation>
    </message>
    <message>
        <source>shrink until the table is at most N pages wide</source>
        <translation>缩小到表格最多 N 页宽</translation>
    </message>
    <message>
        <source>columns to repeat at the left of every page</source>
        <translation>在每页左侧重复的列</translation>
    </message>
    <message>
        <source>all rows of the first columns come before the next columns</source>
        <translation>先打印前几列的所有行，再打印后面的列</translation>
    </message>
    <message>
        <source>rows with equal texts in these columns stay on one page</source>
        <translation>这些列文字相同的行保持在同一页</translation>
    </message>
    <message>
        <source>totals of columns; F is sum, count, mean, min or max</source>
        <translation>列的合计；F 为 sum、count、mean、min 或 max</translation>
    </message>
    <message>
        <source>a faint text across every page</source>
        <translation>每页上的浅色文字</translation>
    </message>
    <message>
        <source>a faint picture in the middle of every page</source>
        <translation>每页中央的浅色图片</translation>
    </message>
    <message>
        <source>of the watermark, 1 to 100 (15)</source>
        <translation>水印的不透明度，1 到 100（15）</translation>
    </message>
    <message>
        <source>the watermark lies above the table, not behind it</source>
        <translation>水印位于表格之上，而不是之后</translation>
    </message>
    <message>
        <source>a picture at the top of every page</source>
        <translation>每页顶部的图片</translation>
    </message>
    <message>
        <source>where the logo stands: left, center or right (left)</source>
        <translation>徽标的位置：left、center 或 right（left）</translation>
    </message>
    <message>
        <source>--total takes sum, count, mean, min or max, a colon and a column, such as sum:Price, not &quot;%1&quot;</source>
        <translation>--total 需要 sum、count、mean、min 或 max 加冒号和列名，例如 sum:Price，而不是“%1”</translation>
    </message>
    <message>
        <source>--logo-at takes left, center or right, not &quot;%1&quot;</source>
        <translation>--logo-at 只接受 left、center 或 right，而不是“%1”</translation>
    </message>
    <message>
        <source>--%1 says something about --%2, which is not given</source>
        <translation>--%1 用于 --%2，但没有给出后者</translation>
    </message>
    <message>
        <source>--watermark and --watermark-image exclude each other</source>
        <translation>--watermark 和 --watermark-image 不能同时使用</translation>
    </message>
    <message>
        <source>--where takes a column, &quot;=&quot; and a text, not &quot;%1&quot;</source>
        <translation>--where 需要列名、“=”和文字，而不是“%1”</translation>
    </message>
    <message>
        <source>only these columns, in this order; #3 is the third</source>
        <translation>仅这些列，按此顺序；#3 为第三列</translation>
    </message>
    <message>
        <source>sort the rows by these columns; NAME:desc downwards</source>
        <translation>按这些列排序；NAME:desc 为降序</translation>
    </message>
    <message>
        <source>only these rows, from 1, after sorting; 100- and -100 work, too</source>
        <translation>仅这些行，从 1 起，排序之后；也可写 100- 和 -100</translation>
    </message>
    <message>
        <source>--%1: there is no column &quot;%2&quot;; the table has %3</source>
        <translation>--%1：没有列“%2”；表格有 %3</translation>
    </message>
    <message>
        <source>--rows takes a range such as 1-100, not &quot;%1&quot;</source>
        <translation>--rows 需要 1-100 这样的范围，而不是“%1”</translation>
    </message>
    <message>
        <source>--rows %1 names no row; the table has %2</source>
        <translation>--rows %1 没有对应的行；表格有 %2 行</translation>
    </message>
    <message>
        <source>what to take of a database: a SELECT statement</source>
        <translation>从数据库中取什么：一条 SELECT 语句</translation>
    </message>
    <message>
        <source>of a text file; else found out</source>
        <translation>文本文件的编码；否则自动判断</translation>
    </message>
    <message>
        <source>between the values of a CSV file, or tab; else found out</source>
        <translation>CSV 文件中值之间的分隔符，或 tab；否则自动判断</translation>
    </message>
    <message>
        <source>a quote in a CSV file is a character like any other</source>
        <translation>CSV 文件中的引号是普通字符</translation>
    </message>
    <message>
        <source>standard input</source>
        <translation>标准输入</translation>
    </message>
    <message>
        <source>%1 is a folder; name a file in it</source>
        <translation>%1 是文件夹；请指定其中的文件</translation>
    </message>
    <message>
        <source>%1 is a device; name a file</source>
        <translation>%1 是设备；请指定文件</translation>
    </message>
    <message>
        <source>%1: you may not read this file</source>
        <translation>%1：您无权读取此文件</translation>
    </message>
    <message>
        <source>--encoding is for CSV and TSV files, not databases</source>
        <translation>--encoding 用于 CSV 和 TSV 文件，而不是数据库</translation>
    </message>
    <message>
        <source>take either a table or --query, not both</source>
        <translation>表和 --query 只能用一个</translation>
    </message>
    <message>
        <source>Reading</source>
        <translation>正在读取</translation>
    </message>
    <message>
        <source>--delimiter takes one ASCII character, or &quot;tab&quot;, not &quot;%1&quot;</source>
        <translation>--delimiter 需要一个 ASCII 字符或“tab”，而不是“%1”</translation>
    </message>
    <message>
        <source>--query is for databases; %1 is none</source>
        <translation>--query 用于数据库；%1 不是数据库</translation>
    </message>
    <message>
        <source>of hints, tips and errors (the locale&apos;s): de, en, zh_CN, or system; the rest has one wording</source>
        <translation>提示、说明和错误的语言（默认为区域设置）：de、en、zh_CN 或 system；其余文字只有一种</translation>
    </message>
    <message>
        <source>--language %1: there are de, en, zh_CN, and system</source>
        <translation>--language %1：可用 de、en、zh_CN 和 system</translation>
    </message>
    <message>
        <source>there is no display to show windows on; &quot;pelloric export&quot; and &quot;pelloric demo --walk OUT&quot; need none</source>
        <translation>没有可显示窗口的显示器；“pelloric export”和“pelloric demo --walk OUT”不需要显示器</translation>
    </message>
    <message>
        <source>a document file holds no icons of cells; they were left out</source>
        <translation>文档文件不含单元格的图标；图标已略去</translation>
    </message>
    <message>
        <source>a document file has no code for some characters; %1 of its texts show &quot;?&quot; for them</source>
        <translation>文档文件无法表示某些字符；其中 %1 处文字以“?”代替</translation>
    </message>
    <message>
        <source>1 cell</source>
        <translation>1 个单元格</translation>
    </message>
    <message>
        <source>%1 cells</source>
        <translation>%1 个单元格</translation>
    </message>
    <message>
        <source>no row is printed: --where %1 holds for none</source>
        <translation>没有打印任何行：--where %1 对任何行都不成立</translation>
    </message>
    <message>
        <source>the total of %1 leaves out %2, being no numbers</source>
        <translation>%1 的合计略去了 %2，因为不是数字</translation>
    </message>
    <message>
        <source>%1 is a pipe; a saved document is read from a file, so save it to one and name that</source>
        <translation>%1 是管道；已保存的文档须从文件读取，请先保存为文件并指定该文件</translation>
    </message>
    <message>
        <source>--margins takes one length of %1 mm or more and at most %2 mm, or four (top,right,bottom,left), not &quot;%3&quot;</source>
        <translation>--margins 需要一个不小于 %1 毫米且不大于 %2 毫米的长度，或四个（上,右,下,左），而不是 &quot;%3&quot;</translation>
    </message>
    <message>
        <source>%1 cannot be kept in %2: %3; name another folder in TMPDIR, or save it to a file and name that</source>
        <translation>无法将 %1 暂存到 %2：%3；请在 TMPDIR 中指定其他文件夹，或保存为文件并指定该文件</translation>
    </message>
    <message>
        <source>%1 cannot be read: %2</source>
        <translation>无法读取 %1：%2</translation>
    </message>
    <message>
        <source>%1 goes on after %2 GB, which is the most that is taken of a pipe; save it to a file and name that, or hand over fewer rows</source>
        <translation>%1 超过 %2 GB 仍未结束，这是从管道读取的上限；请保存为文件并指定该文件，或减少行数</translation>
    </message>
    <message>
        <source>%1 does not fit into %2, where it is kept while it is read; make room there, or name another folder in TMPDIR</source>
        <translation>读取 %1 时要暂存到 %2，但空间不足；请在那里腾出空间，或在 TMPDIR 中指定其他文件夹</translation>
    </message>
    <message>
        <source>%1 is a socket; name a file</source>
        <translation>%1 是套接字；请指定文件</translation>
    </message>
    <message>
        <source>%1 takes %2, not &quot;%3&quot;: %4</source>
        <translation>%1 需要 %2，而不是 &quot;%3&quot;：%4</translation>
    </message>
    <message>
        <source>%1: the folder cannot be made: %2</source>
        <translation>%1：无法创建文件夹：%2</translation>
    </message>
    <message>
        <source>--%1 names no column, only &quot;%2&quot;</source>
        <translation>--%1 没有指定任何列，只有 &quot;%2&quot;</translation>
    </message>
    <message>
        <source>%1 is no SQLite database and no office file, so it has no table &quot;%2&quot;</source>
        <translation>%1 既不是 SQLite 数据库也不是办公文件，因此没有表 &quot;%2&quot;</translation>
    </message>
    <message>
        <source>the stack may hold %1 KB only; allow %2 at least: ulimit -s 8192</source>
        <translation>栈最多只能有 %1 KB；请至少允许 %2：ulimit -s 8192</translation>
    </message>
    <message>
        <source>only %1 files may be open; allow %2 at least: ulimit -n 1024</source>
        <translation>最多只能打开 %1 个文件；请至少允许 %2 个：ulimit -n 1024</translation>
    </message>
    <message>
        <source>hidden rows and columns of an office sheet, too</source>
        <translation>也包括工作表中隐藏的行和列</translation>
    </message>
    <message>
        <source>1 hidden row</source>
        <translation>1 个隐藏行</translation>
    </message>
    <message>
        <source>%1 hidden rows</source>
        <translation>%1 个隐藏行</translation>
    </message>
    <message>
        <source>1 hidden column</source>
        <translation>1 个隐藏列</translation>
    </message>
    <message>
        <source>%1 hidden columns</source>
        <translation>%1 个隐藏列</translation>
    </message>
    <message>
        <source>%1 and %2</source>
        <translation>%1和%2</translation>
    </message>
    <message>
        <source>%1: left out are %2; --hidden takes them, too</source>
        <translation>%1：略去了%2；用 --hidden 可一并打印</translation>
    </message>
    <message>
        <source>A NAME that holds a comma stands in double quotes, as in a CSV file:
--columns &apos;Item,&quot;Price, net&quot;&apos;.
</source>
        <translation>含有逗号的 NAME 要像在 CSV 文件中那样放在双引号里：
--columns &apos;品名,&quot;单价,含税&quot;&apos;。
</translation>
    </message>
    <message>
        <source>standard output cannot be written: %1</source>
        <translation>无法写入标准输出：%1</translation>
    </message>
    <message>
        <source>Everything was done.</source>
        <translation>一切都已完成。</translation>
    </message>
    <message>
        <source>It failed; standard error says why in one line.</source>
        <translation>失败；标准错误输出用一行说明原因。</translation>
    </message>
    <message>
        <source>The program was called in a wrong way.</source>
        <translation>程序的调用方式有误。</translation>
    </message>
    <message>
        <source>It was ended by Ctrl+C or a signal.</source>
        <translation>程序被 Ctrl+C 或信号终止。</translation>
    </message>
    <message>
        <source>User Commands</source>
        <translation>用户命令</translation>
    </message>
    <message>
        <source>NAME</source>
        <translation>名称</translation>
    </message>
    <message>
        <source>previews, exports and prints tables</source>
        <translation>预览、导出和打印表格</translation>
    </message>
    <message>
        <source>SYNOPSIS</source>
        <translation>概述</translation>
    </message>
    <message>
        <source>DESCRIPTION</source>
        <translation>描述</translation>
    </message>
    <message>
        <source>Lays tables out into pages with header, titles, grid lines and footer, and shows, prints or saves them.</source>
        <translation>把表格排成带页眉、标题、网格线和页脚的页面，并显示、打印或保存它们。</translation>
    </message>
    <message>
        <source>COMMANDS</source>
        <translation>命令</translation>
    </message>
    <message>
        <source>EXIT STATUS</source>
        <translation>退出状态</translation>
    </message>
    <message>
        <source>FILES</source>
        <translation>文件</translation>
    </message>
    <message>
        <source>Paper, margins, texts and styles; see &quot;pelloric settings&quot;.</source>
        <translation>纸张、边距、文字和样式；参见“pelloric settings”。</translation>
    </message>
    <message>
        <source>no completion for the shell %1; take bash, zsh or fish</source>
        <translation>没有适用于 %1 的补全；可用 bash、zsh 或 fish</translation>
    </message>
    <message>
        <source>For bash: source &lt;(pelloric completion bash)
For zsh: pelloric completion zsh &gt; a folder of $fpath, as _pelloric
For fish: pelloric completion fish | source
</source>
        <translation>bash：source &lt;(pelloric completion bash)
zsh：pelloric completion zsh &gt; 放入 $fpath 的某个文件夹，名为 _pelloric
fish：pelloric completion fish | source
</translation>
    </message>
    <message>
        <source>above every page, at the left</source>
        <translation>每页上方左侧的文字</translation>
    </message>
    <message>
        <source>above every page, in the middle</source>
        <translation>每页上方居中的文字</translation>
    </message>
    <message>
        <source>above every page, at the right</source>
        <translation>每页上方右侧的文字</translation>
    </message>
    <message>
        <source>below every page, at the left</source>
        <translation>每页下方左侧的文字</translation>
    </message>
    <message>
        <source>below every page, in the middle</source>
        <translation>每页下方居中的文字</translation>
    </message>
    <message>
        <source>below every page, at the right</source>
        <translation>每页下方右侧的文字</translation>
    </message>
    <message>
        <source>The texts above and below every page may hold one of the fields [Date Printed],
[Time Printed], [Date &amp; Time Printed], [Page # of Pages #], [Total Pages] and [Page #].
</source>
        <translation>每页上方和下方的文字可以含有以下字段之一：[Date Printed]、
[Time Printed]、[Date &amp; Time Printed]、[Page # of Pages #]、[Total Pages] 和 [Page #]。
</translation>
    </message>
    <message>
        <source>%1; settings files are smaller</source>
        <translation>%1；设置文件没有这么大</translation>
    </message>
    <message>
        <source>the script nests values deeper than its stack holds</source>
        <translation>脚本中的值嵌套过深，超出了栈的容量</translation>
    </message>
    <message>
        <source>%1 is a file; say what to do with it: pelloric %2 %1</source>
        <translation>%1 是文件；请说明要做什么：pelloric %2 %1</translation>
    </message>
    <message>
        <source>an argument is missing</source>
        <translation>缺少参数</translation>
    </message>
</context>
<context>
    <name>pelloric::app::DemoWindow</name>
    <message>
        <source>Tables</source>
        <translation>表格</translation>
    </message>
    <message>
        <source>Pelloric Demonstration</source>
        <translation>Pelloric 演示</translation>
    </message>
    <message>
        <source>&amp;Flex Grid</source>
        <translation>表格(&amp;F)</translation>
    </message>
    <message>
        <source>A table widget: 178 wines in 15 columns, more than one sheet is wide.</source>
        <translation>表格控件：178 种葡萄酒，15 列，比一张纸宽。</translation>
    </message>
    <message>
        <source>&amp;List View</source>
        <translation>列表视图(&amp;L)</translation>
    </message>
    <message>
        <source>A tree widget in report mode: the countries of the world in English and Chinese.</source>
        <translation>报表模式的树形控件：世界各国的中英文名称。</translation>
    </message>
    <message>
        <source>&amp;Data Grid</source>
        <translation>数据表格(&amp;D)</translation>
    </message>
    <message>
        <source>A table view on an SQL table: time zones and their places.</source>
        <translation>SQL 表的表格视图：各时区及其地点。</translation>
    </message>
    <message>
        <source>Choose a table, say how it is to look, and preview it.</source>
        <translation>选择一个表格，设定外观，然后预览。</translation>
    </message>
    <message>
        <source>&amp;Open your own table…</source>
        <translation>打开自己的表格(&amp;O)…</translation>
    </message>
    <message>
        <source>A CSV or TSV file, or a table of an SQLite database</source>
        <translation>CSV 或 TSV 文件，或 SQLite 数据库中的表</translation>
    </message>
    <message>
        <source>Report</source>
        <translation>报表</translation>
    </message>
    <message>
        <source>Col&amp;umn titles</source>
        <translation>列标题(&amp;T)</translation>
    </message>
    <message>
        <source>&amp;Merge equal cells</source>
        <translation>合并相同的单元格(&amp;M)</translation>
    </message>
    <message>
        <source>Of the flex grid; row 0 holds its titles</source>
        <translation>适用于表格；第 0 行是标题</translation>
    </message>
    <message>
        <source>First row</source>
        <translation>起始行</translation>
    </message>
    <message>
        <source>First &amp;row:</source>
        <translation>起始行(&amp;R)：</translation>
    </message>
    <message>
        <source>Foot&amp;er:</source>
        <translation>页脚(&amp;E)：</translation>
    </message>
    <message>
        <source>&amp;Preview</source>
        <translation>预览(&amp;P)</translation>
    </message>
    <message>
        <source>Host code:</source>
        <translation>宿主代码：</translation>
    </message>
    <message>
        <source>Host code</source>
        <translation>宿主代码</translation>
    </message>
    <message>
        <source>&amp;Copy</source>
        <translation>复制(&amp;C)</translation>
    </message>
    <message>
        <source>Copies the code to the clipboard</source>
        <translation>将代码复制到剪贴板</translation>
    </message>
    <message>
        <source>A table of your own: %1.</source>
        <translation>自己的表格：%1。</translation>
    </message>
    <message>
        <source>&amp;Spans</source>
        <translation>合并单元格(&amp;S)</translation>
    </message>
    <message>
        <source>A table widget with spans, ticks and colours, printed as it is shown.</source>
        <translation>带合并单元格、勾选和颜色的表格，按所见打印。</translation>
    </message>
    <message>
        <source>Classes of wines</source>
        <translation>葡萄酒类别</translation>
    </message>
    <message>
        <source>&amp;Tree</source>
        <translation>树(&amp;T)</translation>
    </message>
    <message>
        <source>A tree widget with branches, icons and ticks, printed as it is shown.</source>
        <translation>带分支、图标和勾选的树，按所见打印。</translation>
    </message>
    <message>
        <source>Time zones</source>
        <translation>时区</translation>
    </message>
    <message>
        <source>As sho&amp;wn</source>
        <translation>按所见(&amp;W)</translation>
    </message>
    <message>
        <source>Cells look as the view shows them; F4 in the preview offers more</source>
        <translation>单元格与视图一致；预览中按 F4 可选更多</translation>
    </message>
</context>
<context>
    <name>pelloric::app::OwnTable</name>
    <message>
        <source>Open Your Own Table</source>
        <translation>打开自己的表格</translation>
    </message>
    <message>
        <source>Table of the database:</source>
        <translation>数据库中的表：</translation>
    </message>
    <message>
        <source>Table of the database</source>
        <translation>数据库中的表</translation>
    </message>
    <message>
        <source>Tables (*.csv *.tsv *.txt *.sqlite *.db *.sqlite3);;All files (*)</source>
        <translation>表格 (*.csv *.tsv *.txt *.sqlite *.db *.sqlite3);;所有文件 (*)</translation>
    </message>
</context>
</TS>
