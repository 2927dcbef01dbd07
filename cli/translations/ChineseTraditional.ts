<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="zh_TW" sourcelanguage="en_US">
<context>
    <name>KvCliHost</name>
    <message>
        <source>%1: the image %2 is missing</source>
        <translation>%1：缺少影像 %2</translation>
    </message>
</context>
<context>
    <name>KvCliOutput</name>
    <message>
        <source>cannot be written: %1</source>
        <translation>無法寫入：%1</translation>
    </message>
    <message>
        <source>note: %1</source>
        <translation>提示：%1</translation>
    </message>
    <message>
        <source>&lt;standard output&gt;</source>
        <translation>&lt;標準輸出&gt;</translation>
    </message>
</context>
<context>
    <name>KvCliParser</name>
    <message>
        <source>Language of messages and reports, such as German or de; otherwise the system&apos;s.</source>
        <translation>訊息和報告的語言，例如 German 或 de；未指定時使用系統語言。</translation>
    </message>
    <message>
        <source>Prints a report: template and measurements in, PDF out.</source>
        <translation>列印報告：由範本和量測資料產生 PDF。</translation>
    </message>
    <message>
        <source>Prints the statistics of every measured value, in the table&apos;s own units.</source>
        <translation>依表格本身的單位輸出每個量測值的統計。</translation>
    </message>
    <message>
        <source>Says what a template holds and what would be skipped or refused.</source>
        <translation>說明範本的內容，以及哪些會被略過或拒絕。</translation>
    </message>
    <message>
        <source>Lists the block types and their settings with defaults.</source>
        <translation>列出區塊類型及其設定的預設值。</translation>
    </message>
    <message>
        <source>Turns measurements and a report template into a PDF report, without a display.</source>
        <translation>由量測資料和報告範本產生 PDF 報告，不需要圖形介面。</translation>
    </message>
    <message>
        <source>Commands:</source>
        <translation>命令：</translation>
    </message>
    <message>
        <source>Options everywhere:</source>
        <translation>通用選項：</translation>
    </message>
    <message>
        <source>Shows this text, or that of a command.</source>
        <translation>顯示此說明，或某個命令的說明。</translation>
    </message>
    <message>
        <source>Shows the version.</source>
        <translation>顯示版本。</translation>
    </message>
    <message>
        <source>Writes no notes and no progress.</source>
        <translation>不輸出提示和進度。</translation>
    </message>
    <message>
        <source>Writes errors as one line of JSON each.</source>
        <translation>每個錯誤輸出為一行 JSON。</translation>
    </message>
    <message>
        <source>&quot;-&quot; as a file name is standard input or output.</source>
        <translation>檔名「-」表示標準輸入或標準輸出。</translation>
    </message>
    <message>
        <source>Exit codes: 0 done, 1 the work failed, 2 wrong usage.</source>
        <translation>結束代碼：0 完成，1 處理失敗，2 用法錯誤。</translation>
    </message>
    <message>
        <source>Shows this text.</source>
        <translation>顯示此說明。</translation>
    </message>
    <message>
        <source>Measurements: a session of the Measuring Desk.</source>
        <translation>量測資料：Measuring Desk 的工作階段。</translation>
    </message>
    <message>
        <source>Measurements: a table (CSV, TSV, ImageJ results).</source>
        <translation>量測資料：表格（CSV、TSV、ImageJ 結果）。</translation>
    </message>
    <message>
        <source>Unit of the table&apos;s values that state none, or Name=unit for one value. May be given several times.</source>
        <translation>表格中未註明單位的數值的單位，或用「名稱=單位」指定某個數值的單位。可多次指定。</translation>
    </message>
    <message>
        <source>The table&apos;s column with the object types.</source>
        <translation>表格中物件類型所在的欄。</translation>
    </message>
    <message>
        <source>The table&apos;s column with the object names.</source>
        <translation>表格中物件名稱所在的欄。</translation>
    </message>
    <message>
        <source>Decimal mark of the table: point or comma.</source>
        <translation>表格的小數點符號：point 或 comma。</translation>
    </message>
    <message>
        <source>Significant digits of measured values; 0 is automatic.</source>
        <translation>量測值的有效位數；0 為自動。</translation>
    </message>
    <message>
        <source>Output: text, csv or json.</source>
        <translation>輸出：text、csv 或 json。</translation>
    </message>
    <message>
        <source>Output: text or json.</source>
        <translation>輸出：text 或 json。</translation>
    </message>
    <message>
        <source>The report template.</source>
        <translation>報告範本。</translation>
    </message>
    <message>
        <source>The image that was measured.</source>
        <translation>所量測的影像。</translation>
    </message>
    <message>
        <source>The PDF file to write.</source>
        <translation>要寫入的 PDF 檔案。</translation>
    </message>
    <message>
        <source>Groups: object (type and value) or measurement.</source>
        <translation>分組：object（類型和數值名稱）或 measurement。</translation>
    </message>
    <message>
        <source>--format must be %1, not &quot;%2&quot;</source>
        <translation>--format 必須為 %1，而不是「%2」</translation>
    </message>
    <message>
        <source>text, csv or json</source>
        <translation>text、csv 或 json</translation>
    </message>
    <message>
        <source>text or json</source>
        <translation>text 或 json</translation>
    </message>
    <message>
        <source>--group-by must be object or measurement, not &quot;%1&quot;</source>
        <translation>--group-by 必須為 object 或 measurement，而不是「%1」</translation>
    </message>
    <message>
        <source>--digits must be a number from 0 to 15, not &quot;%1&quot;</source>
        <translation>--digits 必須為 0 到 15 的數字，而不是「%1」</translation>
    </message>
    <message>
        <source>give the measurements: either --session or --table</source>
        <translation>請指定量測資料：--session 或 --table</translation>
    </message>
    <message>
        <source>--decimal must be point or comma, not &quot;%1&quot;</source>
        <translation>--decimal 必須為 point 或 comma，而不是「%1」</translation>
    </message>
    <message>
        <source>the template is missing</source>
        <translation>缺少範本</translation>
    </message>
    <message>
        <source>unexpected argument &quot;%1&quot;</source>
        <translation>多餘的引數「%1」</translation>
    </message>
    <message>
        <source>the file to write is missing: -o OUT.pdf</source>
        <translation>缺少要寫入的檔案：-o OUT.pdf</translation>
    </message>
    <message>
        <source>only one file can be read from standard input</source>
        <translation>只能從標準輸入讀取一個檔案</translation>
    </message>
    <message>
        <source>--language must be one of %1, not &quot;%2&quot;</source>
        <translation>--language 必須為 %1 之一，而不是「%2」</translation>
    </message>
    <message>
        <source>a command is missing: render, stats, check or blocks</source>
        <translation>缺少命令：render、stats、check 或 blocks</translation>
    </message>
    <message>
        <source>unknown command &quot;%1&quot;; it must be render, stats, check or blocks</source>
        <translation>未知命令「%1」；必須為 render、stats、check 或 blocks</translation>
    </message>
    <message>
        <source>%1 (statreport --help tells more)</source>
        <translation>%1（詳見 statreport --help）</translation>
    </message>
