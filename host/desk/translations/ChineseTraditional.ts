<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="zh_TW" sourcelanguage="en_US">
<context>
    <name>KvDeskActions</name>
    <message>
        <source>&amp;New session</source>
        <translation>新增工作階段(&amp;N)</translation>
    </message>
    <message>
        <source>Start an empty session</source>
        <translation>新增空白工作階段</translation>
    </message>
    <message>
        <source>Open &amp;image...</source>
        <translation>開啟影像(&amp;I)...</translation>
    </message>
    <message>
        <source>Open image</source>
        <translation>開啟影像</translation>
    </message>
    <message>
        <source>&amp;Open session...</source>
        <translation>開啟工作階段(&amp;O)...</translation>
    </message>
    <message>
        <source>Open session</source>
        <translation>開啟工作階段</translation>
    </message>
    <message>
        <source>Import &amp;table...</source>
        <translation>匯入表格(&amp;T)...</translation>
    </message>
    <message>
        <source>Import table of measured values</source>
        <translation>匯入量測值表格</translation>
    </message>
    <message>
        <source>&amp;Save session</source>
        <translation>儲存工作階段(&amp;S)</translation>
    </message>
    <message>
        <source>Save session</source>
        <translation>儲存工作階段</translation>
    </message>
    <message>
        <source>Save session &amp;as...</source>
        <translation>另存工作階段(&amp;A)...</translation>
    </message>
    <message>
        <source>Save session to another file</source>
        <translation>將工作階段另存為其他檔案</translation>
    </message>
    <message>
        <source>&amp;Quit</source>
        <translation>結束(&amp;Q)</translation>
    </message>
    <message>
        <source>Quit the program</source>
        <translation>結束程式</translation>
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
        <translation>縮小(&amp;O)</translation>
    </message>
    <message>
        <source>Zoom out</source>
        <translation>縮小</translation>
    </message>
    <message>
        <source>&amp;Fit to window</source>
        <translation>符合視窗大小(&amp;F)</translation>
    </message>
    <message>
        <source>Show the whole image</source>
        <translation>顯示整幅影像</translation>
    </message>
    <message>
        <source>&amp;Actual size</source>
        <translation>實際大小(&amp;A)</translation>
    </message>
    <message>
        <source>Show the image at 100 %</source>
        <translation>以 100% 顯示影像</translation>
    </message>
    <message>
        <source>&amp;Measured values</source>
        <translation>量測值(&amp;M)</translation>
    </message>
    <message>
        <source>Show or hide the measured values</source>
        <translation>顯示或隱藏量測值</translation>
    </message>
    <message>
        <source>Stat&amp;us log</source>
        <translation>狀態記錄(&amp;U)</translation>
    </message>
    <message>
        <source>Show or hide the status log</source>
        <translation>顯示或隱藏狀態記錄</translation>
    </message>
    <message>
        <source>&amp;Dark or light theme</source>
        <translation>深色或淺色主題(&amp;D)</translation>
    </message>
    <message>
        <source>Change between the dark and the light theme</source>
        <translation>在深色與淺色主題之間切換</translation>
    </message>
    <message>
        <source>Settin&amp;gs...</source>
        <translation>設定(&amp;G)...</translation>
    </message>
    <message>
        <source>Settings</source>
        <translation>設定</translation>
    </message>
    <message>
        <source>&amp;About Measuring Desk</source>
        <translation>關於 Measuring Desk(&amp;A)</translation>
    </message>
    <message>
        <source>About Measuring Desk</source>
        <translation>關於 Measuring Desk</translation>
    </message>
    <message>
        <source>%1 (%2)</source>
        <comment>command (shortcut)</comment>
        <translation>%1 (%2)</translation>
    </message>
    <message>
        <source>&amp;Export measured values...</source>
        <translation>匯出量測值(&amp;E)...</translation>
    </message>
    <message>
        <source>Export measured values as a table</source>
        <translation>將量測值匯出為表格</translation>
    </message>
    <message>
        <source>&amp;Undo</source>
        <translation>復原(&amp;U)</translation>
    </message>
    <message>
        <source>Undo the last step</source>
        <translation>復原上一個步驟</translation>
    </message>
    <message>
        <source>&amp;Redo</source>
        <translation>重做(&amp;R)</translation>
    </message>
    <message>
        <source>Redo what was undone</source>
        <translation>重做已復原的步驟</translation>
    </message>
    <message>
        <source>Cu&amp;t</source>
        <translation>剪下(&amp;T)</translation>
    </message>
    <message>
        <source>Cut the selected objects</source>
        <translation>剪下選取的物件</translation>
    </message>
    <message>
        <source>&amp;Copy</source>
        <translation>複製(&amp;C)</translation>
    </message>
    <message>
        <source>Copy the selected objects</source>
        <translation>複製選取的物件</translation>
    </message>
    <message>
        <source>&amp;Paste</source>
        <translation>貼上(&amp;P)</translation>
    </message>
    <message>
        <source>Paste copied objects</source>
        <translation>貼上已複製的物件</translation>
    </message>
    <message>
        <source>&amp;Delete</source>
        <translation>刪除(&amp;D)</translation>
    </message>
    <message>
        <source>Delete the selected objects</source>
        <translation>刪除選取的物件</translation>
    </message>
    <message>
        <source>Select &amp;all</source>
        <translation>全選(&amp;A)</translation>
    </message>
    <message>
        <source>Select all objects on the image</source>
        <translation>選取影像上的所有物件</translation>
    </message>
    <message>
        <source>Re&amp;name</source>
        <translation>重新命名(&amp;N)</translation>
    </message>
    <message>
        <source>Give the selected object a name</source>
        <translation>為選取的物件命名</translation>
    </message>
    <message>
        <source>&amp;Find measured values</source>
        <translation>尋找量測值(&amp;F)</translation>
    </message>
    <message>
        <source>Filter the measured values</source>
        <translation>篩選量測值</translation>
    </message>
    <message>
        <source>&amp;Select</source>
        <translation>選取(&amp;S)</translation>
    </message>
    <message>
        <source>Select and change objects</source>
        <translation>選取及變更物件</translation>
    </message>
    <message>
        <source>&amp;Line</source>
        <translation>直線(&amp;L)</translation>
    </message>
    <message>
        <source>Measure a length</source>
        <translation>量測長度</translation>
    </message>
    <message>
        <source>&amp;Polyline</source>
        <translation>折線(&amp;P)</translation>
    </message>
    <message>
        <source>Measure the length of a way</source>
        <translation>量測路徑長度</translation>
    </message>
    <message>
        <source>Parallel &amp;distance</source>
        <translation>平行距離(&amp;D)</translation>
    </message>
    <message>
        <source>Measure the distance of a point from a line</source>
        <translation>量測點到直線的距離</translation>
    </message>
    <message>
        <source>&amp;Arc</source>
        <translation>圓弧(&amp;A)</translation>
    </message>
    <message>
        <source>Measure an arc through three points</source>
        <translation>通過三點量測圓弧</translation>
    </message>
    <message>
        <source>&amp;Circle</source>
        <translation>圓(&amp;C)</translation>
    </message>
    <message>
        <source>Measure a circle</source>
        <translation>量測圓</translation>
    </message>
    <message>
        <source>&amp;Rectangle</source>
        <translation>矩形(&amp;R)</translation>
    </message>
    <message>
        <source>Measure a rectangle</source>
        <translation>量測矩形</translation>
    </message>
    <message>
        <source>Poly&amp;gon</source>
        <translation>多邊形(&amp;G)</translation>
    </message>
    <message>
        <source>Measure the area of a polygon</source>
        <translation>量測多邊形的面積</translation>
    </message>
    <message>
        <source>Cou&amp;nter</source>
        <translation>計數器(&amp;N)</translation>
    </message>
    <message>
        <source>Count by clicks</source>
        <translation>以點擊計數</translation>
    </message>
    <message>
        <source>&amp;Text note</source>
        <translation>文字註解(&amp;T)</translation>
    </message>
    <message>
        <source>Write on the image</source>
        <translation>在影像上書寫文字</translation>
    </message>
    <message>
        <source>Scale &amp;bar</source>
        <translation>比例尺(&amp;B)</translation>
    </message>
    <message>
        <source>Draw a scale bar</source>
        <translation>繪製比例尺</translation>
    </message>
    <message>
        <source>Cal&amp;ibration...</source>
        <translation>校正(&amp;I)...</translation>
    </message>
    <message>
        <source>Say how large a pixel of the image is</source>
        <translation>指定影像中一個像素的實際大小</translation>
    </message>
    <message>
        <source>Use the file&apos;s pixel size</source>
        <translation>使用檔案中的像素尺寸</translation>
    </message>
    <message>
        <source>Measure with the pixel size that the image&apos;s file states</source>
        <translation>依影像檔案中記錄的像素尺寸進行量測</translation>
    </message>
    <message>
        <source>&amp;Take snapshot</source>
        <translation>拍攝快照(&amp;T)</translation>
    </message>
    <message>
        <source>Save the image to the gallery</source>
        <translation>將影像儲存到圖庫</translation>
    </message>
    <message>
        <source>Snapshots &amp;with measurements</source>
        <translation>快照包含量測物件(&amp;W)</translation>
    </message>
    <message>
        <source>Draw the measured objects on snapshots</source>
        <translation>在快照上繪製量測物件</translation>
    </message>
    <message>
        <source>&amp;Freeze</source>
        <translation>凍結(&amp;F)</translation>
    </message>
    <message>
        <source>Freeze the live image</source>
        <translation>凍結即時影像</translation>
    </message>
    <message>
        <source>&amp;Labels on the image</source>
        <translation>影像上的標籤(&amp;L)</translation>
    </message>
    <message>
        <source>Show or hide the labels of objects</source>
        <translation>顯示或隱藏物件的標籤</translation>
    </message>
    <message>
        <source>&amp;Rulers</source>
        <translation>尺規(&amp;R)</translation>
    </message>
    <message>
        <source>Show or hide the rulers</source>
        <translation>顯示或隱藏尺規</translation>
    </message>
    <message>
        <source>&amp;Scale bar on the image</source>
        <translation>影像上的比例尺(&amp;S)</translation>
    </message>
    <message>
        <source>Show or hide the scale bar, on reports, too</source>
        <translation>顯示或隱藏比例尺，包括報告中的比例尺</translation>
    </message>
    <message>
        <source>&amp;Gallery</source>
        <translation>圖庫(&amp;G)</translation>
    </message>
    <message>
        <source>Show or hide the gallery</source>
        <translation>顯示或隱藏圖庫</translation>
    </message>
    <message>
        <source>&amp;Start page</source>
        <translation>起始頁(&amp;S)</translation>
    </message>
    <message>
        <source>Show the first steps, the examples and the recent sessions</source>
        <translation>顯示入門步驟、範例及最近的工作階段</translation>
    </message>
    <message>
        <source>&amp;User guide</source>
        <translation>使用者指南(&amp;U)</translation>
    </message>
    <message>
        <source>Read the user guide</source>
        <translation>閱讀使用者指南</translation>
    </message>
