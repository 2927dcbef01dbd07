<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="ar_EG" sourcelanguage="en_US">
<context>
    <name>KvCliHost</name>
    <message>
        <source>%1: the image %2 is missing</source>
        <translation>%1: الصورة %2 مفقودة</translation>
    </message>
</context>
<context>
    <name>KvCliOutput</name>
    <message>
        <source>cannot be written: %1</source>
        <translation>تعذرت الكتابة: %1</translation>
    </message>
    <message>
        <source>note: %1</source>
        <translation>ملاحظة: %1</translation>
    </message>
    <message>
        <source>&lt;standard output&gt;</source>
        <translation>&lt;الخرج القياسي&gt;</translation>
    </message>
</context>
<context>
    <name>KvCliParser</name>
    <message>
        <source>Language of messages and reports, such as German or de; otherwise the system&apos;s.</source>
        <translation>لغة الرسائل والتقارير، مثل German أو de؛ وإلا فلغة النظام.</translation>
    </message>
    <message>
        <source>Prints a report: template and measurements in, PDF out.</source>
        <translation>يطبع تقريرًا: قالب وقياسات تعطي ملف PDF.</translation>
    </message>
    <message>
        <source>Prints the statistics of every measured value, in the table&apos;s own units.</source>
        <translation>يعرض إحصاءات كل قيمة مقيسة بوحدات الجدول.</translation>
    </message>
    <message>
        <source>Says what a template holds and what would be skipped or refused.</source>
        <translation>يبيّن محتوى القالب وما سيُتخطى أو يُرفض منه.</translation>
    </message>
    <message>
        <source>Lists the block types and their settings with defaults.</source>
        <translation>يسرد أنواع الكتل وإعداداتها بقيمها الافتراضية.</translation>
    </message>
    <message>
        <source>Turns measurements and a report template into a PDF report, without a display.</source>
        <translation>يحوّل القياسات وقالب التقرير إلى تقرير PDF من دون شاشة.</translation>
    </message>
    <message>
        <source>Commands:</source>
        <translation>الأوامر:</translation>
    </message>
    <message>
        <source>Options everywhere:</source>
        <translation>خيارات عامة:</translation>
    </message>
    <message>
        <source>Shows this text, or that of a command.</source>
        <translation>يعرض هذا النص أو نص أمر معيّن.</translation>
    </message>
    <message>
        <source>Shows the version.</source>
        <translation>يعرض الإصدار.</translation>
    </message>
    <message>
        <source>Writes no notes and no progress.</source>
        <translation>لا يكتب الملاحظات ولا التقدم.</translation>
    </message>
    <message>
        <source>Writes errors as one line of JSON each.</source>
        <translation>يكتب كل خطأ في سطر JSON واحد.</translation>
    </message>
    <message>
        <source>&quot;-&quot; as a file name is standard input or output.</source>
        <translation>«-» بدل اسم الملف تعني الدخل القياسي أو الخرج القياسي.</translation>
    </message>
    <message>
        <source>Exit codes: 0 done, 1 the work failed, 2 wrong usage.</source>
        <translation>رموز الخروج: 0 تم، 1 فشل العمل، 2 استخدام خاطئ.</translation>
    </message>
    <message>
        <source>Shows this text.</source>
        <translation>يعرض هذا النص.</translation>
    </message>
    <message>
        <source>Measurements: a session of the Measuring Desk.</source>
        <translation>القياسات: جلسة من Measuring Desk.</translation>
    </message>
    <message>
        <source>Measurements: a table (CSV, TSV, ImageJ results).</source>
        <translation>القياسات: جدول (CSV أو TSV أو نتائج ImageJ).</translation>
    </message>
    <message>
        <source>Unit of the table&apos;s values that state none, or Name=unit for one value. May be given several times.</source>
        <translation>وحدة قيم الجدول التي لا تذكر وحدة، أو Name=unit لقيمة واحدة. يمكن تكراره.</translation>
    </message>
    <message>
        <source>The table&apos;s column with the object types.</source>
        <translation>عمود الجدول الذي فيه أنواع الكائنات.</translation>
    </message>
    <message>
        <source>The table&apos;s column with the object names.</source>
        <translation>عمود الجدول الذي فيه أسماء الكائنات.</translation>
    </message>
    <message>
        <source>Decimal mark of the table: point or comma.</source>
        <translation>الفاصلة العشرية في الجدول: point أو comma.</translation>
    </message>
    <message>
        <source>Significant digits of measured values; 0 is automatic.</source>
        <translation>الأرقام المعنوية للقيم المقيسة؛ 0 تلقائي.</translation>
    </message>
    <message>
        <source>Output: text, csv or json.</source>
        <translation>الخرج: text أو csv أو json.</translation>
    </message>
    <message>
        <source>Output: text or json.</source>
        <translation>الخرج: text أو json.</translation>
    </message>
    <message>
        <source>The report template.</source>
        <translation>قالب التقرير.</translation>
    </message>
    <message>
        <source>The image that was measured.</source>
        <translation>الصورة التي جرى القياس عليها.</translation>
    </message>
    <message>
        <source>The PDF file to write.</source>
        <translation>ملف PDF المراد كتابته.</translation>
    </message>
    <message>
        <source>Groups: object (type and value) or measurement.</source>
        <translation>المجموعات: object (النوع والقيمة) أو measurement.</translation>
    </message>
    <message>
        <source>--format must be %1, not &quot;%2&quot;</source>
        <translation>يجب أن يكون ‎--format هو %1، لا «%2»</translation>
    </message>
    <message>
        <source>text, csv or json</source>
        <translation>text أو csv أو json</translation>
    </message>
    <message>
        <source>text or json</source>
        <translation>text أو json</translation>
    </message>
    <message>
        <source>--group-by must be object or measurement, not &quot;%1&quot;</source>
        <translation>يجب أن يكون ‎--group-by هو object أو measurement، لا «%1»</translation>
    </message>
    <message>
        <source>--digits must be a number from 0 to 15, not &quot;%1&quot;</source>
        <translation>يجب أن يكون ‎--digits عددًا من 0 إلى 15، لا «%1»</translation>
    </message>
    <message>
        <source>give the measurements: either --session or --table</source>
        <translation>حدد القياسات: إما ‎--session أو ‎--table</translation>
    </message>
    <message>
        <source>--decimal must be point or comma, not &quot;%1&quot;</source>
        <translation>يجب أن يكون ‎--decimal هو point أو comma، لا «%1»</translation>
    </message>
    <message>
        <source>the template is missing</source>
        <translation>القالب مفقود</translation>
    </message>
    <message>
        <source>unexpected argument &quot;%1&quot;</source>
        <translation>وسيط غير متوقع «%1»</translation>
    </message>
    <message>
        <source>the file to write is missing: -o OUT.pdf</source>
        <translation>الملف المراد كتابته مفقود: ‎-o OUT.pdf</translation>
    </message>
    <message>
        <source>only one file can be read from standard input</source>
        <translation>لا يمكن قراءة أكثر من ملف واحد من الدخل القياسي</translation>
    </message>
    <message>
        <source>--language must be one of %1, not &quot;%2&quot;</source>
        <translation>يجب أن يكون ‎--language واحدًا من %1، لا «%2»</translation>
    </message>
    <message>
        <source>a command is missing: render, stats, check or blocks</source>
        <translation>الأمر مفقود: render أو stats أو check أو blocks</translation>
    </message>
    <message>
        <source>unknown command &quot;%1&quot;; it must be render, stats, check or blocks</source>
        <translation>أمر غير معروف «%1»؛ يجب أن يكون render أو stats أو check أو blocks</translation>
    </message>
    <message>
        <source>%1 (statreport --help tells more)</source>
        <translation>%1 (للمزيد: statreport --help)</translation>
    </message>
