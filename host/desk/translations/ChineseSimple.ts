<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="zh_CN" sourcelanguage="en_US">
<context>
    <name>KvDeskActions</name>
    <message>
        <source>&amp;New session</source>
        <translation>新建会话(&amp;N)</translation>
    </message>
    <message>
        <source>Start an empty session</source>
        <translation>新建空白会话</translation>
    </message>
    <message>
        <source>Open &amp;image...</source>
        <translation>打开图像(&amp;I)...</translation>
    </message>
    <message>
        <source>Open image</source>
        <translation>打开图像</translation>
    </message>
    <message>
        <source>&amp;Open session...</source>
        <translation>打开会话(&amp;O)...</translation>
    </message>
    <message>
        <source>Open session</source>
        <translation>打开会话</translation>
    </message>
    <message>
        <source>Import &amp;table...</source>
        <translation>导入表格(&amp;T)...</translation>
    </message>
    <message>
        <source>Import table of measured values</source>
        <translation>导入测量值表格</translation>
    </message>
    <message>
        <source>&amp;Save session</source>
        <translation>保存会话(&amp;S)</translation>
    </message>
    <message>
        <source>Save session</source>
        <translation>保存会话</translation>
    </message>
    <message>
        <source>Save session &amp;as...</source>
        <translation>会话另存为(&amp;A)...</translation>
    </message>
    <message>
        <source>Save session to another file</source>
        <translation>将会话另存为其他文件</translation>
    </message>
    <message>
        <source>&amp;Quit</source>
        <translation>退出(&amp;Q)</translation>
    </message>
    <message>
        <source>Quit the program</source>
        <translation>退出程序</translation>
    </message>
    <message>
        <source>Zoom &amp;in</source>
        <translation>放大(&amp;I)</translation>
    </message>
    <message>
        <source>Zoom in</source>
        <translation>放大</translation>
    </message>
    <message>
        <source>Zoom &amp;out</source>
        <translation>缩小(&amp;O)</translation>
    </message>
    <message>
        <source>Zoom out</source>
        <translation>缩小</translation>
    </message>
    <message>
        <source>&amp;Fit to window</source>
        <translation>适合窗口(&amp;F)</translation>
    </message>
    <message>
        <source>Show the whole image</source>
        <translation>显示整幅图像</translation>
    </message>
    <message>
        <source>&amp;Actual size</source>
        <translation>实际大小(&amp;A)</translation>
    </message>
    <message>
        <source>Show the image at 100 %</source>
        <translation>以 100% 显示图像</translation>
    </message>
    <message>
        <source>&amp;Measured values</source>
        <translation>测量值(&amp;M)</translation>
    </message>
    <message>
        <source>Show or hide the measured values</source>
        <translation>显示或隐藏测量值</translation>
    </message>
    <message>
        <source>Stat&amp;us log</source>
        <translation>状态日志(&amp;U)</translation>
    </message>
    <message>
        <source>Show or hide the status log</source>
        <translation>显示或隐藏状态日志</translation>
    </message>
    <message>
        <source>&amp;Dark or light theme</source>
        <translation>深色或浅色主题(&amp;D)</translation>
    </message>
    <message>
        <source>Change between the dark and the light theme</source>
        <translation>在深色和浅色主题之间切换</translation>
    </message>
    <message>
        <source>Settin&amp;gs...</source>
        <translation>设置(&amp;G)...</translation>
    </message>
    <message>
        <source>Settings</source>
        <translation>设置</translation>
    </message>
    <message>
        <source>&amp;About Measuring Desk</source>
        <translation>关于 Measuring Desk(&amp;A)</translation>
    </message>
    <message>
        <source>About Measuring Desk</source>
        <translation>关于 Measuring Desk</translation>
    </message>
    <message>
        <source>%1 (%2)</source>
        <comment>command (shortcut)</comment>
        <translation>%1 (%2)</translation>
    </message>
    <message>
        <source>&amp;Export measured values...</source>
        <translation>导出测量值(&amp;E)...</translation>
    </message>
    <message>
        <source>Export measured values as a table</source>
        <translation>将测量值导出为表格</translation>
    </message>
    <message>
        <source>&amp;Undo</source>
        <translation>撤销(&amp;U)</translation>
    </message>
    <message>
        <source>Undo the last step</source>
        <translation>撤销上一步操作</translation>
    </message>
    <message>
        <source>&amp;Redo</source>
        <translation>重做(&amp;R)</translation>
    </message>
    <message>
        <source>Redo what was undone</source>
        <translation>重做已撤销的操作</translation>
    </message>
    <message>
        <source>Cu&amp;t</source>
        <translation>剪切(&amp;T)</translation>
    </message>
    <message>
        <source>Cut the selected objects</source>
        <translation>剪切所选对象</translation>
    </message>
    <message>
        <source>&amp;Copy</source>
        <translation>复制(&amp;C)</translation>
    </message>
    <message>
        <source>Copy the selected objects</source>
        <translation>复制所选对象</translation>
    </message>
    <message>
        <source>&amp;Paste</source>
        <translation>粘贴(&amp;P)</translation>
    </message>
    <message>
        <source>Paste copied objects</source>
        <translation>粘贴已复制的对象</translation>
    </message>
    <message>
        <source>&amp;Delete</source>
        <translation>删除(&amp;D)</translation>
    </message>
    <message>
        <source>Delete the selected objects</source>
        <translation>删除所选对象</translation>
    </message>
    <message>
        <source>Select &amp;all</source>
        <translation>全选(&amp;A)</translation>
    </message>
    <message>
        <source>Select all objects on the image</source>
        <translation>选择图像上的所有对象</translation>
    </message>
    <message>
        <source>Re&amp;name</source>
        <translation>重命名(&amp;N)</translation>
    </message>
    <message>
        <source>Give the selected object a name</source>
        <translation>为所选对象命名</translation>
    </message>
    <message>
        <source>&amp;Find measured values</source>
        <translation>查找测量值(&amp;F)</translation>
    </message>
    <message>
        <source>Filter the measured values</source>
        <translation>筛选测量值</translation>
    </message>
    <message>
        <source>&amp;Select</source>
        <translation>选择(&amp;S)</translation>
    </message>
    <message>
        <source>Select and change objects</source>
        <translation>选择和修改对象</translation>
    </message>
    <message>
        <source>&amp;Line</source>
        <translation>直线(&amp;L)</translation>
    </message>
    <message>
        <source>Measure a length</source>
        <translation>测量长度</translation>
    </message>
    <message>
        <source>&amp;Polyline</source>
        <translation>折线(&amp;P)</translation>
    </message>
    <message>
        <source>Measure the length of a way</source>
        <translation>测量路径长度</translation>
    </message>
    <message>
        <source>Parallel &amp;distance</source>
        <translation>平行距离(&amp;D)</translation>
    </message>
    <message>
        <source>Measure the distance of a point from a line</source>
        <translation>测量点到直线的距离</translation>
    </message>
    <message>
        <source>&amp;Arc</source>
        <translation>圆弧(&amp;A)</translation>
    </message>
    <message>
        <source>Measure an arc through three points</source>
        <translation>通过三点测量圆弧</translation>
    </message>
    <message>
        <source>&amp;Circle</source>
        <translation>圆(&amp;C)</translation>
    </message>
    <message>
        <source>Measure a circle</source>
        <translation>测量圆</translation>
    </message>
    <message>
        <source>&amp;Rectangle</source>
        <translation>矩形(&amp;R)</translation>
    </message>
    <message>
        <source>Measure a rectangle</source>
        <translation>测量矩形</translation>
    </message>
    <message>
        <source>Poly&amp;gon</source>
        <translation>多边形(&amp;G)</translation>
    </message>
    <message>
        <source>Measure the area of a polygon</source>
        <translation>测量多边形的面积</translation>
    </message>
    <message>
        <source>Cou&amp;nter</source>
        <translation>计数器(&amp;N)</translation>
    </message>
    <message>
        <source>Count by clicks</source>
        <translation>通过点击计数</translation>
    </message>
    <message>
        <source>&amp;Text note</source>
        <translation>文本注释(&amp;T)</translation>
    </message>
    <message>
        <source>Write on the image</source>
        <translation>在图像上写文字</translation>
    </message>
    <message>
        <source>Scale &amp;bar</source>
        <translation>比例尺(&amp;B)</translation>
    </message>
    <message>
        <source>Draw a scale bar</source>
        <translation>绘制比例尺</translation>
    </message>
    <message>
        <source>Cal&amp;ibration...</source>
        <translation>校准(&amp;I)...</translation>
    </message>
    <message>
        <source>Say how large a pixel of the image is</source>
        <translation>指定图像中一个像素的实际大小</translation>
    </message>
    <message>
        <source>Use the file&apos;s pixel size</source>
        <translation>使用文件中的像素尺寸</translation>
    </message>
    <message>
        <source>Measure with the pixel size that the image&apos;s file states</source>
        <translation>按图像文件中记录的像素尺寸进行测量</translation>
    </message>
    <message>
        <source>&amp;Take snapshot</source>
        <translation>拍摄快照(&amp;T)</translation>
    </message>
    <message>
        <source>Save the image to the gallery</source>
        <translation>将图像保存到图库</translation>
    </message>
    <message>
        <source>Snapshots &amp;with measurements</source>
        <translation>快照包含测量对象(&amp;W)</translation>
    </message>
    <message>
        <source>Draw the measured objects on snapshots</source>
        <translation>在快照上绘制测量对象</translation>
    </message>
    <message>
        <source>&amp;Freeze</source>
        <translation>冻结(&amp;F)</translation>
    </message>
    <message>
        <source>Freeze the live image</source>
        <translation>冻结实时图像</translation>
    </message>
    <message>
        <source>&amp;Labels on the image</source>
        <translation>图像上的标签(&amp;L)</translation>
    </message>
    <message>
        <source>Show or hide the labels of objects</source>
        <translation>显示或隐藏对象标签</translation>
    </message>
    <message>
        <source>&amp;Rulers</source>
        <translation>标尺(&amp;R)</translation>
    </message>
    <message>
        <source>Show or hide the rulers</source>
        <translation>显示或隐藏标尺</translation>
    </message>
    <message>
        <source>&amp;Scale bar on the image</source>
        <translation>图像上的比例尺(&amp;S)</translation>
    </message>
    <message>
        <source>Show or hide the scale bar, on reports, too</source>
        <translation>显示或隐藏比例尺，包括报告中的比例尺</translation>
    </message>
    <message>
        <source>&amp;Gallery</source>
        <translation>图库(&amp;G)</translation>
    </message>
    <message>
        <source>Show or hide the gallery</source>
        <translation>显示或隐藏图库</translation>
    </message>
    <message>
        <source>&amp;Start page</source>
        <translation>起始页(&amp;S)</translation>
    </message>
    <message>
        <source>Show the first steps, the examples and the recent sessions</source>
        <translation>显示入门步骤、示例和最近的会话</translation>
    </message>
    <message>
        <source>&amp;User guide</source>
        <translation>用户指南(&amp;U)</translation>
    </message>
    <message>
        <source>Read the user guide</source>
        <translation>阅读用户指南</translation>
    </message>
