<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="ru_RU" sourcelanguage="en_US">
<context>
    <name>KvCliHost</name>
    <message>
        <source>%1: the image %2 is missing</source>
        <translation>%1: нет изображения %2</translation>
    </message>
</context>
<context>
    <name>KvCliOutput</name>
    <message>
        <source>cannot be written: %1</source>
        <translation>не удаётся записать: %1</translation>
    </message>
    <message>
        <source>note: %1</source>
        <translation>примечание: %1</translation>
    </message>
    <message>
        <source>&lt;standard output&gt;</source>
        <translation>&lt;стандартный вывод&gt;</translation>
    </message>
</context>
<context>
    <name>KvCliParser</name>
    <message>
        <source>Language of messages and reports, such as German or de; otherwise the system&apos;s.</source>
        <translation>Язык сообщений и отчётов, например German или de; иначе язык системы.</translation>
    </message>
    <message>
        <source>Prints a report: template and measurements in, PDF out.</source>
        <translation>Печатает отчёт: из шаблона и измерений получается PDF.</translation>
    </message>
    <message>
        <source>Prints the statistics of every measured value, in the table&apos;s own units.</source>
        <translation>Выводит статистику каждого измеренного значения в единицах таблицы.</translation>
    </message>
    <message>
        <source>Says what a template holds and what would be skipped or refused.</source>
        <translation>Сообщает, что содержит шаблон и что будет пропущено или отклонено.</translation>
    </message>
    <message>
        <source>Lists the block types and their settings with defaults.</source>
        <translation>Перечисляет типы блоков и их параметры со значениями по умолчанию.</translation>
    </message>
    <message>
        <source>Turns measurements and a report template into a PDF report, without a display.</source>
        <translation>Создаёт отчёт PDF из измерений и шаблона отчёта; дисплей не требуется.</translation>
    </message>
    <message>
        <source>Commands:</source>
        <translation>Команды:</translation>
    </message>
    <message>
        <source>Options everywhere:</source>
        <translation>Общие параметры:</translation>
    </message>
    <message>
        <source>Shows this text, or that of a command.</source>
        <translation>Показывает этот текст или справку по команде.</translation>
    </message>
    <message>
        <source>Shows the version.</source>
        <translation>Показывает версию.</translation>
    </message>
    <message>
        <source>Writes no notes and no progress.</source>
        <translation>Не выводит примечания и ход работы.</translation>
    </message>
    <message>
        <source>Writes errors as one line of JSON each.</source>
        <translation>Выводит каждую ошибку одной строкой JSON.</translation>
    </message>
    <message>
        <source>&quot;-&quot; as a file name is standard input or output.</source>
        <translation>«-» вместо имени файла означает стандартный ввод или вывод.</translation>
    </message>
    <message>
        <source>Exit codes: 0 done, 1 the work failed, 2 wrong usage.</source>
        <translation>Коды завершения: 0 — готово, 1 — сбой при выполнении, 2 — неверный вызов.</translation>
    </message>
    <message>
        <source>Shows this text.</source>
        <translation>Показывает этот текст.</translation>
    </message>
    <message>
        <source>Measurements: a session of the Measuring Desk.</source>
        <translation>Измерения: сеанс Measuring Desk.</translation>
    </message>
    <message>
        <source>Measurements: a table (CSV, TSV, ImageJ results).</source>
        <translation>Измерения: таблица (CSV, TSV, результаты ImageJ).</translation>
    </message>
    <message>
        <source>Unit of the table&apos;s values that state none, or Name=unit for one value. May be given several times.</source>
        <translation>Единица значений таблицы, у которых её нет, или Имя=единица для одного значения. Можно указать несколько раз.</translation>
    </message>
    <message>
        <source>The table&apos;s column with the object types.</source>
        <translation>Столбец таблицы с типами объектов.</translation>
    </message>
    <message>
        <source>The table&apos;s column with the object names.</source>
        <translation>Столбец таблицы с именами объектов.</translation>
    </message>
    <message>
        <source>Decimal mark of the table: point or comma.</source>
        <translation>Десятичный разделитель таблицы: point или comma.</translation>
    </message>
    <message>
        <source>Significant digits of measured values; 0 is automatic.</source>
        <translation>Значащие цифры измеренных значений; 0 — автоматически.</translation>
    </message>
    <message>
        <source>Output: text, csv or json.</source>
        <translation>Вывод: text, csv или json.</translation>
    </message>
    <message>
        <source>Output: text or json.</source>
        <translation>Вывод: text или json.</translation>
    </message>
    <message>
        <source>The report template.</source>
        <translation>Шаблон отчёта.</translation>
    </message>
    <message>
        <source>The image that was measured.</source>
        <translation>Изображение, на котором измеряли.</translation>
    </message>
    <message>
        <source>The PDF file to write.</source>
        <translation>Создаваемый файл PDF.</translation>
    </message>
    <message>
        <source>Groups: object (type and value) or measurement.</source>
        <translation>Группы: object (тип и величина) или measurement.</translation>
    </message>
    <message>
        <source>--format must be %1, not &quot;%2&quot;</source>
        <translation>--format: допустимо %1, а не «%2»</translation>
    </message>
    <message>
        <source>text, csv or json</source>
        <translation>text, csv или json</translation>
    </message>
    <message>
        <source>text or json</source>
        <translation>text или json</translation>
    </message>
    <message>
        <source>--group-by must be object or measurement, not &quot;%1&quot;</source>
        <translation>--group-by: допустимо object или measurement, а не «%1»</translation>
    </message>
    <message>
        <source>--digits must be a number from 0 to 15, not &quot;%1&quot;</source>
        <translation>--digits: допустимо число от 0 до 15, а не «%1»</translation>
    </message>
    <message>
        <source>give the measurements: either --session or --table</source>
        <translation>укажите измерения: --session или --table</translation>
    </message>
    <message>
        <source>--decimal must be point or comma, not &quot;%1&quot;</source>
        <translation>--decimal: допустимо point или comma, а не «%1»</translation>
    </message>
    <message>
        <source>the template is missing</source>
        <translation>не указан шаблон</translation>
    </message>
    <message>
        <source>unexpected argument &quot;%1&quot;</source>
        <translation>лишний аргумент «%1»</translation>
    </message>
    <message>
        <source>the file to write is missing: -o OUT.pdf</source>
        <translation>не указан создаваемый файл: -o OUT.pdf</translation>
    </message>
    <message>
        <source>only one file can be read from standard input</source>
        <translation>из стандартного ввода можно прочитать только один файл</translation>
    </message>
    <message>
        <source>--language must be one of %1, not &quot;%2&quot;</source>
        <translation>--language: допустимые значения: %1, а не «%2»</translation>
    </message>
    <message>
        <source>a command is missing: render, stats, check or blocks</source>
        <translation>не указана команда: render, stats, check или blocks</translation>
    </message>
    <message>
        <source>unknown command &quot;%1&quot;; it must be render, stats, check or blocks</source>
        <translation>неизвестная команда «%1»; допустимы render, stats, check и blocks</translation>
    </message>
    <message>
        <source>%1 (statreport --help tells more)</source>
        <translation>%1 (подробнее: statreport --help)</translation>
    </message>