</context>
<context>
    <name>KvCliSource</name>
    <message>
        <source>&lt;standard input&gt;</source>
        <translation>&lt;الدخل القياسي&gt;</translation>
    </message>
    <message>
        <source>cannot be read</source>
        <translation>تعذرت القراءة</translation>
    </message>
</context>
<context>
    <name>KvRenderCommand</name>
    <message>
        <source>is a directory</source>
        <translation>هذا مجلد</translation>
    </message>
    <message>
        <source>the file could not be written completely</source>
        <translation>تعذرت كتابة الملف كاملًا</translation>
    </message>
    <message>
        <source>cannot be written: %1</source>
        <translation>تعذرت الكتابة: %1</translation>
    </message>
</context>
<context>
    <name>KvStatsReport</name>
    <message>
        <source>Object Type</source>
        <translation>نوع الكائن</translation>
    </message>
    <message>
        <source>Measurement Type</source>
        <translation>نوع القياس</translation>
    </message>
    <message>
        <source>Unit</source>
        <translation>الوحدة</translation>
    </message>
    <message>
        <source>Count</source>
        <translation>العدد</translation>
    </message>
    <message>
        <source>Min</source>
        <translation>الأدنى</translation>
    </message>
    <message>
        <source>Max</source>
        <translation>الأقصى</translation>
    </message>
    <message>
        <source>Average</source>
        <translation>المتوسط</translation>
    </message>
    <message>
        <source>Sigma</source>
        <translation>سيجما</translation>
    </message>
    <message>
        <source>3 Sigma</source>
        <translation>3 سيجما</translation>
    </message>
    <message>
        <source>6 Sigma</source>
        <translation>6 سيجما</translation>
    </message>