</context>
<context>
    <name>KvDeskAutosave</name>
    <message>
        <source>the folder &quot;%1&quot; cannot be written</source>
        <translation>无法写入文件夹“%1”</translation>
    </message>
    <message>
        <source>Unsaved changes are not being copied: %1</source>
        <translation>未保存的更改当前没有备份：%1</translation>
    </message>
</context>
<context>
    <name>KvDeskCalibrationCommands</name>
    <message>
        <source>The session measures with it already</source>
        <translation>会话已在使用该像素尺寸</translation>
    </message>
    <message>
        <source>The image&apos;s file does not state one</source>
        <translation>图像文件中没有记录像素尺寸</translation>
    </message>
</context>
<context>
    <name>KvDeskCalibrationDialog</name>
    <message>
        <source>Calibration</source>
        <translation>校准</translation>
    </message>
    <message>
        <source>Objective</source>
        <translation>物镜</translation>
    </message>
    <message>
        <source>Choose an objective, or type the name of a new one</source>
        <translation>选择物镜，或输入新物镜的名称</translation>
    </message>
    <message>
        <source>Such as 10x</source>
        <translation>例如 10x</translation>
    </message>
    <message>
        <source>In use</source>
        <translation>当前使用</translation>
    </message>
    <message>
        <source>New calibration</source>
        <translation>新建校准</translation>
    </message>
    <message>
        <source>Known distance</source>
        <translation>已知距离</translation>
    </message>
    <message>
        <source>Image file</source>
        <translation>图像文件</translation>
    </message>
    <message>
        <source>Typed</source>
        <translation>手动输入</translation>
    </message>
    <message>
        <source>Name</source>
        <translation>名称</translation>
    </message>
    <message>
        <source>Who</source>
        <translation>校准人</translation>
    </message>
    <message>
        <source>Note</source>
        <translation>备注</translation>
    </message>
    <message>
        <source>Calibrate</source>
        <translation>校准</translation>
    </message>
    <message>
        <source>History of the objective</source>
        <translation>物镜校准历史</translation>
    </message>
    <message>
        <source>Calibrations of this objective appear here</source>
        <translation>此物镜的校准记录将显示在这里</translation>
    </message>
    <message>
        <source>Use again</source>
        <translation>再次使用</translation>
    </message>
    <message>
        <source>Close</source>
        <translation>关闭</translation>
    </message>
    <message>
        <source>New pixel size: %1</source>
        <translation>新像素尺寸：%1</translation>
    </message>
    <message>
        <source>No pixel size yet</source>
        <translation>尚无像素尺寸</translation>
    </message>
    <message>
        <source>Measure with this pixel size and remember it</source>
        <translation>使用此像素尺寸进行测量并记住它</translation>
    </message>
    <message>
        <source>Complete the fields above first</source>
        <translation>请先填写以上各项</translation>
    </message>
    <message>
        <source>Measure with the selected calibration</source>
        <translation>使用所选校准进行测量</translation>
    </message>
    <message>
        <source>Select a calibration in the table first</source>
        <translation>请先在表格中选择一项校准</translation>
    </message>
</context>
<context>
    <name>KvDeskCalibrationHistory</name>
    <message>
        <source>Date</source>
        <translation>日期</translation>
    </message>
    <message>
        <source>Who</source>
        <translation>校准人</translation>
    </message>
    <message>
        <source>Pixel size</source>
        <translation>像素尺寸</translation>
    </message>
    <message>
        <source>Origin</source>
        <translation>来源</translation>
    </message>
    <message>
        <source>Name</source>
        <translation>名称</translation>
    </message>
</context>
<context>
    <name>KvDeskCalibrationText</name>
    <message>
        <source>%1 μm</source>
        <comment>size of a pixel</comment>
        <translation>%1 μm</translation>
    </message>
    <message>
        <source>%1 × %2 μm</source>
        <comment>width and height of a pixel</comment>
        <translation>%1 × %2 μm</translation>
    </message>
    <message>
        <source>Known distance</source>
        <translation>已知距离</translation>
    </message>
    <message>
        <source>Image file</source>
        <translation>图像文件</translation>
    </message>
    <message>
        <source>Typed</source>
        <translation>手动输入</translation>
    </message>
    <message>
        <source>Not calibrated</source>
        <translation>未校准</translation>
    </message>
</context>
<context>
    <name>KvDeskCalibrationWay</name>
    <message>
        <source>Type a number such as 5.3 or 5,3</source>
        <translation>请输入数字，例如 5.3 或 5,3</translation>
    </message>
    <message>
        <source>A pixel measures between %1 and %2</source>
        <translation>像素大小应在 %1 与 %2 之间</translation>
    </message>
</context>
<context>
    <name>KvDeskCalibrator</name>
    <message>
        <source>%1 states pixels of %2; the session measures with %3</source>
        <translation>%1 中记录的像素尺寸为 %2；当前会话使用 %3</translation>
    </message>
    <message>
        <source>%1 states pixels of %2; the session measures in pixels</source>
        <translation>%1 中记录的像素尺寸为 %2；当前会话以像素为单位测量</translation>
    </message>
    <message>
        <source>Calibrated: %1, %2 per pixel</source>
        <extracomment>%1 is an objective or a file, %2 the size of a pixel with its unit</extracomment>
        <translation>已校准：%1，每像素 %2</translation>
    </message>
</context>
<context>
    <name>KvDeskCommandLine</name>
    <message>
        <source>There is no theme &quot;%1&quot;: use %2</source>
        <translation>没有名为“%1”的主题：请使用 %2</translation>
    </message>
    <message>
        <source> or </source>
        <translation> 或 </translation>
    </message>
    <message>
        <source>Usage: measuringdesk [OPTION...] [SESSION|IMAGE|TABLE|FOLDER|VIDEO...]
Measures objects on images and shows their values.

  --session FILE      open a session
  --image FILE        open an image
  --table FILE        import a table of measured values
  --theme Dark|Light  theme of this run
  --plugins DIR       look for plug-ins here, too; can be given several times
  --help              show this text
  --version           show the version

The environment variable STATREPORT_PLUGINS names more folders with plug-ins.
</source>
        <translation>用法：measuringdesk [选项...] [会话|图像|表格|文件夹|视频...]
测量图像上的对象并显示其数值。

  --session 文件      打开会话
  --image 文件        打开图像
  --table 文件        导入测量值表格
  --theme Dark|Light  本次运行使用的主题
  --plugins 目录      也在此目录中查找插件；可多次指定
  --help              显示此帮助
  --version           显示版本

环境变量 STATREPORT_PLUGINS 可指定更多插件目录。
</translation>
    </message>
    <message>
        <source>%1 (measuringdesk --help tells more)</source>
        <translation>%1（详细信息：measuringdesk --help）</translation>
    </message>
</context>
<context>
    <name>KvDeskCounterBar</name>
    <message>
        <source>Clicks count for</source>
        <translation>点击计入</translation>
    </message>
    <message>
        <source>The counter that gets the clicks (1 to 9)</source>
        <translation>接收点击的计数器（按键 1 至 9）</translation>
    </message>
    <message>
        <source>Count another class</source>
        <translation>为另一类别计数</translation>
    </message>
    <message>
        <source>A right click takes a place away</source>
        <translation>右击可移除计数点</translation>
    </message>
    <message>
        <source>A new counter</source>
        <translation>新计数器</translation>
    </message>
</context>
<context>
    <name>KvDeskEditCommands</name>
    <message>
        <source>&amp;Undo %1</source>
        <extracomment>%1 is what is undone or redone, such as &quot;move of Line 3&quot;</extracomment>
        <translation>撤销“%1”(&amp;U)</translation>
    </message>
    <message>
        <source>&amp;Undo</source>
        <translation>撤销(&amp;U)</translation>
    </message>
    <message>
        <source>&amp;Redo %1</source>
        <translation>重做“%1”(&amp;R)</translation>
    </message>
    <message>
        <source>&amp;Redo</source>
        <translation>重做(&amp;R)</translation>
    </message>
    <message>
        <source>Nothing was done yet</source>
        <translation>尚未执行任何操作</translation>
    </message>
    <message>
        <source>Nothing was undone</source>
        <translation>没有已撤销的操作</translation>
    </message>
    <message>
        <source>Select an object first</source>
        <translation>请先选择对象</translation>
    </message>
    <message>
        <source>Select one object first</source>
        <translation>请先选择一个对象</translation>
    </message>
    <message>
        <source>No measured objects were copied</source>
        <translation>没有已复制的测量对象</translation>
    </message>
    <message>
        <source>Finish or cancel what you have begun first</source>
        <translation>请先完成或取消已开始的操作</translation>
    </message>
