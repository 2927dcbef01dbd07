<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="es_ES" sourcelanguage="en_US">
<context>
    <name>KvCliHost</name>
    <message>
        <source>%1: the image %2 is missing</source>
        <translation>%1: falta la imagen %2</translation>
    </message>
</context>
<context>
    <name>KvCliOutput</name>
    <message>
        <source>cannot be written: %1</source>
        <translation>no se puede escribir: %1</translation>
    </message>
    <message>
        <source>note: %1</source>
        <translation>nota: %1</translation>
    </message>
    <message>
        <source>&lt;standard output&gt;</source>
        <translation>&lt;salida estándar&gt;</translation>
    </message>
</context>
<context>
    <name>KvCliParser</name>
    <message>
        <source>Language of messages and reports, such as German or de; otherwise the system&apos;s.</source>
        <translation>Idioma de los mensajes e informes, como German o de; si no, el del sistema.</translation>
    </message>
    <message>
        <source>Prints a report: template and measurements in, PDF out.</source>
        <translation>Imprime un informe: a partir de una plantilla y mediciones se obtiene un PDF.</translation>
    </message>
    <message>
        <source>Prints the statistics of every measured value, in the table&apos;s own units.</source>
        <translation>Muestra las estadísticas de cada valor medido, en las unidades de la tabla.</translation>
    </message>
    <message>
        <source>Says what a template holds and what would be skipped or refused.</source>
        <translation>Indica qué contiene una plantilla y qué se omitiría o rechazaría.</translation>
    </message>
    <message>
        <source>Lists the block types and their settings with defaults.</source>
        <translation>Enumera los tipos de bloque y su configuración con los valores predeterminados.</translation>
    </message>
    <message>
        <source>Turns measurements and a report template into a PDF report, without a display.</source>
        <translation>Convierte mediciones y una plantilla en un informe PDF, sin pantalla.</translation>
    </message>
    <message>
        <source>Commands:</source>
        <translation>Comandos:</translation>
    </message>
    <message>
        <source>Options everywhere:</source>
        <translation>Opciones generales:</translation>
    </message>
    <message>
        <source>Shows this text, or that of a command.</source>
        <translation>Muestra este texto o el de un comando.</translation>
    </message>
    <message>
        <source>Shows the version.</source>
        <translation>Muestra la versión.</translation>
    </message>
    <message>
        <source>Writes no notes and no progress.</source>
        <translation>No escribe notas ni progreso.</translation>
    </message>
    <message>
        <source>Writes errors as one line of JSON each.</source>
        <translation>Escribe cada error en una línea JSON.</translation>
    </message>
    <message>
        <source>&quot;-&quot; as a file name is standard input or output.</source>
        <translation>«-» como nombre de archivo es la entrada o la salida estándar.</translation>
    </message>
    <message>
        <source>Exit codes: 0 done, 1 the work failed, 2 wrong usage.</source>
        <translation>Códigos de salida: 0 terminado, 1 el trabajo ha fallado, 2 uso incorrecto.</translation>
    </message>
    <message>
        <source>Shows this text.</source>
        <translation>Muestra este texto.</translation>
    </message>
    <message>
        <source>Measurements: a session of the Measuring Desk.</source>
        <translation>Mediciones: una sesión de Measuring Desk.</translation>
    </message>
    <message>
        <source>Measurements: a table (CSV, TSV, ImageJ results).</source>
        <translation>Mediciones: una tabla (CSV, TSV, resultados de ImageJ).</translation>
    </message>
    <message>
        <source>Unit of the table&apos;s values that state none, or Name=unit for one value. May be given several times.</source>
        <translation>Unidad de los valores de la tabla que no indican ninguna, o Nombre=unidad para un valor. Puede indicarse varias veces.</translation>
    </message>
    <message>
        <source>The table&apos;s column with the object types.</source>
        <translation>La columna de la tabla con los tipos de objeto.</translation>
    </message>
    <message>
        <source>The table&apos;s column with the object names.</source>
        <translation>La columna de la tabla con los nombres de los objetos.</translation>
    </message>
    <message>
        <source>Decimal mark of the table: point or comma.</source>
        <translation>Separador decimal de la tabla: point o comma.</translation>
    </message>
    <message>
        <source>Significant digits of measured values; 0 is automatic.</source>
        <translation>Cifras significativas de los valores medidos; 0 es automático.</translation>
    </message>
    <message>
        <source>Output: text, csv or json.</source>
        <translation>Salida: text, csv o json.</translation>
    </message>
    <message>
        <source>Output: text or json.</source>
        <translation>Salida: text o json.</translation>
    </message>
    <message>
        <source>The report template.</source>
        <translation>La plantilla de informe.</translation>
    </message>
    <message>
        <source>The image that was measured.</source>
        <translation>La imagen que se midió.</translation>
    </message>
    <message>
        <source>The PDF file to write.</source>
        <translation>El archivo PDF que se escribirá.</translation>
    </message>
    <message>
        <source>Groups: object (type and value) or measurement.</source>
        <translation>Grupos: object (tipo y valor) o measurement.</translation>
    </message>
    <message>
        <source>--format must be %1, not &quot;%2&quot;</source>
        <translation>--format debe ser %1, no «%2»</translation>
    </message>
    <message>
        <source>text, csv or json</source>
        <translation>text, csv o json</translation>
    </message>
    <message>
        <source>text or json</source>
        <translation>text o json</translation>
    </message>
    <message>
        <source>--group-by must be object or measurement, not &quot;%1&quot;</source>
        <translation>--group-by debe ser object o measurement, no «%1»</translation>
    </message>
    <message>
        <source>--digits must be a number from 0 to 15, not &quot;%1&quot;</source>
        <translation>--digits debe ser un número de 0 a 15, no «%1»</translation>
    </message>
    <message>
        <source>give the measurements: either --session or --table</source>
        <translation>indique las mediciones: --session o --table</translation>
    </message>
    <message>
        <source>--decimal must be point or comma, not &quot;%1&quot;</source>
        <translation>--decimal debe ser point o comma, no «%1»</translation>
    </message>
    <message>
        <source>the template is missing</source>
        <translation>falta la plantilla</translation>
    </message>
    <message>
        <source>unexpected argument &quot;%1&quot;</source>
        <translation>argumento inesperado «%1»</translation>
    </message>
    <message>
        <source>the file to write is missing: -o OUT.pdf</source>
        <translation>falta el archivo que se escribirá: -o OUT.pdf</translation>
    </message>
    <message>
        <source>only one file can be read from standard input</source>
        <translation>solo se puede leer un archivo de la entrada estándar</translation>
    </message>
    <message>
        <source>--language must be one of %1, not &quot;%2&quot;</source>
        <translation>--language debe ser uno de %1, no «%2»</translation>
    </message>
    <message>
        <source>a command is missing: render, stats, check or blocks</source>
        <translation>falta un comando: render, stats, check o blocks</translation>
    </message>
    <message>
        <source>unknown command &quot;%1&quot;; it must be render, stats, check or blocks</source>
        <translation>comando desconocido «%1»; debe ser render, stats, check o blocks</translation>
    </message>
    <message>
        <source>%1 (statreport --help tells more)</source>
        <translation>%1 (más información con statreport --help)</translation>
    </message>
