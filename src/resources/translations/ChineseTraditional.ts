<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="zh_TW" sourcelanguage="en_US">
<context>
    <name>GuiStatReportingPluginUi</name>
    <message>
        <source>Form</source>
        <translation>表單</translation>
    </message>
    <message>
        <source>Open Templates Editor</source>
        <translation>開啟範本編輯器</translation>
    </message>
    <message>
        <source>Opens Report Template Editor</source>
        <translation>開啟報告範本編輯器</translation>
    </message>
    <message>
        <source>Generate Report File</source>
        <translation>產生報告檔案</translation>
    </message>
    <message>
        <source>Exports current measurments to pdf file.</source>
        <translation>將目前的量測資料匯出為 PDF 檔案。</translation>
    </message>
    <message>
        <source>Open Statistics Window</source>
        <translation>開啟統計視窗</translation>
    </message>
    <message>
        <source>Template:</source>
        <translation>範本：</translation>
    </message>
    <message>
        <source>Browse Templates</source>
        <translation>瀏覽範本</translation>
    </message>
    <message>
        <source>Opens default template for report generation</source>
        <translation>開啟用於產生報告的預設範本</translation>
    </message>
</context>
<context>
    <name>KvAddImageDialog</name>
    <message>
        <source>Choose image file</source>
        <translation>選擇影像檔案</translation>
    </message>
    <message>
        <source>Image file(*.png *.jpg *.gif *.tif *.bmp)</source>
        <translation>影像檔案 (*.png *.jpg *.gif *.tif *.bmp)</translation>
    </message>
</context>
<context>
    <name>KvAddLinkDialogUi</name>
    <message>
        <source>Insert Link</source>
        <translation>插入連結</translation>
    </message>
    <message>
        <source>Title:</source>
        <translation>標題：</translation>
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
        <translation>靠左對齊</translation>
    </message>
    <message>
        <source>Align center</source>
        <translation>置中對齊</translation>
    </message>
    <message>
        <source>Align right</source>
        <translation>靠右對齊</translation>
    </message>
</context>
<context>
    <name>KvBaseEditorNodeFactory</name>
    <message>
        <source>Measurements Table</source>
        <translation>量測資料表</translation>
    </message>
    <message>
        <source>Text Document</source>
        <translation>文字文件</translation>
    </message>
    <message>
        <source>Camera Image View</source>
        <translation>相機影像檢視</translation>
    </message>
    <message>
        <source>Image View</source>
        <translation>影像檢視</translation>
    </message>
    <message>
        <source>Statistics</source>
        <translation>統計</translation>
    </message>
    <message>
        <source>Statistics Table</source>
        <translation>統計表</translation>
    </message>
    <message>
        <source>Counters</source>
        <translation>計數器</translation>
    </message>
    <message>
        <source>Min / Median / Max Box</source>
        <translation>最小值/中位數/最大值盒鬚圖</translation>
    </message>
    <message>
        <source>Trend</source>
        <translation>趨勢</translation>
    </message>
</context>
<context>
    <name>KvCameraImageNodeOptionsWidget</name>
    <message>
        <source>Camera image view</source>
        <translation>相機影像檢視</translation>
    </message>
    <message>
        <source>Render measurements</source>
        <translation>繪製量測物件</translation>
    </message>
    <message>
        <source>Draw the measurement objects on the picture</source>
        <translation>在影像上繪製量測物件</translation>
    </message>
</context>
<context>
    <name>KvCameraImageWidget</name>
    <message>
        <source>Camera Image View</source>
        <translation>相機影像檢視</translation>
    </message>
</context>
<context>
    <name>KvColumnsOptionsRow</name>
    <message>
        <source>Select columns:</source>
        <translation>選擇欄位：</translation>
    </message>
</context>
<context>
    <name>KvEditorAddImageExtWidgetUi</name>
    <message>
        <source>Width:</source>
        <translation>寬度：</translation>
    </message>
    <message>
        <source>Width in percent of the text&apos;s width</source>
        <translation>寬度，以文字寬度的百分比表示</translation>
    </message>
    <message>
        <source>Float:</source>
        <translation>文繞圖：</translation>
    </message>
    <message>
        <source>Side of the text at which the picture stands</source>
        <translation>圖片位於文字的哪一側</translation>
    </message>
    <message>
        <source>none</source>
        <translation>無</translation>
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
        <translation>區塊群組，已展開</translation>
    </message>
    <message>
        <source>Group of blocks, closed</source>
        <translation>區塊群組，已收合</translation>
    </message>
    <message>
        <source>Close the group (Enter)</source>
        <translation>收合群組 (Enter)</translation>
    </message>
    <message>
        <source>Open the group (Enter)</source>
        <translation>展開群組 (Enter)</translation>
    </message>