</context>
<context>
    <name>KvDeskExamples</name>
    <message>
        <source>Coin: first length</source>
        <translation>硬币：首次测量长度</translation>
    </message>
    <message>
        <source>Plate: dimensions</source>
        <translation>板件：尺寸</translation>
    </message>
    <message>
        <source>Cells: counting</source>
        <translation>细胞：计数</translation>
    </message>
    <message>
        <source>Fibres: statistics</source>
        <translation>纤维：统计</translation>
    </message>
</context>
<context>
    <name>KvDeskExportCommand</name>
    <message>
        <source>Nothing was measured yet</source>
        <translation>尚未进行任何测量</translation>
    </message>
    <message>
        <source>Measured values</source>
        <comment>file name</comment>
        <translation>测量值</translation>
    </message>
    <message>
        <source>JSON files</source>
        <translation>JSON 文件</translation>
    </message>
    <message>
        <source>CSV tables</source>
        <translation>CSV 表格</translation>
    </message>
    <message>
        <source>Export measured values</source>
        <translation>导出测量值</translation>
    </message>
    <message>
        <source>Export cancelled: %1</source>
        <translation>导出已取消：%1</translation>
    </message>
    <message>
        <source>The table &quot;%1&quot; was not written.</source>
        <translation>未写入表格“%1”。</translation>
    </message>
    <message>
        <source>Measured values exported: %1</source>
        <translation>测量值已导出：%1</translation>
    </message>
    <message>
        <source>Exporting measured values</source>
        <translation>正在导出测量值</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>取消</translation>
    </message>
</context>
<context>
    <name>KvDeskExportDialog</name>
    <message>
        <source>Export measured values</source>
        <translation>导出测量值</translation>
    </message>
    <message>
        <source>Table</source>
        <translation>表格</translation>
    </message>
    <message>
        <source>Numbers</source>
        <translation>数字</translation>
    </message>
    <message>
        <source>Byte order mark, for spreadsheets that do not expect UTF-8</source>
        <translation>字节顺序标记 (BOM)，供默认不使用 UTF-8 的电子表格软件识别</translation>
    </message>
    <message>
        <source>Apostrophe before names that spreadsheets take for formulas</source>
        <translation>在会被电子表格视为公式的名称前加单引号</translation>
    </message>
    <message>
        <source>Changes names that begin with =, +, - or @: they are others when the table is imported again</source>
        <translation>会更改以 =、+、- 或 @ 开头的名称：再次导入该表格时，名称将与原来不同</translation>
    </message>
    <message>
        <source>Export...</source>
        <translation>导出...</translation>
    </message>
    <message>
        <source>CSV, one row per value</source>
        <translation>CSV，每个数值一行</translation>
    </message>
    <message>
        <source>CSV, one row per object</source>
        <translation>CSV，每个对象一行</translation>
    </message>
    <message>
        <source>JSON</source>
        <translation>JSON</translation>
    </message>
    <message>
        <source>1.5, commas between the fields</source>
        <translation>1.5，字段以逗号分隔</translation>
    </message>
    <message>
        <source>1,5, semicolons between the fields (spreadsheets, %1)</source>
        <extracomment>%1 is the name of a language</extracomment>
        <translation>1,5，字段以分号分隔（电子表格，%1）</translation>
    </message>
    <message>
        <source>1.5, commas between the fields (spreadsheets, %1)</source>
        <translation>1.5，字段以逗号分隔（电子表格，%1）</translation>
    </message>
    <message>
        <source>For statistics programs. Can be imported here again.</source>
        <translation>适用于统计软件。可重新导入本程序。</translation>
    </message>
    <message>
        <source>For spreadsheets. Headings name the units.</source>
        <translation>适用于电子表格。列标题包含单位。</translation>
    </message>
    <message>
        <source>For programs. Numbers always have a decimal point.</source>
        <translation>适用于程序。小数点始终为“.”。</translation>
    </message>
    <message>
        <source>No measured object is selected</source>
        <translation>未选择测量对象</translation>
    </message>
    <message>
        <source>Concerns CSV tables only</source>
        <translation>仅适用于 CSV 表格</translation>
    </message>
    <message numerus="yes">
        <source>Only the selected object(s) (%n)</source>
        <translation>
            <numerusform>仅所选对象（%n 个）</numerusform>
        </translation>
    </message>
</context>
<context>
    <name>KvDeskExposureControl</name>
    <message>
        <source>E&amp;xposure</source>
        <translation>曝光(&amp;X)</translation>
    </message>
    <message>
        <source>Exposure time of the camera</source>
        <translation>相机的曝光时间</translation>
    </message>
    <message>
        <source> ms</source>
        <comment>milliseconds</comment>
        <translation> ms</translation>
    </message>
</context>
<context>
    <name>KvDeskFileCommands</name>
    <message>
        <source>Sessions</source>
        <translation>会话</translation>
    </message>
    <message>
        <source>All files</source>
        <translation>所有文件</translation>
    </message>
    <message>
        <source>Unsaved changes</source>
        <translation>未保存的更改</translation>
    </message>
    <message>
        <source>Save the changes to &quot;%1&quot;?</source>
        <translation>要将更改保存到“%1”吗？</translation>
    </message>
    <message>
        <source>The session &quot;%1&quot; was not opened.</source>
        <translation>未能打开会话“%1”。</translation>
    </message>
    <message>
        <source>Image missing</source>
        <translation>缺少图像</translation>
    </message>
    <message>
        <source>Open the session without its image?</source>
        <translation>要在没有图像的情况下打开会话吗？</translation>
    </message>
    <message>
        <source>The image &quot;%1&quot; was not opened.</source>
        <translation>未能打开图像“%1”。</translation>
    </message>
    <message>
        <source>Image opened: %1</source>
        <translation>已打开图像：%1</translation>
    </message>
    <message>
        <source>The table &quot;%1&quot; was not imported.</source>
        <translation>未能导入表格“%1”。</translation>
    </message>
    <message>
        <source>%1: %2</source>
        <comment>file, remark</comment>
        <translation>%1：%2</translation>
    </message>
    <message>
        <source>The session &quot;%1&quot; was not saved.</source>
        <translation>未能保存会话“%1”。</translation>
    </message>
    <message>
        <source>Session saved: %1</source>
        <translation>已保存会话：%1</translation>
    </message>
    <message>
        <source>Open session</source>
        <translation>打开会话</translation>
    </message>
    <message>
        <source>Open image</source>
        <translation>打开图像</translation>
    </message>
    <message>
        <source>Images</source>
        <translation>图像</translation>
    </message>
    <message>
        <source>Import table</source>
        <translation>导入表格</translation>
    </message>
    <message>
        <source>Tables</source>
        <translation>表格</translation>
    </message>
    <message>
        <source>Save session</source>
        <translation>保存会话</translation>
    </message>
    <message>
        <source>Measuring Desk</source>
        <translation>Measuring Desk</translation>
    </message>
    <message>
        <source>Only one session can be open; not opened: %1</source>
        <translation>只能打开一个会话；未打开：%1</translation>
    </message>
    <message>
        <source>Neither a session, an image nor a table: %1</source>
        <translation>不是会话、图像或表格：%1</translation>
    </message>
    <message>
        <source>There is not enough memory</source>
        <translation>内存不足</translation>
    </message>
    <message>
        <source>Opening &quot;%1&quot;</source>
        <translation>正在打开“%1”</translation>
    </message>
    <message>
        <source>The measurements were not restored.</source>
        <translation>未能恢复测量数据。</translation>
    </message>
    <message>
        <source>Restoring measurements</source>
        <translation>正在恢复测量数据</translation>
    </message>
    <message>
        <source>Importing &quot;%1&quot;</source>
        <translation>正在导入“%1”</translation>
    </message>
    <message>
        <source>Saving &quot;%1&quot;</source>
        <translation>正在保存“%1”</translation>
    </message>
    <message>
        <source>Session changed by another program</source>
        <translation>会话已被其他程序更改</translation>
    </message>
    <message>
        <source>&quot;%1&quot; was changed by another program. Overwrite its changes?</source>
        <translation>“%1”已被其他程序更改。要覆盖这些更改吗？</translation>
    </message>
    <message>
        <source>Overwrite</source>
        <translation>覆盖</translation>
    </message>
    <message>
        <source>Save as...</source>
        <translation>另存为...</translation>
    </message>
    <message numerus="yes">
        <source>%n files were not opened.</source>
        <extracomment>%n is 2 at least</extracomment>
        <translation>
            <numerusform>有 %n 个文件未能打开。</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Session opened: %1 (%n object(s))</source>
        <translation>
            <numerusform>已打开会话：%1（%n 个对象）</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Measurements restored: %1 (%n object(s))</source>
        <translation>
            <numerusform>已恢复测量数据：%1（%n 个对象）</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Table imported: %1 (%n object(s))</source>
        <translation>
            <numerusform>已导入表格：%1（%n 个对象）</numerusform>
        </translation>
    </message>
</context>
<context>
    <name>KvDeskFilePixelSize</name>
    <message>
        <source>%1 states pixels of %2.</source>
        <comment>file, size</comment>
        <translation>%1 中记录的像素尺寸为 %2。</translation>
    </message>
    <message>
        <source>The image&apos;s file does not state how large its pixels are.</source>
        <translation>图像文件中没有记录像素的大小。</translation>
    </message>
