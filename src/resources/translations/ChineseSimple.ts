<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="zh_CN" sourcelanguage="en_US">
<context>
    <name>GuiStatReportingPluginUi</name>
    <message>
        <source>Form</source>
        <translation>窗体</translation>
    </message>
    <message>
        <source>Open Templates Editor</source>
        <translation>打开模板编辑器</translation>
    </message>
    <message>
        <source>Opens Report Template Editor</source>
        <translation>打开报告模板编辑器</translation>
    </message>
    <message>
        <source>Generate Report File</source>
        <translation>生成报告文件</translation>
    </message>
    <message>
        <source>Exports current measurments to pdf file.</source>
        <translation>将当前测量数据导出为 PDF 文件。</translation>
    </message>
    <message>
        <source>Open Statistics Window</source>
        <translation>打开统计窗口</translation>
    </message>
    <message>
        <source>Template:</source>
        <translation>模板：</translation>
    </message>
    <message>
        <source>Browse Templates</source>
        <translation>浏览模板</translation>
    </message>
    <message>
        <source>Opens default template for report generation</source>
        <translation>打开用于生成报告的默认模板</translation>
    </message>
</context>
<context>
    <name>KvAddImageDialog</name>
    <message>
        <source>Choose image file</source>
        <translation>选择图像文件</translation>
    </message>
    <message>
        <source>Image file(*.png *.jpg *.gif *.tif *.bmp)</source>
        <translation>图像文件 (*.png *.jpg *.gif *.tif *.bmp)</translation>
    </message>
</context>
<context>
    <name>KvAddLinkDialogUi</name>
    <message>
        <source>Insert Link</source>
        <translation>插入链接</translation>
    </message>
    <message>
        <source>Title:</source>
        <translation>标题：</translation>
    </message>
    <message>
        <source>URL:</source>
        <translation>URL：</translation>
    </message>
</context>
<context>
    <name>KvAlignmentOptionsRow</name>
    <message>
        <source>Align left</source>
        <translation>左对齐</translation>
    </message>
    <message>
        <source>Align center</source>
        <translation>居中</translation>
    </message>
    <message>
        <source>Align right</source>
        <translation>右对齐</translation>
    </message>
</context>
<context>
    <name>KvBaseEditorNodeFactory</name>
    <message>
        <source>Measurements Table</source>
        <translation>测量数据表</translation>
    </message>
    <message>
        <source>Text Document</source>
        <translation>文本文档</translation>
    </message>
    <message>
        <source>Camera Image View</source>
        <translation>相机图像视图</translation>
    </message>
    <message>
        <source>Image View</source>
        <translation>图像视图</translation>
    </message>
    <message>
        <source>Statistics</source>
        <translation>统计</translation>
    </message>
    <message>
        <source>Statistics Table</source>
        <translation>统计表</translation>
    </message>
    <message>
        <source>Counters</source>
        <translation>计数器</translation>
    </message>
    <message>
        <source>Min / Median / Max Box</source>
        <translation>最小值/中位数/最大值箱线图</translation>
    </message>
    <message>
        <source>Trend</source>
        <translation>趋势</translation>
    </message>
</context>
<context>
    <name>KvCameraImageNodeOptionsWidget</name>
    <message>
        <source>Camera image view</source>
        <translation>相机图像视图</translation>
    </message>
    <message>
        <source>Render measurements</source>
        <translation>绘制测量对象</translation>
    </message>
    <message>
        <source>Draw the measurement objects on the picture</source>
        <translation>在图像上绘制测量对象</translation>
    </message>
</context>
<context>
    <name>KvCameraImageWidget</name>
    <message>
        <source>Camera Image View</source>
        <translation>相机图像视图</translation>
    </message>
</context>
<context>
    <name>KvColumnsOptionsRow</name>
    <message>
        <source>Select columns:</source>
        <translation>选择列：</translation>
    </message>