</context>
<context>
    <name>KvEditorToolWidget</name>
    <message>
        <source>Drag onto the page, or press Enter to append</source>
        <translation>拖曳到頁面上，或按 Enter 鍵加到最後</translation>
    </message>
</context>
<context>
    <name>KvFileDialogs</name>
    <message>
        <source>%1 already exists.
Do you want to replace it?</source>
        <translation>%1 已存在。
要取代它嗎？</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>儲存</translation>
    </message>
</context>
<context>
    <name>KvFooterWidget</name>
    <message>
        <source>Footer</source>
        <translation>頁尾</translation>
    </message>
</context>
<context>
    <name>KvGroupByOptionsRow</name>
    <message>
        <source>Group by:</source>
        <translation>分組依據：</translation>
    </message>
    <message>
        <source>Object</source>
        <translation>物件</translation>
    </message>
    <message>
        <source>Measurement</source>
        <translation>量測類型</translation>
    </message>
</context>
<context>
    <name>KvHeaderWidget</name>
    <message>
        <source>Header</source>
        <translation>頁首</translation>
    </message>
</context>
<context>
    <name>KvImageFile</name>
    <message>
        <source>Cannot read the image file %1</source>
        <translation>無法讀取影像檔案 %1</translation>
    </message>
    <message>
        <source>The image that the template holds of %1 is damaged</source>
        <translation>範本中儲存的影像 %1 已損毀</translation>
    </message>
</context>
<context>
    <name>KvImageNodeOptionsWidget</name>
    <message>
        <source>Image view</source>
        <translation>影像檢視</translation>
    </message>
    <message>
        <source>Browse</source>
        <translation>瀏覽</translation>
    </message>
    <message>
        <source>Choose an image file</source>
        <translation>選擇影像檔案</translation>
    </message>
    <message>
        <source>Choose image file</source>
        <translation>選擇影像檔案</translation>
    </message>
    <message>
        <source>Image file(*.png *.jpg *.gif *.tif *.bmp)</source>
        <translation>影像檔案 (*.png *.jpg *.gif *.tif *.bmp)</translation>
    </message>
</context>
<context>
    <name>KvImageWidget</name>
    <message>
        <source>Image View</source>
        <translation>影像檢視</translation>
    </message>
</context>
<context>
    <name>KvPageCountWidget</name>
    <message>
        <source>Page count</source>
        <translation>頁碼</translation>
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
        <translation>正在列印報告</translation>
    </message>
    <message>
        <source>Progress</source>
        <translation>進度</translation>
    </message>
    <message>
        <source>Cancel (Esc)</source>
        <translation>取消 (Esc)</translation>
    </message>
    <message>
        <source>Page %1 of %2</source>
        <translation>第 %1 頁，共 %2 頁</translation>
    </message>
</context>
<context>
    <name>KvReportGlyphs</name>
    <message>
        <source>No installed font has these characters, the report leaves them out: %1</source>
        <translation>已安裝的字型都沒有這些字元，報告中將省略：%1</translation>
    </message>
    <message>
        <source>No installed font has these characters, the report leaves them out: %1 (fonts to install: %2)</source>
        <translation>已安裝的字型都沒有這些字元，報告中將省略：%1（需要安裝的字型：%2）</translation>
    </message>
</context>
<context>
    <name>KvReportKeywords</name>
    <message>
        <source>Creation date (ISO)</source>
        <translation>建立日期 (ISO)</translation>
    </message>
    <message>
        <source>Creation date (Text)</source>
        <translation>建立日期（文字）</translation>
    </message>
    <message>
        <source>Creation time</source>
        <translation>建立時間</translation>
    </message>
    <message>
        <source>Program name</source>
        <translation>程式名稱</translation>
    </message>
    <message>
        <source>Program version</source>
        <translation>程式版本</translation>
    </message>
    <message>
        <source>Program vendor</source>
        <translation>程式廠商</translation>
    </message>
</context>
<context>
    <name>KvReportTemplatesEditor</name>
    <message>
        <source>Report template editor</source>
        <translation>報告範本編輯器</translation>
    </message>
    <message>
        <source>Report template file (*.rtp)</source>
        <translation>報告範本檔案 (*.rtp)</translation>
    </message>
</context>
<context>
    <name>KvRotationOptionsRow</name>
    <message>
        <source>Rotation</source>
        <translation>旋轉</translation>
    </message>
    <message>
        <source>Rotation of the picture, clockwise</source>
        <translation>順時針旋轉影像</translation>
    </message>
