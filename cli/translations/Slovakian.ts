<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="sk_SK" sourcelanguage="en_US">
<context>
    <name>KvCliHost</name>
    <message>
        <source>%1: the image %2 is missing</source>
        <translation>%1: chýba obrázok %2</translation>
    </message>
</context>
<context>
    <name>KvCliOutput</name>
    <message>
        <source>cannot be written: %1</source>
        <translation>nedá sa zapísať: %1</translation>
    </message>
    <message>
        <source>note: %1</source>
        <translation>poznámka: %1</translation>
    </message>
    <message>
        <source>&lt;standard output&gt;</source>
        <translation>&lt;štandardný výstup&gt;</translation>
    </message>
</context>
<context>
    <name>KvCliParser</name>
    <message>
        <source>Language of messages and reports, such as German or de; otherwise the system&apos;s.</source>
        <translation>Jazyk hlásení a protokolov, napríklad German alebo de; inak jazyk systému.</translation>
    </message>
    <message>
        <source>Prints a report: template and measurements in, PDF out.</source>
        <translation>Vytlačí protokol: zo šablóny a meraní vznikne PDF.</translation>
    </message>
    <message>
        <source>Prints the statistics of every measured value, in the table&apos;s own units.</source>
        <translation>Vypíše štatistiku každej meranej veličiny v jednotkách tabuľky.</translation>
    </message>
    <message>
        <source>Says what a template holds and what would be skipped or refused.</source>
        <translation>Vypíše, čo šablóna obsahuje a čo by sa preskočilo alebo odmietlo.</translation>
    </message>
    <message>
        <source>Lists the block types and their settings with defaults.</source>
        <translation>Vypíše typy blokov a ich nastavenia s predvolenými hodnotami.</translation>
    </message>
    <message>
        <source>Turns measurements and a report template into a PDF report, without a display.</source>
        <translation>Z meraní a šablóny vytvorí protokol PDF, bez obrazovky.</translation>
    </message>
    <message>
        <source>Commands:</source>
        <translation>Príkazy:</translation>
    </message>
    <message>
        <source>Options everywhere:</source>
        <translation>Spoločné voľby:</translation>
    </message>
    <message>
        <source>Shows this text, or that of a command.</source>
        <translation>Zobrazí tento text alebo text príkazu.</translation>
    </message>
    <message>
        <source>Shows the version.</source>
        <translation>Zobrazí verziu.</translation>
    </message>
    <message>
        <source>Writes no notes and no progress.</source>
        <translation>Nevypisuje poznámky ani priebeh.</translation>
    </message>
    <message>
        <source>Writes errors as one line of JSON each.</source>
        <translation>Vypíše každú chybu ako jeden riadok JSON.</translation>
    </message>
    <message>
        <source>&quot;-&quot; as a file name is standard input or output.</source>
        <translation>„-“ namiesto názvu súboru je štandardný vstup alebo výstup.</translation>
    </message>
    <message>
        <source>Exit codes: 0 done, 1 the work failed, 2 wrong usage.</source>
        <translation>Návratové kódy: 0 hotovo, 1 zlyhanie, 2 nesprávne použitie.</translation>
    </message>
    <message>
        <source>Shows this text.</source>
        <translation>Zobrazí tento text.</translation>
    </message>
    <message>
        <source>Measurements: a session of the Measuring Desk.</source>
        <translation>Merania: relácia programu Measuring Desk.</translation>
    </message>
    <message>
        <source>Measurements: a table (CSV, TSV, ImageJ results).</source>
        <translation>Merania: tabuľka (CSV, TSV, výsledky ImageJ).</translation>
    </message>
    <message>
        <source>Unit of the table&apos;s values that state none, or Name=unit for one value. May be given several times.</source>
        <translation>Jednotka hodnôt tabuľky, ktoré žiadnu neuvádzajú, alebo Názov=jednotka pre jednu veličinu. Možno zadať viackrát.</translation>
    </message>
    <message>
        <source>The table&apos;s column with the object types.</source>
        <translation>Stĺpec tabuľky s typmi objektov.</translation>
    </message>
    <message>
        <source>The table&apos;s column with the object names.</source>
        <translation>Stĺpec tabuľky s názvami objektov.</translation>
    </message>
    <message>
        <source>Decimal mark of the table: point or comma.</source>
        <translation>Desatinný oddeľovač tabuľky: point alebo comma.</translation>
    </message>
    <message>
        <source>Significant digits of measured values; 0 is automatic.</source>
        <translation>Platné číslice nameraných hodnôt; 0 je automaticky.</translation>
    </message>
    <message>
        <source>Output: text, csv or json.</source>
        <translation>Výstup: text, csv alebo json.</translation>
    </message>
    <message>
        <source>Output: text or json.</source>
        <translation>Výstup: text alebo json.</translation>
    </message>
    <message>
        <source>The report template.</source>
        <translation>Šablóna protokolu.</translation>
    </message>
    <message>
        <source>The image that was measured.</source>
        <translation>Obrázok, na ktorom sa meralo.</translation>
    </message>
    <message>
        <source>The PDF file to write.</source>
        <translation>Súbor PDF, ktorý sa zapíše.</translation>
    </message>
    <message>
        <source>Groups: object (type and value) or measurement.</source>
        <translation>Skupiny: object (typ a veličina) alebo measurement.</translation>
    </message>
    <message>
        <source>--format must be %1, not &quot;%2&quot;</source>
        <translation>--format musí byť %1, nie „%2“</translation>
    </message>
    <message>
        <source>text, csv or json</source>
        <translation>text, csv alebo json</translation>
    </message>
    <message>
        <source>text or json</source>
        <translation>text alebo json</translation>
    </message>
    <message>
        <source>--group-by must be object or measurement, not &quot;%1&quot;</source>
        <translation>--group-by musí byť object alebo measurement, nie „%1“</translation>
    </message>
    <message>
        <source>--digits must be a number from 0 to 15, not &quot;%1&quot;</source>
        <translation>--digits musí byť číslo od 0 do 15, nie „%1“</translation>
    </message>
    <message>
        <source>give the measurements: either --session or --table</source>
        <translation>zadajte merania: buď --session, alebo --table</translation>
    </message>
    <message>
        <source>--decimal must be point or comma, not &quot;%1&quot;</source>
        <translation>--decimal musí byť point alebo comma, nie „%1“</translation>
    </message>
    <message>
        <source>the template is missing</source>
        <translation>chýba šablóna</translation>
    </message>
    <message>
        <source>unexpected argument &quot;%1&quot;</source>
        <translation>neočakávaný argument „%1“</translation>
    </message>
    <message>
        <source>the file to write is missing: -o OUT.pdf</source>
        <translation>chýba súbor, ktorý sa má zapísať: -o OUT.pdf</translation>
    </message>
    <message>
        <source>only one file can be read from standard input</source>
        <translation>zo štandardného vstupu možno čítať iba jeden súbor</translation>
    </message>
    <message>
        <source>--language must be one of %1, not &quot;%2&quot;</source>
        <translation>--language musí byť jedna z hodnôt %1, nie „%2“</translation>
    </message>
    <message>
        <source>a command is missing: render, stats, check or blocks</source>
        <translation>chýba príkaz: render, stats, check alebo blocks</translation>
    </message>
    <message>
        <source>unknown command &quot;%1&quot;; it must be render, stats, check or blocks</source>
        <translation>neznámy príkaz „%1“; musí byť render, stats, check alebo blocks</translation>
    </message>
    <message>
        <source>%1 (statreport --help tells more)</source>
        <translation>%1 (ďalšia pomoc: statreport --help)</translation>
    </message>
