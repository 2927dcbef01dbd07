<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="it_IT" sourcelanguage="en_US">
<context>
    <name>KvCliHost</name>
    <message>
        <source>%1: the image %2 is missing</source>
        <translation>%1: manca l&apos;immagine %2</translation>
    </message>
</context>
<context>
    <name>KvCliOutput</name>
    <message>
        <source>cannot be written: %1</source>
        <translation>impossibile scrivere: %1</translation>
    </message>
    <message>
        <source>note: %1</source>
        <translation>nota: %1</translation>
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
        <translation>Lingua dei messaggi e dei report, ad esempio German o de; altrimenti quella del sistema.</translation>
    </message>
    <message>
        <source>Prints a report: template and measurements in, PDF out.</source>
        <translation>Stampa un report: da un modello e da misure si ottiene un PDF.</translation>
    </message>
    <message>
        <source>Prints the statistics of every measured value, in the table&apos;s own units.</source>
        <translation>Mostra le statistiche di ogni valore misurato, nelle unità della tabella.</translation>
    </message>
    <message>
        <source>Says what a template holds and what would be skipped or refused.</source>
        <translation>Indica che cosa contiene un modello e che cosa verrebbe saltato o rifiutato.</translation>
    </message>
    <message>
        <source>Lists the block types and their settings with defaults.</source>
        <translation>Elenca i tipi di blocco e le loro impostazioni con i valori predefiniti.</translation>
    </message>
    <message>
        <source>Turns measurements and a report template into a PDF report, without a display.</source>
        <translation>Trasforma misure e un modello in un report PDF, senza schermo.</translation>
    </message>
    <message>
        <source>Commands:</source>
        <translation>Comandi:</translation>
    </message>
    <message>
        <source>Options everywhere:</source>
        <translation>Opzioni generali:</translation>
    </message>
    <message>
        <source>Shows this text, or that of a command.</source>
        <translation>Mostra questo testo o quello di un comando.</translation>
    </message>
    <message>
        <source>Shows the version.</source>
        <translation>Mostra la versione.</translation>
    </message>
    <message>
        <source>Writes no notes and no progress.</source>
        <translation>Non scrive note né avanzamento.</translation>
    </message>
    <message>
        <source>Writes errors as one line of JSON each.</source>
        <translation>Scrive ogni errore in una riga JSON.</translation>
    </message>
    <message>
        <source>&quot;-&quot; as a file name is standard input or output.</source>
        <translation>“-” come nome di file è lo standard input o lo standard output.</translation>
    </message>
    <message>
        <source>Exit codes: 0 done, 1 the work failed, 2 wrong usage.</source>
        <translation>Codici di uscita: 0 completato, 1 operazione non riuscita, 2 uso errato.</translation>
    </message>
    <message>
        <source>Shows this text.</source>
        <translation>Mostra questo testo.</translation>
    </message>
    <message>
        <source>Measurements: a session of the Measuring Desk.</source>
        <translation>Misure: una sessione di Measuring Desk.</translation>
    </message>
    <message>
        <source>Measurements: a table (CSV, TSV, ImageJ results).</source>
        <translation>Misure: una tabella (CSV, TSV, risultati di ImageJ).</translation>
    </message>
    <message>
        <source>Unit of the table&apos;s values that state none, or Name=unit for one value. May be given several times.</source>
        <translation>Unità dei valori della tabella che non ne indicano una, o Nome=unità per un valore. Si può indicare più volte.</translation>
    </message>
    <message>
        <source>The table&apos;s column with the object types.</source>
        <translation>La colonna della tabella con i tipi di oggetto.</translation>
    </message>
    <message>
        <source>The table&apos;s column with the object names.</source>
        <translation>La colonna della tabella con i nomi degli oggetti.</translation>
    </message>
    <message>
        <source>Decimal mark of the table: point or comma.</source>
        <translation>Separatore decimale della tabella: point o comma.</translation>
    </message>
    <message>
        <source>Significant digits of measured values; 0 is automatic.</source>
        <translation>Cifre significative dei valori misurati; 0 è automatico.</translation>
    </message>
    <message>
        <source>Output: text, csv or json.</source>
        <translation>Output: text, csv o json.</translation>
    </message>
    <message>
        <source>Output: text or json.</source>
        <translation>Output: text o json.</translation>
    </message>
    <message>
        <source>The report template.</source>
        <translation>Il modello di report.</translation>
    </message>
    <message>
        <source>The image that was measured.</source>
        <translation>L&apos;immagine misurata.</translation>
    </message>
    <message>
        <source>The PDF file to write.</source>
        <translation>Il file PDF da scrivere.</translation>
    </message>
    <message>
        <source>Groups: object (type and value) or measurement.</source>
        <translation>Gruppi: object (tipo e valore) o measurement.</translation>
    </message>
    <message>
        <source>--format must be %1, not &quot;%2&quot;</source>
        <translation>--format deve essere %1, non “%2”</translation>
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
        <translation>--group-by deve essere object o measurement, non “%1”</translation>
    </message>
    <message>
        <source>--digits must be a number from 0 to 15, not &quot;%1&quot;</source>
        <translation>--digits deve essere un numero da 0 a 15, non “%1”</translation>
    </message>
    <message>
        <source>give the measurements: either --session or --table</source>
        <translation>indicare le misure: --session oppure --table</translation>
    </message>
    <message>
        <source>--decimal must be point or comma, not &quot;%1&quot;</source>
        <translation>--decimal deve essere point o comma, non “%1”</translation>
    </message>
    <message>
        <source>the template is missing</source>
        <translation>manca il modello</translation>
    </message>
    <message>
        <source>unexpected argument &quot;%1&quot;</source>
        <translation>argomento inatteso “%1”</translation>
    </message>
    <message>
        <source>the file to write is missing: -o OUT.pdf</source>
        <translation>manca il file da scrivere: -o OUT.pdf</translation>
    </message>
    <message>
        <source>only one file can be read from standard input</source>
        <translation>si può leggere un solo file dallo standard input</translation>
    </message>
    <message>
        <source>--language must be one of %1, not &quot;%2&quot;</source>
        <translation>--language deve essere uno tra %1, non “%2”</translation>
    </message>
    <message>
        <source>a command is missing: render, stats, check or blocks</source>
        <translation>manca un comando: render, stats, check o blocks</translation>
    </message>
    <message>
        <source>unknown command &quot;%1&quot;; it must be render, stats, check or blocks</source>
        <translation>comando sconosciuto “%1”; deve essere render, stats, check o blocks</translation>
    </message>
    <message>
        <source>%1 (statreport --help tells more)</source>
        <translation>%1 (per saperne di più: statreport --help)</translation>
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
        <translation>impossibile leggere</translation>
    </message>