</context>
<context>
    <name>KvTemplateCheck</name>
    <message>
        <source>a boolean</source>
        <translation>قيمة منطقية</translation>
    </message>
    <message>
        <source>a number</source>
        <translation>عدد</translation>
    </message>
    <message>
        <source>a string</source>
        <translation>سلسلة نصية</translation>
    </message>
    <message>
        <source>an array</source>
        <translation>مصفوفة</translation>
    </message>
    <message>
        <source>an object</source>
        <translation>كائن JSON</translation>
    </message>
    <message>
        <source>missing</source>
        <translation>لا شيء</translation>
    </message>
    <message>
        <source>&quot;%1&quot; is missing</source>
        <translation>«%1» مفقود</translation>
    </message>
    <message>
        <source>&quot;%1&quot; is %2, not %3</source>
        <translation>«%1»: الموجود %2، والمطلوب %3</translation>
    </message>
    <message>
        <source>&quot;%1&quot; has a value that the block refuses</source>
        <translation>قيمة «%1» ترفضها الكتلة</translation>
    </message>
    <message>
        <source>the block refuses its settings</source>
        <translation>الكتلة ترفض إعداداتها</translation>
    </message>
    <message>
        <source>cannot be opened: %1</source>
        <translation>تعذر الفتح: %1</translation>
    </message>
    <message>
        <source>cannot be read: %1</source>
        <translation>تعذرت القراءة: %1</translation>
    </message>
    <message>
        <source>is larger than 256 MB</source>
        <translation>أكبر من 256 ميغابايت</translation>
    </message>
    <message>
        <source>is no JSON: %1</source>
        <translation>ليس JSON: %1</translation>
    </message>
    <message>
        <source>is no template: the JSON document is no object</source>
        <translation>ليس قالبًا: مستند JSON ليس كائنًا</translation>
    </message>
    <message>
        <source>is %1; the page keeps its defaults</source>
        <translation>الموجود %1؛ تحتفظ الصفحة بقيمها الافتراضية</translation>
    </message>
    <message>
        <source>is no whole number of pixels above 0</source>
        <translation>ليس عددًا صحيحًا من البكسلات أكبر من 0</translation>
    </message>
    <message>
        <source>page width %1 px</source>
        <translation>عرض الصفحة %1 بكسل</translation>
    </message>
    <message>
        <source>is no fraction of the page width from 0 to 0.5</source>
        <translation>ليس كسرًا من عرض الصفحة بين 0 و0.5</translation>
    </message>
    <message>
        <source>is %1, not an object; it is off</source>
        <translation>الموجود %1، والمطلوب كائن JSON؛ يبقى معطلًا</translation>
    </message>
    <message>
        <source>is %1, not a boolean; it is off</source>
        <translation>الموجود %1، والمطلوب قيمة منطقية؛ يبقى معطلًا</translation>
    </message>
    <message>
        <source>is %1, not a string; the section is off</source>
        <translation>الموجود %1، والمطلوب سلسلة نصية؛ يبقى القسم معطلًا</translation>
    </message>
    <message>
        <source>is %1, not an array; there are no blocks</source>
        <translation>الموجود %1، والمطلوب مصفوفة؛ لا توجد كتل</translation>
    </message>
    <message>
        <source>is %1, not a string; the block is skipped</source>
        <translation>الموجود %1، والمطلوب سلسلة نصية؛ تُتخطى الكتلة</translation>
    </message>
    <message>
        <source>there is no block type &quot;%1&quot;; the block is skipped</source>
        <translation>لا يوجد نوع كتلة باسم «%1»؛ تُتخطى الكتلة</translation>
    </message>
    <message>
        <source>is %1, not an object</source>
        <translation>الموجود %1، والمطلوب كائن JSON</translation>
    </message>
    <message>
        <source>block &quot;%1&quot;</source>
        <translation>كتلة «%1»</translation>
    </message>
    <message>
        <source>is %1, not %2; it is ignored</source>
        <translation>الموجود %1، والمطلوب %2؛ يُتجاهل</translation>
    </message>
    <message>
        <source>unknown keyword %1; it stays as it is</source>
        <translation>وسم غير معروف %1؛ يبقى كما هو</translation>
    </message>
</context>
<context>
    <name>KvTemplateCommands</name>
    <message>
        <source>warning: %1</source>
        <translation>تحذير: %1</translation>
    </message>
</context>
<context>
    <name>KvTerminalProgress</name>
    <message>
        <source>page %1 of %2</source>
        <translation>صفحة %1 من %2</translation>
    </message>
</context>
<context>
    <name>QCommandLineParser</name>
    <message>
        <source>Usage: %1</source>
        <translation>الاستخدام: %1</translation>
    </message>
    <message>
        <source>[options]</source>
        <translation>[خيارات]</translation>
    </message>
    <message>
        <source>Options:</source>
        <translation>الخيارات:</translation>
    </message>
    <message>
        <source>Arguments:</source>
        <translation>الوسائط:</translation>
    </message>
    <message>
        <source>Unknown option &apos;%1&apos;.</source>
        <translation>خيار غير معروف «%1».</translation>
    </message>
    <message>
        <source>Unknown options: %1.</source>
        <translation>خيارات غير معروفة: %1.</translation>
    </message>
    <message>
        <source>Missing value after &apos;%1&apos;.</source>
        <translation>القيمة مفقودة بعد «%1».</translation>
    </message>
    <message>
        <source>Unexpected value after &apos;%1&apos;.</source>
        <translation>قيمة غير متوقعة بعد «%1».</translation>
    </message>
</context>
</TS>