</context>
<context>
    <name>KvCliSource</name>
    <message>
        <source>&lt;standard input&gt;</source>
        <translation>&lt;標準輸入&gt;</translation>
    </message>
    <message>
        <source>cannot be read</source>
        <translation>無法讀取</translation>
    </message>
</context>
<context>
    <name>KvRenderCommand</name>
    <message>
        <source>is a directory</source>
        <translation>是目錄</translation>
    </message>
    <message>
        <source>the file could not be written completely</source>
        <translation>未能完整寫入檔案</translation>
    </message>
    <message>
        <source>cannot be written: %1</source>
        <translation>無法寫入：%1</translation>
    </message>
</context>
<context>
    <name>KvStatsReport</name>
    <message>
        <source>Object Type</source>
        <translation>物件類型</translation>
    </message>
    <message>
        <source>Measurement Type</source>
        <translation>量測類型</translation>
    </message>
    <message>
        <source>Unit</source>
        <translation>單位</translation>
    </message>
    <message>
        <source>Count</source>
        <translation>計數</translation>
    </message>
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
    <name>KvTemplateCheck</name>
    <message>
        <source>a boolean</source>
        <translation>布林值</translation>
    </message>
    <message>
        <source>a number</source>
        <translation>數字</translation>
    </message>
    <message>
        <source>a string</source>
        <translation>字串</translation>
    </message>
    <message>
        <source>an array</source>
        <translation>陣列</translation>
    </message>
    <message>
        <source>an object</source>
        <translation>JSON 物件</translation>
    </message>
    <message>
        <source>missing</source>
        <translation>未定義</translation>
    </message>
    <message>
        <source>&quot;%1&quot; is missing</source>
        <translation>缺少「%1」</translation>
    </message>
    <message>
        <source>&quot;%1&quot; is %2, not %3</source>
        <translation>「%1」為%2，應為%3</translation>
    </message>
    <message>
        <source>&quot;%1&quot; has a value that the block refuses</source>
        <translation>「%1」的值被區塊拒絕</translation>
    </message>
    <message>
        <source>the block refuses its settings</source>
        <translation>區塊拒絕其設定</translation>
    </message>
    <message>
        <source>cannot be opened: %1</source>
        <translation>無法開啟：%1</translation>
    </message>
    <message>
        <source>cannot be read: %1</source>
        <translation>無法讀取：%1</translation>
    </message>
    <message>
        <source>is larger than 256 MB</source>
        <translation>大於 256 MB</translation>
    </message>
    <message>
        <source>is no JSON: %1</source>
        <translation>不是 JSON：%1</translation>
    </message>
    <message>
        <source>is no template: the JSON document is no object</source>
        <translation>不是範本：JSON 文件不是物件</translation>
    </message>
    <message>
        <source>is %1; the page keeps its defaults</source>
        <translation>為%1；頁面保持預設值</translation>
    </message>
    <message>
        <source>is no whole number of pixels above 0</source>
        <translation>不是大於 0 的整數像素數</translation>
    </message>
    <message>
        <source>page width %1 px</source>
        <translation>頁面寬度 %1 px</translation>
    </message>
    <message>
        <source>is no fraction of the page width from 0 to 0.5</source>
        <translation>不是 0 到 0.5 之間的頁面寬度比例</translation>
    </message>
    <message>
        <source>is %1, not an object; it is off</source>
        <translation>為%1，應為 JSON 物件；保持關閉</translation>
    </message>
    <message>
        <source>is %1, not a boolean; it is off</source>
        <translation>為%1，應為布林值；保持關閉</translation>
    </message>
    <message>
        <source>is %1, not a string; the section is off</source>
        <translation>為%1，應為字串；該部分保持關閉</translation>
    </message>
    <message>
        <source>is %1, not an array; there are no blocks</source>
        <translation>為%1，應為陣列；沒有區塊</translation>
    </message>
    <message>
        <source>is %1, not a string; the block is skipped</source>
        <translation>為%1，應為字串；略過該區塊</translation>
    </message>
    <message>
        <source>there is no block type &quot;%1&quot;; the block is skipped</source>
        <translation>沒有區塊類型「%1」；略過該區塊</translation>
    </message>
    <message>
        <source>is %1, not an object</source>
        <translation>為%1，應為 JSON 物件</translation>
    </message>
    <message>
        <source>block &quot;%1&quot;</source>
        <translation>區塊「%1」</translation>
    </message>
    <message>
        <source>is %1, not %2; it is ignored</source>
        <translation>為%1，應為%2；將被忽略</translation>
    </message>
    <message>
        <source>unknown keyword %1; it stays as it is</source>
        <translation>未知標記 %1；保持原樣</translation>
    </message>