</context>
<context>
    <name>KvCliSource</name>
    <message>
        <source>&lt;standard input&gt;</source>
        <translation>&lt;štandardný vstup&gt;</translation>
    </message>
    <message>
        <source>cannot be read</source>
        <translation>nedá sa prečítať</translation>
    </message>
</context>
<context>
    <name>KvRenderCommand</name>
    <message>
        <source>is a directory</source>
        <translation>je priečinok</translation>
    </message>
    <message>
        <source>the file could not be written completely</source>
        <translation>súbor sa nepodarilo zapísať celý</translation>
    </message>
    <message>
        <source>cannot be written: %1</source>
        <translation>nedá sa zapísať: %1</translation>
    </message>
</context>
<context>
    <name>KvStatsReport</name>
    <message>
        <source>Object Type</source>
        <translation>Typ objektu</translation>
    </message>
    <message>
        <source>Measurement Type</source>
        <translation>Veličina</translation>
    </message>
    <message>
        <source>Unit</source>
        <translation>Jednotka</translation>
    </message>
    <message>
        <source>Count</source>
        <translation>Počet</translation>
    </message>
    <message>
        <source>Min</source>
        <translation>Min.</translation>
    </message>
    <message>
        <source>Max</source>
        <translation>Max.</translation>
    </message>
    <message>
        <source>Average</source>
        <translation>Str. hodnota</translation>
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
        <translation>logická hodnota</translation>
    </message>
    <message>
        <source>a number</source>
        <translation>číslo</translation>
    </message>
    <message>
        <source>a string</source>
        <translation>reťazec</translation>
    </message>
    <message>
        <source>an array</source>
        <translation>pole hodnôt</translation>
    </message>
    <message>
        <source>an object</source>
        <translation>objekt</translation>
    </message>
    <message>
        <source>missing</source>
        <translation>nič</translation>
    </message>
    <message>
        <source>&quot;%1&quot; is missing</source>
        <translation>chýba „%1“</translation>
    </message>
    <message>
        <source>&quot;%1&quot; is %2, not %3</source>
        <translation>„%1“: nájdené: %2, očakáva sa: %3</translation>
    </message>
    <message>
        <source>&quot;%1&quot; has a value that the block refuses</source>
        <translation>„%1“ má hodnotu, ktorú blok odmieta</translation>
    </message>
    <message>
        <source>the block refuses its settings</source>
        <translation>blok odmieta svoje nastavenia</translation>
    </message>
    <message>
        <source>cannot be opened: %1</source>
        <translation>nedá sa otvoriť: %1</translation>
    </message>
    <message>
        <source>cannot be read: %1</source>
        <translation>nedá sa prečítať: %1</translation>
    </message>
    <message>
        <source>is larger than 256 MB</source>
        <translation>je väčšie ako 256 MB</translation>
    </message>
    <message>
        <source>is no JSON: %1</source>
        <translation>nie je JSON: %1</translation>
    </message>
    <message>
        <source>is no template: the JSON document is no object</source>
        <translation>nie je šablóna: dokument JSON nie je objekt</translation>
    </message>
    <message>
        <source>is %1; the page keeps its defaults</source>
        <translation>nájdené: %1; strana si ponechá predvolené hodnoty</translation>
    </message>
    <message>
        <source>is no whole number of pixels above 0</source>
        <translation>nie je celý počet pixelov väčší ako 0</translation>
    </message>
    <message>
        <source>page width %1 px</source>
        <translation>šírka strany %1&#xa0;px</translation>
    </message>
    <message>
        <source>is no fraction of the page width from 0 to 0.5</source>
        <translation>nie je podiel šírky strany od 0 do 0,5</translation>
    </message>
    <message>
        <source>is %1, not an object; it is off</source>
        <translation>nájdené: %1, očakáva sa: objekt; je vypnuté</translation>
    </message>
    <message>
        <source>is %1, not a boolean; it is off</source>
        <translation>nájdené: %1, očakáva sa: logická hodnota; je vypnuté</translation>
    </message>
    <message>
        <source>is %1, not a string; the section is off</source>
        <translation>nájdené: %1, očakáva sa: reťazec; časť je vypnutá</translation>
    </message>
    <message>
        <source>is %1, not an array; there are no blocks</source>
        <translation>nájdené: %1, očakáva sa: pole hodnôt; nie sú žiadne bloky</translation>
    </message>
    <message>
        <source>is %1, not a string; the block is skipped</source>
        <translation>nájdené: %1, očakáva sa: reťazec; blok sa preskočí</translation>
    </message>
    <message>
        <source>there is no block type &quot;%1&quot;; the block is skipped</source>
        <translation>typ bloku „%1“ neexistuje; blok sa preskočí</translation>
    </message>
    <message>
        <source>is %1, not an object</source>
        <translation>nájdené: %1, očakáva sa: objekt</translation>
    </message>
    <message>
        <source>block &quot;%1&quot;</source>
        <translation>blok „%1“</translation>
    </message>
    <message>
        <source>is %1, not %2; it is ignored</source>
        <translation>nájdené: %1, očakáva sa: %2; neberie sa do úvahy</translation>
    </message>
    <message>
        <source>unknown keyword %1; it stays as it is</source>
        <translation>neznáme pole %1; zostáva tak, ako je</translation>
    </message>