</context>
<context>
    <name>KvDeskAutosave</name>
    <message>
        <source>the folder &quot;%1&quot; cannot be written</source>
        <translation>無法寫入資料夾「%1」</translation>
    </message>
    <message>
        <source>Unsaved changes are not being copied: %1</source>
        <translation>尚未儲存的變更目前沒有備份：%1</translation>
    </message>
</context>
<context>
    <name>KvDeskCalibrationCommands</name>
    <message>
        <source>The session measures with it already</source>
        <translation>工作階段已在使用該像素尺寸</translation>
    </message>
    <message>
        <source>The image&apos;s file does not state one</source>
        <translation>影像檔案中沒有記錄像素尺寸</translation>
    </message>
</context>
<context>
    <name>KvDeskCalibrationDialog</name>
    <message>
        <source>Calibration</source>
        <translation>校正</translation>
    </message>
    <message>
        <source>Objective</source>
        <translation>物鏡</translation>
    </message>
    <message>
        <source>Choose an objective, or type the name of a new one</source>
        <translation>選擇物鏡，或輸入新物鏡的名稱</translation>
    </message>
    <message>
        <source>Such as 10x</source>
        <translation>例如 10x</translation>
    </message>
    <message>
        <source>In use</source>
        <translation>目前使用</translation>
    </message>
    <message>
        <source>New calibration</source>
        <translation>新增校正</translation>
    </message>
    <message>
        <source>Known distance</source>
        <translation>已知距離</translation>
    </message>
    <message>
        <source>Image file</source>
        <translation>影像檔案</translation>
    </message>
    <message>
        <source>Typed</source>
        <translation>手動輸入</translation>
    </message>
    <message>
        <source>Name</source>
        <translation>名稱</translation>
    </message>
    <message>
        <source>Who</source>
        <translation>校正人員</translation>
    </message>
    <message>
        <source>Note</source>
        <translation>備註</translation>
    </message>
    <message>
        <source>Calibrate</source>
        <translation>校正</translation>
    </message>
    <message>
        <source>History of the objective</source>
        <translation>物鏡校正歷程</translation>
    </message>
    <message>
        <source>Calibrations of this objective appear here</source>
        <translation>此物鏡的校正記錄會顯示在這裡</translation>
    </message>
    <message>
        <source>Use again</source>
        <translation>再次使用</translation>
    </message>
    <message>
        <source>Close</source>
        <translation>關閉</translation>
    </message>
    <message>
        <source>New pixel size: %1</source>
        <translation>新像素尺寸：%1</translation>
    </message>
    <message>
        <source>No pixel size yet</source>
        <translation>尚無像素尺寸</translation>
    </message>
    <message>
        <source>Measure with this pixel size and remember it</source>
        <translation>使用此像素尺寸進行量測並記住它</translation>
    </message>
    <message>
        <source>Complete the fields above first</source>
        <translation>請先填寫以上各項</translation>
    </message>
    <message>
        <source>Measure with the selected calibration</source>
        <translation>使用選取的校正進行量測</translation>
    </message>
    <message>
        <source>Select a calibration in the table first</source>
        <translation>請先在表格中選取一筆校正</translation>
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
        <translation>校正人員</translation>
    </message>
    <message>
        <source>Pixel size</source>
        <translation>像素尺寸</translation>
    </message>
    <message>
        <source>Origin</source>
        <translation>來源</translation>
    </message>
    <message>
        <source>Name</source>
        <translation>名稱</translation>
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
        <translation>已知距離</translation>
    </message>
    <message>
        <source>Image file</source>
        <translation>影像檔案</translation>
    </message>
    <message>
        <source>Typed</source>
        <translation>手動輸入</translation>
    </message>
    <message>
        <source>Not calibrated</source>
        <translation>未校正</translation>
    </message>
</context>
<context>
    <name>KvDeskCalibrationWay</name>
    <message>
        <source>Type a number such as 5.3 or 5,3</source>
        <translation>請輸入數字，例如 5.3 或 5,3</translation>
    </message>
    <message>
        <source>A pixel measures between %1 and %2</source>
        <translation>像素大小應介於 %1 與 %2 之間</translation>
    </message>
</context>
<context>
    <name>KvDeskCalibrator</name>
    <message>
        <source>%1 states pixels of %2; the session measures with %3</source>
        <translation>%1 中記錄的像素尺寸為 %2；目前的工作階段使用 %3</translation>
    </message>
    <message>
        <source>%1 states pixels of %2; the session measures in pixels</source>
        <translation>%1 中記錄的像素尺寸為 %2；目前的工作階段以像素為單位量測</translation>
    </message>
    <message>
        <source>Calibrated: %1, %2 per pixel</source>
        <extracomment>%1 is an objective or a file, %2 the size of a pixel with its unit</extracomment>
        <translation>已校正：%1，每像素 %2</translation>
    </message>
</context>
<context>
    <name>KvDeskCommandLine</name>
    <message>
        <source>There is no theme &quot;%1&quot;: use %2</source>
        <translation>沒有名為「%1」的主題：請使用 %2</translation>
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
        <translation>用法：measuringdesk [選項...] [工作階段|影像|表格|資料夾|影片...]
量測影像上的物件並顯示其數值。

  --session 檔案      開啟工作階段
  --image 檔案        開啟影像
  --table 檔案        匯入量測值表格
  --theme Dark|Light  本次執行使用的主題
  --plugins 目錄      也在此目錄中尋找外掛程式；可多次指定
  --help              顯示此說明
  --version           顯示版本

環境變數 STATREPORT_PLUGINS 可指定更多外掛程式目錄。
</translation>
    </message>
    <message>
        <source>%1 (measuringdesk --help tells more)</source>
        <translation>%1（詳細資訊：measuringdesk --help）</translation>
    </message>
</context>
<context>
    <name>KvDeskCounterBar</name>
    <message>
        <source>Clicks count for</source>
        <translation>點擊計入</translation>
    </message>
    <message>
        <source>The counter that gets the clicks (1 to 9)</source>
        <translation>接收點擊的計數器（按鍵 1 至 9）</translation>
    </message>
    <message>
        <source>Count another class</source>
        <translation>為另一類別計數</translation>
    </message>
    <message>
        <source>A right click takes a place away</source>
        <translation>按右鍵可移除計數點</translation>
    </message>
    <message>
        <source>A new counter</source>
        <translation>新計數器</translation>
    </message>
</context>
<context>
    <name>KvDeskEditCommands</name>
    <message>
        <source>&amp;Undo %1</source>
        <extracomment>%1 is what is undone or redone, such as &quot;move of Line 3&quot;</extracomment>
        <translation>復原「%1」(&amp;U)</translation>
    </message>
    <message>
        <source>&amp;Undo</source>
        <translation>復原(&amp;U)</translation>
    </message>
    <message>
        <source>&amp;Redo %1</source>
        <translation>重做「%1」(&amp;R)</translation>
    </message>
    <message>
        <source>&amp;Redo</source>
        <translation>重做(&amp;R)</translation>
    </message>
    <message>
        <source>Nothing was done yet</source>
        <translation>尚未執行任何步驟</translation>
    </message>
    <message>
        <source>Nothing was undone</source>
        <translation>沒有已復原的步驟</translation>
    </message>
    <message>
        <source>Select an object first</source>
        <translation>請先選取物件</translation>
    </message>
    <message>
        <source>Select one object first</source>
        <translation>請先選取一個物件</translation>
    </message>
    <message>
        <source>No measured objects were copied</source>
        <translation>沒有已複製的量測物件</translation>
    </message>
    <message>
        <source>Finish or cancel what you have begun first</source>
        <translation>請先完成或取消已開始的操作</translation>
    </message>