</context>
<context>
    <name>KvEditorAddImageExtWidgetUi</name>
    <message>
        <source>Width:</source>
        <translation>宽度：</translation>
    </message>
    <message>
        <source>Width in percent of the text&apos;s width</source>
        <translation>宽度，以文本宽度的百分比表示</translation>
    </message>
    <message>
        <source>Float:</source>
        <translation>环绕：</translation>
    </message>
    <message>
        <source>Side of the text at which the picture stands</source>
        <translation>图片位于文字的哪一侧</translation>
    </message>
    <message>
        <source>none</source>
        <translation>无</translation>
    </message>
    <message>
        <source>left</source>
        <translation>左</translation>
    </message>
    <message>
        <source>right</source>
        <translation>右</translation>
    </message>
</context>
<context>
    <name>KvEditorToolCombo</name>
    <message>
        <source>Group of blocks, open</source>
        <translation>区块组，已展开</translation>
    </message>
    <message>
        <source>Group of blocks, closed</source>
        <translation>区块组，已折叠</translation>
    </message>
    <message>
        <source>Close the group (Enter)</source>
        <translation>折叠组 (Enter)</translation>
    </message>
    <message>
        <source>Open the group (Enter)</source>
        <translation>展开组 (Enter)</translation>
    </message>
</context>
<context>
    <name>KvEditorToolWidget</name>
    <message>
        <source>Drag onto the page, or press Enter to append</source>
        <translation>拖到页面上，或按 Enter 键添加到末尾</translation>
    </message>
</context>
<context>
    <name>KvFileDialogs</name>
    <message>
        <source>%1 already exists.
Do you want to replace it?</source>
        <translation>%1 已存在。
要替换它吗？</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>保存</translation>
    </message>
</context>
<context>
    <name>KvFooterWidget</name>
    <message>
        <source>Footer</source>
        <translation>页脚</translation>
    </message>
</context>
<context>
    <name>KvGroupByOptionsRow</name>
    <message>
        <source>Group by:</source>
        <translation>分组依据：</translation>
    </message>
    <message>
        <source>Object</source>
        <translation>对象</translation>
    </message>
    <message>
        <source>Measurement</source>
        <translation>测量类型</translation>
    </message>
</context>
<context>
    <name>KvHeaderWidget</name>
    <message>
        <source>Header</source>
        <translation>页眉</translation>
    </message>
</context>
<context>
    <name>KvImageFile</name>
    <message>
        <source>Cannot read the image file %1</source>
        <translation>无法读取图像文件 %1</translation>
    </message>
    <message>
        <source>The image that the template holds of %1 is damaged</source>
        <translation>模板中保存的图像 %1 已损坏</translation>
    </message>
</context>
<context>
    <name>KvImageNodeOptionsWidget</name>
    <message>
        <source>Image view</source>
        <translation>图像视图</translation>
    </message>
    <message>
        <source>Browse</source>
        <translation>浏览</translation>
    </message>
    <message>
        <source>Choose an image file</source>
        <translation>选择图像文件</translation>
    </message>
    <message>
        <source>Choose image file</source>
        <translation>选择图像文件</translation>
    </message>
    <message>
        <source>Image file(*.png *.jpg *.gif *.tif *.bmp)</source>
        <translation>图像文件 (*.png *.jpg *.gif *.tif *.bmp)</translation>
    </message>
</context>
<context>
    <name>KvImageWidget</name>
    <message>
        <source>Image View</source>
        <translation>图像视图</translation>
    </message>
</context>
<context>
    <name>KvPageCountWidget</name>
    <message>
        <source>Page count</source>
        <translation>页码</translation>
    </message>
</context>
<context>
    <name>KvPrintProgressDialog</name>
    <message>
        <source>Cancel</source>
        <translation>取消</translation>
    </message>
    <message>
        <source>Printing the report</source>
        <translation>正在打印报告</translation>
    </message>
    <message>
        <source>Progress</source>
        <translation>进度</translation>
    </message>
    <message>
        <source>Cancel (Esc)</source>
        <translation>取消 (Esc)</translation>
    </message>
    <message>
        <source>Page %1 of %2</source>
        <translation>第 %1 页，共 %2 页</translation>
    </message>
