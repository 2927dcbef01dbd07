<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="en_US" sourcelanguage="en_US">
<context>
    <name>KvCliHost</name>
    <message>
        <source>%1: the image %2 is missing</source>
        <translation>%1: the image %2 is missing</translation>
    </message>
</context>
<context>
    <name>KvCliOutput</name>
    <message>
        <source>cannot be written: %1</source>
        <translation>cannot be written: %1</translation>
    </message>
    <message>
        <source>note: %1</source>
        <translation>note: %1</translation>
    </message>
    <message>
        <source>&lt;standard output&gt;</source>
        <translation>&lt;standard output&gt;</translation>
    </message>
</context>
<context>
    <name>KvCliParser</name>
    <message>
        <source>Language of messages and reports, such as German or de; otherwise the system&apos;s.</source>
        <translation>Language of messages and reports, such as German or de; otherwise the system&apos;s.</translation>
    </message>
    <message>
        <source>Prints a report: template and measurements in, PDF out.</source>
        <translation>Prints a report: template and measurements in, PDF out.</translation>
    </message>
    <message>
        <source>Prints the statistics of every measured value, in the table&apos;s own units.</source>
        <translation>Prints the statistics of every measured value, in the table&apos;s own units.</translation>
    </message>
    <message>
        <source>Says what a template holds and what would be skipped or refused.</source>
        <translation>Says what a template holds and what would be skipped or refused.</translation>
    </message>
    <message>
        <source>Lists the block types and their settings with defaults.</source>
        <translation>Lists the block types and their settings with defaults.</translation>
    </message>
    <message>
        <source>Turns measurements and a report template into a PDF report, without a display.</source>
        <translation>Turns measurements and a report template into a PDF report, without a display.</translation>
    </message>
    <message>
        <source>Commands:</source>
        <translation>Commands:</translation>
    </message>
    <message>
        <source>Options everywhere:</source>
        <translation>Options everywhere:</translation>
    </message>
    <message>
        <source>Shows this text, or that of a command.</source>
        <translation>Shows this text, or that of a command.</translation>
    </message>
    <message>
        <source>Shows the version.</source>
        <translation>Shows the version.</translation>
    </message>
    <message>
        <source>Writes no notes and no progress.</source>
        <translation>Writes no notes and no progress.</translation>
    </message>
    <message>
        <source>Writes errors as one line of JSON each.</source>
        <translation>Writes errors as one line of JSON each.</translation>
    </message>
    <message>
        <source>&quot;-&quot; as a file name is standard input or output.</source>
        <translation>&quot;-&quot; as a file name is standard input or output.</translation>
    </message>
    <message>
        <source>Exit codes: 0 done, 1 the work failed, 2 wrong usage.</source>
        <translation>Exit codes: 0 done, 1 the work failed, 2 wrong usage.</translation>
    </message>
    <message>
        <source>Shows this text.</source>
        <translation>Shows this text.</translation>
    </message>
    <message>
        <source>Measurements: a session of the Measuring Desk.</source>
        <translation>Measurements: a session of the Measuring Desk.</translation>
    </message>
    <message>
        <source>Measurements: a table (CSV, TSV, ImageJ results).</source>
        <translation>Measurements: a table (CSV, TSV, ImageJ results).</translation>
    </message>
    <message>
        <source>Unit of the table&apos;s values that state none, or Name=unit for one value. May be given several times.</source>
        <translation>Unit of the table&apos;s values that state none, or Name=unit for one value. May be given several times.</translation>
    </message>
    <message>
        <source>The table&apos;s column with the object types.</source>
        <translation>The table&apos;s column with the object types.</translation>
    </message>
    <message>
        <source>The table&apos;s column with the object names.</source>
        <translation>The table&apos;s column with the object names.</translation>
    </message>
    <message>
        <source>Decimal mark of the table: point or comma.</source>
        <translation>Decimal mark of the table: point or comma.</translation>
    </message>
    <message>
        <source>Significant digits of measured values; 0 is automatic.</source>
        <translation>Significant digits of measured values; 0 is automatic.</translation>
    </message>
    <message>
        <source>Output: text, csv or json.</source>
        <translation>Output: text, csv or json.</translation>
    </message>
    <message>
        <source>Output: text or json.</source>
        <translation>Output: text or json.</translation>
    </message>
    <message>
        <source>The report template.</source>
        <translation>The report template.</translation>
    </message>
    <message>
        <source>The image that was measured.</source>
        <translation>The image that was measured.</translation>
    </message>
    <message>
        <source>The PDF file to write.</source>
        <translation>The PDF file to write.</translation>
    </message>
    <message>
        <source>Groups: object (type and value) or measurement.</source>
        <translation>Groups: object (type and value) or measurement.</translation>
    </message>
    <message>
        <source>--format must be %1, not &quot;%2&quot;</source>
        <translation>--format must be %1, not &quot;%2&quot;</translation>
    </message>
    <message>
        <source>text, csv or json</source>
        <translation>text, csv or json</translation>
    </message>
    <message>
        <source>text or json</source>
        <translation>text or json</translation>
    </message>
    <message>
        <source>--group-by must be object or measurement, not &quot;%1&quot;</source>
        <translation>--group-by must be object or measurement, not &quot;%1&quot;</translation>
    </message>
    <message>
        <source>--digits must be a number from 0 to 15, not &quot;%1&quot;</source>
        <translation>--digits must be a number from 0 to 15, not &quot;%1&quot;</translation>
    </message>
    <message>
        <source>give the measurements: either --session or --table</source>
        <translation>give the measurements: either --session or --table</translation>
    </message>
    <message>
        <source>--decimal must be point or comma, not &quot;%1&quot;</source>
        <translation>--decimal must be point or comma, not &quot;%1&quot;</translation>
    </message>
    <message>
        <source>the template is missing</source>
        <translation>the template is missing</translation>
    </message>
    <message>
        <source>unexpected argument &quot;%1&quot;</source>
        <translation>unexpected argument &quot;%1&quot;</translation>
    </message>
    <message>
        <source>the file to write is missing: -o OUT.pdf</source>
        <translation>the file to write is missing: -o OUT.pdf</translation>
    </message>
    <message>
        <source>only one file can be read from standard input</source>
        <translation>only one file can be read from standard input</translation>
    </message>
    <message>
        <source>--language must be one of %1, not &quot;%2&quot;</source>
        <translation>--language must be one of %1, not &quot;%2&quot;</translation>
    </message>
    <message>
        <source>a command is missing: render, stats, check or blocks</source>
        <translation>a command is missing: render, stats, check or blocks</translation>
    </message>
    <message>
        <source>unknown command &quot;%1&quot;; it must be render, stats, check or blocks</source>
        <translation>unknown command &quot;%1&quot;; it must be render, stats, check or blocks</translation>
    </message>
    <message>
        <source>%1 (statreport --help tells more)</source>
        <translation>%1 (statreport --help tells more)</translation>
    </message>