</context>
<context>
    <name>KvDeskExamples</name>
    <message>
        <source>Coin: first length</source>
        <translation>硬幣：首次量測長度</translation>
    </message>
    <message>
        <source>Plate: dimensions</source>
        <translation>板件：尺寸</translation>
    </message>
    <message>
        <source>Cells: counting</source>
        <translation>細胞：計數</translation>
    </message>
    <message>
        <source>Fibres: statistics</source>
        <translation>纖維：統計</translation>
    </message>
</context>
<context>
    <name>KvDeskExportCommand</name>
    <message>
        <source>Nothing was measured yet</source>
        <translation>尚未進行任何量測</translation>
    </message>
    <message>
        <source>Measured values</source>
        <comment>file name</comment>
        <translation>量測值</translation>
    </message>
    <message>
        <source>JSON files</source>
        <translation>JSON 檔案</translation>
    </message>
    <message>
        <source>CSV tables</source>
        <translation>CSV 表格</translation>
    </message>
    <message>
        <source>Export measured values</source>
        <translation>匯出量測值</translation>
    </message>
    <message>
        <source>Export cancelled: %1</source>
        <translation>已取消匯出：%1</translation>
    </message>
    <message>
        <source>The table &quot;%1&quot; was not written.</source>
        <translation>未寫入表格「%1」。</translation>
    </message>
    <message>
        <source>Measured values exported: %1</source>
        <translation>已匯出量測值：%1</translation>
    </message>
    <message>
        <source>Exporting measured values</source>
        <translation>正在匯出量測值</translation>
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
        <translation>匯出量測值</translation>
    </message>
    <message>
        <source>Table</source>
        <translation>表格</translation>
    </message>
    <message>
        <source>Numbers</source>
        <translation>數字</translation>
    </message>
    <message>
        <source>Byte order mark, for spreadsheets that do not expect UTF-8</source>
        <translation>位元組順序標記 (BOM)，供預設不使用 UTF-8 的試算表軟體辨識</translation>
    </message>
    <message>
        <source>Apostrophe before names that spreadsheets take for formulas</source>
        <translation>在會被試算表視為公式的名稱前加上單引號</translation>
    </message>
    <message>
        <source>Changes names that begin with =, +, - or @: they are others when the table is imported again</source>
        <translation>會變更以 =、+、- 或 @ 開頭的名稱：再次匯入該表格時，名稱會與原本不同</translation>
    </message>
    <message>
        <source>Export...</source>
        <translation>匯出...</translation>
    </message>
    <message>
        <source>CSV, one row per value</source>
        <translation>CSV，每個數值一列</translation>
    </message>
    <message>
        <source>CSV, one row per object</source>
        <translation>CSV，每個物件一列</translation>
    </message>
    <message>
        <source>JSON</source>
        <translation>JSON</translation>
    </message>
    <message>
        <source>1.5, commas between the fields</source>
        <translation>1.5，欄位以逗號分隔</translation>
    </message>
    <message>
        <source>1,5, semicolons between the fields (spreadsheets, %1)</source>
        <extracomment>%1 is the name of a language</extracomment>
        <translation>1,5，欄位以分號分隔（試算表，%1）</translation>
    </message>
    <message>
        <source>1.5, commas between the fields (spreadsheets, %1)</source>
        <translation>1.5，欄位以逗號分隔（試算表，%1）</translation>
    </message>
    <message>
        <source>For statistics programs. Can be imported here again.</source>
        <translation>適用於統計軟體。可重新匯入本程式。</translation>
    </message>
    <message>
        <source>For spreadsheets. Headings name the units.</source>
        <translation>適用於試算表。欄標題包含單位。</translation>
    </message>
    <message>
        <source>For programs. Numbers always have a decimal point.</source>
        <translation>適用於程式。小數點一律為「.」。</translation>
    </message>
    <message>
        <source>No measured object is selected</source>
        <translation>未選取量測物件</translation>
    </message>
    <message>
        <source>Concerns CSV tables only</source>
        <translation>僅適用於 CSV 表格</translation>
    </message>
    <message numerus="yes">
        <source>Only the selected object(s) (%n)</source>
        <translation>
            <numerusform>僅選取的物件（%n 個）</numerusform>
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
        <translation>相機的曝光時間</translation>
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
        <translation>工作階段</translation>
    </message>
    <message>
        <source>All files</source>
        <translation>所有檔案</translation>
    </message>
    <message>
        <source>Unsaved changes</source>
        <translation>尚未儲存的變更</translation>
    </message>
    <message>
        <source>Save the changes to &quot;%1&quot;?</source>
        <translation>要將變更儲存到「%1」嗎？</translation>
    </message>
    <message>
        <source>The session &quot;%1&quot; was not opened.</source>
        <translation>未能開啟工作階段「%1」。</translation>
    </message>
    <message>
        <source>Image missing</source>
        <translation>找不到影像</translation>
    </message>
    <message>
        <source>Open the session without its image?</source>
        <translation>要在沒有影像的情況下開啟工作階段嗎？</translation>
    </message>
    <message>
        <source>The image &quot;%1&quot; was not opened.</source>
        <translation>未能開啟影像「%1」。</translation>
    </message>
    <message>
        <source>Image opened: %1</source>
        <translation>已開啟影像：%1</translation>
    </message>
    <message>
        <source>The table &quot;%1&quot; was not imported.</source>
        <translation>未能匯入表格「%1」。</translation>
    </message>
    <message>
        <source>%1: %2</source>
        <comment>file, remark</comment>
        <translation>%1：%2</translation>
    </message>
    <message>
        <source>The session &quot;%1&quot; was not saved.</source>
        <translation>未能儲存工作階段「%1」。</translation>
    </message>
    <message>
        <source>Session saved: %1</source>
        <translation>已儲存工作階段：%1</translation>
    </message>
    <message>
        <source>Open session</source>
        <translation>開啟工作階段</translation>
    </message>
    <message>
        <source>Open image</source>
        <translation>開啟影像</translation>
    </message>
    <message>
        <source>Images</source>
        <translation>影像</translation>
    </message>
    <message>
        <source>Import table</source>
        <translation>匯入表格</translation>
    </message>
    <message>
        <source>Tables</source>
        <translation>表格</translation>
    </message>
    <message>
        <source>Save session</source>
        <translation>儲存工作階段</translation>
    </message>
    <message>
        <source>Measuring Desk</source>
        <translation>Measuring Desk</translation>
    </message>
    <message>
        <source>Only one session can be open; not opened: %1</source>
        <translation>只能開啟一個工作階段；未開啟：%1</translation>
    </message>
    <message>
        <source>Neither a session, an image nor a table: %1</source>
        <translation>不是工作階段、影像或表格：%1</translation>
    </message>
    <message>
        <source>There is not enough memory</source>
        <translation>記憶體不足</translation>
    </message>
    <message>
        <source>Opening &quot;%1&quot;</source>
        <translation>正在開啟「%1」</translation>
    </message>
    <message>
        <source>The measurements were not restored.</source>
        <translation>未能還原量測資料。</translation>
    </message>
    <message>
        <source>Restoring measurements</source>
        <translation>正在還原量測資料</translation>
    </message>
    <message>
        <source>Importing &quot;%1&quot;</source>
        <translation>正在匯入「%1」</translation>
    </message>
    <message>
        <source>Saving &quot;%1&quot;</source>
        <translation>正在儲存「%1」</translation>
    </message>
    <message>
        <source>Session changed by another program</source>
        <translation>工作階段已被其他程式變更</translation>
    </message>
    <message>
        <source>&quot;%1&quot; was changed by another program. Overwrite its changes?</source>
        <translation>「%1」已被其他程式變更。要覆寫這些變更嗎？</translation>
    </message>
    <message>
        <source>Overwrite</source>
        <translation>覆寫</translation>
    </message>
    <message>
        <source>Save as...</source>
        <translation>另存新檔...</translation>
    </message>
    <message numerus="yes">
        <source>%n files were not opened.</source>
        <extracomment>%n is 2 at least</extracomment>
        <translation>
            <numerusform>有 %n 個檔案未能開啟。</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Session opened: %1 (%n object(s))</source>
        <translation>
            <numerusform>已開啟工作階段：%1（%n 個物件）</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Measurements restored: %1 (%n object(s))</source>
        <translation>
            <numerusform>已還原量測資料：%1（%n 個物件）</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Table imported: %1 (%n object(s))</source>
        <translation>
            <numerusform>已匯入表格：%1（%n 個物件）</numerusform>
        </translation>
    </message>
</context>
<context>
    <name>KvDeskFilePixelSize</name>
    <message>
        <source>%1 states pixels of %2.</source>
        <comment>file, size</comment>
        <translation>%1 中記錄的像素尺寸為 %2。</translation>
    </message>
    <message>
        <source>The image&apos;s file does not state how large its pixels are.</source>
        <translation>影像檔案中沒有記錄像素的大小。</translation>
    </message>