</context>
<context>
    <name>KvTemplateCommands</name>
    <message>
        <source>warning: %1</source>
        <translation>警告：%1</translation>
    </message>
</context>
<context>
    <name>KvTerminalProgress</name>
    <message>
        <source>page %1 of %2</source>
        <translation>第 %1 頁，共 %2 頁</translation>
    </message>
</context>
<context>
    <name>QCommandLineParser</name>
    <message>
        <source>Usage: %1</source>
        <translation>用法：%1</translation>
    </message>
    <message>
        <source>[options]</source>
        <translation>[選項]</translation>
    </message>
    <message>
        <source>Options:</source>
        <translation>選項：</translation>
    </message>
    <message>
        <source>Arguments:</source>
        <translation>引數：</translation>
    </message>
    <message>
        <source>Unknown option &apos;%1&apos;.</source>
        <translation>未知選項「%1」。</translation>
    </message>
    <message>
        <source>Unknown options: %1.</source>
        <translation>未知選項：%1。</translation>
    </message>
    <message>
        <source>Missing value after &apos;%1&apos;.</source>
        <translation>「%1」之後缺少值。</translation>
    </message>
    <message>
        <source>Unexpected value after &apos;%1&apos;.</source>
        <translation>「%1」之後有多餘的值。</translation>
    </message>
</context>
</TS>