</context>
<context>
    <name>KvSelectionOverlay</name>
    <message>
        <source>Delete block</source>
        <translation>刪除區塊</translation>
    </message>
    <message>
        <source>Delete block (Del)</source>
        <translation>刪除區塊 (Del)</translation>
    </message>
</context>
<context>
    <name>KvStatisticsMeasurementsTableNodeCfg</name>
    <message>
        <source>Object Name</source>
        <translation>物件名稱</translation>
    </message>
    <message>
        <source>Object Type</source>
        <translation>物件類型</translation>
    </message>
    <message>
        <source>Value Name</source>
        <translation>數值名稱</translation>
    </message>
    <message>
        <source>Value</source>
        <translation>數值</translation>
    </message>
</context>
<context>
    <name>KvStatisticsMeasurementsTableOptionsWidget</name>
    <message>
        <source>Measurements table</source>
        <translation>量測資料表</translation>
    </message>
    <message>
        <source>Order by:</source>
        <translation>排序依據：</translation>
    </message>
    <message>
        <source>default</source>
        <translation>預設</translation>
    </message>
    <message>
        <source>%1, ascending</source>
        <translation>%1，遞增</translation>
    </message>
    <message>
        <source>%1, descending</source>
        <translation>%1，遞減</translation>
    </message>
</context>
<context>
    <name>KvStatisticsMeasurementsTableWidget</name>
    <message>
        <source>Measurements Table</source>
        <translation>量測資料表</translation>
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
        <translation>統計表</translation>
    </message>
</context>
<context>
    <name>KvStatisticsStatsTableWidget</name>
    <message>
        <source>Statistics Table</source>
        <translation>統計表</translation>
    </message>
    <message>
        <source>Object Type</source>
        <translation>物件類型</translation>
    </message>
    <message>
        <source>Measurement Type</source>
        <translation>量測類型</translation>
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
        <translation>個</translation>
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
        <translation>量測統計</translation>
    </message>
    <message>
        <source>Choose a statistics view on the right.</source>
        <translation>請在右側選擇一個統計檢視。</translation>
    </message>
    <message>
        <source>No statistics blocks are installed.</source>
        <translation>未安裝任何統計區塊。</translation>
    </message>
</context>
<context>
    <name>KvTemplateModel</name>
    <message>
        <source>Cannot read</source>
        <translation>無法讀取</translation>
    </message>
    <message>
        <source>Cannot open file %1</source>
        <translation>無法開啟檔案 %1</translation>
    </message>
    <message>
        <source>Error reading file</source>
        <translation>讀取檔案時發生錯誤</translation>
    </message>
    <message>
        <source>Cannot read file %1</source>
        <translation>無法讀取檔案 %1</translation>
    </message>
    <message>
        <source>Cannot save</source>
        <translation>無法儲存</translation>
    </message>
    <message>
        <source>Cannot create file %1</source>
        <translation>無法建立檔案 %1</translation>
    </message>
</context>
<context>
    <name>KvTemplatesEditorWindow</name>
    <message>
        <source>Open a template file</source>
        <translation>開啟範本檔案</translation>
    </message>
    <message>
        <source>Start a new, empty template</source>
        <translation>新增空白範本</translation>
    </message>
    <message>
        <source>Save the template to another file</source>
        <translation>將範本另存為其他檔案</translation>
    </message>
    <message>
        <source>Save the template</source>
        <translation>儲存範本</translation>
    </message>
    <message>
        <source>Print the report to a PDF file</source>
        <translation>將報告列印為 PDF 檔案</translation>
    </message>
    <message>
        <source>Header on every page</source>
        <translation>每頁顯示頁首</translation>
    </message>
    <message>
        <source>Footer on every page</source>
        <translation>每頁顯示頁尾</translation>
    </message>
    <message>
        <source>Page numbers</source>
        <translation>頁碼</translation>
    </message>
    <message>
        <source>Report pages</source>
        <translation>報告頁面</translation>
    </message>
    <message>
        <source>Blocks to add</source>
        <translation>可加入的區塊</translation>
    </message>
    <message>
        <source>Are you sure?</source>
        <translation>確認</translation>
    </message>
    <message>
        <source>The template is modified, do you want to save it first?</source>
        <translation>範本已修改，要先儲存嗎？</translation>
    </message>
    <message>
        <source>Choose file to open</source>
        <translation>選擇要開啟的檔案</translation>
    </message>
    <message>
        <source>Choose file to save</source>
        <translation>選擇要儲存的檔案</translation>
    </message>
    <message>
        <source>Choose file to print to</source>
        <translation>選擇列印輸出檔案</translation>
    </message>
    <message>
        <source>Pdf file (*.pdf)</source>
        <translation>PDF 檔案 (*.pdf)</translation>
    </message>
    <message>
        <source>Save failed</source>
        <translation>儲存失敗</translation>
    </message>
    <message>
        <source>Cannot write to file %1</source>
        <translation>無法寫入檔案 %1</translation>
    </message>
    <message>
        <source>[new]</source>
        <translation>[新範本]</translation>
    </message>