</context>
<context>
    <name>KvCliSource</name>
    <message>
        <source>&lt;standard input&gt;</source>
        <translation>&lt;standard input&gt;</translation>
    </message>
    <message>
        <source>cannot be read</source>
        <translation>cannot be read</translation>
    </message>
</context>
<context>
    <name>KvRenderCommand</name>
    <message>
        <source>is a directory</source>
        <translation>is a directory</translation>
    </message>
    <message>
        <source>the file could not be written completely</source>
        <translation>the file could not be written completely</translation>
    </message>
    <message>
        <source>cannot be written: %1</source>
        <translation>cannot be written: %1</translation>
    </message>
</context>
<context>
    <name>KvStatsReport</name>
    <message>
        <source>Object Type</source>
        <translation>Object Type</translation>
    </message>
    <message>
        <source>Measurement Type</source>
        <translation>Measurement Type</translation>
    </message>
    <message>
        <source>Unit</source>
        <translation>Unit</translation>
    </message>
    <message>
        <source>Count</source>
        <translation>Count</translation>
    </message>
    <message>
        <source>Min</source>
        <translation>Min</translation>
    </message>
    <message>
        <source>Max</source>
        <translation>Max</translation>
    </message>
    <message>
        <source>Average</source>
        <translation>Average</translation>
    </message>
    <message>
        <source>Sigma</source>
        <translation>Sigma</translation>
    </message>
    <message>
        <source>3 Sigma</source>
        <translation>3 Sigma</translation>
    </message>
    <message>
        <source>6 Sigma</source>
        <translation>6 Sigma</translation>
    </message>