</context>
<context>
    <name>KvCliSource</name>
    <message>
        <source>&lt;standard input&gt;</source>
        <translation>&lt;стандартный ввод&gt;</translation>
    </message>
    <message>
        <source>cannot be read</source>
        <translation>не удаётся прочитать</translation>
    </message>
</context>
<context>
    <name>KvRenderCommand</name>
    <message>
        <source>is a directory</source>
        <translation>это папка</translation>
    </message>
    <message>
        <source>the file could not be written completely</source>
        <translation>файл не удалось записать полностью</translation>
    </message>
    <message>
        <source>cannot be written: %1</source>
        <translation>не удаётся записать: %1</translation>
    </message>
</context>
<context>
    <name>KvStatsReport</name>
    <message>
        <source>Object Type</source>
        <translation>Тип объекта</translation>
    </message>
    <message>
        <source>Measurement Type</source>
        <translation>Вид измерения</translation>
    </message>
    <message>
        <source>Unit</source>
        <translation>Единица</translation>
    </message>
    <message>
        <source>Count</source>
        <translation>Количество</translation>
    </message>
    <message>
        <source>Min</source>
        <translation>Мин.</translation>
    </message>
    <message>
        <source>Max</source>
        <translation>Макс.</translation>
    </message>
    <message>
        <source>Average</source>
        <translation>Среднее</translation>
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
        <translation>логическое значение</translation>
    </message>
    <message>
        <source>a number</source>
        <translation>число</translation>
    </message>
    <message>
        <source>a string</source>
        <translation>строка</translation>
    </message>
    <message>
        <source>an array</source>
        <translation>массив</translation>
    </message>
    <message>
        <source>an object</source>
        <translation>объект</translation>
    </message>
    <message>
        <source>missing</source>
        <translation>ничего</translation>
    </message>
    <message>
        <source>&quot;%1&quot; is missing</source>
        <translation>нет «%1»</translation>
    </message>
    <message>
        <source>&quot;%1&quot; is %2, not %3</source>
        <translation>«%1»: найдено: %2, ожидается: %3</translation>
    </message>
    <message>
        <source>&quot;%1&quot; has a value that the block refuses</source>
        <translation>у «%1» значение, которое блок не принимает</translation>
    </message>
    <message>
        <source>the block refuses its settings</source>
        <translation>блок не принимает свои параметры</translation>
    </message>
    <message>
        <source>cannot be opened: %1</source>
        <translation>не удаётся открыть: %1</translation>
    </message>
    <message>
        <source>cannot be read: %1</source>
        <translation>не удаётся прочитать: %1</translation>
    </message>
    <message>
        <source>is larger than 256 MB</source>
        <translation>больше 256 МБ</translation>
    </message>
    <message>
        <source>is no JSON: %1</source>
        <translation>это не JSON: %1</translation>
    </message>
    <message>
        <source>is no template: the JSON document is no object</source>
        <translation>это не шаблон: документ JSON не является объектом</translation>
    </message>
    <message>
        <source>is %1; the page keeps its defaults</source>
        <translation>найдено: %1; страница сохраняет значения по умолчанию</translation>
    </message>
    <message>
        <source>is no whole number of pixels above 0</source>
        <translation>это не целое число пикселей больше 0</translation>
    </message>
    <message>
        <source>page width %1 px</source>
        <translation>ширина страницы %1 px</translation>
    </message>
    <message>
        <source>is no fraction of the page width from 0 to 0.5</source>
        <translation>это не доля ширины страницы от 0 до 0,5</translation>
    </message>
    <message>
        <source>is %1, not an object; it is off</source>
        <translation>найдено: %1, ожидается: объект; выключено</translation>
    </message>
    <message>
        <source>is %1, not a boolean; it is off</source>
        <translation>найдено: %1, ожидается: логическое значение; выключено</translation>
    </message>
    <message>
        <source>is %1, not a string; the section is off</source>
        <translation>найдено: %1, ожидается: строка; раздел выключен</translation>
    </message>
    <message>
        <source>is %1, not an array; there are no blocks</source>
        <translation>найдено: %1, ожидается: массив; блоков нет</translation>
    </message>
    <message>
        <source>is %1, not a string; the block is skipped</source>
        <translation>найдено: %1, ожидается: строка; блок пропущен</translation>
    </message>
    <message>
        <source>there is no block type &quot;%1&quot;; the block is skipped</source>
        <translation>типа блока «%1» нет; блок пропущен</translation>
    </message>
    <message>
        <source>is %1, not an object</source>
        <translation>найдено: %1, ожидается: объект</translation>
    </message>
    <message>
        <source>block &quot;%1&quot;</source>
        <translation>блок «%1»</translation>
    </message>
    <message>
        <source>is %1, not %2; it is ignored</source>
        <translation>найдено: %1, ожидается: %2; не учитывается</translation>
    </message>
    <message>
        <source>unknown keyword %1; it stays as it is</source>
        <translation>неизвестное поле %1; остаётся как есть</translation>
    </message>
