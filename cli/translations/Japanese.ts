<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="ja_JP" sourcelanguage="en_US">
<context>
    <name>KvCliHost</name>
    <message>
        <source>%1: the image %2 is missing</source>
        <translation>%1: 画像 %2 がありません</translation>
    </message>
</context>
<context>
    <name>KvCliOutput</name>
    <message>
        <source>cannot be written: %1</source>
        <translation>書き込めません: %1</translation>
    </message>
    <message>
        <source>note: %1</source>
        <translation>注記: %1</translation>
    </message>
    <message>
        <source>&lt;standard output&gt;</source>
        <translation>&lt;標準出力&gt;</translation>
    </message>
</context>
<context>
    <name>KvCliParser</name>
    <message>
        <source>Language of messages and reports, such as German or de; otherwise the system&apos;s.</source>
        <translation>メッセージとレポートの言語 (German、de など)。指定がなければシステムの言語。</translation>
    </message>
    <message>
        <source>Prints a report: template and measurements in, PDF out.</source>
        <translation>レポートを出力します。テンプレートと測定データから PDF を作成します。</translation>
    </message>
    <message>
        <source>Prints the statistics of every measured value, in the table&apos;s own units.</source>
        <translation>すべての測定値の統計を、表の単位で表示します。</translation>
    </message>
    <message>
        <source>Says what a template holds and what would be skipped or refused.</source>
        <translation>テンプレートの内容と、無視または拒否されるものを表示します。</translation>
    </message>
    <message>
        <source>Lists the block types and their settings with defaults.</source>
        <translation>ブロックの種類と、その設定の既定値を一覧表示します。</translation>
    </message>
    <message>
        <source>Turns measurements and a report template into a PDF report, without a display.</source>
        <translation>測定データとレポートテンプレートから、画面なしで PDF レポートを作成します。</translation>
    </message>
    <message>
        <source>Commands:</source>
        <translation>コマンド:</translation>
    </message>
    <message>
        <source>Options everywhere:</source>
        <translation>共通のオプション:</translation>
    </message>
    <message>
        <source>Shows this text, or that of a command.</source>
        <translation>このテキスト、またはコマンドの説明を表示します。</translation>
    </message>
    <message>
        <source>Shows the version.</source>
        <translation>バージョンを表示します。</translation>
    </message>
    <message>
        <source>Writes no notes and no progress.</source>
        <translation>注記と進行状況を出力しません。</translation>
    </message>
    <message>
        <source>Writes errors as one line of JSON each.</source>
        <translation>エラーを 1 行ずつ JSON で出力します。</translation>
    </message>
    <message>
        <source>&quot;-&quot; as a file name is standard input or output.</source>
        <translation>ファイル名「-」は標準入力または標準出力を表します。</translation>
    </message>
    <message>
        <source>Exit codes: 0 done, 1 the work failed, 2 wrong usage.</source>
        <translation>終了コード: 0 完了、1 処理の失敗、2 使い方の誤り。</translation>
    </message>
    <message>
        <source>Shows this text.</source>
        <translation>このテキストを表示します。</translation>
    </message>
    <message>
        <source>Measurements: a session of the Measuring Desk.</source>
        <translation>測定データ: Measuring Desk のセッション。</translation>
    </message>
    <message>
        <source>Measurements: a table (CSV, TSV, ImageJ results).</source>
        <translation>測定データ: 表 (CSV、TSV、ImageJ の結果)。</translation>
    </message>
    <message>
        <source>Unit of the table&apos;s values that state none, or Name=unit for one value. May be given several times.</source>
        <translation>表で単位のない値の単位。Name=unit とすると 1 つの値だけに適用されます。複数回指定できます。</translation>
    </message>
    <message>
        <source>The table&apos;s column with the object types.</source>
        <translation>オブジェクトの種類が入っている表の列。</translation>
    </message>
    <message>
        <source>The table&apos;s column with the object names.</source>
        <translation>オブジェクトの名前が入っている表の列。</translation>
    </message>
    <message>
        <source>Decimal mark of the table: point or comma.</source>
        <translation>表の小数点記号: point または comma。</translation>
    </message>
    <message>
        <source>Significant digits of measured values; 0 is automatic.</source>
        <translation>測定値の有効桁数。0 は自動。</translation>
    </message>
    <message>
        <source>Output: text, csv or json.</source>
        <translation>出力: text、csv または json。</translation>
    </message>
    <message>
        <source>Output: text or json.</source>
        <translation>出力: text または json。</translation>
    </message>
    <message>
        <source>The report template.</source>
        <translation>レポートテンプレート。</translation>
    </message>
    <message>
        <source>The image that was measured.</source>
        <translation>測定した画像。</translation>
    </message>
    <message>
        <source>The PDF file to write.</source>
        <translation>出力する PDF ファイル。</translation>
    </message>
    <message>
        <source>Groups: object (type and value) or measurement.</source>
        <translation>グループ: object (種類と値) または measurement。</translation>
    </message>
    <message>
        <source>--format must be %1, not &quot;%2&quot;</source>
        <translation>--format は %1 でなければなりません (「%2」は無効)</translation>
    </message>
    <message>
        <source>text, csv or json</source>
        <translation>text、csv または json</translation>
    </message>
    <message>
        <source>text or json</source>
        <translation>text または json</translation>
    </message>
    <message>
        <source>--group-by must be object or measurement, not &quot;%1&quot;</source>
        <translation>--group-by は object または measurement でなければなりません (「%1」は無効)</translation>
    </message>
    <message>
        <source>--digits must be a number from 0 to 15, not &quot;%1&quot;</source>
        <translation>--digits は 0 から 15 までの数値でなければなりません (「%1」は無効)</translation>
    </message>
    <message>
        <source>give the measurements: either --session or --table</source>
        <translation>測定データを --session または --table で指定してください</translation>
    </message>
    <message>
        <source>--decimal must be point or comma, not &quot;%1&quot;</source>
        <translation>--decimal は point または comma でなければなりません (「%1」は無効)</translation>
    </message>
    <message>
        <source>the template is missing</source>
        <translation>テンプレートが指定されていません</translation>
    </message>
    <message>
        <source>unexpected argument &quot;%1&quot;</source>
        <translation>余分な引数「%1」</translation>
    </message>
    <message>
        <source>the file to write is missing: -o OUT.pdf</source>
        <translation>出力ファイルが指定されていません: -o OUT.pdf</translation>
    </message>
    <message>
        <source>only one file can be read from standard input</source>
        <translation>標準入力から読み取れるファイルは 1 つだけです</translation>
    </message>
    <message>
        <source>--language must be one of %1, not &quot;%2&quot;</source>
        <translation>--language は %1 のいずれかでなければなりません (「%2」は無効)</translation>
    </message>
    <message>
        <source>a command is missing: render, stats, check or blocks</source>
        <translation>コマンドが指定されていません: render、stats、check または blocks</translation>
    </message>
    <message>
        <source>unknown command &quot;%1&quot;; it must be render, stats, check or blocks</source>
        <translation>不明なコマンド「%1」。render、stats、check、blocks のいずれかを指定してください</translation>
    </message>
    <message>
        <source>%1 (statreport --help tells more)</source>
        <translation>%1 (詳細は statreport --help)</translation>
    </message>