</context>
<context>
    <name>KvRenderCommand</name>
    <message>
        <source>is a directory</source>
        <translation>è una cartella</translation>
    </message>
    <message>
        <source>the file could not be written completely</source>
        <translation>non è stato possibile scrivere il file per intero</translation>
    </message>
    <message>
        <source>cannot be written: %1</source>
        <translation>impossibile scrivere: %1</translation>
    </message>
</context>
<context>
    <name>KvStatsReport</name>
    <message>
        <source>Object Type</source>
        <translation>Tipo di oggetto</translation>
    </message>
    <message>
        <source>Measurement Type</source>
        <translation>Tipo di misura</translation>
    </message>
    <message>
        <source>Unit</source>
        <translation>Unità</translation>
    </message>
    <message>
        <source>Count</source>
        <translation>Conteggio</translation>
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
        <translation>un valore logico</translation>
    </message>
    <message>
        <source>a number</source>
        <translation>un numero</translation>
    </message>
    <message>
        <source>a string</source>
        <translation>una stringa</translation>
    </message>
    <message>
        <source>an array</source>
        <translation>un elenco</translation>
    </message>
    <message>
        <source>an object</source>
        <translation>un oggetto JSON</translation>
    </message>
    <message>
        <source>missing</source>
        <translation>niente</translation>
    </message>
    <message>
        <source>&quot;%1&quot; is missing</source>
        <translation>manca “%1”</translation>
    </message>
    <message>
        <source>&quot;%1&quot; is %2, not %3</source>
        <translation>“%1”: trovato: %2, atteso: %3</translation>
    </message>
    <message>
        <source>&quot;%1&quot; has a value that the block refuses</source>
        <translation>“%1” ha un valore che il blocco rifiuta</translation>
    </message>
    <message>
        <source>the block refuses its settings</source>
        <translation>il blocco rifiuta le sue impostazioni</translation>
    </message>
    <message>
        <source>cannot be opened: %1</source>
        <translation>impossibile aprire: %1</translation>
    </message>
    <message>
        <source>cannot be read: %1</source>
        <translation>impossibile leggere: %1</translation>
    </message>
    <message>
        <source>is larger than 256 MB</source>
        <translation>supera 256 MB</translation>
    </message>
    <message>
        <source>is no JSON: %1</source>
        <translation>non è JSON: %1</translation>
    </message>
    <message>
        <source>is no template: the JSON document is no object</source>
        <translation>non è un modello: il documento JSON non è un oggetto</translation>
    </message>
    <message>
        <source>is %1; the page keeps its defaults</source>
        <translation>trovato: %1; la pagina mantiene i valori predefiniti</translation>
    </message>
    <message>
        <source>is no whole number of pixels above 0</source>
        <translation>non è un numero intero di pixel maggiore di 0</translation>
    </message>
    <message>
        <source>page width %1 px</source>
        <translation>larghezza pagina %1 px</translation>
    </message>
    <message>
        <source>is no fraction of the page width from 0 to 0.5</source>
        <translation>non è una frazione della larghezza pagina da 0 a 0,5</translation>
    </message>
    <message>
        <source>is %1, not an object; it is off</source>
        <translation>trovato: %1, atteso: un oggetto JSON; resta disattivato</translation>
    </message>
    <message>
        <source>is %1, not a boolean; it is off</source>
        <translation>trovato: %1, atteso: un valore logico; resta disattivato</translation>
    </message>
    <message>
        <source>is %1, not a string; the section is off</source>
        <translation>trovato: %1, atteso: una stringa; la sezione resta disattivata</translation>
    </message>
    <message>
        <source>is %1, not an array; there are no blocks</source>
        <translation>trovato: %1, atteso: un elenco; non ci sono blocchi</translation>
    </message>
    <message>
        <source>is %1, not a string; the block is skipped</source>
        <translation>trovato: %1, atteso: una stringa; il blocco viene saltato</translation>
    </message>
    <message>
        <source>there is no block type &quot;%1&quot;; the block is skipped</source>
        <translation>il tipo di blocco “%1” non esiste; il blocco viene saltato</translation>
    </message>
    <message>
        <source>is %1, not an object</source>
        <translation>trovato: %1, atteso: un oggetto JSON</translation>
    </message>
    <message>
        <source>block &quot;%1&quot;</source>
        <translation>blocco “%1”</translation>
    </message>
    <message>
        <source>is %1, not %2; it is ignored</source>
        <translation>trovato: %1, atteso: %2; viene ignorato</translation>
    </message>
    <message>
        <source>unknown keyword %1; it stays as it is</source>
        <translation>campo sconosciuto %1; resta com&apos;è</translation>
    </message>
</context>
<context>
    <name>KvTemplateCommands</name>
    <message>
        <source>warning: %1</source>
        <translation>avviso: %1</translation>
    </message>
</context>
<context>
    <name>KvTerminalProgress</name>
    <message>
        <source>page %1 of %2</source>
        <translation>pagina %1 di %2</translation>
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
        <translation>[opzioni]</translation>
    </message>
    <message>
        <source>Options:</source>
        <translation>Opzioni:</translation>
    </message>
    <message>
        <source>Arguments:</source>
        <translation>Argomenti:</translation>
    </message>
    <message>
        <source>Unknown option &apos;%1&apos;.</source>
        <translation>Opzione sconosciuta “%1”.</translation>
    </message>
    <message>
        <source>Unknown options: %1.</source>
        <translation>Opzioni sconosciute: %1.</translation>
    </message>
    <message>
        <source>Missing value after &apos;%1&apos;.</source>
        <translation>Manca il valore dopo “%1”.</translation>
    </message>
    <message>
        <source>Unexpected value after &apos;%1&apos;.</source>
        <translation>Valore inatteso dopo “%1”.</translation>
    </message>
</context>
</TS>