</context>
<context>
    <name>KvReportGlyphs</name>
    <message>
        <source>No installed font has these characters, the report leaves them out: %1</source>
        <translation>已安装的字体都没有这些字符，报告中将省略：%1</translation>
    </message>
    <message>
        <source>No installed font has these characters, the report leaves them out: %1 (fonts to install: %2)</source>
        <translation>已安装的字体都没有这些字符，报告中将省略：%1（需要安装的字体：%2）</translation>
    </message>
</context>
<context>
    <name>KvReportKeywords</name>
    <message>
        <source>Creation date (ISO)</source>
        <translation>创建日期 (ISO)</translation>
    </message>
    <message>
        <source>Creation date (Text)</source>
        <translation>创建日期（文本）</translation>
    </message>
    <message>
        <source>Creation time</source>
        <translation>创建时间</translation>
    </message>
    <message>
        <source>Program name</source>
        <translation>程序名称</translation>
    </message>
    <message>
        <source>Program version</source>
        <translation>程序版本</translation>
    </message>
    <message>
        <source>Program vendor</source>
        <translation>程序供应商</translation>
    </message>
</context>
<context>
    <name>KvReportTemplatesEditor</name>
    <message>
        <source>Report template editor</source>
        <translation>报告模板编辑器</translation>
    </message>
    <message>
        <source>Report template file (*.rtp)</source>
        <translation>报告模板文件 (*.rtp)</translation>
    </message>
</context>
<context>
    <name>KvRotationOptionsRow</name>
    <message>
        <source>Rotation</source>
        <translation>旋转</translation>
    </message>
    <message>
        <source>Rotation of the picture, clockwise</source>
        <translation>顺时针旋转图像</translation>
    </message>
</context>
<context>
    <name>KvSelectionOverlay</name>
    <message>
        <source>Delete block</source>
        <translation>删除区块</translation>
    </message>
    <message>
        <source>Delete block (Del)</source>
        <translation>删除区块 (Del)</translation>
    </message>
</context>
<context>
    <name>KvStatisticsMeasurementsTableNodeCfg</name>
    <message>
        <source>Object Name</source>
        <translation>对象名称</translation>
    </message>
    <message>
        <source>Object Type</source>
        <translation>对象类型</translation>
    </message>
    <message>
        <source>Value Name</source>
        <translation>数值名称</translation>
    </message>
    <message>
        <source>Value</source>
        <translation>数值</translation>
    </message>
</context>
<context>
    <name>KvStatisticsMeasurementsTableOptionsWidget</name>
    <message>
        <source>Measurements table</source>
        <translation>测量数据表</translation>
    </message>
    <message>
        <source>Order by:</source>
        <translation>排序依据：</translation>
    </message>
    <message>
        <source>default</source>
        <translation>默认</translation>
    </message>
    <message>
        <source>%1, ascending</source>
        <translation>%1，升序</translation>
    </message>
    <message>
        <source>%1, descending</source>
        <translation>%1，降序</translation>
    </message>
</context>
<context>
    <name>KvStatisticsMeasurementsTableWidget</name>
    <message>
        <source>Measurements Table</source>
        <translation>测量数据表</translation>
    </message>
</context>
<context>
    <name>KvStatisticsStatsTableNodeCfg</name>
    <message>
        <source>Min</source>
        <translation>最小值</translation>
    </message>
    <message>
        <source>Max</source>
        <translation>最大值</translation>
    </message>
    <message>
        <source>Average</source>
        <translation>平均值</translation>
    </message>
    <message>
        <source>Sigma</source>
        <translation>σ</translation>
    </message>
    <message>
        <source>3 Sigma</source>
        <translation>3σ</translation>
    </message>
    <message>
        <source>6 Sigma</source>
        <translation>6σ</translation>
    </message>