</context>
<context>
    <name>KvCliSource</name>
    <message>
        <source>&lt;standard input&gt;</source>
        <translation>&lt;標準入力&gt;</translation>
    </message>
    <message>
        <source>cannot be read</source>
        <translation>読み取れません</translation>
    </message>
</context>
<context>
    <name>KvRenderCommand</name>
    <message>
        <source>is a directory</source>
        <translation>フォルダーです</translation>
    </message>
    <message>
        <source>the file could not be written completely</source>
        <translation>ファイルを最後まで書き込めませんでした</translation>
    </message>
    <message>
        <source>cannot be written: %1</source>
        <translation>書き込めません: %1</translation>
    </message>
</context>
<context>
    <name>KvStatsReport</name>
    <message>
        <source>Object Type</source>
        <translation>オブジェクトの種類</translation>
    </message>
    <message>
        <source>Measurement Type</source>
        <translation>測定項目</translation>
    </message>
    <message>
        <source>Unit</source>
        <translation>単位</translation>
    </message>
    <message>
        <source>Count</source>
        <translation>個数</translation>
    </message>
    <message>
        <source>Min</source>
        <translation>最小</translation>
    </message>
    <message>
        <source>Max</source>
        <translation>最大</translation>
    </message>
    <message>
        <source>Average</source>
        <translation>平均</translation>
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
        <translation>真偽値</translation>
    </message>
    <message>
        <source>a number</source>
        <translation>数値</translation>
    </message>
    <message>
        <source>a string</source>
        <translation>文字列</translation>
    </message>
    <message>
        <source>an array</source>
        <translation>配列</translation>
    </message>
    <message>
        <source>an object</source>
        <translation>JSON オブジェクト</translation>
    </message>
    <message>
        <source>missing</source>
        <translation>なし</translation>
    </message>
    <message>
        <source>&quot;%1&quot; is missing</source>
        <translation>「%1」がありません</translation>
    </message>
    <message>
        <source>&quot;%1&quot; is %2, not %3</source>
        <translation>「%1」の型: %2、必要な型: %3</translation>
    </message>
    <message>
        <source>&quot;%1&quot; has a value that the block refuses</source>
        <translation>「%1」の値をブロックが受け付けません</translation>
    </message>
    <message>
        <source>the block refuses its settings</source>
        <translation>ブロックが設定を受け付けません</translation>
    </message>
    <message>
        <source>cannot be opened: %1</source>
        <translation>開けません: %1</translation>
    </message>
    <message>
        <source>cannot be read: %1</source>
        <translation>読み取れません: %1</translation>
    </message>
    <message>
        <source>is larger than 256 MB</source>
        <translation>256 MB を超えています</translation>
    </message>
    <message>
        <source>is no JSON: %1</source>
        <translation>JSON ではありません: %1</translation>
    </message>
    <message>
        <source>is no template: the JSON document is no object</source>
        <translation>テンプレートではありません: 最上位が JSON オブジェクトではありません</translation>
    </message>
    <message>
        <source>is %1; the page keeps its defaults</source>
        <translation>実際の型: %1。ページは既定値のままです</translation>
    </message>
    <message>
        <source>is no whole number of pixels above 0</source>
        <translation>0 より大きい整数のピクセル数ではありません</translation>
    </message>
    <message>
        <source>page width %1 px</source>
        <translation>ページ幅 %1 px</translation>
    </message>
    <message>
        <source>is no fraction of the page width from 0 to 0.5</source>
        <translation>ページ幅に対する 0 から 0.5 までの割合ではありません</translation>
    </message>
    <message>
        <source>is %1, not an object; it is off</source>
        <translation>実際の型: %1、必要な型: JSON オブジェクト。オフになります</translation>
    </message>
    <message>
        <source>is %1, not a boolean; it is off</source>
        <translation>実際の型: %1、必要な型: 真偽値。オフになります</translation>
    </message>
    <message>
        <source>is %1, not a string; the section is off</source>
        <translation>実際の型: %1、必要な型: 文字列。セクションはオフになります</translation>
    </message>
    <message>
        <source>is %1, not an array; there are no blocks</source>
        <translation>実際の型: %1、必要な型: 配列。ブロックはありません</translation>
    </message>
    <message>
        <source>is %1, not a string; the block is skipped</source>
        <translation>実際の型: %1、必要な型: 文字列。ブロックは無視されます</translation>
    </message>
    <message>
        <source>there is no block type &quot;%1&quot;; the block is skipped</source>
        <translation>ブロックの種類「%1」はありません。ブロックは無視されます</translation>
    </message>
    <message>
        <source>is %1, not an object</source>
        <translation>実際の型: %1、必要な型: JSON オブジェクト</translation>
    </message>
    <message>
        <source>block &quot;%1&quot;</source>
        <translation>ブロック「%1」</translation>
    </message>
    <message>
        <source>is %1, not %2; it is ignored</source>
        <translation>実際の型: %1、必要な型: %2。無視されます</translation>
    </message>
    <message>
        <source>unknown keyword %1; it stays as it is</source>
        <translation>不明なタグ %1 はそのまま残ります</translation>
    </message>