</context>
<context>
    <name>KvDeskGallery</name>
    <message>
        <source>Gallery</source>
        <translation>图库</translation>
    </message>
    <message>
        <source>Hide the gallery</source>
        <translation>隐藏图库</translation>
    </message>
    <message>
        <source>&amp;Open image</source>
        <translation>打开图像(&amp;O)</translation>
    </message>
    <message>
        <source>&amp;Show in folder</source>
        <translation>在文件夹中显示(&amp;S)</translation>
    </message>
    <message>
        <source>&amp;Copy path</source>
        <translation>复制路径(&amp;C)</translation>
    </message>
    <message>
        <source>&amp;Move to trash...</source>
        <translation>移到回收站(&amp;M)...</translation>
    </message>
    <message>
        <source>Choose &amp;folder...</source>
        <translation>选择文件夹(&amp;F)...</translation>
    </message>
    <message>
        <source>Show the images of a folder</source>
        <translation>显示某个文件夹中的图像</translation>
    </message>
    <message>
        <source>Save s&amp;napshots in this folder</source>
        <translation>将快照保存到此文件夹(&amp;N)</translation>
    </message>
    <message>
        <source>Folder of the gallery</source>
        <translation>图库文件夹</translation>
    </message>
    <message>
        <source>More commands of the gallery</source>
        <translation>图库的更多命令</translation>
    </message>
    <message>
        <source>Snapshots</source>
        <translation>快照</translation>
    </message>
    <message>
        <source>Choose folder</source>
        <translation>选择文件夹</translation>
    </message>
    <message>
        <source>Snapshots are saved in %1</source>
        <translation>快照保存在 %1</translation>
    </message>
    <message>
        <source>Snapshots (%1) and the images of a folder appear here; drag them onto report pages</source>
        <translation>快照 (%1) 和文件夹中的图像将显示在这里；可将其拖到报告页面上</translation>
    </message>
    <message>
        <source>There are no images in %1</source>
        <translation>%1 中没有图像</translation>
    </message>
    <message>
        <source>The folder %1 does not exist</source>
        <translation>文件夹 %1 不存在</translation>
    </message>
    <message>
        <source>Select an image first</source>
        <translation>请先选择图像</translation>
    </message>
    <message>
        <source>Snapshots are saved in this folder already</source>
        <translation>快照目前就保存在此文件夹中</translation>
    </message>
    <message>
        <source>Move &quot;%1&quot; to the trash?</source>
        <translation>要将“%1”移到回收站吗？</translation>
    </message>
    <message>
        <source>Move to trash</source>
        <translation>移到回收站</translation>
    </message>
    <message>
        <source>Moved to the trash: %1</source>
        <translation>已移到回收站：%1</translation>
    </message>
    <message>
        <source>Not moved to the trash: %1</source>
        <translation>未能移到回收站：%1</translation>
    </message>
    <message>
        <source>Measuring Desk</source>
        <translation>Measuring Desk</translation>
    </message>
    <message>
        <source>The files are still there. They are write-protected, or there is no trash for them.</source>
        <translation>文件仍在原处。文件受写保护，或者没有可用的回收站。</translation>
    </message>
    <message numerus="yes">
        <source>Move %n selected image(s) to the trash?</source>
        <translation>
            <numerusform>要将所选的 %n 张图像移到回收站吗？</numerusform>
        </translation>
    </message>
</context>
<context>
    <name>KvDeskGalleryModel</name>
    <message>
        <source>%1 × %2 px</source>
        <comment>width, height</comment>
        <translation>%1 × %2 px</translation>
    </message>
</context>
<context>
    <name>KvDeskGalleryView</name>
    <message>
        <source>Gallery</source>
        <translation>图库</translation>
    </message>
</context>
<context>
    <name>KvDeskGuideCommand</name>
    <message>
        <source>The user guide is not installed</source>
        <translation>未安装用户指南</translation>
    </message>
</context>
<context>
    <name>KvDeskGuideWindow</name>
    <message>
        <source>User guide</source>
        <translation>用户指南</translation>
    </message>
    <message>
        <source>Contents</source>
        <translation>目录</translation>
    </message>
    <message>
        <source>Back</source>
        <translation>后退</translation>
    </message>
    <message>
        <source>Forward</source>
        <translation>前进</translation>
    </message>
    <message>
        <source>Find in the guide</source>
        <translation>在指南中查找</translation>
    </message>
    <message>
        <source>Find previous</source>
        <translation>查找上一个</translation>
    </message>
    <message>
        <source>Find next</source>
        <translation>查找下一个</translation>
    </message>
    <message>
        <source>This is the first place</source>
        <translation>已是第一个位置</translation>
    </message>
    <message>
        <source>This is the last place</source>
        <translation>已是最后一个位置</translation>
    </message>
    <message>
        <source>Not found</source>
        <translation>未找到</translation>
    </message>
    <message>
        <source>Type what to find first</source>
        <translation>请先输入要查找的内容</translation>
    </message>
</context>
<context>
    <name>KvDeskImageView</name>
    <message>
        <source>Image</source>
        <translation>图像</translation>
    </message>
    <message>
        <source>Open an image or a session to start</source>
        <translation>请打开图像或会话以开始</translation>
    </message>
</context>
<context>
    <name>KvDeskInlineEditor</name>
    <message>
        <source>Text</source>
        <translation>文本</translation>
    </message>
    <message>
        <source>Name</source>
        <translation>名称</translation>
    </message>
</context>
<context>
    <name>KvDeskKnownDistance</name>
    <message>
        <source>inch</source>
        <translation>英寸</translation>
    </message>
    <message>
        <source>Use selected line</source>
        <translation>使用所选直线</translation>
    </message>
    <message>
        <source>Length of the line</source>
        <translation>直线长度</translation>
    </message>
    <message>
        <source>Unit of the length</source>
        <translation>长度单位</translation>
    </message>
    <message>
        <source>Its length</source>
        <translation>长度</translation>
    </message>
    <message>
        <source>Draw a line over a distance that you know, such as on a stage micrometer, and select it.</source>
        <translation>沿已知距离（例如镜台测微尺上的刻度）绘制一条直线，然后选中它。</translation>
    </message>
    <message>
        <source>No line yet</source>
        <translation>尚无直线</translation>
    </message>
    <message>
        <source>%1: %2</source>
        <comment>name and length of a line</comment>
        <translation>%1：%2</translation>
    </message>
    <message>
        <source>Take the selected line as the known distance</source>
        <translation>将所选直线作为已知距离</translation>
    </message>
    <message>
        <source>Select one line on the image first</source>
        <translation>请先在图像上选择一条直线</translation>
    </message>
</context>
<context>
    <name>KvDeskLiveBar</name>
    <message>
        <source>Live image</source>
        <translation>实时图像</translation>
    </message>
    <message>
        <source>Freeze</source>
        <translation>冻结</translation>
    </message>
    <message>
        <source>%1 fps</source>
        <extracomment>frames per second</extracomment>
        <translation>%1 fps</translation>
    </message>
    <message>
        <source>%1 delivers no pictures any more; this is the last one</source>
        <translation>%1 不再传送图像；这是最后一帧</translation>
    </message>
    <message>
        <source>%1 delivers no pictures</source>
        <translation>%1 没有传送图像</translation>
    </message>
    <message>
        <source>%1 is stopped</source>
        <translation>%1 已停止</translation>
    </message>
    <message>
        <source>Waiting for the first picture of %1</source>
        <translation>正在等待 %1 的第一帧图像</translation>
    </message>
    <message>
        <source>Frozen: %1</source>
        <translation>已冻结：%1</translation>
    </message>
    <message>
        <source>Live: %1</source>
        <translation>实时：%1</translation>
    </message>
    <message>
        <source>This image is not live</source>
        <translation>此图像不是实时图像</translation>
    </message>
    <message>
        <source>&amp;Reconnect</source>
        <translation>重新连接(&amp;R)</translation>
    </message>
    <message>
        <source>&amp;Start</source>
        <translation>开始(&amp;S)</translation>
    </message>
    <message>
        <source>Frames per second
Dropped, because newer ones came first: %1</source>
        <translation>每秒帧数
因有更新的帧先到而丢弃：%1</translation>
    </message>
    <message>
        <source>Stop the live image; other programs can use the camera then</source>
        <translation>停止实时图像；之后其他程序可以使用相机</translation>
    </message>
</context>
<context>
    <name>KvDeskMainWindow</name>
    <message>
        <source>&amp;File</source>
        <translation>文件(&amp;F)</translation>
    </message>
    <message>
        <source>&amp;Recent sessions</source>
        <translation>最近的会话(&amp;R)</translation>
    </message>
    <message>
        <source>&amp;View</source>
        <translation>视图(&amp;V)</translation>
    </message>
    <message>
        <source>&amp;Help</source>
        <translation>帮助(&amp;H)</translation>
    </message>
    <message>
        <source>Main tool bar</source>
        <translation>主工具栏</translation>
    </message>
    <message>
        <source>%1[*] - Measuring Desk</source>
        <extracomment>%1 is the name of a session; [*] is replaced by a star when it has unsaved changes</extracomment>
        <translation>%1[*] - Measuring Desk</translation>
    </message>
    <message>
        <source>None yet</source>
        <translation>暂无</translation>
    </message>
    <message>
        <source>About Measuring Desk</source>
        <translation>关于 Measuring Desk</translation>
    </message>
    <message>
        <source>&lt;b&gt;Measuring Desk %1&lt;/b&gt;&lt;p&gt;Measures objects on images, and hosts plug-ins such as the statistics reports.&lt;/p&gt;&lt;p&gt;%2, MIT licence&lt;/p&gt;</source>
        <translation>&lt;b&gt;Measuring Desk %1&lt;/b&gt;&lt;p&gt;测量图像上的对象，并可加载统计报告等插件。&lt;/p&gt;&lt;p&gt;%2，MIT 许可证&lt;/p&gt;</translation>
    </message>
    <message>
        <source>Measuring Desk</source>
        <translation>Measuring Desk</translation>
    </message>
    <message>
        <source>&amp;Edit</source>
        <translation>编辑(&amp;E)</translation>
    </message>
    <message>
        <source>&amp;Image</source>
        <translation>图像(&amp;I)</translation>
    </message>
    <message>
        <source>&amp;Measure</source>
        <translation>测量(&amp;M)</translation>
    </message>
    <message>
        <source>Choose the image source</source>
        <translation>选择图像源</translation>
    </message>
