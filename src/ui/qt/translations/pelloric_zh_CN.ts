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
    <name>Phrase</name>
    <message>
        <source>no report was built yet</source>
        <translation>尚未生成报表</translation>
    </message>
    <message>
        <source>nobody opens the preview window</source>
        <translation>没有打开预览窗口的程序</translation>
    </message>
    <message>
        <source>doPreview was given no grid</source>
        <translation>doPreview 没有得到表格</translation>
    </message>
    <message>
        <source>%1 was given where a plain value is wanted</source>
        <translation>给出的是 %1，需要的是简单值</translation>
    </message>
    <message>
        <source>%1 was given where a number is wanted</source>
        <translation>给出的是 %1，需要的是数字</translation>
    </message>
    <message>
        <source>no grid was given</source>
        <translation>没有给出表格</translation>
    </message>
    <message>
        <source>%1 was given where a grid is wanted</source>
        <translation>给出的是 %1，需要的是表格</translation>
    </message>
    <message>
        <source>page</source>
        <translation>页</translation>
    </message>
    <message>
        <source>a document holds at most %1 pages</source>
        <translation>一个文档最多有 %1 页</translation>
    </message>
    <message>
        <source>on page %1 line</source>
        <translation>第 %1 页上的线条</translation>
    </message>
    <message>
        <source>on page %1 text</source>
        <translation>第 %1 页上的文字</translation>
    </message>
    <message>
        <source>a font of %1 points is too large to be measured; choose a smaller size</source>
        <translation>%1 磅的字体太大，无法测量；请选择更小的字号</translation>
    </message>
    <message>
        <source>a text of more than 4294967295 characters cannot be recorded</source>
        <translation>超过 4294967295 个字符的文字无法记录</translation>
    </message>
    <message>
        <source>paper of %1 by %2 twips cannot be written; each side is 1 to %3 twips (200 inches)</source>
        <translation>无法写出 %1 × %2 缇的纸张；每边为 1 到 %3 缇（200 英寸）</translation>
    </message>
    <message>
        <source>the document has no page to write</source>
        <translation>文档中没有可写出的页</translation>
    </message>
    <message>
        <source>there is no memory for an image of %1 by %2 pixels; choose a lower resolution</source>
        <translation>内存不足以生成 %1 × %2 像素的图像；请选择较低的分辨率</translation>
    </message>
    <message>
        <source>an image of %1 by %2 pixels (%3 per inch) cannot be made; it has 1 to %4, so choose another resolution</source>
        <translation>无法生成 %1 × %2 像素（每英寸 %3）的图像；像素数为 1 到 %4，请选择其他分辨率</translation>
    </message>
    <message>
        <source>the font %1 is damaged</source>
        <translation>字体 %1 已损坏</translation>
    </message>
    <message>
        <source>the font %1 may not be embedded</source>
        <translation>字体 %1 不允许嵌入</translation>
    </message>
    <message>
        <source>the font %1 is a variable or coloured font</source>
        <translation>字体 %1 是可变字体或彩色字体</translation>
    </message>
    <message>
        <source>the font %1 has no outlines of a kind that can be embedded</source>
        <translation>字体 %1 没有可以嵌入的轮廓</translation>
    </message>
    <message>
        <source>the grid is gone</source>
        <translation>表格已不存在</translation>
    </message>
    <message>
        <source>%1 is past what the member holds</source>
        <translation>%1 超出了成员的范围</translation>
    </message>
    <message>
        <source>an object is no plain value</source>
        <translation>对象不是简单值</translation>
    </message>
    <message>
        <source>&quot;%1&quot; is no %2</source>
        <translation>“%1”不是 %2</translation>
    </message>
    <message>
        <source>column</source>
        <translation>列</translation>
    </message>
    <message>
        <source>the grid&apos;s model is gone</source>
        <translation>表格的模型已不存在</translation>
    </message>
    <message>
        <source>row</source>
        <translation>行</translation>
    </message>
    <message>
        <source>the grid has lost rows</source>
        <translation>表格的行变少了</translation>
    </message>
    <message>
        <source>member number</source>
        <translation>成员编号</translation>
    </message>
    <message>
        <source>the object is gone</source>
        <translation>对象已不存在</translation>
    </message>
    <message>
        <source>the list has changed</source>
        <translation>列表已改变</translation>
    </message>
    <message>
        <source>a row of %1 cells; there are %2 columns</source>
        <translation>一行有 %1 个单元格；共有 %2 列</translation>
    </message>
    <message>
        <source>row %1 holds more than 4294967295 characters</source>
        <translation>第 %1 行超过 4294967295 个字符</translation>
    </message>
    <message>
        <source>there is no printer</source>
        <translation>没有打印机</translation>
    </message>
    <message>
        <source>there is no printer %1</source>
        <translation>没有打印机 %1</translation>
    </message>
    <message>
        <source>the printer %1 takes no jobs</source>
        <translation>打印机 %1 不接受任务</translation>
    </message>
    <message>
        <source>no column of the grid is wide enough to be printed</source>
        <translation>表格中没有一列宽到可以打印</translation>
    </message>
    <message>
        <source>%1 is no document file</source>
        <translation>%1 不是文档文件</translation>
    </message>
    <message>
        <source>%1 holds more than %2 bytes</source>
        <translation>%1 超过 %2 字节</translation>
    </message>
    <message>
        <source>an index is missing</source>
        <translation>缺少索引</translation>
    </message>
    <message>
        <source>index %1</source>
        <translation>索引 %1</translation>
    </message>
    <message>
        <source>%1 is past what a single-precision number holds</source>
        <translation>%1 超出了单精度数的范围</translation>
    </message>
    <message>
        <source>&quot;%1&quot; is no whole number between -32768 and 32767</source>
        <translation>“%1”不是 -32768 到 32767 之间的整数</translation>
    </message>
    <message>
        <source>this Qt has no converter for GB18030</source>
        <translation>此 Qt 没有 GB18030 转换器</translation>
    </message>
    <message>
        <source>row %1, column %2 holds %3 characters, at most %4 can be printed</source>
        <translation>第 %1 行第 %2 列有 %3 个字符，最多可打印 %4 个</translation>
    </message>
    <message>
        <source>Invalid procedure call or argument</source>
        <translation>无效的过程调用或参数</translation>
    </message>
    <message>
        <source>Overflow</source>
        <translation>溢出</translation>
    </message>
    <message>
        <source>Subscript out of range</source>
        <translation>下标越界</translation>
    </message>
    <message>
        <source>Division by zero</source>
        <translation>除数为零</translation>
    </message>
    <message>
        <source>Type mismatch</source>
        <translation>类型不匹配</translation>
    </message>
    <message>
        <source>File not found</source>
        <translation>文件未找到</translation>
    </message>
    <message>
        <source>The file cannot be written</source>
        <translation>无法写入文件</translation>
    </message>
    <message>
        <source>Disk full</source>
        <translation>磁盘已满</translation>
    </message>
    <message>
        <source>Permission denied</source>
        <translation>没有权限</translation>
    </message>
    <message>
        <source>Object variable not set</source>
        <translation>未设置对象变量</translation>
    </message>
    <message>
        <source>Object doesn&apos;t support this property or method</source>
        <translation>对象不支持该属性或方法</translation>
    </message>
    <message>
        <source>Cancel was selected</source>
        <translation>已选择取消</translation>
    </message>
    <message>
        <source>Error</source>
        <translation>错误</translation>
    </message>
    <message>
        <source>%1 %2; there is %3</source>
        <translation>%1 %2；共有 %3</translation>
    </message>
    <message>
        <source>%1 %2; there are %3</source>
        <translation>%1 %2；共有 %3</translation>
    </message>
    <message>
        <source>%1 is not between %2 and %3</source>
        <translation>%1 不在 %2 与 %3 之间</translation>
    </message>
    <message>
        <source>an object is no number</source>
        <translation>对象不是数字</translation>
    </message>
    <message>
        <source>an object was expected</source>
        <translation>应为对象</translation>
    </message>
    <message>
        <source>a row set was expected</source>
        <translation>应为行集</translation>
    </message>
    <message>
        <source>an object has no text</source>
        <translation>对象没有文字</translation>
    </message>
    <message>
        <source>the page list names too many pages; write fewer ranges</source>
        <translation>页码列表包含的页太多；请减少范围</translation>
    </message>
    <message>
        <source>The pages are %1, the printer&apos;s sheet is %2 (%3): what does not fit on it is lost.</source>
        <translation>页面为 %1，打印机的纸张为 %2（%3）：放不下的部分将丢失。</translation>
    </message>
    <message>
        <source>The pages are %1, the printer&apos;s sheet is %2 (%3).</source>
        <translation>页面为 %1，打印机的纸张为 %2（%3）。</translation>
    </message>
    <message>
        <source>after %1 of %2 pages</source>
        <translation>已打印 %1 页，共 %2 页</translation>
    </message>
    <message>
        <source>the print system does not answer (nothing came within %1 seconds)</source>
        <translation>打印系统没有响应（%1 秒内没有回应）</translation>
    </message>
    <message>
        <source>no room for the document in %1</source>
        <translation>%1 中没有存放文档的空间</translation>
    </message>
    <message>
        <source>the document could not be ended</source>
        <translation>文档无法结束</translation>
    </message>
    <message>
        <source>the document could not be begun</source>
        <translation>文档无法开始</translation>
    </message>
    <message>
        <source>the printer rejects jobs</source>
        <translation>打印机拒绝任务</translation>
    </message>
    <message>
        <source>the printer is stopped</source>
        <translation>打印机已停止</translation>
    </message>
    <message>
        <source>the print system does not answer (%1)</source>
        <translation>打印系统没有响应（%1）</translation>
    </message>
    <message>
        <source>the print system did not take the document (%1)</source>
        <translation>打印系统没有接受文档（%1）</translation>
    </message>
    <message>
        <source>there is no such printer</source>
        <translation>没有这台打印机</translation>
    </message>
    <message>
        <source>field</source>
        <translation>字段</translation>
    </message>
    <message>
        <source>the grid prints no column &quot;%1&quot;; there are: %2</source>
        <translation>表格没有打印列“%1”；现有的列：%2</translation>
    </message>
    <message>
        <source>this grid does not tell which of its rows are marked</source>
        <translation>此表格不提供哪些行被选中</translation>
    </message>
    <message>
        <source>no row of the grid is marked; mark rows, or print all</source>
        <translation>表格中没有选中的行；请选中行，或打印全部</translation>
    </message>
    <message>
        <source>more than %1 columns are printed; leave some out</source>
        <translation>要打印的列超过 %1；请去掉一些</translation>
    </message>
    <message>
        <source>the grid has %1 columns, at most %2 can be read</source>
        <translation>表格有 %1 列，最多可读取 %2 列</translation>
    </message>
    <message>
        <source>the grid prints %1 columns now, the report was built with %2; preview it anew</source>
        <translation>表格现在打印 %1 列，而报表有 %2 列；请重新预览</translation>
    </message>
    <message>
        <source>the data grid has more columns than fields</source>
        <translation>数据表格的列多于字段</translation>
    </message>
    <message>
        <source>m_PrintObj names no kind of grid</source>
        <translation>m_PrintObj 不是任何表格类型</translation>
    </message>
    <message>
        <source>the data source never comes to its first record</source>
        <translation>数据源始终到不了第一条记录</translation>
    </message>
    <message>
        <source>the colour %1 of the font %2 is not between 0 and %3</source>
        <translation>字体 %2 的颜色 %1 不在 0 与 %3 之间</translation>
    </message>
    <message>
        <source>the report needs about %1 pages, a document holds %2; print rows 1 to %3, or leave out columns</source>
        <translation>报表约需 %1 页，而一个文档最多 %2 页；请打印第 1 到 %3 行，或去掉一些列</translation>
    </message>
    <message>
        <source>not even the first rows fit on the %1 pages that a document holds; choose larger paper, or leave out columns</source>
        <translation>一个文档的 %1 页连前几行都放不下；请选择更大的纸张，或去掉一些列</translation>
    </message>
    <message>
        <source>1 is portrait and 2 is landscape</source>
        <translation>1 为纵向，2 为横向</translation>
    </message>
    <message>
        <source>the number of a paper is a whole number, such as 9</source>
        <translation>纸张编号是整数，例如 9</translation>
    </message>
    <message>
        <source>this margin is at most %1 mm</source>
        <translation>此边距最大为 %1 mm</translation>
    </message>
    <message>
        <source>a sheet is wider than 0 and no wider than %1 mm</source>
        <translation>纸张宽度大于 0，不超过 %1 mm</translation>
    </message>
    <message>
        <source>a sheet is higher than 0 and no higher than %1 mm</source>
        <translation>纸张高度大于 0，不超过 %1 mm</translation>
    </message>
    <message>
        <source>a colour is a number from 0 to %1</source>
        <translation>颜色是 0 到 %1 之间的数</translation>
    </message>
    <message>
        <source>a font size is a number of points above 0, at most %1</source>
        <translation>字号是大于 0、不超过 %1 的磅数</translation>
    </message>
    <message>
        <source>%1 in %2</source>
        <translation>%1（在 %2 中）</translation>
    </message>
    <message>
        <source>%1 and %2 more settings</source>
        <translation>%1 以及另外 %2 项设置</translation>
    </message>
    <message>
        <source>%1 and %2</source>
        <translation>%1 和 %2</translation>
    </message>
    <message>
        <source>%1 is missing</source>
        <translation>缺少 %1</translation>
    </message>
    <message>
        <source>%1 are missing</source>
        <translation>缺少 %1</translation>
    </message>
    <message>
        <source>the margins leave no room on the sheet; they are printed larger than stored, 1.6 times at the top, 1.8 times at the bottom and 1.2 times at the sides.</source>
        <translation>边距在纸上没有留下空间；打印时边距比保存的值大：上边 1.6 倍，下边 1.8 倍，两侧 1.2 倍。</translation>
    </message>
    <message>
        <source>%1 begins with a byte-order mark, which belongs to another encoding; settings are written in GB18030.</source>
        <translation>%1 以字节顺序标记开头，那属于另一种编码；设置使用 GB18030 编码。</translation>
    </message>
    <message>
        <source>%1; restore the defaults</source>
        <translation>%1；请恢复默认值</translation>
    </message>
    <message>
        <source>%1; correct it in %2 or restore the defaults</source>
        <translation>%1；请在“%2”中更正，或恢复默认值</translation>
    </message>
    <message>
        <source>%1, which holds paper, margins and style; restore the defaults</source>
        <translation>%1（保存纸张、边距和样式）；请恢复默认值</translation>
    </message>
    <message>
        <source>a cell holds an object</source>
        <translation>单元格中是对象</translation>
    </message>
    <message>
        <source>fields %1 to</source>
        <translation>字段 %1 到</translation>
    </message>
    <message>
        <source>a Sorvane was expected</source>
        <translation>应为 Sorvane</translation>
    </message>
    <message>
        <source>an object of the library cannot be handed to a script&apos;s grid</source>
        <translation>库的对象不能交给脚本的表格</translation>
    </message>
    <message>
        <source>Item needs an index</source>
        <translation>Item 需要索引</translation>
    </message>
    <message>
        <source>a symbol is no value</source>
        <translation>符号不是值</translation>
    </message>
    <message>
        <source>only an array takes an index</source>
        <translation>只有数组接受索引</translation>
    </message>
    <message>
        <source>item</source>
        <translation>项</translation>
    </message>
    <message>
        <source>this is a picture, not a table</source>
        <translation>这是图片，不是表格</translation>
    </message>
    <message>
        <source>this is a packed file; unpack it first, for example with: gunzip -c FILE</source>
        <translation>这是压缩文件；请先解压，例如：gunzip -c 文件</translation>
    </message>
    <message>
        <source>this is an HTML or XML document, not a table; save its table as CSV</source>
        <translation>这是 HTML 或 XML 文档，不是表格；请把其中的表格另存为 CSV</translation>
    </message>
    <message>
        <source>this is a PDF file; take the file that it was made from, or save its table as CSV</source>
        <translation>这是 PDF 文件；请使用生成它的原文件，或把其中的表格另存为 CSV</translation>
    </message>
    <message>
        <source>this is a ZIP archive; unpack it first</source>
        <translation>这是 ZIP 压缩包；请先解压</translation>
    </message>
    <message>
        <source>this is a program, not a table</source>
        <translation>这是程序，不是表格</translation>
    </message>
    <message>
        <source>this is a Parquet file; save its table as CSV</source>
        <translation>这是 Parquet 文件；请把其中的表格另存为 CSV</translation>
    </message>
    <message>
        <source>this is a text document, not a table; save its table as CSV</source>
        <translation>这是文字文档，不是表格；请把其中的表格另存为 CSV</translation>
    </message>
    <message>
        <source>more than %1 values in a row</source>
        <translation>一行中的值超过 %1 个</translation>
    </message>
    <message>
        <source>the file is empty</source>
        <translation>文件是空的</translation>
    </message>
    <message>
        <source>%1 and others</source>
        <translation>%1 等</translation>
    </message>
    <message>
        <source>the row at line %1 may be several rows glued together: a quoted value goes on over a line break, and the row has not as many values as the titles</source>
        <translation>第 %1 行处的记录可能是几行粘在一起：带引号的值跨越了换行，而且值的个数与标题不同</translation>
    </message>
    <message>
        <source>the rows at lines %1 may be several rows glued together: a quoted value goes on over a line break, and the row has not as many values as the titles</source>
        <translation>第 %1 行处的记录可能是几行粘在一起：带引号的值跨越了换行，而且值的个数与标题不同</translation>
    </message>
    <message>
        <source>a tab</source>
        <translation>制表符</translation>
    </message>
    <message>
        <source>%1 of %2 rows have not as many values as the titles, the first at line %3; is this a table with %4 between its values?</source>
        <translation>%2 行中有 %1 行的值与标题的个数不同，第一处在第 %3 行；这张表的值之间用的是 %4 吗？</translation>
    </message>
    <message>
        <source>the encoding was guessed to be %1; name another one if letters look wrong</source>
        <translation>编码猜测为 %1；如果文字显示不对，请指定其他编码</translation>
    </message>
    <message>
        <source>a table is an array of objects, [{&quot;name&quot;: value, …}, …], or one object a line</source>
        <translation>表格是对象的数组 [{&quot;名称&quot;: 值, …}, …]，或每行一个对象</translation>
    </message>
    <message>
        <source>more than %1 different names</source>
        <translation>不同的名称超过 %1 个</translation>
    </message>
    <message>
        <source>this is no JSON: %1</source>
        <translation>这不是 JSON：%1</translation>
    </message>
    <message>
        <source>this office file has to be converted by LibreOffice, which is not installed; install libreoffice-calc, or save the file as .xlsx, .ods or CSV</source>
        <translation>此办公文件需要由 LibreOffice 转换，但未安装 LibreOffice；请安装 libreoffice-calc，或把文件另存为 .xlsx、.ods 或 CSV</translation>
    </message>
    <message>
        <source>LibreOffice could not convert this file; save it as .xlsx, .ods or CSV</source>
        <translation>LibreOffice 无法转换此文件；请把它另存为 .xlsx、.ods 或 CSV</translation>
    </message>
    <message>
        <source>a cell past the end of its sheet</source>
        <translation>单元格超出了工作表的末尾</translation>
    </message>
    <message>
        <source>the sheet is empty</source>
        <translation>工作表是空的</translation>
    </message>
    <message>
        <source>no sheet %1; the file has: %2</source>
        <translation>没有工作表 %1；文件中有：%2</translation>
    </message>
    <message>
        <source>the office file is damaged; open it in its program and save it again, or save it as CSV</source>
        <translation>办公文件已损坏；请用原程序打开并重新保存，或另存为 CSV</translation>
    </message>
    <message>
        <source>give one statement only</source>
        <translation>只能给出一条语句</translation>
    </message>
    <message>
        <source>the database cannot be copied to read its log: %1</source>
        <translation>无法复制数据库以读取其日志：%1</translation>
    </message>
    <message>
        <source>this is no SQLite database</source>
        <translation>这不是 SQLite 数据库</translation>
    </message>
    <message>
        <source>the database has no table</source>
        <translation>数据库中没有表</translation>
    </message>
    <message>
        <source>name one of the database&apos;s tables: %1</source>
        <translation>请指定数据库中的一张表：%1</translation>
    </message>
    <message>
        <source>no table %1; the database has: %2</source>
        <translation>没有表 %1；数据库中有：%2</translation>
    </message>
    <message>
        <source>the statement is no query; give a SELECT</source>
        <translation>该语句不是查询；请给出 SELECT</translation>
    </message>
    <message>
        <source>the statement answers no rows; give a SELECT</source>
        <translation>该语句不返回行；请给出 SELECT</translation>
    </message>
    <message>
        <source>bytes that are neither UTF-8 nor GB18030 text; name the encoding</source>
        <translation>既不是 UTF-8 也不是 GB18030 的字节；请指定编码</translation>
    </message>
    <message>
        <source>line %1: %2</source>
        <translation>第 %1 行：%2</translation>
    </message>
    <message>
        <source>unknown encoding %1; known are UTF-8, GB18030, GBK, Big5, UTF-16 and ISO-8859-1, among others</source>
        <translation>未知的编码 %1；已知的有 UTF-8、GB18030、GBK、Big5、UTF-16 和 ISO-8859-1 等</translation>
    </message>
    <message>
        <source>bytes that are no %1</source>
        <translation>不是 %1 的字节</translation>
    </message>
    <message>
        <source>bytes that are no %1, which the file&apos;s mark says it is</source>
        <translation>不是 %1 的字节，而文件标记说它是</translation>
    </message>
    <message>
        <source>the office file holds more than 2 GB</source>
        <translation>办公文件超过 2 GB</translation>
    </message>
    <message>
        <source>%1 OK will save nothing.</source>
        <translation>%1 OK 将不会保存任何内容。</translation>
    </message>
    <message>
        <source>%1 is empty: OK keeps the stored one.</source>
        <translation>%1 为空：OK 保留已保存的值。</translation>
    </message>
    <message>
        <source>%1 &quot;%2&quot; lacks its unit, as in &quot;210mm&quot;: OK will save nothing of all three tabs.</source>
        <translation>%1“%2”缺少单位（例如“210mm”）：OK 不会保存三个选项卡中的任何内容。</translation>
    </message>
    <message>
        <source>%1 must be above 0: OK will store it, and no page can be laid out.</source>
        <translation>%1 必须大于 0：OK 会保存它，但无法排出任何页面。</translation>
    </message>
    <message>
        <source>%1 is at most %2: OK will store it, and no page can be built until it is smaller.</source>
        <translation>%1 最大为 %2：OK 会保存它，但在改小之前无法生成任何页面。</translation>
    </message>
    <message>
        <source>%1 %2 is printed as %3</source>
        <translation>%1 %2 打印为 %3</translation>
    </message>
    <message>
        <source>%1; a margin is at most %2 here. OK will store it, and no page can be built until it is smaller.</source>
        <translation>%1；此处边距最大为 %2。OK 会保存它，但在改小之前无法生成任何页面。</translation>
    </message>
    <message>
        <source>%1 0 mm is printed as 20 mm.</source>
        <translation>%1 0 mm 打印为 20 mm。</translation>
    </message>
    <message>
        <source>%1 lies outside the sheet. OK will store it all the same.</source>
        <translation>%1 在纸张之外。OK 仍会保存它。</translation>
    </message>
    <message>
        <source>%1, and the sheet is %2 high</source>
        <translation>%1，而纸张高 %2</translation>
    </message>
    <message>
        <source>%1, and the sheet is %2 wide</source>
        <translation>%1，而纸张宽 %2</translation>
    </message>
    <message>
        <source>%1: it lies outside. OK will store it all the same.</source>
        <translation>%1：边距在纸张之外。OK 仍会保存它。</translation>
    </message>
    <message>
        <source>%1: there is no room left for a row. OK will store it all the same.</source>
        <translation>%1：没有放下一行的空间。OK 仍会保存它。</translation>
    </message>
    <message>
        <source>%1: there is no room left for a column. OK will store it all the same.</source>
        <translation>%1：没有放下一列的空间。OK 仍会保存它。</translation>
    </message>
    <message>
        <source>no grid is previewed</source>
        <translation>没有正在预览的表格</translation>
    </message>
    <message>
        <source>There are %1 more like this.</source>
        <translation>还有 %1 处类似的问题。</translation>
    </message>
    <message>
        <source>The pages could not be built.</source>
        <translation>无法生成页面。</translation>
    </message>
    <message>
        <source>%1: the name must end in .pdf, .png or .svg</source>
        <translation>%1：文件名必须以 .pdf、.png 或 .svg 结尾</translation>
    </message>
    <message>
        <source>%1 character has no glyph in any installed font and shows as a hollow box (%2)</source>
        <translation>%1 个字符在已安装的字体中没有字形，显示为空框（%2）</translation>
    </message>
    <message>
        <source>%1 characters have no glyph in any installed font and show as hollow boxes (%2)</source>
        <translation>%1 个字符在已安装的字体中没有字形，显示为空框（%2）</translation>
    </message>
    <message>
        <source>%1; install %2</source>
        <translation>%1；请安装 %2</translation>
    </message>
    <message>
        <source>the paper has no width</source>
        <translation>纸张没有宽度</translation>
    </message>
    <message>
        <source>the paper has no width or no height</source>
        <translation>纸张没有宽度或没有高度</translation>
    </message>
    <message>
        <source>the window has no room for a page</source>
        <translation>窗口放不下一页</translation>
    </message>
    <message>
        <source>the pages cannot be shown any smaller</source>
        <translation>页面无法显示得更小</translation>
    </message>
    <message>
        <source>a scale of 0 shows nothing</source>
        <translation>比例为 0 时什么也不显示</translation>
    </message>
    <message>
        <source>a scale of %1 is too small</source>
        <translation>比例 %1 太小</translation>
    </message>
    <message>
        <source>this is an Arrow file; save its table as CSV</source>
        <translation>这是 Arrow 文件；请把其中的表格另存为 CSV</translation>
    </message>
    <message>
        <source>%1 is no picture</source>
        <translation>%1 不是图片</translation>
    </message>
    <message>
        <source>%1; what stands before it is shown</source>
        <translation>%1；其前的内容已显示</translation>
    </message>
    <message>
        <source>%1 is damaged: %2</source>
        <translation>%1 已损坏：%2</translation>
    </message>
    <message>
        <source>row %1 of a table of %2 columns makes more than %3 cells; take fewer rows or columns</source>
        <translation>%2 列的表格的第 %1 行使单元格超过 %3 个；请减少行或列</translation>
    </message>
    <message>
        <source>a zero byte; this is no text file, unless in UTF-16: then name UTF-16LE or UTF-16BE as its encoding</source>
        <translation>有一个零字节；除非采用 UTF-16 编码，否则这不是文本文件；若是，请指定编码 UTF-16LE 或 UTF-16BE</translation>
    </message>
    <message>
        <source>the number %1 is too large; write it in quotation marks</source>
        <translation>数字 %1 过大；请用引号括起来</translation>
    </message>
    <message>
        <source>the sheet holds more than %1 cells; save the part that is wanted as CSV</source>
        <translation>工作表的单元格超过 %1 个；请将所需部分另存为 CSV</translation>
    </message>
    <message>
        <source>the sheet holds more than %1 characters; save the part that is wanted as CSV</source>
        <translation>工作表的字符超过 %1 个；请将所需部分另存为 CSV</translation>
    </message>
    <message>
        <source>%1 goes on after 4 GB; save it to a file and name that</source>
        <translation>%1 超过 4 GB 仍未结束；请保存为文件并指定该文件</translation>
    </message>
    <message>
        <source>a line holds more than %1 bytes</source>
        <translation>有一行超过 %1 个字节</translation>
    </message>
    <message>
        <source>it goes on after %1 bytes, which is the most that is read of what is no ordinary file</source>
        <translation>%1 个字节之后还有内容；不是普通文件时最多只读取这么多</translation>
    </message>
    <message>
        <source>pictures cannot be kept in %1: %2</source>
        <translation>无法在 %1 中存放图片：%2</translation>
    </message>
    <message>
        <source>the grid has %1 rows; the %2 pages that a document holds take %3 of them at most, so print fewer rows</source>
        <translation>表格有 %1 行；一个文档的 %2 页最多容纳 %3 行，请少打印一些行</translation>
    </message>
    <message>
        <source>no object of the file has a name, so there is no column; %1</source>
        <translation>文件中没有任何带名称的对象，因此没有列；%1</translation>
    </message>
    <message>
        <source>the statement leaves a value open (?, :name or $name); write the value</source>
        <translation>语句中有未给出的值（?、:name 或 $name）；请直接写出该值</translation>
    </message>
    <message>
        <source>all that the sheet holds is hidden</source>
        <translation>工作表中的所有内容都被隐藏了</translation>
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
        <source>Total</source>
        <translation>总计</translation>
    </message>
    <message>
        <source>the file cannot be copied into %1 to be converted: %2</source>
        <translation>无法将文件复制到 %1 以便转换：%2</translation>
    </message>
    <message>
        <source>value %1 of the row holds more than %2 bytes; leave it out, or shorten it</source>
        <translation>该行的第 %1 个值超过 %2 个字节；请省略或缩短</translation>
    </message>
    <message>
        <source>a value holds more than %1 bytes; leave it out, or shorten it</source>
        <translation>有一个值超过 %1 个字节；请省略或缩短</translation>
    </message>
    <message>
        <source>the value behind byte %1 holds more than %2 bytes; leave it out, or shorten it</source>
        <translation>第 %1 个字节之后的值超过 %2 个字节；请省略或缩短</translation>
    </message>
    <message>
        <source>take the array out of it, for example with: jq %1</source>
        <translation>请取出其中的数组，例如用：jq %1</translation>
    </message>
    <message>
        <source>take one of its arrays out of it, for example with jq and one of: %1</source>
        <translation>请取出其中一个数组，例如用 jq 加上其中之一：%1</translation>
    </message>
    <message>
        <source>make rows of its objects, for example with: jq &apos;[.[]]&apos;</source>
        <translation>请把其中的对象变成行，例如用：jq &apos;[.[]]&apos;</translation>
    </message>
    <message>
        <source>it holds no array of objects, but %1</source>
        <translation>其中没有对象数组，只有 %1</translation>
    </message>
    <message>
        <source>the file is one object; %1; %2</source>
        <translation>文件是一个对象；%1；%2</translation>
    </message>
    <message>
        <source>%1 is a link that leads to no file</source>
        <translation>%1 是一个不指向任何文件的链接</translation>
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
    <message>
        <source>Too wide to be shrunk: its columns are narrowed.</source>
        <translation>表格太宽，无法缩小：列已变窄。</translation>
    </message>
    <message>
        <source>Pages across: %1.</source>
        <translation>横向页数：%1。</translation>
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
    <message>
        <source>The font %1 is not installed; %2 is taken instead.</source>
        <translation>未安装字体 %1；改用 %2。</translation>
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
    <message>
        <source>Cells of %1 that show no number and that its total leaves out: %2.</source>
        <translation>%1 中不是数字、未计入合计的单元格：%2。</translation>
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