</context>
<context>
    <name>KvTemplatesEditorWindowUi</name>
    <message>
        <source>Open File</source>
        <translation>開啟檔案</translation>
    </message>
    <message>
        <source>Clear</source>
        <translation>清空</translation>
    </message>
    <message>
        <source>Save as ...</source>
        <translation>另存新檔...</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>儲存</translation>
    </message>
    <message>
        <source>Print</source>
        <translation>列印</translation>
    </message>
    <message>
        <source>Add block</source>
        <translation>加入區塊</translation>
    </message>
    <message>
        <source>The template is empty. Drag a block from here onto the page.</source>
        <translation>範本是空的。請將區塊從此處拖曳到頁面上。</translation>
    </message>
</context>
<context>
    <name>KvTextDocumentNodeOptionsWidget</name>
    <message>
        <source>Text</source>
        <translation>文字</translation>
    </message>
    <message>
        <source>Font size in points</source>
        <translation>字型大小（點）</translation>
    </message>
    <message>
        <source>Font size</source>
        <translation>字型大小</translation>
    </message>
    <message>
        <source>Text color</source>
        <translation>文字色彩</translation>
    </message>
    <message>
        <source>Bold</source>
        <translation>粗體</translation>
    </message>
    <message>
        <source>Italic</source>
        <translation>斜體</translation>
    </message>
    <message>
        <source>Underline</source>
        <translation>底線</translation>
    </message>
    <message>
        <source>Align left</source>
        <translation>靠左對齊</translation>
    </message>
    <message>
        <source>Align center</source>
        <translation>置中對齊</translation>
    </message>
    <message>
        <source>Align right</source>
        <translation>靠右對齊</translation>
    </message>
    <message>
        <source>Justify</source>
        <translation>左右對齊</translation>
    </message>
    <message>
        <source>Superscript</source>
        <translation>上標</translation>
    </message>
    <message>
        <source>Subscript</source>
        <translation>下標</translation>
    </message>
    <message>
        <source>Insert link</source>
        <translation>插入連結</translation>
    </message>
    <message>
        <source>Insert picture</source>
        <translation>插入圖片</translation>
    </message>
    <message>
        <source>Insert tag</source>
        <translation>插入標記</translation>
    </message>
    <message>
        <source>Insert a tag that the report replaces by its value</source>
        <translation>插入標記，產生報告時會以對應的值取代</translation>
    </message>
</context>
<context>
    <name>KvTextDocumentNodeWidget</name>
    <message>
        <source>Text</source>
        <translation>文字</translation>
    </message>
</context>
<context>
    <name>KvThemeOptionsRow</name>
    <message>
        <source>Color theme:</source>
        <translation>色彩主題：</translation>
    </message>
    <message>
        <source>Dark</source>
        <translation>深色</translation>
    </message>
    <message>
        <source>Light</source>
        <translation>淺色</translation>
    </message>
</context>
<context>
    <name>KvWidthOptionsRow</name>
    <message>
        <source>W</source>
        <comment>short for width</comment>
        <translation>寬</translation>
    </message>
    <message>
        <source>Width in percent</source>
        <translation>寬度（百分比）</translation>
    </message>
    <message>
        <source>Width in percent of the page&apos;s content</source>
        <translation>寬度，以頁面內容寬度的百分比表示</translation>
    </message>
</context>
<context>
    <name>KvWindowTitleBar</name>
    <message>
        <source>Close</source>
        <translation>關閉</translation>
    </message>
</context>
<context>
    <name>StatReportingPlugin</name>
    <message>
        <source>Statistics tools</source>
        <translation>報告與統計</translation>
    </message>
    <message>
        <source>Select Template File</source>
        <translation>選擇範本檔案</translation>
    </message>
    <message>
        <source>Report Template File (*.rtp)</source>
        <translation>報告範本檔案 (*.rtp)</translation>
    </message>
    <message>
        <source>No report template selected.</source>
        <translation>未選擇報告範本。</translation>
    </message>
</context>
</TS>