</context>
<context>
    <name>KvDeskGallery</name>
    <message>
        <source>Gallery</source>
        <translation>圖庫</translation>
    </message>
    <message>
        <source>Hide the gallery</source>
        <translation>隱藏圖庫</translation>
    </message>
    <message>
        <source>&amp;Open image</source>
        <translation>開啟影像(&amp;O)</translation>
    </message>
    <message>
        <source>&amp;Show in folder</source>
        <translation>在資料夾中顯示(&amp;S)</translation>
    </message>
    <message>
        <source>&amp;Copy path</source>
        <translation>複製路徑(&amp;C)</translation>
    </message>
    <message>
        <source>&amp;Move to trash...</source>
        <translation>移至垃圾桶(&amp;M)...</translation>
    </message>
    <message>
        <source>Choose &amp;folder...</source>
        <translation>選擇資料夾(&amp;F)...</translation>
    </message>
    <message>
        <source>Show the images of a folder</source>
        <translation>顯示某個資料夾中的影像</translation>
    </message>
    <message>
        <source>Save s&amp;napshots in this folder</source>
        <translation>將快照儲存到此資料夾(&amp;N)</translation>
    </message>
    <message>
        <source>Folder of the gallery</source>
        <translation>圖庫的資料夾</translation>
    </message>
    <message>
        <source>More commands of the gallery</source>
        <translation>圖庫的更多命令</translation>
    </message>
    <message>
        <source>Snapshots</source>
        <translation>快照</translation>
    </message>
    <message>
        <source>Choose folder</source>
        <translation>選擇資料夾</translation>
    </message>
    <message>
        <source>Snapshots are saved in %1</source>
        <translation>快照儲存於 %1</translation>
    </message>
    <message>
        <source>Snapshots (%1) and the images of a folder appear here; drag them onto report pages</source>
        <translation>快照 (%1) 及資料夾中的影像會顯示在這裡；可將其拖曳到報告頁面上</translation>
    </message>
    <message>
        <source>There are no images in %1</source>
        <translation>%1 中沒有影像</translation>
    </message>
    <message>
        <source>The folder %1 does not exist</source>
        <translation>資料夾 %1 不存在</translation>
    </message>
    <message>
        <source>Select an image first</source>
        <translation>請先選取影像</translation>
    </message>
    <message>
        <source>Snapshots are saved in this folder already</source>
        <translation>快照目前就儲存在此資料夾中</translation>
    </message>
    <message>
        <source>Move &quot;%1&quot; to the trash?</source>
        <translation>要將「%1」移至垃圾桶嗎？</translation>
    </message>
    <message>
        <source>Move to trash</source>
        <translation>移至垃圾桶</translation>
    </message>
    <message>
        <source>Moved to the trash: %1</source>
        <translation>已移至垃圾桶：%1</translation>
    </message>
    <message>
        <source>Not moved to the trash: %1</source>
        <translation>未能移至垃圾桶：%1</translation>
    </message>
    <message>
        <source>Measuring Desk</source>
        <translation>Measuring Desk</translation>
    </message>
    <message>
        <source>The files are still there. They are write-protected, or there is no trash for them.</source>
        <translation>檔案仍在原處。檔案有寫入保護，或沒有可用的垃圾桶。</translation>
    </message>
    <message numerus="yes">
        <source>Move %n selected image(s) to the trash?</source>
        <translation>
            <numerusform>要將選取的 %n 張影像移至垃圾桶嗎？</numerusform>
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
        <translation>圖庫</translation>
    </message>
</context>
<context>
    <name>KvDeskGuideCommand</name>
    <message>
        <source>The user guide is not installed</source>
        <translation>未安裝使用者指南</translation>
    </message>
</context>
<context>
    <name>KvDeskGuideWindow</name>
    <message>
        <source>User guide</source>
        <translation>使用者指南</translation>
    </message>
    <message>
        <source>Contents</source>
        <translation>目錄</translation>
    </message>
    <message>
        <source>Back</source>
        <translation>返回</translation>
    </message>
    <message>
        <source>Forward</source>
        <translation>前進</translation>
    </message>
    <message>
        <source>Find in the guide</source>
        <translation>在指南中尋找</translation>
    </message>
    <message>
        <source>Find previous</source>
        <translation>尋找上一個</translation>
    </message>
    <message>
        <source>Find next</source>
        <translation>尋找下一個</translation>
    </message>
    <message>
        <source>This is the first place</source>
        <translation>已是第一個位置</translation>
    </message>
    <message>
        <source>This is the last place</source>
        <translation>已是最後一個位置</translation>
    </message>
    <message>
        <source>Not found</source>
        <translation>找不到</translation>
    </message>
    <message>
        <source>Type what to find first</source>
        <translation>請先輸入要尋找的內容</translation>
    </message>
</context>
<context>
    <name>KvDeskImageView</name>
    <message>
        <source>Image</source>
        <translation>影像</translation>
    </message>
    <message>
        <source>Open an image or a session to start</source>
        <translation>請開啟影像或工作階段以開始</translation>
    </message>
</context>
<context>
    <name>KvDeskInlineEditor</name>
    <message>
        <source>Text</source>
        <translation>文字</translation>
    </message>
    <message>
        <source>Name</source>
        <translation>名稱</translation>
    </message>
</context>
<context>
    <name>KvDeskKnownDistance</name>
    <message>
        <source>inch</source>
        <translation>英吋</translation>
    </message>
    <message>
        <source>Use selected line</source>
        <translation>使用選取的直線</translation>
    </message>
    <message>
        <source>Length of the line</source>
        <translation>直線長度</translation>
    </message>
    <message>
        <source>Unit of the length</source>
        <translation>長度單位</translation>
    </message>
    <message>
        <source>Its length</source>
        <translation>長度</translation>
    </message>
    <message>
        <source>Draw a line over a distance that you know, such as on a stage micrometer, and select it.</source>
        <translation>沿已知距離（例如載物台測微尺上的刻度）繪製一條直線，然後選取它。</translation>
    </message>
    <message>
        <source>No line yet</source>
        <translation>尚無直線</translation>
    </message>
    <message>
        <source>%1: %2</source>
        <comment>name and length of a line</comment>
        <translation>%1：%2</translation>
    </message>
    <message>
        <source>Take the selected line as the known distance</source>
        <translation>以選取的直線作為已知距離</translation>
    </message>
    <message>
        <source>Select one line on the image first</source>
        <translation>請先在影像上選取一條直線</translation>
    </message>
</context>
<context>
    <name>KvDeskLiveBar</name>
    <message>
        <source>Live image</source>
        <translation>即時影像</translation>
    </message>
    <message>
        <source>Freeze</source>
        <translation>凍結</translation>
    </message>
    <message>
        <source>%1 fps</source>
        <extracomment>frames per second</extracomment>
        <translation>%1 fps</translation>
    </message>
    <message>
        <source>%1 delivers no pictures any more; this is the last one</source>
        <translation>%1 不再傳送影像；這是最後一張</translation>
    </message>
    <message>
        <source>%1 delivers no pictures</source>
        <translation>%1 沒有傳送影像</translation>
    </message>
    <message>
        <source>%1 is stopped</source>
        <translation>%1 已停止</translation>
    </message>
    <message>
        <source>Waiting for the first picture of %1</source>
        <translation>正在等待 %1 的第一張影像</translation>
    </message>
    <message>
        <source>Frozen: %1</source>
        <translation>已凍結：%1</translation>
    </message>
    <message>
        <source>Live: %1</source>
        <translation>即時：%1</translation>
    </message>
    <message>
        <source>This image is not live</source>
        <translation>此影像不是即時影像</translation>
    </message>
    <message>
        <source>&amp;Reconnect</source>
        <translation>重新連線(&amp;R)</translation>
    </message>
    <message>
        <source>&amp;Start</source>
        <translation>開始(&amp;S)</translation>
    </message>
    <message>
        <source>Frames per second
Dropped, because newer ones came first: %1</source>
        <translation>每秒影格數
因較新的影格先到而捨棄：%1</translation>
    </message>
    <message>
        <source>Stop the live image; other programs can use the camera then</source>
        <translation>停止即時影像；之後其他程式即可使用相機</translation>
    </message>
</context>
<context>
    <name>KvDeskMainWindow</name>
    <message>
        <source>&amp;File</source>
        <translation>檔案(&amp;F)</translation>
    </message>
    <message>
        <source>&amp;Recent sessions</source>
        <translation>最近的工作階段(&amp;R)</translation>
    </message>
    <message>
        <source>&amp;View</source>
        <translation>檢視(&amp;V)</translation>
    </message>
    <message>
        <source>&amp;Help</source>
        <translation>說明(&amp;H)</translation>
    </message>
    <message>
        <source>Main tool bar</source>
        <translation>主工具列</translation>
    </message>
    <message>
        <source>%1[*] - Measuring Desk</source>
        <extracomment>%1 is the name of a session; [*] is replaced by a star when it has unsaved changes</extracomment>
        <translation>%1[*] - Measuring Desk</translation>
    </message>
    <message>
        <source>None yet</source>
        <translation>尚無</translation>
    </message>
    <message>
        <source>About Measuring Desk</source>
        <translation>關於 Measuring Desk</translation>
    </message>
    <message>
        <source>&lt;b&gt;Measuring Desk %1&lt;/b&gt;&lt;p&gt;Measures objects on images, and hosts plug-ins such as the statistics reports.&lt;/p&gt;&lt;p&gt;%2, MIT licence&lt;/p&gt;</source>
        <translation>&lt;b&gt;Measuring Desk %1&lt;/b&gt;&lt;p&gt;量測影像上的物件，並可載入統計報告等外掛程式。&lt;/p&gt;&lt;p&gt;%2，MIT 授權條款&lt;/p&gt;</translation>
    </message>
    <message>
        <source>Measuring Desk</source>
        <translation>Measuring Desk</translation>
    </message>
    <message>
        <source>&amp;Edit</source>
        <translation>編輯(&amp;E)</translation>
    </message>
    <message>
        <source>&amp;Image</source>
        <translation>影像(&amp;I)</translation>
    </message>
    <message>
        <source>&amp;Measure</source>
        <translation>量測(&amp;M)</translation>
    </message>
    <message>
        <source>Choose the image source</source>
        <translation>選擇影像來源</translation>
    </message>