</context>
<context>
    <name>KvDeskNotice</name>
    <message>
        <source>Close this message</source>
        <translation>关闭此消息</translation>
    </message>
</context>
<context>
    <name>KvDeskObjectClipboard</name>
    <message>
        <source>Type</source>
        <translation>类型</translation>
    </message>
    <message>
        <source>Object</source>
        <translation>对象</translation>
    </message>
    <message>
        <source>Value name</source>
        <translation>数值名称</translation>
    </message>
    <message>
        <source>Value</source>
        <translation>数值</translation>
    </message>
</context>
<context>
    <name>KvDeskObjectEditor</name>
    <message numerus="yes">
        <source>%n objects</source>
        <comment>several measured objects</comment>
        <extracomment>%n is 2 at least</extracomment>
        <translation>
            <numerusform>%n 个对象</numerusform>
        </translation>
    </message>
    <message>
        <source>drawing of %1</source>
        <translation>绘制 %1</translation>
    </message>
    <message>
        <source>change of %1</source>
        <translation>修改 %1</translation>
    </message>
    <message>
        <source>move of %1</source>
        <translation>移动 %1</translation>
    </message>
    <message>
        <source>renaming of %1</source>
        <translation>重命名 %1</translation>
    </message>
    <message>
        <source>text of %1</source>
        <translation>更改 %1 的文本</translation>
    </message>
    <message>
        <source>showing of %1 of %2</source>
        <extracomment>%1 is a value, %2 an object</extracomment>
        <translation>显示 %2 的%1</translation>
    </message>
    <message>
        <source>hiding of %1 of %2</source>
        <translation>隐藏 %2 的%1</translation>
    </message>
    <message>
        <source>deletion of %1</source>
        <translation>删除 %1</translation>
    </message>
    <message>
        <source>change of the calibration</source>
        <translation>更改校准</translation>
    </message>
    <message>
        <source>place of %1</source>
        <translation>在 %1 中添加计数点</translation>
    </message>
    <message>
        <source>deletion of a place of %1</source>
        <translation>删除 %1 的计数点</translation>
    </message>
    <message>
        <source>pasting of %1</source>
        <translation>粘贴 %1</translation>
    </message>
    <message>
        <source>import of %1</source>
        <translation>导入 %1</translation>
    </message>
</context>
<context>
    <name>KvDeskPlugins</name>
    <message>
        <source>No plug-ins were found</source>
        <translation>未找到插件</translation>
    </message>
    <message>
        <source>It is no plug-in for this program</source>
        <translation>它不是本程序的插件</translation>
    </message>
    <message>
        <source>Its tools &quot;%1&quot; could not be started</source>
        <translation>无法启动其工具“%1”</translation>
    </message>
    <message>
        <source>Plug-in loaded: %1</source>
        <translation>已加载插件：%1</translation>
    </message>
    <message>
        <source>Plug-in not loaded: %1: %2</source>
        <translation>未加载插件：%1：%2</translation>
    </message>
    <message>
        <source>It failed: %1</source>
        <translation>插件出错：%1</translation>
    </message>
    <message>
        <source>It failed for a reason of its own</source>
        <translation>插件因其内部原因出错</translation>
    </message>
</context>
<context>
    <name>KvDeskProgress</name>
    <message>
        <source>Cancel</source>
        <translation>取消</translation>
    </message>
    <message>
        <source>Leave everything as it was (Esc)</source>
        <translation>保持一切不变 (Esc)</translation>
    </message>
    <message>
        <source>This can no longer be cancelled</source>
        <translation>已无法取消</translation>
    </message>
</context>
<context>
    <name>KvDeskRecovery</name>
    <message>
        <source>Untitled session</source>
        <translation>未命名会话</translation>
    </message>
    <message numerus="yes">
        <source>%1 (%n object(s))</source>
        <extracomment>%1 is the name of a session</extracomment>
        <translation>
            <numerusform>%1（%n 个对象）</numerusform>
        </translation>
    </message>
</context>
<context>
    <name>KvDeskRecoveryBar</name>
    <message>
        <source>Show other measurements that were not saved</source>
        <translation>显示其他未保存的测量数据</translation>
    </message>
    <message>
        <source>Restore</source>
        <translation>恢复</translation>
    </message>
    <message>
        <source>Open these measurements as a session with unsaved changes</source>
        <translation>将这些测量数据作为含未保存更改的会话打开</translation>
    </message>
    <message>
        <source>Discard</source>
        <translation>放弃</translation>
    </message>
    <message>
        <source>Delete these measurements for good</source>
        <translation>永久删除这些测量数据</translation>
    </message>
    <message>
        <source>%1: %2</source>
        <extracomment>%1 is a time, %2 a session</extracomment>
        <translation>%1：%2</translation>
    </message>
    <message numerus="yes">
        <source>%n more</source>
        <comment>measurements that were not saved</comment>
        <translation>
            <numerusform>另有 %n 项</numerusform>
        </translation>
    </message>
    <message>
        <source>Measurements from %1 were not saved.</source>
        <translation>%1 的测量数据未保存。</translation>
    </message>
</context>
<context>
    <name>KvDeskRuler</name>
    <message>
        <source>Horizontal ruler</source>
        <translation>水平标尺</translation>
    </message>
    <message>
        <source>Vertical ruler</source>
        <translation>垂直标尺</translation>
    </message>
    <message>
        <source>Ruler in %1</source>
        <translation>标尺单位：%1</translation>
    </message>
</context>
<context>
    <name>KvDeskSelectionStatistics</name>
    <message>
        <source>n = %1, mean %2, SD %3, min %4, max %5</source>
        <extracomment>number of values, their mean, standard deviation, smallest and largest one</extracomment>
        <translation>n = %1，平均值 %2，标准差 %3，最小 %4，最大 %5</translation>
    </message>
    <message>
        <source>Selected values: %1</source>
        <translation>已选择 %1 个数值</translation>
    </message>
    <message>
        <source>Mean: %1</source>
        <translation>平均值：%1</translation>
    </message>
    <message>
        <source>Standard deviation: %1</source>
        <translation>标准差：%1</translation>
    </message>
    <message>
        <source>Smallest: %1</source>
        <translation>最小值：%1</translation>
    </message>
    <message>
        <source>Largest: %1</source>
        <translation>最大值：%1</translation>
    </message>
</context>
<context>
    <name>KvDeskSession</name>
    <message>
        <source>Untitled session</source>
        <translation>未命名会话</translation>
    </message>
</context>
<context>
    <name>KvDeskSettingsDialog</name>
    <message>
        <source>Settings</source>
        <translation>设置</translation>
    </message>
    <message>
        <source>Appearance</source>
        <translation>外观</translation>
    </message>
    <message>
        <source>Theme</source>
        <translation>主题</translation>
    </message>
    <message>
        <source>Dark</source>
        <translation>深色</translation>
    </message>
    <message>
        <source>Light</source>
        <translation>浅色</translation>
    </message>
    <message>
        <source>Language</source>
        <translation>语言</translation>
    </message>
    <message>
        <source>Another language takes effect when the program is started again.</source>
        <translation>更改语言后，需重新启动程序才能生效。</translation>
    </message>
    <message>
        <source>Measured values</source>
        <translation>测量值</translation>
    </message>
    <message>
        <source>Automatic</source>
        <translation>自动</translation>
    </message>
    <message>
        <source>Significant digits</source>
        <translation>有效数字</translation>
    </message>
    <message>
        <source>Length unit</source>
        <translation>长度单位</translation>
    </message>
    <message>
        <source>Angle unit</source>
        <translation>角度单位</translation>
    </message>
    <message>
        <source>Degrees (°)</source>
        <translation>度 (°)</translation>
    </message>
    <message>
        <source>Radians (rad)</source>
        <translation>弧度 (rad)</translation>
    </message>
    <message>
        <source>System default</source>
        <translation>系统默认</translation>
    </message>
    <message>
        <source>Nothing was changed yet</source>
        <translation>尚未进行任何更改</translation>
    </message>
</context>
<context>
    <name>KvDeskSnapshotFile</name>
    <message>
        <source>The folder cannot be created</source>
        <translation>无法创建文件夹</translation>
    </message>
    <message>
        <source>The picture cannot be encoded</source>
        <translation>无法对图像进行编码</translation>
    </message>
</context>
<context>
    <name>KvDeskSnapshots</name>
    <message>
        <source>Open an image first</source>
        <translation>请先打开图像</translation>
    </message>
    <message>
        <source>No snapshot was taken: earlier ones are still being saved</source>
        <translation>未能拍摄快照：之前的快照仍在保存</translation>
    </message>
    <message>
        <source>Snapshot saved: %1</source>
        <translation>已保存快照：%1</translation>
    </message>
    <message>
        <source>The snapshot was not saved. %1</source>
        <translation>未能保存快照。%1</translation>
    </message>
