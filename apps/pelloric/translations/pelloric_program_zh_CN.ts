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