</context>
<context>
    <name>KvDeskNotice</name>
    <message>
        <source>Close this message</source>
        <translation>關閉此訊息</translation>
    </message>
</context>
<context>
    <name>KvDeskObjectClipboard</name>
    <message>
        <source>Type</source>
        <translation>類型</translation>
    </message>
    <message>
        <source>Object</source>
        <translation>物件</translation>
    </message>
    <message>
        <source>Value name</source>
        <translation>數值名稱</translation>
    </message>
    <message>
        <source>Value</source>
        <translation>數值</translation>
    </message>
</context>
<context>
    <name>KvDeskObjectEditor</name>
    <message numerus="yes">
        <source>%n objects</source>
        <comment>several measured objects</comment>
        <extracomment>%n is 2 at least</extracomment>
        <translation>
            <numerusform>%n 個物件</numerusform>
        </translation>
    </message>
    <message>
        <source>drawing of %1</source>
        <translation>繪製 %1</translation>
    </message>
    <message>
        <source>change of %1</source>
        <translation>變更 %1</translation>
    </message>
    <message>
        <source>move of %1</source>
        <translation>移動 %1</translation>
    </message>
    <message>
        <source>renaming of %1</source>
        <translation>重新命名 %1</translation>
    </message>
    <message>
        <source>text of %1</source>
        <translation>變更 %1 的文字</translation>
    </message>
    <message>
        <source>showing of %1 of %2</source>
        <extracomment>%1 is a value, %2 an object</extracomment>
        <translation>顯示 %2 的%1</translation>
    </message>
    <message>
        <source>hiding of %1 of %2</source>
        <translation>隱藏 %2 的%1</translation>
    </message>
    <message>
        <source>deletion of %1</source>
        <translation>刪除 %1</translation>
    </message>
    <message>
        <source>change of the calibration</source>
        <translation>變更校正</translation>
    </message>
    <message>
        <source>place of %1</source>
        <translation>在 %1 中新增計數點</translation>
    </message>
    <message>
        <source>deletion of a place of %1</source>
        <translation>刪除 %1 的計數點</translation>
    </message>
    <message>
        <source>pasting of %1</source>
        <translation>貼上 %1</translation>
    </message>
    <message>
        <source>import of %1</source>
        <translation>匯入 %1</translation>
    </message>
</context>
<context>
    <name>KvDeskPlugins</name>
    <message>
        <source>No plug-ins were found</source>
        <translation>找不到外掛程式</translation>
    </message>
    <message>
        <source>It is no plug-in for this program</source>
        <translation>它不是本程式的外掛程式</translation>
    </message>
    <message>
        <source>Its tools &quot;%1&quot; could not be started</source>
        <translation>無法啟動其工具「%1」</translation>
    </message>
    <message>
        <source>Plug-in loaded: %1</source>
        <translation>已載入外掛程式：%1</translation>
    </message>
    <message>
        <source>Plug-in not loaded: %1: %2</source>
        <translation>未載入外掛程式：%1：%2</translation>
    </message>
    <message>
        <source>It failed: %1</source>
        <translation>外掛程式發生錯誤：%1</translation>
    </message>
    <message>
        <source>It failed for a reason of its own</source>
        <translation>外掛程式因其內部原因發生錯誤</translation>
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
        <translation>讓一切保持原狀 (Esc)</translation>
    </message>
    <message>
        <source>This can no longer be cancelled</source>
        <translation>已無法取消</translation>
    </message>
</context>
<context>
    <name>KvDeskRecovery</name>
    <message>
        <source>Untitled session</source>
        <translation>未命名的工作階段</translation>
    </message>
    <message numerus="yes">
        <source>%1 (%n object(s))</source>
        <extracomment>%1 is the name of a session</extracomment>
        <translation>
            <numerusform>%1（%n 個物件）</numerusform>
        </translation>
    </message>
</context>
<context>
    <name>KvDeskRecoveryBar</name>
    <message>
        <source>Show other measurements that were not saved</source>
        <translation>顯示其他尚未儲存的量測資料</translation>
    </message>
    <message>
        <source>Restore</source>
        <translation>還原</translation>
    </message>
    <message>
        <source>Open these measurements as a session with unsaved changes</source>
        <translation>將這些量測資料開啟為含有未儲存變更的工作階段</translation>
    </message>
    <message>
        <source>Discard</source>
        <translation>捨棄</translation>
    </message>
    <message>
        <source>Delete these measurements for good</source>
        <translation>永久刪除這些量測資料</translation>
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
            <numerusform>另有 %n 項</numerusform>
        </translation>
    </message>
    <message>
        <source>Measurements from %1 were not saved.</source>
        <translation>%1 的量測資料尚未儲存。</translation>
    </message>
</context>
<context>
    <name>KvDeskRuler</name>
    <message>
        <source>Horizontal ruler</source>
        <translation>水平尺規</translation>
    </message>
    <message>
        <source>Vertical ruler</source>
        <translation>垂直尺規</translation>
    </message>
    <message>
        <source>Ruler in %1</source>
        <translation>尺規單位：%1</translation>
    </message>
</context>
<context>
    <name>KvDeskSelectionStatistics</name>
    <message>
        <source>n = %1, mean %2, SD %3, min %4, max %5</source>
        <extracomment>number of values, their mean, standard deviation, smallest and largest one</extracomment>
        <translation>n = %1，平均值 %2，標準差 %3，最小 %4，最大 %5</translation>
    </message>
    <message>
        <source>Selected values: %1</source>
        <translation>已選取 %1 個數值</translation>
    </message>
    <message>
        <source>Mean: %1</source>
        <translation>平均值：%1</translation>
    </message>
    <message>
        <source>Standard deviation: %1</source>
        <translation>標準差：%1</translation>
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
        <translation>未命名的工作階段</translation>
    </message>
</context>
<context>
    <name>KvDeskSettingsDialog</name>
    <message>
        <source>Settings</source>
        <translation>設定</translation>
    </message>
    <message>
        <source>Appearance</source>
        <translation>外觀</translation>
    </message>
    <message>
        <source>Theme</source>
        <translation>主題</translation>
    </message>
    <message>
        <source>Dark</source>
        <translation>深色</translation>
    </message>
    <message>
        <source>Light</source>
        <translation>淺色</translation>
    </message>
    <message>
        <source>Language</source>
        <translation>語言</translation>
    </message>
    <message>
        <source>Another language takes effect when the program is started again.</source>
        <translation>變更語言後，須重新啟動程式才會生效。</translation>
    </message>
    <message>
        <source>Measured values</source>
        <translation>量測值</translation>
    </message>
    <message>
        <source>Automatic</source>
        <translation>自動</translation>
    </message>
    <message>
        <source>Significant digits</source>
        <translation>有效位數</translation>
    </message>
    <message>
        <source>Length unit</source>
        <translation>長度單位</translation>
    </message>
    <message>
        <source>Angle unit</source>
        <translation>角度單位</translation>
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
        <translation>系統預設</translation>
    </message>
    <message>
        <source>Nothing was changed yet</source>
        <translation>尚未進行任何變更</translation>
    </message>
</context>
<context>
    <name>KvDeskSnapshotFile</name>
    <message>
        <source>The folder cannot be created</source>
        <translation>無法建立資料夾</translation>
    </message>
    <message>
        <source>The picture cannot be encoded</source>
        <translation>無法編碼影像</translation>
    </message>
</context>
<context>
    <name>KvDeskSnapshots</name>
    <message>
        <source>Open an image first</source>
        <translation>請先開啟影像</translation>
    </message>
    <message>
        <source>No snapshot was taken: earlier ones are still being saved</source>
        <translation>未能拍攝快照：先前的快照仍在儲存中</translation>
    </message>
    <message>
        <source>Snapshot saved: %1</source>
        <translation>已儲存快照：%1</translation>
    </message>
    <message>
        <source>The snapshot was not saved. %1</source>
        <translation>未能儲存快照。%1</translation>
    </message>
</context>
<context>
    <name>KvDeskSourceCommands</name>
    <message>
        <source>The image source &quot;%1&quot; was not opened.</source>
        <translation>未能開啟影像來源「%1」。</translation>
    </message>
    <message>
        <source>Image source: %1</source>
        <translation>影像來源：%1</translation>
    </message>
    <message>
        <source>Open image folder</source>
        <translation>開啟影像資料夾</translation>
    </message>
    <message>
        <source>Open video</source>
        <translation>開啟影片</translation>
    </message>
    <message>
        <source>Videos</source>
        <translation>影片</translation>
    </message>