</context>
<context>
    <name>KvCliSource</name>
    <message>
        <source>&lt;standard input&gt;</source>
        <translation>&lt;entrada estándar&gt;</translation>
    </message>
    <message>
        <source>cannot be read</source>
        <translation>no se puede leer</translation>
    </message>
</context>
<context>
    <name>KvRenderCommand</name>
    <message>
        <source>is a directory</source>
        <translation>es una carpeta</translation>
    </message>
    <message>
        <source>the file could not be written completely</source>
        <translation>el archivo no se ha podido escribir por completo</translation>
    </message>
    <message>
        <source>cannot be written: %1</source>
        <translation>no se puede escribir: %1</translation>
    </message>
</context>
<context>
    <name>KvStatsReport</name>
    <message>
        <source>Object Type</source>
        <translation>Tipo de objeto</translation>
    </message>
    <message>
        <source>Measurement Type</source>
        <translation>Tipo de medición</translation>
    </message>
    <message>
        <source>Unit</source>
        <translation>Unidad</translation>
    </message>
    <message>
        <source>Count</source>
        <translation>Recuento</translation>
    </message>
    <message>
        <source>Min</source>
        <translation>Mín.</translation>
    </message>
    <message>
        <source>Max</source>
        <translation>Máx.</translation>
    </message>
    <message>
        <source>Average</source>
        <translation>Media</translation>
    </message>
    <message>
        <source>Sigma</source>
        <translation>Sigma</translation>
    </message>
    <message>
        <source>3 Sigma</source>
        <translation>3 sigma</translation>
    </message>
    <message>
        <source>6 Sigma</source>
        <translation>6 sigma</translation>
    </message>