</context>
<context>
    <name>KvStatisticsStatsTableOptionsWidget</name>
    <message>
        <source>Statistics table</source>
        <translation>统计表</translation>
    </message>
</context>
<context>
    <name>KvStatisticsStatsTableWidget</name>
    <message>
        <source>Statistics Table</source>
        <translation>统计表</translation>
    </message>
    <message>
        <source>Object Type</source>
        <translation>对象类型</translation>
    </message>
    <message>
        <source>Measurement Type</source>
        <translation>测量类型</translation>
    </message>
</context>
<context>
    <name>KvStatisticsUnitConverter</name>
    <message>
        <source>deg</source>
        <translation>度</translation>
    </message>
    <message>
        <source>pcs</source>
        <translation>个</translation>
    </message>
    <message>
        <source>%</source>
        <translation>%</translation>
    </message>
</context>
<context>
    <name>KvStatisticsWindow</name>
    <message>
        <source>Measurement statistics</source>
        <translation>测量统计</translation>
    </message>
    <message>
        <source>Choose a statistics view on the right.</source>
        <translation>请在右侧选择一个统计视图。</translation>
    </message>
    <message>
        <source>No statistics blocks are installed.</source>
        <translation>未安装任何统计区块。</translation>
    </message>
</context>
<context>
    <name>KvTemplateModel</name>
    <message>
        <source>Cannot read</source>
        <translation>无法读取</translation>
    </message>
    <message>
        <source>Cannot open file %1</source>
        <translation>无法打开文件 %1</translation>
    </message>
    <message>
        <source>Error reading file</source>
        <translation>读取文件时出错</translation>
    </message>
    <message>
        <source>Cannot read file %1</source>
        <translation>无法读取文件 %1</translation>
    </message>
    <message>
        <source>Cannot save</source>
        <translation>无法保存</translation>
    </message>
    <message>
        <source>Cannot create file %1</source>
        <translation>无法创建文件 %1</translation>
    </message>
</context>
<context>
    <name>KvTemplatesEditorWindow</name>
    <message>
        <source>Open a template file</source>
        <translation>打开模板文件</translation>
    </message>
    <message>
        <source>Start a new, empty template</source>
        <translation>新建空白模板</translation>
    </message>
    <message>
        <source>Save the template to another file</source>
        <translation>将模板另存为其他文件</translation>
    </message>
    <message>
        <source>Save the template</source>
        <translation>保存模板</translation>
    </message>
    <message>
        <source>Print the report to a PDF file</source>
        <translation>将报告打印为 PDF 文件</translation>
    </message>
    <message>
        <source>Header on every page</source>
        <translation>每页显示页眉</translation>
    </message>
    <message>
        <source>Footer on every page</source>
        <translation>每页显示页脚</translation>
    </message>
    <message>
        <source>Page numbers</source>
        <translation>页码</translation>
    </message>
    <message>
        <source>Report pages</source>
        <translation>报告页面</translation>
    </message>
    <message>
        <source>Blocks to add</source>
        <translation>可添加的区块</translation>
    </message>
    <message>
        <source>Are you sure?</source>
        <translation>确认</translation>
    </message>
    <message>
        <source>The template is modified, do you want to save it first?</source>
        <translation>模板已修改，要先保存吗？</translation>
    </message>
    <message>
        <source>Choose file to open</source>
        <translation>选择要打开的文件</translation>
    </message>
    <message>
        <source>Choose file to save</source>
        <translation>选择要保存的文件</translation>
    </message>
    <message>
        <source>Choose file to print to</source>
        <translation>选择打印输出文件</translation>
    </message>
    <message>
        <source>Pdf file (*.pdf)</source>
        <translation>PDF 文件 (*.pdf)</translation>
    </message>
    <message>
        <source>Save failed</source>
        <translation>保存失败</translation>
    </message>
    <message>
        <source>Cannot write to file %1</source>
        <translation>无法写入文件 %1</translation>
    </message>
    <message>
        <source>[new]</source>
        <translation>[新模板]</translation>
    </message>