</context>
<context>
    <name>KvDeskSourceMenu</name>
    <message>
        <source>Image &amp;source</source>
        <translation>影像來源(&amp;S)</translation>
    </message>
    <message>
        <source>Still &amp;image...</source>
        <translation>靜態影像(&amp;I)...</translation>
    </message>
    <message>
        <source>Image &amp;folder...</source>
        <translation>影像資料夾(&amp;F)...</translation>
    </message>
    <message>
        <source>Play the images of a folder like a camera</source>
        <translation>像相機一樣播放資料夾中的影像</translation>
    </message>
    <message>
        <source>&amp;Video...</source>
        <translation>影片(&amp;V)...</translation>
    </message>
    <message>
        <source>Play a video like a camera</source>
        <translation>像相機一樣播放影片</translation>
    </message>
    <message>
        <source>Looking for cameras...</source>
        <translation>正在尋找相機...</translation>
    </message>
    <message>
        <source>No camera is connected</source>
        <translation>未連接相機</translation>
    </message>
</context>
<context>
    <name>KvDeskStartPage</name>
    <message>
        <source>From an image to a report</source>
        <translation>從影像到報告</translation>
    </message>
    <message>
        <source>Back to the image</source>
        <translation>返回影像</translation>
    </message>
    <message>
        <source>%1 (%2)</source>
        <comment>command (shortcut)</comment>
        <translation>%1 (%2)</translation>
    </message>
    <message>
        <source>Open an image</source>
        <translation>開啟影像</translation>
    </message>
    <message>
        <source>A picture file, or the live image of a camera.</source>
        <translation>影像檔案或相機的即時影像。</translation>
    </message>
    <message>
        <source>Choose a camera or another source</source>
        <translation>選擇相機或其他影像來源</translation>
    </message>
    <message>
        <source>Calibrate</source>
        <translation>校正</translation>
    </message>
    <message>
        <source>Say how large a pixel is. The examples are calibrated already.</source>
        <translation>指定一個像素的大小。範例皆已校正。</translation>
    </message>
    <message>
        <source>Measure and report</source>
        <translation>量測並產生報告</translation>
    </message>
    <message>
        <source>Drag a line over the image: its length is listed at once. The report panel makes a PDF of all values.</source>
        <translation>在影像上拖曳出一條直線，其長度會立即列出。報告面板可用所有數值產生 PDF。</translation>
    </message>
    <message>
        <source>Examples to try</source>
        <translation>試用範例</translation>
    </message>
    <message>
        <source>Recent sessions</source>
        <translation>最近的工作階段</translation>
    </message>
    <message>
        <source>Open an image first</source>
        <translation>請先開啟影像</translation>
    </message>
    <message>
        <source>Open a copy of this example</source>
        <translation>開啟此範例的副本</translation>
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
        <translation>錯誤</translation>
    </message>
    <message>
        <source>Information</source>
        <translation>資訊</translation>
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
        <translation>選取數值的統計</translation>
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
        <translation>狀態記錄</translation>
    </message>
    <message>
        <source>Hide the status log</source>
        <translation>隱藏狀態記錄</translation>
    </message>
    <message>
        <source>Clear the status log</source>
        <translation>清空狀態記錄</translation>
    </message>
    <message>
        <source>Messages of the program and its plug-ins appear here</source>
        <translation>程式及其外掛程式的訊息會顯示在這裡</translation>
    </message>
    <message>
        <source>There are no messages</source>
        <translation>沒有訊息</translation>
    </message>
</context>
<context>
    <name>KvDeskStatusLogModel</name>
    <message>
        <source>%1
Reported by %2</source>
        <comment>message, source</comment>
        <translation>%1
來源：%2</translation>
    </message>
    <message>
        <source>Category</source>
        <translation>等級</translation>
    </message>
    <message>
        <source>Time</source>
        <translation>時間</translation>
    </message>
    <message>
        <source>Message</source>
        <translation>訊息</translation>
    </message>
</context>
<context>
    <name>KvDeskTableView</name>
    <message>
        <source>Copy</source>
        <translation>複製</translation>
    </message>
</context>
<context>
    <name>KvDeskToolStrip</name>
    <message>
        <source>Measuring tools</source>
        <translation>量測工具</translation>
    </message>
</context>
<context>
    <name>KvDeskTypedPixelSize</name>
    <message>
        <source>Width of a pixel in micrometres</source>
        <translation>像素寬度（微米）</translation>
    </message>
    <message>
        <source>Height of a pixel in micrometres</source>
        <translation>像素高度（微米）</translation>
    </message>
    <message>
        <source>Same size in both directions</source>
        <translation>兩個方向大小相同</translation>
    </message>
    <message>
        <source>Width</source>
        <translation>寬度</translation>
    </message>
    <message>
        <source>Height</source>
        <translation>高度</translation>
    </message>
    <message>
        <source>Type how large a pixel of the image is in reality.</source>
        <translation>請輸入影像中一個像素的實際大小。</translation>
    </message>
</context>
<context>
    <name>KvDeskValueCommands</name>
    <message>
        <source>Rename</source>
        <translation>重新命名</translation>
    </message>
    <message>
        <source>Delete object</source>
        <translation>刪除物件</translation>
    </message>
    <message>
        <source>Hide value</source>
        <translation>隱藏數值</translation>
    </message>
    <message>
        <source>Show all values of the object</source>
        <translation>顯示物件的所有數值</translation>
    </message>
    <message>
        <source>Select one object first</source>
        <translation>請先選取一個物件</translation>
    </message>
    <message>
        <source>Select an object first</source>
        <translation>請先選取物件</translation>
    </message>
    <message>
        <source>Select a value first</source>
        <translation>請先選取數值</translation>
    </message>
    <message>
        <source>No value of the selected object is hidden</source>
        <translation>選取的物件沒有隱藏的數值</translation>
    </message>
    <message>
        <source>showing of values</source>
        <translation>顯示數值</translation>
    </message>
    <message>
        <source>hiding of values</source>
        <translation>隱藏數值</translation>
    </message>
</context>
<context>
    <name>KvDeskValueTable</name>
    <message>
        <source>Measured values</source>
        <translation>量測值</translation>
    </message>
    <message>
        <source>Hide the measured values</source>
        <translation>隱藏量測值</translation>
    </message>
    <message>
        <source>Filter by type, object or value name</source>
        <translation>依類型、物件或數值名稱篩選</translation>
    </message>
    <message>
        <source>Filter of the measured values</source>
        <translation>量測值篩選</translation>
    </message>
    <message>
        <source>Shows only rows that have all of these words</source>
        <translation>僅顯示包含所有這些字詞的列</translation>
    </message>
    <message>
        <source>No measured value matches the filter</source>
        <translation>沒有符合篩選條件的量測值</translation>
    </message>
    <message>
        <source>Clear the filter</source>
        <translation>清除篩選</translation>
    </message>
    <message>
        <source>%1 of %2</source>
        <extracomment>rows that match the filter, all rows</extracomment>
        <translation>%1 / %2</translation>
    </message>
    <message>
        <source>Measured values appear here once something is measured or imported</source>
        <translation>進行量測或匯入後，量測值會顯示在這裡</translation>
    </message>
    <message>
        <source>There are no measured values yet</source>
        <translation>尚無量測值</translation>
    </message>
</context>
<context>
    <name>KvDeskValueTableModel</name>
    <message>
        <source>Type</source>
        <translation>類型</translation>
    </message>
    <message>
        <source>Object</source>
        <translation>物件</translation>
    </message>
    <message>
        <source>Value name</source>
        <translation>數值名稱</translation>
    </message>
    <message>
        <source>Value</source>
        <translation>數值</translation>
    </message>
</context>
<context>
    <name>KvToolBase</name>
    <message>
        <source>Reset</source>
        <translation>重設</translation>
    </message>
    <message>
        <source>Reset to the default values</source>
        <translation>重設為預設值</translation>
    </message>
</context>
<context>
    <name>QPlatformTheme</name>
    <message>
        <source>OK</source>
        <translation>確定</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>取消</translation>
    </message>
    <message>
        <source>Apply</source>
        <translation>套用</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>儲存</translation>
    </message>
    <message>
        <source>Open</source>
        <translation>開啟</translation>
    </message>
    <message>
        <source>Close</source>
        <translation>關閉</translation>
    </message>
    <message>
        <source>Discard</source>
        <translation>不儲存</translation>
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
        <translation>無法將設定儲存到 %1。請檢查該資料夾是否可寫入。</translation>
    </message>
    <message>
        <source>The settings file %1 cannot be read. Changes to the settings will not be kept.</source>
        <translation>無法讀取設定檔 %1。對設定的變更將不會保留。</translation>
    </message>
    <message>
        <source>The settings file %1 is damaged. It was renamed to %2; all settings are back at their defaults.</source>
        <translation>設定檔 %1 已損毀，已重新命名為 %2；所有設定均已恢復為預設值。</translation>
    </message>
    <message>
        <source>The settings file %1 is damaged and could not be renamed to %2. Changes to the settings will not be kept.</source>
        <translation>設定檔 %1 已損毀，且無法重新命名為 %2。對設定的變更將不會保留。</translation>
    </message>