</context>
<context>
    <name>KvDeskSourceCommands</name>
    <message>
        <source>The image source &quot;%1&quot; was not opened.</source>
        <translation>未能打开图像源“%1”。</translation>
    </message>
    <message>
        <source>Image source: %1</source>
        <translation>图像源：%1</translation>
    </message>
    <message>
        <source>Open image folder</source>
        <translation>打开图像文件夹</translation>
    </message>
    <message>
        <source>Open video</source>
        <translation>打开视频</translation>
    </message>
    <message>
        <source>Videos</source>
        <translation>视频</translation>
    </message>
</context>
<context>
    <name>KvDeskSourceMenu</name>
    <message>
        <source>Image &amp;source</source>
        <translation>图像源(&amp;S)</translation>
    </message>
    <message>
        <source>Still &amp;image...</source>
        <translation>静态图像(&amp;I)...</translation>
    </message>
    <message>
        <source>Image &amp;folder...</source>
        <translation>图像文件夹(&amp;F)...</translation>
    </message>
    <message>
        <source>Play the images of a folder like a camera</source>
        <translation>像相机一样播放文件夹中的图像</translation>
    </message>
    <message>
        <source>&amp;Video...</source>
        <translation>视频(&amp;V)...</translation>
    </message>
    <message>
        <source>Play a video like a camera</source>
        <translation>像相机一样播放视频</translation>
    </message>
    <message>
        <source>Looking for cameras...</source>
        <translation>正在查找相机...</translation>
    </message>
    <message>
        <source>No camera is connected</source>
        <translation>未连接相机</translation>
    </message>
</context>
<context>
    <name>KvDeskStartPage</name>
    <message>
        <source>From an image to a report</source>
        <translation>从图像到报告</translation>
    </message>
    <message>
        <source>Back to the image</source>
        <translation>返回图像</translation>
    </message>
    <message>
        <source>%1 (%2)</source>
        <comment>command (shortcut)</comment>
        <translation>%1 (%2)</translation>
    </message>
    <message>
        <source>Open an image</source>
        <translation>打开图像</translation>
    </message>
    <message>
        <source>A picture file, or the live image of a camera.</source>
        <translation>图像文件或相机的实时图像。</translation>
    </message>
    <message>
        <source>Choose a camera or another source</source>
        <translation>选择相机或其他图像源</translation>
    </message>
    <message>
        <source>Calibrate</source>
        <translation>校准</translation>
    </message>
    <message>
        <source>Say how large a pixel is. The examples are calibrated already.</source>
        <translation>指定一个像素的大小。示例均已校准。</translation>
    </message>
    <message>
        <source>Measure and report</source>
        <translation>测量并生成报告</translation>
    </message>
    <message>
        <source>Drag a line over the image: its length is listed at once. The report panel makes a PDF of all values.</source>
        <translation>在图像上拖出一条直线，其长度会立即列出。报告面板可用所有数值生成 PDF。</translation>
    </message>
    <message>
        <source>Examples to try</source>
        <translation>试用示例</translation>
    </message>
    <message>
        <source>Recent sessions</source>
        <translation>最近的会话</translation>
    </message>
    <message>
        <source>Open an image first</source>
        <translation>请先打开图像</translation>
    </message>
    <message>
        <source>Open a copy of this example</source>
        <translation>打开此示例的副本</translation>
    </message>
</context>
<context>
    <name>KvDeskStatus</name>
    <message>
        <source>Warning</source>
        <translation>警告</translation>
    </message>
    <message>
        <source>Error</source>
        <translation>错误</translation>
    </message>
    <message>
        <source>Information</source>
        <translation>信息</translation>
    </message>
</context>
<context>
    <name>KvDeskStatusBar</name>
    <message>
        <source>%1 × %2 px</source>
        <translation>%1 × %2 px</translation>
    </message>
    <message>
        <source>%1 %</source>
        <comment>zoom</comment>
        <translation>%1%</translation>
    </message>
    <message>
        <source>x %1, y %2</source>
        <comment>pixel below the pointer</comment>
        <translation>x %1, y %2</translation>
    </message>
    <message>
        <source>Statistics of the selected values</source>
        <translation>所选数值的统计</translation>
    </message>
    <message>
        <source>, %1</source>
        <comment>objective</comment>
        <translation>，%1</translation>
    </message>
    <message>
        <source>, %1/px</source>
        <comment>size of a pixel</comment>
        <translation>，%1/px</translation>
    </message>
</context>
<context>
    <name>KvDeskStatusLog</name>
    <message>
        <source>Status log</source>
        <translation>状态日志</translation>
    </message>
    <message>
        <source>Hide the status log</source>
        <translation>隐藏状态日志</translation>
    </message>
    <message>
        <source>Clear the status log</source>
        <translation>清空状态日志</translation>
    </message>
    <message>
        <source>Messages of the program and its plug-ins appear here</source>
        <translation>程序及其插件的消息将显示在这里</translation>
    </message>
    <message>
        <source>There are no messages</source>
        <translation>没有消息</translation>
    </message>
</context>
<context>
    <name>KvDeskStatusLogModel</name>
    <message>
        <source>%1
Reported by %2</source>
        <comment>message, source</comment>
        <translation>%1
来源：%2</translation>
    </message>
    <message>
        <source>Category</source>
        <translation>级别</translation>
    </message>
    <message>
        <source>Time</source>
        <translation>时间</translation>
    </message>
    <message>
        <source>Message</source>
        <translation>消息</translation>
    </message>
</context>
<context>
    <name>KvDeskTableView</name>
    <message>
        <source>Copy</source>
        <translation>复制</translation>
    </message>
</context>
<context>
    <name>KvDeskToolStrip</name>
    <message>
        <source>Measuring tools</source>
        <translation>测量工具</translation>
    </message>
</context>
<context>
    <name>KvDeskTypedPixelSize</name>
    <message>
        <source>Width of a pixel in micrometres</source>
        <translation>像素宽度（微米）</translation>
    </message>
    <message>
        <source>Height of a pixel in micrometres</source>
        <translation>像素高度（微米）</translation>
    </message>
    <message>
        <source>Same size in both directions</source>
        <translation>两个方向大小相同</translation>
    </message>
    <message>
        <source>Width</source>
        <translation>宽度</translation>
    </message>
    <message>
        <source>Height</source>
        <translation>高度</translation>
    </message>
    <message>
        <source>Type how large a pixel of the image is in reality.</source>
        <translation>请输入图像中一个像素的实际大小。</translation>
    </message>
</context>
<context>
    <name>KvDeskValueCommands</name>
    <message>
        <source>Rename</source>
        <translation>重命名</translation>
    </message>
    <message>
        <source>Delete object</source>
        <translation>删除对象</translation>
    </message>
    <message>
        <source>Hide value</source>
        <translation>隐藏数值</translation>
    </message>
    <message>
        <source>Show all values of the object</source>
        <translation>显示对象的所有数值</translation>
    </message>
    <message>
        <source>Select one object first</source>
        <translation>请先选择一个对象</translation>
    </message>
    <message>
        <source>Select an object first</source>
        <translation>请先选择对象</translation>
    </message>
    <message>
        <source>Select a value first</source>
        <translation>请先选择数值</translation>
    </message>
    <message>
        <source>No value of the selected object is hidden</source>
        <translation>所选对象没有隐藏的数值</translation>
    </message>
    <message>
        <source>showing of values</source>
        <translation>显示数值</translation>
    </message>
    <message>
        <source>hiding of values</source>
        <translation>隐藏数值</translation>
    </message>
</context>
<context>
    <name>KvDeskValueTable</name>
    <message>
        <source>Measured values</source>
        <translation>测量值</translation>
    </message>
    <message>
        <source>Hide the measured values</source>
        <translation>隐藏测量值</translation>
    </message>
    <message>
        <source>Filter by type, object or value name</source>
        <translation>按类型、对象或数值名称筛选</translation>
    </message>
    <message>
        <source>Filter of the measured values</source>
        <translation>测量值筛选</translation>
    </message>
    <message>
        <source>Shows only rows that have all of these words</source>
        <translation>仅显示包含所有这些词的行</translation>
    </message>
    <message>
        <source>No measured value matches the filter</source>
        <translation>没有符合筛选条件的测量值</translation>
    </message>
    <message>
        <source>Clear the filter</source>
        <translation>清除筛选</translation>
    </message>
    <message>
        <source>%1 of %2</source>
        <extracomment>rows that match the filter, all rows</extracomment>
        <translation>%1 / %2</translation>
    </message>
    <message>
        <source>Measured values appear here once something is measured or imported</source>
        <translation>进行测量或导入后，测量值将显示在这里</translation>
    </message>
    <message>
        <source>There are no measured values yet</source>
        <translation>尚无测量值</translation>
    </message>
</context>
<context>
    <name>KvDeskValueTableModel</name>
    <message>
        <source>Type</source>
        <translation>类型</translation>
    </message>
    <message>
        <source>Object</source>
        <translation>对象</translation>
    </message>
    <message>
        <source>Value name</source>
        <translation>数值名称</translation>
    </message>
    <message>
        <source>Value</source>
        <translation>数值</translation>
    </message>
</context>
<context>
    <name>KvToolBase</name>
    <message>
        <source>Reset</source>
        <translation>重置</translation>
    </message>
    <message>
        <source>Reset to the default values</source>
        <translation>重置为默认值</translation>
    </message>