</context>
<context>
    <name>KvTemplateCheck</name>
    <message>
        <source>a boolean</source>
        <translation>un valor lógico</translation>
    </message>
    <message>
        <source>a number</source>
        <translation>un número</translation>
    </message>
    <message>
        <source>a string</source>
        <translation>una cadena</translation>
    </message>
    <message>
        <source>an array</source>
        <translation>una lista</translation>
    </message>
    <message>
        <source>an object</source>
        <translation>un objeto JSON</translation>
    </message>
    <message>
        <source>missing</source>
        <translation>nada</translation>
    </message>
    <message>
        <source>&quot;%1&quot; is missing</source>
        <translation>falta «%1»</translation>
    </message>
    <message>
        <source>&quot;%1&quot; is %2, not %3</source>
        <translation>«%1»: valor encontrado: %2; se esperaba %3</translation>
    </message>
    <message>
        <source>&quot;%1&quot; has a value that the block refuses</source>
        <translation>«%1» tiene un valor que el bloque rechaza</translation>
    </message>
    <message>
        <source>the block refuses its settings</source>
        <translation>el bloque rechaza su configuración</translation>
    </message>
    <message>
        <source>cannot be opened: %1</source>
        <translation>no se puede abrir: %1</translation>
    </message>
    <message>
        <source>cannot be read: %1</source>
        <translation>no se puede leer: %1</translation>
    </message>
    <message>
        <source>is larger than 256 MB</source>
        <translation>ocupa más de 256 MB</translation>
    </message>
    <message>
        <source>is no JSON: %1</source>
        <translation>no es JSON: %1</translation>
    </message>
    <message>
        <source>is no template: the JSON document is no object</source>
        <translation>no es una plantilla: el documento JSON no es un objeto</translation>
    </message>
    <message>
        <source>is %1; the page keeps its defaults</source>
        <translation>valor encontrado: %1; la página conserva sus valores predeterminados</translation>
    </message>
    <message>
        <source>is no whole number of pixels above 0</source>
        <translation>no es un número entero de píxeles mayor que 0</translation>
    </message>
    <message>
        <source>page width %1 px</source>
        <translation>ancho de página %1 px</translation>
    </message>
    <message>
        <source>is no fraction of the page width from 0 to 0.5</source>
        <translation>no es una fracción del ancho de página de 0 a 0,5</translation>
    </message>
    <message>
        <source>is %1, not an object; it is off</source>
        <translation>valor encontrado: %1; se esperaba un objeto JSON; queda desactivado</translation>
    </message>
    <message>
        <source>is %1, not a boolean; it is off</source>
        <translation>valor encontrado: %1; se esperaba un valor lógico; queda desactivado</translation>
    </message>
    <message>
        <source>is %1, not a string; the section is off</source>
        <translation>valor encontrado: %1; se esperaba una cadena; la sección queda desactivada</translation>
    </message>
    <message>
        <source>is %1, not an array; there are no blocks</source>
        <translation>valor encontrado: %1; se esperaba una lista; no hay bloques</translation>
    </message>
    <message>
        <source>is %1, not a string; the block is skipped</source>
        <translation>valor encontrado: %1; se esperaba una cadena; el bloque se omite</translation>
    </message>
    <message>
        <source>there is no block type &quot;%1&quot;; the block is skipped</source>
        <translation>no existe el tipo de bloque «%1»; el bloque se omite</translation>
    </message>
    <message>
        <source>is %1, not an object</source>
        <translation>valor encontrado: %1; se esperaba un objeto JSON</translation>
    </message>
    <message>
        <source>block &quot;%1&quot;</source>
        <translation>bloque «%1»</translation>
    </message>
    <message>
        <source>is %1, not %2; it is ignored</source>
        <translation>valor encontrado: %1; se esperaba %2; se ignora</translation>
    </message>
    <message>
        <source>unknown keyword %1; it stays as it is</source>
        <translation>campo desconocido %1; se queda como está</translation>
    </message>
</context>
<context>
    <name>KvTemplateCommands</name>
    <message>
        <source>warning: %1</source>
        <translation>advertencia: %1</translation>
    </message>
</context>
<context>
    <name>KvTerminalProgress</name>
    <message>
        <source>page %1 of %2</source>
        <translation>página %1 de %2</translation>
    </message>
</context>
<context>
    <name>QCommandLineParser</name>
    <message>
        <source>Usage: %1</source>
        <translation>Uso: %1</translation>
    </message>
    <message>
        <source>[options]</source>
        <translation>[opciones]</translation>
    </message>
    <message>
        <source>Options:</source>
        <translation>Opciones:</translation>
    </message>
    <message>
        <source>Arguments:</source>
        <translation>Argumentos:</translation>
    </message>
    <message>
        <source>Unknown option &apos;%1&apos;.</source>
        <translation>Opción desconocida «%1».</translation>
    </message>
    <message>
        <source>Unknown options: %1.</source>
        <translation>Opciones desconocidas: %1.</translation>
    </message>
    <message>
        <source>Missing value after &apos;%1&apos;.</source>
        <translation>Falta el valor después de «%1».</translation>
    </message>
    <message>
        <source>Unexpected value after &apos;%1&apos;.</source>
        <translation>Valor inesperado después de «%1».</translation>
    </message>
</context>
</TS>