</context>
<context>
    <name>KvTemplateCommands</name>
    <message>
        <source>warning: %1</source>
        <translation>предупреждение: %1</translation>
    </message>
</context>
<context>
    <name>KvTerminalProgress</name>
    <message>
        <source>page %1 of %2</source>
        <translation>страница %1 из %2</translation>
    </message>
</context>
<context>
    <name>QCommandLineParser</name>
    <message>
        <source>Usage: %1</source>
        <translation>Использование: %1</translation>
    </message>
    <message>
        <source>[options]</source>
        <translation>[параметры]</translation>
    </message>
    <message>
        <source>Options:</source>
        <translation>Параметры:</translation>
    </message>
    <message>
        <source>Arguments:</source>
        <translation>Аргументы:</translation>
    </message>
    <message>
        <source>Unknown option &apos;%1&apos;.</source>
        <translation>Неизвестный параметр «%1».</translation>
    </message>
    <message>
        <source>Unknown options: %1.</source>
        <translation>Неизвестные параметры: %1.</translation>
    </message>
    <message>
        <source>Missing value after &apos;%1&apos;.</source>
        <translation>После «%1» нет значения.</translation>
    </message>
    <message>
        <source>Unexpected value after &apos;%1&apos;.</source>
        <translation>Лишнее значение после «%1».</translation>
    </message>
</context>
</TS>