</context>
<context>
    <name>KvTemplateCommands</name>
    <message>
        <source>warning: %1</source>
        <translation>upozornenie: %1</translation>
    </message>
</context>
<context>
    <name>KvTerminalProgress</name>
    <message>
        <source>page %1 of %2</source>
        <translation>strana %1 z %2</translation>
    </message>
</context>
<context>
    <name>QCommandLineParser</name>
    <message>
        <source>Usage: %1</source>
        <translation>Použitie: %1</translation>
    </message>
    <message>
        <source>[options]</source>
        <translation>[voľby]</translation>
    </message>
    <message>
        <source>Options:</source>
        <translation>Voľby:</translation>
    </message>
    <message>
        <source>Arguments:</source>
        <translation>Argumenty:</translation>
    </message>
    <message>
        <source>Unknown option &apos;%1&apos;.</source>
        <translation>Neznáma voľba „%1“.</translation>
    </message>
    <message>
        <source>Unknown options: %1.</source>
        <translation>Neznáme voľby: %1.</translation>
    </message>
    <message>
        <source>Missing value after &apos;%1&apos;.</source>
        <translation>Za „%1“ chýba hodnota.</translation>
    </message>
    <message>
        <source>Unexpected value after &apos;%1&apos;.</source>
        <translation>Neočakávaná hodnota za „%1“.</translation>
    </message>
</context>
</TS>