</context>
<context>
    <name>KvTemplateCommands</name>
    <message>
        <source>warning: %1</source>
        <translation>警告: %1</translation>
    </message>
</context>
<context>
    <name>KvTerminalProgress</name>
    <message>
        <source>page %1 of %2</source>
        <translation>%1 / %2 ページ</translation>
    </message>
</context>
<context>
    <name>QCommandLineParser</name>
    <message>
        <source>Usage: %1</source>
        <translation>使用法: %1</translation>
    </message>
    <message>
        <source>[options]</source>
        <translation>[オプション]</translation>
    </message>
    <message>
        <source>Options:</source>
        <translation>オプション:</translation>
    </message>
    <message>
        <source>Arguments:</source>
        <translation>引数:</translation>
    </message>
    <message>
        <source>Unknown option &apos;%1&apos;.</source>
        <translation>不明なオプション「%1」です。</translation>
    </message>
    <message>
        <source>Unknown options: %1.</source>
        <translation>不明なオプション: %1。</translation>
    </message>
    <message>
        <source>Missing value after &apos;%1&apos;.</source>
        <translation>「%1」の後に値がありません。</translation>
    </message>
    <message>
        <source>Unexpected value after &apos;%1&apos;.</source>
        <translation>「%1」の後の値は不要です。</translation>
    </message>
</context>
</TS>
