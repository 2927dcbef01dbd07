<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="zh_CN" sourcelanguage="en_US">
<context>
    <name>KvCliHost</name>
    <message>
        <source>%1: the image %2 is missing</source>
        <translation>%1：缺少图像 %2</translation>
    </message>
</context>
<context>
    <name>KvCliOutput</name>
    <message>
        <source>cannot be written: %1</source>
        <translation>无法写入：%1</translation>
    </message>
    <message>
        <source>note: %1</source>
        <translation>提示：%1</translation>
    </message>
    <message>
        <source>&lt;standard output&gt;</source>
        <translation>&lt;标准输出&gt;</translation>
    </message>
</context>
<context>
    <name>KvCliParser</name>
    <message>
        <source>Language of messages and reports, such as German or de; otherwise the system&apos;s.</source>
        <translation>消息和报告的语言，例如 German 或 de；未指定时使用系统语言。</translation>
    </message>
    <message>
        <source>Prints a report: template and measurements in, PDF out.</source>
        <translation>打印报告：由模板和测量数据生成 PDF。</translation>
    </message>
    <message>
        <source>Prints the statistics of every measured value, in the table&apos;s own units.</source>
        <translation>按表格自身的单位输出每个测量值的统计。</translation>
    </message>
    <message>
        <source>Says what a template holds and what would be skipped or refused.</source>
        <translation>说明模板的内容，以及哪些会被跳过或拒绝。</translation>
    </message>
    <message>
        <source>Lists the block types and their settings with defaults.</source>
        <translation>列出区块类型及其设置的默认值。</translation>
    </message>
    <message>
        <source>Turns measurements and a report template into a PDF report, without a display.</source>
        <translation>由测量数据和报告模板生成 PDF 报告，无需图形界面。</translation>
    </message>
    <message>
        <source>Commands:</source>
        <translation>命令：</translation>
    </message>
    <message>
        <source>Options everywhere:</source>
        <translation>通用选项：</translation>
    </message>
    <message>
        <source>Shows this text, or that of a command.</source>
        <translation>显示此帮助，或某个命令的帮助。</translation>
    </message>
    <message>
        <source>Shows the version.</source>
        <translation>显示版本。</translation>
    </message>
    <message>
        <source>Writes no notes and no progress.</source>
        <translation>不输出提示和进度。</translation>
    </message>
    <message>
        <source>Writes errors as one line of JSON each.</source>
        <translation>每个错误输出为一行 JSON。</translation>
    </message>
    <message>
        <source>&quot;-&quot; as a file name is standard input or output.</source>
        <translation>文件名“-”表示标准输入或标准输出。</translation>
    </message>
    <message>
        <source>Exit codes: 0 done, 1 the work failed, 2 wrong usage.</source>
        <translation>退出代码：0 完成，1 处理失败，2 用法错误。</translation>
    </message>
    <message>
        <source>Shows this text.</source>
        <translation>显示此帮助。</translation>
    </message>
    <message>
        <source>Measurements: a session of the Measuring Desk.</source>
        <translation>测量数据：Measuring Desk 的会话。</translation>
    </message>
    <message>
        <source>Measurements: a table (CSV, TSV, ImageJ results).</source>
        <translation>测量数据：表格（CSV、TSV、ImageJ 结果）。</translation>
    </message>
    <message>
        <source>Unit of the table&apos;s values that state none, or Name=unit for one value. May be given several times.</source>
        <translation>表格中未注明单位的数值的单位，或用“名称=单位”指定某个数值的单位。可多次指定。</translation>
    </message>
    <message>
        <source>The table&apos;s column with the object types.</source>
        <translation>表格中对象类型所在的列。</translation>
    </message>
    <message>
        <source>The table&apos;s column with the object names.</source>
        <translation>表格中对象名称所在的列。</translation>
    </message>
    <message>
        <source>Decimal mark of the table: point or comma.</source>
        <translation>表格的小数点符号：point 或 comma。</translation>
    </message>
    <message>
        <source>Significant digits of measured values; 0 is automatic.</source>
        <translation>测量值的有效数字位数；0 为自动。</translation>
    </message>
    <message>
        <source>Output: text, csv or json.</source>
        <translation>输出：text、csv 或 json。</translation>
    </message>
    <message>
        <source>Output: text or json.</source>
        <translation>输出：text 或 json。</translation>
    </message>
    <message>
        <source>The report template.</source>
        <translation>报告模板。</translation>
    </message>
    <message>
        <source>The image that was measured.</source>
        <translation>所测量的图像。</translation>
    </message>
    <message>
        <source>The PDF file to write.</source>
        <translation>要写入的 PDF 文件。</translation>
    </message>
    <message>
        <source>Groups: object (type and value) or measurement.</source>
        <translation>分组：object（类型和数值名称）或 measurement。</translation>
    </message>
    <message>
        <source>--format must be %1, not &quot;%2&quot;</source>
        <translation>--format 必须为 %1，而不是“%2”</translation>
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
        <translation>--group-by 必须为 object 或 measurement，而不是“%1”</translation>
    </message>
    <message>
        <source>--digits must be a number from 0 to 15, not &quot;%1&quot;</source>
        <translation>--digits 必须为 0 到 15 的数字，而不是“%1”</translation>
    </message>
    <message>
        <source>give the measurements: either --session or --table</source>
        <translation>请指定测量数据：--session 或 --table</translation>
    </message>
    <message>
        <source>--decimal must be point or comma, not &quot;%1&quot;</source>
        <translation>--decimal 必须为 point 或 comma，而不是“%1”</translation>
    </message>
    <message>
        <source>the template is missing</source>
        <translation>缺少模板</translation>
    </message>
    <message>
        <source>unexpected argument &quot;%1&quot;</source>
        <translation>多余的参数“%1”</translation>
    </message>
    <message>
        <source>the file to write is missing: -o OUT.pdf</source>
        <translation>缺少要写入的文件：-o OUT.pdf</translation>
    </message>
    <message>
        <source>only one file can be read from standard input</source>
        <translation>只能从标准输入读取一个文件</translation>
    </message>
    <message>
        <source>--language must be one of %1, not &quot;%2&quot;</source>
        <translation>--language 必须为 %1 之一，而不是“%2”</translation>
    </message>
    <message>
        <source>a command is missing: render, stats, check or blocks</source>
        <translation>缺少命令：render、stats、check 或 blocks</translation>
    </message>
    <message>
        <source>unknown command &quot;%1&quot;; it must be render, stats, check or blocks</source>
        <translation>未知命令“%1”；必须为 render、stats、check 或 blocks</translation>
    </message>
    <message>
        <source>%1 (statreport --help tells more)</source>
        <translation>%1（详见 statreport --help）</translation>
    </message>