</context>
<context>
    <name>QPlatformTheme</name>
    <message>
        <source>OK</source>
        <translation>确定</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>取消</translation>
    </message>
    <message>
        <source>Apply</source>
        <translation>应用</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>保存</translation>
    </message>
    <message>
        <source>Open</source>
        <translation>打开</translation>
    </message>
    <message>
        <source>Close</source>
        <translation>关闭</translation>
    </message>
    <message>
        <source>Discard</source>
        <translation>不保存</translation>
    </message>
    <message>
        <source>&amp;Yes</source>
        <translation>是(&amp;Y)</translation>
    </message>
    <message>
        <source>&amp;No</source>
        <translation>否(&amp;N)</translation>
    </message>
</context>
<context>
    <name>ZtAppSettings</name>
    <message>
        <source>The settings could not be saved to %1. Check that the folder is writable.</source>
        <translation>无法将设置保存到 %1。请检查该文件夹是否可写。</translation>
    </message>
    <message>
        <source>The settings file %1 cannot be read. Changes to the settings will not be kept.</source>
        <translation>无法读取设置文件 %1。对设置的更改将不会保留。</translation>
    </message>
    <message>
        <source>The settings file %1 is damaged. It was renamed to %2; all settings are back at their defaults.</source>
        <translation>设置文件 %1 已损坏，已重命名为 %2；所有设置均已恢复为默认值。</translation>
    </message>
    <message>
        <source>The settings file %1 is damaged and could not be renamed to %2. Changes to the settings will not be kept.</source>
        <translation>设置文件 %1 已损坏，且无法重命名为 %2。对设置的更改将不会保留。</translation>
    </message>
</context>
<context>
    <name>ZtAravisSource</name>
    <message>
        <source>%1 is disconnected; its last picture stays</source>
        <translation>%1 已断开连接；保留其最后一帧图像</translation>
    </message>
    <message>
        <source>%1 delivers pictures of a kind that cannot be shown</source>
        <translation>%1 传送的图像类型无法显示</translation>
    </message>
    <message>
        <source>The camera does not take the setting (%1)</source>
        <translation>相机不接受该设置（%1）</translation>
    </message>
    <message>
        <source>%1 cannot be opened (%2)</source>
        <translation>无法打开 %1（%2）</translation>
    </message>
</context>
<context>
    <name>ZtCalibrationStore</name>
    <message>
        <source>This is not a calibration</source>
        <translation>这不是校准</translation>
    </message>
    <message>
        <source>A calibration in the settings is damaged and was left out (%1: %2)</source>
        <translation>设置中有一项校准已损坏，已忽略（%1：%2）</translation>
    </message>
</context>
<context>
    <name>ZtCsvReader</name>
    <message>
        <source>A quoted text does not end</source>
        <translation>带引号的文本没有结束</translation>
    </message>
    <message>
        <source>There is text after a closing quote</source>
        <translation>右引号之后还有文本</translation>
    </message>
    <message>
        <source>Reading was cancelled</source>
        <translation>读取已取消</translation>
    </message>
</context>
<context>
    <name>ZtDrawnType</name>
    <message>
        <source>Rectangle</source>
        <translation>矩形</translation>
    </message>
    <message>
        <source>Width</source>
        <translation>宽度</translation>
    </message>
    <message>
        <source>Height</source>
        <translation>高度</translation>
    </message>
    <message>
        <source>Area</source>
        <translation>面积</translation>
    </message>
    <message>
        <source>Line</source>
        <translation>直线</translation>
    </message>
    <message>
        <source>Length</source>
        <translation>长度</translation>
    </message>
    <message>
        <source>Arc</source>
        <translation>圆弧</translation>
    </message>
    <message>
        <source>Angle</source>
        <translation>角度</translation>
    </message>
    <message>
        <source>Arc length</source>
        <translation>弧长</translation>
    </message>
    <message>
        <source>Polygon</source>
        <translation>多边形</translation>
    </message>
    <message>
        <source>Perimeter</source>
        <translation>周长</translation>
    </message>
    <message>
        <source>Polyline</source>
        <translation>折线</translation>
    </message>
    <message>
        <source>Parallel distance</source>
        <translation>平行距离</translation>
    </message>
    <message>
        <source>Distance</source>
        <translation>距离</translation>
    </message>
    <message>
        <source>Text note</source>
        <translation>文本注释</translation>
    </message>
    <message>
        <source>Scale bar</source>
        <translation>比例尺</translation>
    </message>
    <message>
        <source>Counter</source>
        <translation>计数器</translation>
    </message>
    <message>
        <source>Count</source>
        <translation>计数</translation>
    </message>
    <message>
        <source>Share</source>
        <translation>占比</translation>
    </message>
    <message>
        <source>Circle</source>
        <translation>圆</translation>
    </message>
    <message>
        <source>Diameter</source>
        <translation>直径</translation>
    </message>
</context>
<context>
    <name>ZtFileFault</name>
    <message>
        <source>No such file or directory</source>
        <translation>没有那个文件或目录</translation>
    </message>
    <message>
        <source>Permission denied</source>
        <translation>权限不够</translation>
    </message>
    <message>
        <source>Is a directory</source>
        <translation>是一个目录</translation>
    </message>
    <message>
        <source>Not a directory</source>
        <translation>不是目录</translation>
    </message>
    <message>
        <source>File name too long</source>
        <translation>文件名过长</translation>
    </message>
    <message>
        <source>No space left on device</source>
        <translation>设备上没有空间</translation>
    </message>
    <message>
        <source>Read-only file system</source>
        <translation>只读文件系统</translation>
    </message>
    <message>
        <source>Input/output error</source>
        <translation>输入/输出错误</translation>
    </message>
</context>
<context>
    <name>ZtFrameSourceCatalogue</name>
    <message>
        <source>This program cannot play videos</source>
        <translation>本程序无法播放视频</translation>
    </message>
    <message>
        <source>This program knows no cameras of this kind</source>
        <translation>本程序不支持这类相机</translation>
    </message>
</context>
<context>
    <name>ZtImageFolderSource</name>
    <message>
        <source>%1: no picture of the folder can be shown</source>
        <translation>%1：文件夹中没有可显示的图像</translation>
    </message>
    <message>
        <source>The folder does not exist</source>
        <translation>文件夹不存在</translation>
    </message>
    <message>
        <source>The folder cannot be read</source>
        <translation>无法读取文件夹</translation>
    </message>
    <message>
        <source>The folder holds no pictures</source>
        <translation>文件夹中没有图像</translation>
    </message>
</context>
<context>
    <name>ZtKernelImage</name>
    <message>
        <source>%1 delivers pictures again</source>
        <translation>%1 已恢复传送图像</translation>
    </message>
</context>
<context>
    <name>ZtLiveFrameSource</name>
    <message>
        <source>%1 has stopped delivering pictures; the last one stays</source>
        <translation>%1 已停止传送图像；保留最后一帧</translation>
    </message>
</context>
<context>
    <name>ZtMeasureFormat</name>
    <message>
        <source>pcs</source>
        <translation>个</translation>
    </message>
</context>
<context>
    <name>ZtSession</name>
    <message>
        <source>The file is empty</source>
        <translation>文件为空</translation>
    </message>
    <message>
        <source>The file is not a session</source>
        <translation>文件不是会话</translation>
    </message>
    <message>
        <source>The file cannot be written (%1)</source>
        <translation>无法写入文件（%1）</translation>
    </message>
    <message>
        <source>This must be a list</source>
        <translation>此处必须为列表</translation>
    </message>
    <message>
        <source>This must be a text</source>
        <translation>此处必须为文本</translation>
    </message>
    <message>
        <source>This must be a whole number from 1</source>
        <translation>此处必须为不小于 1 的整数</translation>
    </message>
    <message>
        <source>This must be a number</source>
        <translation>此处必须为数字</translation>
    </message>
    <message>
        <source>This must be a number greater than 0</source>
        <translation>此处必须为大于 0 的数字</translation>
    </message>
    <message>
        <source>Another object of this type has the same number</source>
        <translation>已有另一个同类型对象使用相同编号</translation>
    </message>
    <message>
        <source>This must be an object</source>
        <translation>此处必须为 JSON 对象</translation>
    </message>
    <message>
        <source>&quot;%1&quot; is not a type of objects</source>
        <translation>“%1”不是对象类型</translation>
    </message>
    <message>
        <source>An object of type &quot;%1&quot; cannot have this number of points (%2)</source>
        <translation>“%1”类型对象的点数不能为 %2</translation>
    </message>
    <message>
        <source>A point must be a list of two numbers between -1e9 and 1e9</source>
        <translation>点必须是由两个介于 -1e9 和 1e9 之间的数字组成的列表</translation>
    </message>
    <message>
        <source>This must be the name of a value</source>
        <translation>此处必须为数值名称</translation>
    </message>
    <message>
        <source>The type has no name</source>
        <translation>该类型没有名称</translation>
    </message>
    <message>
        <source>A value must have a name of its own</source>
        <translation>每个数值必须有各自的名称</translation>
    </message>
    <message>
        <source>The numbers of the rows must rise</source>
        <translation>行号必须递增</translation>
    </message>
    <message>
        <source>A row must be a list of number, name and values</source>
        <translation>行必须是由编号、名称和数值组成的列表</translation>
    </message>
    <message>
        <source>This must be a text or null</source>
        <translation>此处必须为文本或 null</translation>
    </message>
    <message>
        <source>This must be a list or an object</source>
        <translation>此处必须为列表或 JSON 对象</translation>
    </message>
    <message>
        <source>The table has no such value</source>
        <translation>表格中没有此数值</translation>
    </message>
    <message>
        <source>This must be the text of a number</source>
        <translation>此处必须为表示数字的文本</translation>
    </message>
    <message>
        <source>The unit does not fit that of the value</source>
        <translation>单位与该数值的单位不符</translation>
    </message>
    <message>
        <source>The file is nested too deeply</source>
        <translation>文件嵌套过深</translation>
    </message>
    <message>
        <source>The file is not valid JSON (%1)</source>
        <translation>文件不是有效的 JSON（%1）</translation>
    </message>
    <message>
        <source>The file does not exist</source>
        <translation>文件不存在</translation>
    </message>
    <message>
        <source>This is a folder, not a file</source>
        <translation>这是文件夹，不是文件</translation>
    </message>
    <message>
        <source>The file cannot be read (%1)</source>
        <translation>无法读取文件（%1）</translation>
    </message>
    <message>
        <source>The file is too large for a session</source>
        <translation>文件过大，无法作为会话打开</translation>
    </message>
    <message>
        <source>This must be a date such as 2026-01-31T12:00:00Z</source>
        <translation>此处必须为日期，例如 2026-01-31T12:00:00Z</translation>
    </message>
    <message>
        <source>This must be &quot;knownDistance&quot;, &quot;metadata&quot; or &quot;typed&quot;</source>
        <translation>此处必须为 &quot;knownDistance&quot;、&quot;metadata&quot; 或 &quot;typed&quot;</translation>
    </message>
    <message>
        <source>The file is write-protected</source>
        <translation>文件受写保护</translation>
    </message>
    <message>
        <source>Writing was cancelled</source>
        <translation>写入已取消</translation>
    </message>
    <message>
        <source>Reading was cancelled</source>
        <translation>读取已取消</translation>
    </message>
    <message>
        <source>The session is of the newer version %1; this program reads versions up to %2</source>
        <translation>会话为较新的版本 %1；本程序最高可读取版本 %2</translation>
    </message>
    <message>
        <source>Sessions of version %1 are not known; this program reads versions %2 to %3</source>
        <translation>无法识别版本 %1 的会话；本程序可读取版本 %2 至 %3</translation>
    </message>
    <message>
        <source>This file is a table of values; import it</source>
        <translation>此文件是测量值表，请导入</translation>
    </message>