</context>
<context>
    <name>KvTemplatesEditorWindowUi</name>
    <message>
        <source>Open File</source>
        <translation>打开文件</translation>
    </message>
    <message>
        <source>Clear</source>
        <translation>清空</translation>
    </message>
    <message>
        <source>Save as ...</source>
        <translation>另存为...</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>保存</translation>
    </message>
    <message>
        <source>Print</source>
        <translation>打印</translation>
    </message>
    <message>
        <source>Add block</source>
        <translation>添加区块</translation>
    </message>
    <message>
        <source>The template is empty. Drag a block from here onto the page.</source>
        <translation>模板为空。请将区块从此处拖到页面上。</translation>
    </message>
</context>
<context>
    <name>KvTextDocumentNodeOptionsWidget</name>
    <message>
        <source>Text</source>
        <translation>文本</translation>
    </message>
    <message>
        <source>Font size in points</source>
        <translation>字号（磅）</translation>
    </message>
    <message>
        <source>Font size</source>
        <translation>字号</translation>
    </message>
    <message>
        <source>Text color</source>
        <translation>文本颜色</translation>
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
        <source>Underline</source>
        <translation>下划线</translation>
    </message>
    <message>
        <source>Align left</source>
        <translation>左对齐</translation>
    </message>
    <message>
        <source>Align center</source>
        <translation>居中</translation>
    </message>
    <message>
        <source>Align right</source>
        <translation>右对齐</translation>
    </message>
    <message>
        <source>Justify</source>
        <translation>两端对齐</translation>
    </message>
    <message>
        <source>Superscript</source>
        <translation>上标</translation>
    </message>
    <message>
        <source>Subscript</source>
        <translation>下标</translation>
    </message>
    <message>
        <source>Insert link</source>
        <translation>插入链接</translation>
    </message>
    <message>
        <source>Insert picture</source>
        <translation>插入图片</translation>
    </message>
    <message>
        <source>Insert tag</source>
        <translation>插入标记</translation>
    </message>
    <message>
        <source>Insert a tag that the report replaces by its value</source>
        <translation>插入标记，生成报告时会替换为相应的值</translation>
    </message>
</context>
<context>
    <name>KvTextDocumentNodeWidget</name>
    <message>
        <source>Text</source>
        <translation>文本</translation>
    </message>
</context>
<context>
    <name>KvThemeOptionsRow</name>
    <message>
        <source>Color theme:</source>
        <translation>颜色主题：</translation>
    </message>
    <message>
        <source>Dark</source>
        <translation>深色</translation>
    </message>
    <message>
        <source>Light</source>
        <translation>浅色</translation>
    </message>
</context>
<context>
    <name>KvWidthOptionsRow</name>
    <message>
        <source>W</source>
        <comment>short for width</comment>
        <translation>宽</translation>
    </message>
    <message>
        <source>Width in percent</source>
        <translation>宽度（百分比）</translation>
    </message>
    <message>
        <source>Width in percent of the page&apos;s content</source>
        <translation>宽度，以页面内容宽度的百分比表示</translation>
    </message>
</context>
<context>
    <name>KvWindowTitleBar</name>
    <message>
        <source>Close</source>
        <translation>关闭</translation>
    </message>
</context>
<context>
    <name>StatReportingPlugin</name>
    <message>
        <source>Statistics tools</source>
        <translation>报告与统计</translation>
    </message>
    <message>
        <source>Select Template File</source>
        <translation>选择模板文件</translation>
    </message>
    <message>
        <source>Report Template File (*.rtp)</source>
        <translation>报告模板文件 (*.rtp)</translation>
    </message>
    <message>
        <source>No report template selected.</source>
        <translation>未选择报告模板。</translation>
    </message>
</context>
</TS>