</context>
<context>
    <name>KvCliSource</name>
    <message>
        <source>&lt;standard input&gt;</source>
        <translation>&lt;标准输入&gt;</translation>
    </message>
    <message>
        <source>cannot be read</source>
        <translation>无法读取</translation>
    </message>
</context>
<context>
    <name>KvRenderCommand</name>
    <message>
        <source>is a directory</source>
        <translation>是目录</translation>
    </message>
    <message>
        <source>the file could not be written completely</source>
        <translation>未能完整写入文件</translation>
    </message>
    <message>
        <source>cannot be written: %1</source>
        <translation>无法写入：%1</translation>
    </message>
</context>
<context>
    <name>KvStatsReport</name>
    <message>
        <source>Object Type</source>
        <translation>对象类型</translation>
    </message>
    <message>
        <source>Measurement Type</source>
        <translation>测量类型</translation>
    </message>
    <message>
        <source>Unit</source>
        <translation>单位</translation>
    </message>
    <message>
        <source>Count</source>
        <translation>计数</translation>
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
        <translation>布尔值</translation>
    </message>
    <message>
        <source>a number</source>
        <translation>数字</translation>
    </message>
    <message>
        <source>a string</source>
        <translation>字符串</translation>
    </message>
    <message>
        <source>an array</source>
        <translation>数组</translation>
    </message>
    <message>
        <source>an object</source>
        <translation>JSON 对象</translation>
    </message>
    <message>
        <source>missing</source>
        <translation>未定义</translation>
    </message>
    <message>
        <source>&quot;%1&quot; is missing</source>
        <translation>缺少“%1”</translation>
    </message>
    <message>
        <source>&quot;%1&quot; is %2, not %3</source>
        <translation>“%1”为%2，应为%3</translation>
    </message>
    <message>
        <source>&quot;%1&quot; has a value that the block refuses</source>
        <translation>“%1”的值被区块拒绝</translation>
    </message>
    <message>
        <source>the block refuses its settings</source>
        <translation>区块拒绝其设置</translation>
    </message>
    <message>
        <source>cannot be opened: %1</source>
        <translation>无法打开：%1</translation>
    </message>
    <message>
        <source>cannot be read: %1</source>
        <translation>无法读取：%1</translation>
    </message>
    <message>
        <source>is larger than 256 MB</source>
        <translation>大于 256 MB</translation>
    </message>
    <message>
        <source>is no JSON: %1</source>
        <translation>不是 JSON：%1</translation>
    </message>
    <message>
        <source>is no template: the JSON document is no object</source>
        <translation>不是模板：JSON 文档不是对象</translation>
    </message>
    <message>
        <source>is %1; the page keeps its defaults</source>
        <translation>为%1；页面保持默认值</translation>
    </message>
    <message>
        <source>is no whole number of pixels above 0</source>
        <translation>不是大于 0 的整数像素数</translation>
    </message>
    <message>
        <source>page width %1 px</source>
        <translation>页面宽度 %1 px</translation>
    </message>
    <message>
        <source>is no fraction of the page width from 0 to 0.5</source>
        <translation>不是 0 到 0.5 之间的页面宽度比例</translation>
    </message>
    <message>
        <source>is %1, not an object; it is off</source>
        <translation>为%1，应为 JSON 对象；保持关闭</translation>
    </message>
    <message>
        <source>is %1, not a boolean; it is off</source>
        <translation>为%1，应为布尔值；保持关闭</translation>
    </message>
    <message>
        <source>is %1, not a string; the section is off</source>
        <translation>为%1，应为字符串；该部分保持关闭</translation>
    </message>
    <message>
        <source>is %1, not an array; there are no blocks</source>
        <translation>为%1，应为数组；没有区块</translation>
    </message>
    <message>
        <source>is %1, not a string; the block is skipped</source>
        <translation>为%1，应为字符串；跳过该区块</translation>
    </message>
    <message>
        <source>there is no block type &quot;%1&quot;; the block is skipped</source>
        <translation>没有区块类型“%1”；跳过该区块</translation>
    </message>
    <message>
        <source>is %1, not an object</source>
        <translation>为%1，应为 JSON 对象</translation>
    </message>
    <message>
        <source>block &quot;%1&quot;</source>
        <translation>区块“%1”</translation>
    </message>
    <message>
        <source>is %1, not %2; it is ignored</source>
        <translation>为%1，应为%2；将被忽略</translation>
    </message>
    <message>
        <source>unknown keyword %1; it stays as it is</source>
        <translation>未知标记 %1；保持原样</translation>
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
        <translation>第 %1 页，共 %2 页</translation>
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
        <translation>[选项]</translation>
    </message>
    <message>
        <source>Options:</source>
        <translation>选项：</translation>
    </message>
    <message>
        <source>Arguments:</source>
        <translation>参数：</translation>
    </message>
    <message>
        <source>Unknown option &apos;%1&apos;.</source>
        <translation>未知选项“%1”。</translation>
    </message>
    <message>
        <source>Unknown options: %1.</source>
        <translation>未知选项：%1。</translation>
    </message>
    <message>
        <source>Missing value after &apos;%1&apos;.</source>
        <translation>“%1”之后缺少值。</translation>
    </message>
    <message>
        <source>Unexpected value after &apos;%1&apos;.</source>
        <translation>“%1”之后有多余的值。</translation>
    </message>
</context>
</TS>