</context>
<context>
    <name>KvTemplateCheck</name>
    <message>
        <source>a boolean</source>
        <translation>a boolean</translation>
    </message>
    <message>
        <source>a number</source>
        <translation>a number</translation>
    </message>
    <message>
        <source>a string</source>
        <translation>a string</translation>
    </message>
    <message>
        <source>an array</source>
        <translation>an array</translation>
    </message>
    <message>
        <source>an object</source>
        <translation>an object</translation>
    </message>
    <message>
        <source>missing</source>
        <translation>missing</translation>
    </message>
    <message>
        <source>&quot;%1&quot; is missing</source>
        <translation>&quot;%1&quot; is missing</translation>
    </message>
    <message>
        <source>&quot;%1&quot; is %2, not %3</source>
        <translation>&quot;%1&quot; is %2, not %3</translation>
    </message>
    <message>
        <source>&quot;%1&quot; has a value that the block refuses</source>
        <translation>&quot;%1&quot; has a value that the block refuses</translation>
    </message>
    <message>
        <source>the block refuses its settings</source>
        <translation>the block refuses its settings</translation>
    </message>
    <message>
        <source>cannot be opened: %1</source>
        <translation>cannot be opened: %1</translation>
    </message>
    <message>
        <source>cannot be read: %1</source>
        <translation>cannot be read: %1</translation>
    </message>
    <message>
        <source>is larger than 256 MB</source>
        <translation>is larger than 256 MB</translation>
    </message>
    <message>
        <source>is no JSON: %1</source>
        <translation>is no JSON: %1</translation>
    </message>
    <message>
        <source>is no template: the JSON document is no object</source>
        <translation>is no template: the JSON document is no object</translation>
    </message>
    <message>
        <source>is %1; the page keeps its defaults</source>
        <translation>is %1; the page keeps its defaults</translation>
    </message>
    <message>
        <source>is no whole number of pixels above 0</source>
        <translation>is no whole number of pixels above 0</translation>
    </message>
    <message>
        <source>page width %1 px</source>
        <translation>page width %1 px</translation>
    </message>
    <message>
        <source>is no fraction of the page width from 0 to 0.5</source>
        <translation>is no fraction of the page width from 0 to 0.5</translation>
    </message>
    <message>
        <source>is %1, not an object; it is off</source>
        <translation>is %1, not an object; it is off</translation>
    </message>
    <message>
        <source>is %1, not a boolean; it is off</source>
        <translation>is %1, not a boolean; it is off</translation>
    </message>
    <message>
        <source>is %1, not a string; the section is off</source>
        <translation>is %1, not a string; the section is off</translation>
    </message>
    <message>
        <source>is %1, not an array; there are no blocks</source>
        <translation>is %1, not an array; there are no blocks</translation>
    </message>
    <message>
        <source>is %1, not a string; the block is skipped</source>
        <translation>is %1, not a string; the block is skipped</translation>
    </message>
    <message>
        <source>there is no block type &quot;%1&quot;; the block is skipped</source>
        <translation>there is no block type &quot;%1&quot;; the block is skipped</translation>
    </message>
    <message>
        <source>is %1, not an object</source>
        <translation>is %1, not an object</translation>
    </message>
    <message>
        <source>block &quot;%1&quot;</source>
        <translation>block &quot;%1&quot;</translation>
    </message>
    <message>
        <source>is %1, not %2; it is ignored</source>
        <translation>is %1, not %2; it is ignored</translation>
    </message>
    <message>
        <source>unknown keyword %1; it stays as it is</source>
        <translation>unknown keyword %1; it stays as it is</translation>
    </message>
</context>
<context>
    <name>KvTemplateCommands</name>
    <message>
        <source>warning: %1</source>
        <translation>warning: %1</translation>
    </message>
</context>
<context>
    <name>KvTerminalProgress</name>
    <message>
        <source>page %1 of %2</source>
        <translation>page %1 of %2</translation>
    </message>
</context>
<context>
    <name>QCommandLineParser</name>
    <message>
        <source>Usage: %1</source>
        <translation>Usage: %1</translation>
    </message>
    <message>
        <source>[options]</source>
        <translation>[options]</translation>
    </message>
    <message>
        <source>Options:</source>
        <translation>Options:</translation>
    </message>
    <message>
        <source>Arguments:</source>
        <translation>Arguments:</translation>
    </message>
    <message>
        <source>Unknown option &apos;%1&apos;.</source>
        <translation>Unknown option &apos;%1&apos;.</translation>
    </message>
    <message>
        <source>Unknown options: %1.</source>
        <translation>Unknown options: %1.</translation>
    </message>
    <message>
        <source>Missing value after &apos;%1&apos;.</source>
        <translation>Missing value after &apos;%1&apos;.</translation>
    </message>
    <message>
        <source>Unexpected value after &apos;%1&apos;.</source>
        <translation>Unexpected value after &apos;%1&apos;.</translation>
    </message>
</context>
</TS>