</context>
<context>
    <name>ZtStillImageSource</name>
    <message>
        <source>The picture does not exist</source>
        <translation>图像不存在</translation>
    </message>
    <message>
        <source>This is a folder, not a picture</source>
        <translation>这是文件夹，不是图像</translation>
    </message>
    <message>
        <source>The picture cannot be read</source>
        <translation>无法读取图像</translation>
    </message>
    <message>
        <source>The picture has %1 x %2 pixels, which is too many</source>
        <translation>图像为 %1 × %2 像素，超出上限</translation>
    </message>
    <message>
        <source>The picture cannot be decoded (%1)</source>
        <translation>无法解码图像（%1）</translation>
    </message>
    <message>
        <source>the file is empty</source>
        <translation>文件为空</translation>
    </message>
    <message>
        <source>it has no size</source>
        <translation>图像没有尺寸</translation>
    </message>
    <message>
        <source>the file is damaged</source>
        <translation>文件已损坏</translation>
    </message>
    <message>
        <source>the file is too short for its picture</source>
        <translation>文件过短，图像数据不完整</translation>
    </message>
    <message>
        <source>there is not enough memory</source>
        <translation>内存不足</translation>
    </message>
</context>
<context>
    <name>ZtTableImport</name>
    <message>
        <source>&quot;%1&quot; already has a value &quot;%2&quot; in line %3</source>
        <translation>“%1”的数值“%2”已出现在第 %3 行</translation>
    </message>
    <message>
        <source>The file does not exist</source>
        <translation>文件不存在</translation>
    </message>
    <message>
        <source>This is a folder, not a file</source>
        <translation>这是文件夹，不是文件</translation>
    </message>
    <message>
        <source>The file cannot be read (%1)</source>
        <translation>无法读取文件（%1）</translation>
    </message>
    <message>
        <source>The table is not open for reading</source>
        <translation>表格未打开，无法读取</translation>
    </message>
    <message>
        <source>The table has no rows</source>
        <translation>表格中没有行</translation>
    </message>
    <message>
        <source>The row and the header differ in their number of fields (%1 and %2)</source>
        <translation>该行与标题行的字段数不同（%1 和 %2）</translation>
    </message>
    <message>
        <source>%1 is not a finite number</source>
        <translation>%1 不是有限数</translation>
    </message>
    <message>
        <source>%1 is not a number</source>
        <translation>%1 不是数字</translation>
    </message>
    <message>
        <source>&quot;%1&quot; of &quot;%2&quot; is given in &quot;%3&quot; here, but in &quot;%4&quot; before</source>
        <translation>“%2”的“%1”在此处的单位为“%3”，而之前为“%4”</translation>
    </message>
    <message>
        <source>There is no column %1; the columns are %2</source>
        <translation>没有列 %1；现有列为 %2</translation>
    </message>
    <message>
        <source>Object</source>
        <translation>对象</translation>
    </message>
    <message>
        <source>There is no value %1 to give a unit; the values are %2</source>
        <translation>没有可指定单位的数值 %1；现有数值为 %2</translation>
    </message>
    <message>
        <source>The first line announces rows without values</source>
        <translation>第一行声明的行不含数值</translation>
    </message>
    <message>
        <source>There is no column %1; the columns of this table have no names</source>
        <translation>没有列 %1；此表格的列没有名称</translation>
    </message>
    <message>
        <source>%1 is not the index of a class; they go from 0 to %2</source>
        <translation>%1 不是类别编号；编号范围为 0 至 %2</translation>
    </message>
    <message>
        <source>Value %1</source>
        <translation>数值 %1</translation>
    </message>
    <message>
        <source>The file is larger than %1 MB</source>
        <translation>文件大于 %1 MB</translation>
    </message>
    <message>
        <source>The file is empty</source>
        <translation>文件为空</translation>
    </message>
    <message>
        <source>The first line does not name the columns</source>
        <translation>第一行没有列名称</translation>
    </message>
    <message>
        <source>Column %1 is not part of a list of values and was left out</source>
        <translation>列 %1 不属于数值列表，已忽略</translation>
    </message>
    <message>
        <source>Columns %1 are not part of a list of values and were left out</source>
        <translation>列 %1 不属于数值列表，已忽略</translation>
    </message>
    <message>
        <source>The value has no name</source>
        <translation>该数值没有名称</translation>
    </message>
    <message>
        <source>The row does not say which object it belongs to</source>
        <translation>该行未说明所属的对象</translation>
    </message>
    <message>
        <source>%1 is not a unit</source>
        <translation>%1 不是单位</translation>
    </message>
    <message>
        <source>There is no column of numbers</source>
        <translation>没有数字列</translation>
    </message>
    <message>
        <source>Column %1</source>
        <translation>列 %1</translation>
    </message>
    <message>
        <source>Column %1 holds text and was left out</source>
        <translation>列 %1 包含文本，已忽略</translation>
    </message>
    <message>
        <source>Columns %1 hold text and were left out</source>
        <translation>列 %1 包含文本，已忽略</translation>
    </message>
    <message>
        <source>Reading was cancelled</source>
        <translation>读取已取消</translation>
    </message>
    <message numerus="yes">
        <source>The table has %n row(s), its first line announces %1</source>
        <translation>
            <numerusform>表格有 %n 行，但第一行声明为 %1 行</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>The row has %n field(s) instead of %1</source>
        <translation>
            <numerusform>该行有 %n 个字段，应为 %1 个</numerusform>
        </translation>
    </message>
    <message>
        <source>The records have too many different names</source>
        <translation>记录中不同的名称太多</translation>
    </message>
    <message>
        <source>This file is a session, not a table; open it</source>
        <translation>此文件是会话而不是表，请打开</translation>
    </message>
    <message>
        <source>The file is neither a list of records nor an export of values</source>
        <translation>此文件既不是记录列表，也不是导出的测量值</translation>
    </message>
    <message>
        <source>This name comes twice</source>
        <translation>此名称出现两次</translation>
    </message>
    <message>
        <source>This must be a text, a number or null</source>
        <translation>此处必须是文本、数字或 null</translation>
    </message>
    <message>
        <source>The table is of version %1; this program reads version %2</source>
        <translation>表的版本为 %1；本程序读取版本 %2</translation>
    </message>
</context>
<context>
    <name>ZtTextDecoder</name>
    <message>
        <source>The file is not a text file: it holds a NUL character</source>
        <translation>文件不是文本文件：其中包含 NUL 字符</translation>
    </message>
    <message>
        <source>The file is not valid UTF-16 text</source>
        <translation>文件不是有效的 UTF-16 文本</translation>
    </message>
    <message>
        <source>The text is not valid UTF-8</source>
        <translation>文本不是有效的 UTF-8</translation>
    </message>
</context>
<context>
    <name>ZtUvcCameraSource</name>
    <message>
        <source>%1 is not connected</source>
        <translation>%1 未连接</translation>
    </message>
    <message>
        <source>%1 is disconnected or in use (%2)</source>
        <translation>%1 已断开连接或正被占用（%2）</translation>
    </message>
</context>
<context>
    <name>ZtVideoFileSource</name>
    <message>
        <source>The video does not exist</source>
        <translation>视频不存在</translation>
    </message>
    <message>
        <source>The video cannot be read</source>
        <translation>无法读取视频</translation>
    </message>
    <message>
        <source>The video is empty</source>
        <translation>视频为空</translation>
    </message>
    <message>
        <source>there is only sound in it</source>
        <translation>其中只有声音</translation>
    </message>
    <message>
        <source>The video %1 cannot be played (%2)</source>
        <translation>无法播放视频 %1（%2）</translation>
    </message>
    <message>
        <source>the file is damaged</source>
        <translation>文件已损坏</translation>
    </message>
</context>
<context>
    <name>acss</name>
    <message>
        <source>The icon %1 is missing.</source>
        <translation>缺少图标 %1。</translation>
    </message>
</context>
</TS>