</context>
<context>
    <name>ZtAravisSource</name>
    <message>
        <source>%1 is disconnected; its last picture stays</source>
        <translation>%1 已中斷連線；保留其最後一張影像</translation>
    </message>
    <message>
        <source>%1 delivers pictures of a kind that cannot be shown</source>
        <translation>%1 傳送的影像類型無法顯示</translation>
    </message>
    <message>
        <source>The camera does not take the setting (%1)</source>
        <translation>相機不接受該設定（%1）</translation>
    </message>
    <message>
        <source>%1 cannot be opened (%2)</source>
        <translation>無法開啟 %1（%2）</translation>
    </message>
</context>
<context>
    <name>ZtCalibrationStore</name>
    <message>
        <source>This is not a calibration</source>
        <translation>這不是校正</translation>
    </message>
    <message>
        <source>A calibration in the settings is damaged and was left out (%1: %2)</source>
        <translation>設定中有一筆校正已損毀，已略過（%1：%2）</translation>
    </message>
</context>
<context>
    <name>ZtCsvReader</name>
    <message>
        <source>A quoted text does not end</source>
        <translation>以引號括住的文字沒有結束</translation>
    </message>
    <message>
        <source>There is text after a closing quote</source>
        <translation>右引號之後還有文字</translation>
    </message>
    <message>
        <source>Reading was cancelled</source>
        <translation>已取消讀取</translation>
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
        <translation>寬度</translation>
    </message>
    <message>
        <source>Height</source>
        <translation>高度</translation>
    </message>
    <message>
        <source>Area</source>
        <translation>面積</translation>
    </message>
    <message>
        <source>Line</source>
        <translation>直線</translation>
    </message>
    <message>
        <source>Length</source>
        <translation>長度</translation>
    </message>
    <message>
        <source>Arc</source>
        <translation>圓弧</translation>
    </message>
    <message>
        <source>Angle</source>
        <translation>角度</translation>
    </message>
    <message>
        <source>Arc length</source>
        <translation>弧長</translation>
    </message>
    <message>
        <source>Polygon</source>
        <translation>多邊形</translation>
    </message>
    <message>
        <source>Perimeter</source>
        <translation>周長</translation>
    </message>
    <message>
        <source>Polyline</source>
        <translation>折線</translation>
    </message>
    <message>
        <source>Parallel distance</source>
        <translation>平行距離</translation>
    </message>
    <message>
        <source>Distance</source>
        <translation>距離</translation>
    </message>
    <message>
        <source>Text note</source>
        <translation>文字註解</translation>
    </message>
    <message>
        <source>Scale bar</source>
        <translation>比例尺</translation>
    </message>
    <message>
        <source>Counter</source>
        <translation>計數器</translation>
    </message>
    <message>
        <source>Count</source>
        <translation>計數</translation>
    </message>
    <message>
        <source>Share</source>
        <translation>佔比</translation>
    </message>
    <message>
        <source>Circle</source>
        <translation>圓</translation>
    </message>
    <message>
        <source>Diameter</source>
        <translation>直徑</translation>
    </message>
</context>
<context>
    <name>ZtFileFault</name>
    <message>
        <source>No such file or directory</source>
        <translation>沒有此一檔案或目錄</translation>
    </message>
    <message>
        <source>Permission denied</source>
        <translation>拒絕不符權限的操作</translation>
    </message>
    <message>
        <source>Is a directory</source>
        <translation>是個目錄</translation>
    </message>
    <message>
        <source>Not a directory</source>
        <translation>並不是一個目錄</translation>
    </message>
    <message>
        <source>File name too long</source>
        <translation>檔名太長</translation>
    </message>
    <message>
        <source>No space left on device</source>
        <translation>裝置上已無多餘空間</translation>
    </message>
    <message>
        <source>Read-only file system</source>
        <translation>唯讀的檔案系統</translation>
    </message>
    <message>
        <source>Input/output error</source>
        <translation>輸入/輸出錯誤</translation>
    </message>
</context>
<context>
    <name>ZtFrameSourceCatalogue</name>
    <message>
        <source>This program cannot play videos</source>
        <translation>本程式無法播放影片</translation>
    </message>
    <message>
        <source>This program knows no cameras of this kind</source>
        <translation>本程式不支援此類相機</translation>
    </message>
</context>
<context>
    <name>ZtImageFolderSource</name>
    <message>
        <source>%1: no picture of the folder can be shown</source>
        <translation>%1：資料夾中沒有可顯示的影像</translation>
    </message>
    <message>
        <source>The folder does not exist</source>
        <translation>資料夾不存在</translation>
    </message>
    <message>
        <source>The folder cannot be read</source>
        <translation>無法讀取資料夾</translation>
    </message>
    <message>
        <source>The folder holds no pictures</source>
        <translation>資料夾中沒有影像</translation>
    </message>
</context>
<context>
    <name>ZtKernelImage</name>
    <message>
        <source>%1 delivers pictures again</source>
        <translation>%1 已恢復傳送影像</translation>
    </message>
</context>
<context>
    <name>ZtLiveFrameSource</name>
    <message>
        <source>%1 has stopped delivering pictures; the last one stays</source>
        <translation>%1 已停止傳送影像；保留最後一張</translation>
    </message>
</context>
<context>
    <name>ZtMeasureFormat</name>
    <message>
        <source>pcs</source>
        <translation>個</translation>
    </message>
</context>
<context>
    <name>ZtSession</name>
    <message>
        <source>The file is empty</source>
        <translation>檔案是空的</translation>
    </message>
    <message>
        <source>The file is not a session</source>
        <translation>檔案不是工作階段</translation>
    </message>
    <message>
        <source>The file cannot be written (%1)</source>
        <translation>無法寫入檔案（%1）</translation>
    </message>
    <message>
        <source>This must be a list</source>
        <translation>此處必須為清單</translation>
    </message>
    <message>
        <source>This must be a text</source>
        <translation>此處必須為文字</translation>
    </message>
    <message>
        <source>This must be a whole number from 1</source>
        <translation>此處必須為不小於 1 的整數</translation>
    </message>
    <message>
        <source>This must be a number</source>
        <translation>此處必須為數字</translation>
    </message>
    <message>
        <source>This must be a number greater than 0</source>
        <translation>此處必須為大於 0 的數字</translation>
    </message>
    <message>
        <source>Another object of this type has the same number</source>
        <translation>已有另一個同類型物件使用相同編號</translation>
    </message>
    <message>
        <source>This must be an object</source>
        <translation>此處必須為 JSON 物件</translation>
    </message>
    <message>
        <source>&quot;%1&quot; is not a type of objects</source>
        <translation>「%1」不是物件類型</translation>
    </message>
    <message>
        <source>An object of type &quot;%1&quot; cannot have this number of points (%2)</source>
        <translation>「%1」類型物件的點數不能為 %2</translation>
    </message>
    <message>
        <source>A point must be a list of two numbers between -1e9 and 1e9</source>
        <translation>點必須是由兩個介於 -1e9 與 1e9 之間的數字組成的清單</translation>
    </message>
    <message>
        <source>This must be the name of a value</source>
        <translation>此處必須為數值名稱</translation>
    </message>
    <message>
        <source>The type has no name</source>
        <translation>該類型沒有名稱</translation>
    </message>
    <message>
        <source>A value must have a name of its own</source>
        <translation>每個數值必須有各自的名稱</translation>
    </message>
    <message>
        <source>The numbers of the rows must rise</source>
        <translation>列的編號必須遞增</translation>
    </message>
    <message>
        <source>A row must be a list of number, name and values</source>
        <translation>列必須是由編號、名稱及數值組成的清單</translation>
    </message>
    <message>
        <source>This must be a text or null</source>
        <translation>此處必須為文字或 null</translation>
    </message>
    <message>
        <source>This must be a list or an object</source>
        <translation>此處必須為清單或 JSON 物件</translation>
    </message>
    <message>
        <source>The table has no such value</source>
        <translation>表格中沒有此數值</translation>
    </message>
    <message>
        <source>This must be the text of a number</source>
        <translation>此處必須為表示數字的文字</translation>
    </message>
    <message>
        <source>The unit does not fit that of the value</source>
        <translation>單位與該數值的單位不符</translation>
    </message>
    <message>
        <source>The file is nested too deeply</source>
        <translation>檔案的巢狀層級過深</translation>
    </message>
    <message>
        <source>The file is not valid JSON (%1)</source>
        <translation>檔案不是有效的 JSON（%1）</translation>
    </message>
    <message>
        <source>The file does not exist</source>
        <translation>檔案不存在</translation>
    </message>
    <message>
        <source>This is a folder, not a file</source>
        <translation>這是資料夾，不是檔案</translation>
    </message>
    <message>
        <source>The file cannot be read (%1)</source>
        <translation>無法讀取檔案（%1）</translation>
    </message>
    <message>
        <source>The file is too large for a session</source>
        <translation>檔案過大，無法作為工作階段開啟</translation>
    </message>
    <message>
        <source>This must be a date such as 2026-01-31T12:00:00Z</source>
        <translation>此處必須為日期，例如 2026-01-31T12:00:00Z</translation>
    </message>
    <message>
        <source>This must be &quot;knownDistance&quot;, &quot;metadata&quot; or &quot;typed&quot;</source>
        <translation>此處必須為 &quot;knownDistance&quot;、&quot;metadata&quot; 或 &quot;typed&quot;</translation>
    </message>
    <message>
        <source>The file is write-protected</source>
        <translation>檔案有寫入保護</translation>
    </message>
    <message>
        <source>Writing was cancelled</source>
        <translation>已取消寫入</translation>
    </message>
    <message>
        <source>Reading was cancelled</source>
        <translation>已取消讀取</translation>
    </message>
    <message>
        <source>The session is of the newer version %1; this program reads versions up to %2</source>
        <translation>工作階段為較新的版本 %1；本程式最高可讀取版本 %2</translation>
    </message>
    <message>
        <source>Sessions of version %1 are not known; this program reads versions %2 to %3</source>
        <translation>無法辨識版本 %1 的工作階段；本程式可讀取版本 %2 至 %3</translation>
    </message>
    <message>
        <source>This file is a table of values; import it</source>
        <translation>此檔案是量測值表，請匯入</translation>
    </message>
</context>
<context>
    <name>ZtStillImageSource</name>
    <message>
        <source>The picture does not exist</source>
        <translation>影像不存在</translation>
    </message>
    <message>
        <source>This is a folder, not a picture</source>
        <translation>這是資料夾，不是影像</translation>
    </message>
    <message>
        <source>The picture cannot be read</source>
        <translation>無法讀取影像</translation>
    </message>
    <message>
        <source>The picture has %1 x %2 pixels, which is too many</source>
        <translation>影像為 %1 × %2 像素，超出上限</translation>
    </message>
    <message>
        <source>The picture cannot be decoded (%1)</source>
        <translation>無法解碼影像（%1）</translation>
    </message>
    <message>
        <source>the file is empty</source>
        <translation>檔案是空的</translation>
    </message>
    <message>
        <source>it has no size</source>
        <translation>影像沒有尺寸</translation>
    </message>
    <message>
        <source>the file is damaged</source>
        <translation>檔案已損毀</translation>
    </message>
    <message>
        <source>the file is too short for its picture</source>
        <translation>檔案過短，影像資料不完整</translation>
    </message>
    <message>
        <source>there is not enough memory</source>
        <translation>記憶體不足</translation>
    </message>
</context>
<context>
    <name>ZtTableImport</name>
    <message>
        <source>&quot;%1&quot; already has a value &quot;%2&quot; in line %3</source>
        <translation>「%1」的數值「%2」已出現在第 %3 行</translation>
    </message>
    <message>
        <source>The file does not exist</source>
        <translation>檔案不存在</translation>
    </message>
    <message>
        <source>This is a folder, not a file</source>
        <translation>這是資料夾，不是檔案</translation>
    </message>
    <message>
        <source>The file cannot be read (%1)</source>
        <translation>無法讀取檔案（%1）</translation>
    </message>
    <message>
        <source>The table is not open for reading</source>
        <translation>表格未開啟，無法讀取</translation>
    </message>
    <message>
        <source>The table has no rows</source>
        <translation>表格中沒有資料列</translation>
    </message>
    <message>
        <source>The row and the header differ in their number of fields (%1 and %2)</source>
        <translation>該列與標題列的欄位數不同（%1 與 %2）</translation>
    </message>
    <message>
        <source>%1 is not a finite number</source>
        <translation>%1 不是有限數</translation>
    </message>
    <message>
        <source>%1 is not a number</source>
        <translation>%1 不是數字</translation>
    </message>
    <message>
        <source>&quot;%1&quot; of &quot;%2&quot; is given in &quot;%3&quot; here, but in &quot;%4&quot; before</source>
        <translation>「%2」的「%1」在此處的單位為「%3」，先前則為「%4」</translation>
    </message>
    <message>
        <source>There is no column %1; the columns are %2</source>
        <translation>沒有欄 %1；現有的欄為 %2</translation>
    </message>
    <message>
        <source>Object</source>
        <translation>物件</translation>
    </message>
    <message>
        <source>There is no value %1 to give a unit; the values are %2</source>
        <translation>沒有可指定單位的數值 %1；現有的數值為 %2</translation>
    </message>
    <message>
        <source>The first line announces rows without values</source>
        <translation>第一行宣告的資料列不含數值</translation>
    </message>
    <message>
        <source>There is no column %1; the columns of this table have no names</source>
        <translation>沒有欄 %1；此表格的欄沒有名稱</translation>
    </message>
    <message>
        <source>%1 is not the index of a class; they go from 0 to %2</source>
        <translation>%1 不是類別編號；編號範圍為 0 至 %2</translation>
    </message>
    <message>
        <source>Value %1</source>
        <translation>數值 %1</translation>
    </message>
    <message>
        <source>The file is larger than %1 MB</source>
        <translation>檔案大於 %1 MB</translation>
    </message>
    <message>
        <source>The file is empty</source>
        <translation>檔案是空的</translation>
    </message>
    <message>
        <source>The first line does not name the columns</source>
        <translation>第一行沒有欄名稱</translation>
    </message>
    <message>
        <source>Column %1 is not part of a list of values and was left out</source>
        <translation>欄 %1 不屬於數值清單，已略過</translation>
    </message>
    <message>
        <source>Columns %1 are not part of a list of values and were left out</source>
        <translation>欄 %1 不屬於數值清單，已略過</translation>
    </message>
    <message>
        <source>The value has no name</source>
        <translation>該數值沒有名稱</translation>
    </message>
    <message>
        <source>The row does not say which object it belongs to</source>
        <translation>該列未說明所屬的物件</translation>
    </message>
    <message>
        <source>%1 is not a unit</source>
        <translation>%1 不是單位</translation>
    </message>
    <message>
        <source>There is no column of numbers</source>
        <translation>沒有數字欄</translation>
    </message>
    <message>
        <source>Column %1</source>
        <translation>欄 %1</translation>
    </message>
    <message>
        <source>Column %1 holds text and was left out</source>
        <translation>欄 %1 包含文字，已略過</translation>
    </message>
    <message>
        <source>Columns %1 hold text and were left out</source>
        <translation>欄 %1 包含文字，已略過</translation>
    </message>
    <message>
        <source>Reading was cancelled</source>
        <translation>已取消讀取</translation>
    </message>
    <message numerus="yes">
        <source>The table has %n row(s), its first line announces %1</source>
        <translation>
            <numerusform>表格有 %n 列資料，但第一行宣告為 %1 列</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>The row has %n field(s) instead of %1</source>
        <translation>
            <numerusform>該列有 %n 個欄位，應為 %1 個</numerusform>
        </translation>
    </message>
    <message>
        <source>The records have too many different names</source>
        <translation>記錄中不同的名稱太多</translation>
    </message>
    <message>
        <source>This file is a session, not a table; open it</source>
        <translation>此檔案是工作階段而不是表格，請開啟</translation>
    </message>
    <message>
        <source>The file is neither a list of records nor an export of values</source>
        <translation>此檔案既不是記錄清單，也不是匯出的量測值</translation>
    </message>
    <message>
        <source>This name comes twice</source>
        <translation>此名稱出現兩次</translation>
    </message>
    <message>
        <source>This must be a text, a number or null</source>
        <translation>此處必須是文字、數字或 null</translation>
    </message>
    <message>
        <source>The table is of version %1; this program reads version %2</source>
        <translation>表格的版本為 %1；本程式讀取版本 %2</translation>
    </message>
</context>
<context>
    <name>ZtTextDecoder</name>
    <message>
        <source>The file is not a text file: it holds a NUL character</source>
        <translation>檔案不是文字檔：其中包含 NUL 字元</translation>
    </message>
    <message>
        <source>The file is not valid UTF-16 text</source>
        <translation>檔案不是有效的 UTF-16 文字</translation>
    </message>
    <message>
        <source>The text is not valid UTF-8</source>
        <translation>文字不是有效的 UTF-8</translation>
    </message>
</context>
<context>
    <name>ZtUvcCameraSource</name>
    <message>
        <source>%1 is not connected</source>
        <translation>%1 未連接</translation>
    </message>
    <message>
        <source>%1 is disconnected or in use (%2)</source>
        <translation>%1 已中斷連線或正被使用（%2）</translation>
    </message>
</context>
<context>
    <name>ZtVideoFileSource</name>
    <message>
        <source>The video does not exist</source>
        <translation>影片不存在</translation>
    </message>
    <message>
        <source>The video cannot be read</source>
        <translation>無法讀取影片</translation>
    </message>
    <message>
        <source>The video is empty</source>
        <translation>影片是空的</translation>
    </message>
    <message>
        <source>there is only sound in it</source>
        <translation>其中只有聲音</translation>
    </message>
    <message>
        <source>The video %1 cannot be played (%2)</source>
        <translation>無法播放影片 %1（%2）</translation>
    </message>
    <message>
        <source>the file is damaged</source>
        <translation>檔案已損毀</translation>
    </message>
</context>
<context>
    <name>acss</name>
    <message>
        <source>The icon %1 is missing.</source>
        <translation>缺少圖示 %1。</translation>
    </message>
</context>
</TS>
