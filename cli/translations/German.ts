<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="de_DE" sourcelanguage="en_US">
<context>
    <name>KvCliHost</name>
    <message>
        <source>%1: the image %2 is missing</source>
        <translation>%1: Das Bild %2 fehlt</translation>
    </message>
</context>
<context>
    <name>KvCliOutput</name>
    <message>
        <source>cannot be written: %1</source>
        <translation>kann nicht geschrieben werden: %1</translation>
    </message>
    <message>
        <source>note: %1</source>
        <translation>Hinweis: %1</translation>
    </message>
    <message>
        <source>&lt;standard output&gt;</source>
        <translation>&lt;Standardausgabe&gt;</translation>
    </message>
</context>
<context>
    <name>KvCliParser</name>
    <message>
        <source>Language of messages and reports, such as German or de; otherwise the system&apos;s.</source>
        <translation>Sprache von Meldungen und Berichten, etwa German oder de; sonst die des Systems.</translation>
    </message>
    <message>
        <source>Prints a report: template and measurements in, PDF out.</source>
        <translation>Druckt einen Bericht: aus Vorlage und Messwerten wird ein PDF.</translation>
    </message>
    <message>
        <source>Prints the statistics of every measured value, in the table&apos;s own units.</source>
        <translation>Gibt die Statistik aller Messgrößen aus, in den Einheiten der Tabelle.</translation>
    </message>
    <message>
        <source>Says what a template holds and what would be skipped or refused.</source>
        <translation>Zeigt, was eine Vorlage enthält und was übersprungen oder abgelehnt würde.</translation>
    </message>
    <message>
        <source>Lists the block types and their settings with defaults.</source>
        <translation>Listet die Blocktypen und ihre Einstellungen mit Standardwerten auf.</translation>
    </message>
    <message>
        <source>Turns measurements and a report template into a PDF report, without a display.</source>
        <translation>Macht aus Messwerten und einer Berichtsvorlage einen PDF-Bericht, ohne Bildschirm.</translation>
    </message>
    <message>
        <source>Commands:</source>
        <translation>Befehle:</translation>
    </message>
    <message>
        <source>Options everywhere:</source>
        <translation>Optionen für alle Befehle:</translation>
    </message>
    <message>
        <source>Shows this text, or that of a command.</source>
        <translation>Zeigt diesen Text oder den eines Befehls.</translation>
    </message>
    <message>
        <source>Shows the version.</source>
        <translation>Zeigt die Version.</translation>
    </message>
    <message>
        <source>Writes no notes and no progress.</source>
        <translation>Gibt keine Hinweise und keinen Fortschritt aus.</translation>
    </message>
    <message>
        <source>Writes errors as one line of JSON each.</source>
        <translation>Gibt Fehler als je eine Zeile JSON aus.</translation>
    </message>
    <message>
        <source>&quot;-&quot; as a file name is standard input or output.</source>
        <translation>„-“ als Dateiname bedeutet Standardeingabe oder Standardausgabe.</translation>
    </message>
    <message>
        <source>Exit codes: 0 done, 1 the work failed, 2 wrong usage.</source>
        <translation>Rückgabewerte: 0 erledigt, 1 fehlgeschlagen, 2 falscher Aufruf.</translation>
    </message>
    <message>
        <source>Shows this text.</source>
        <translation>Zeigt diesen Text.</translation>
    </message>
    <message>
        <source>Measurements: a session of the Measuring Desk.</source>
        <translation>Messwerte: eine Sitzung von Measuring Desk.</translation>
    </message>
    <message>
        <source>Measurements: a table (CSV, TSV, ImageJ results).</source>
        <translation>Messwerte: eine Tabelle (CSV, TSV, ImageJ-Ergebnisse).</translation>
    </message>
    <message>
        <source>Unit of the table&apos;s values that state none, or Name=unit for one value. May be given several times.</source>
        <translation>Einheit für Tabellenwerte ohne eigene Einheit, oder Name=Einheit für eine Messgröße. Mehrfach möglich.</translation>
    </message>
    <message>
        <source>The table&apos;s column with the object types.</source>
        <translation>Die Spalte der Tabelle mit den Objekttypen.</translation>
    </message>
    <message>
        <source>The table&apos;s column with the object names.</source>
        <translation>Die Spalte der Tabelle mit den Objektnamen.</translation>
    </message>
    <message>
        <source>Decimal mark of the table: point or comma.</source>
        <translation>Dezimalzeichen der Tabelle: point oder comma.</translation>
    </message>
    <message>
        <source>Significant digits of measured values; 0 is automatic.</source>
        <translation>Signifikante Stellen der Messwerte; 0 ist automatisch.</translation>
    </message>
    <message>
        <source>Output: text, csv or json.</source>
        <translation>Ausgabe: text, csv oder json.</translation>
    </message>
    <message>
        <source>Output: text or json.</source>
        <translation>Ausgabe: text oder json.</translation>
    </message>
    <message>
        <source>The report template.</source>
        <translation>Die Berichtsvorlage.</translation>
    </message>
    <message>
        <source>The image that was measured.</source>
        <translation>Das Bild, in dem gemessen wurde.</translation>
    </message>
    <message>
        <source>The PDF file to write.</source>
        <translation>Die PDF-Datei, die geschrieben wird.</translation>
    </message>
    <message>
        <source>Groups: object (type and value) or measurement.</source>
        <translation>Gruppen: object (Typ und Messgröße) oder measurement.</translation>
    </message>
    <message>
        <source>--format must be %1, not &quot;%2&quot;</source>
        <translation>--format muss %1 sein, nicht „%2“</translation>
    </message>
    <message>
        <source>text, csv or json</source>
        <translation>text, csv oder json</translation>
    </message>
    <message>
        <source>text or json</source>
        <translation>text oder json</translation>
    </message>
    <message>
        <source>--group-by must be object or measurement, not &quot;%1&quot;</source>
        <translation>--group-by muss object oder measurement sein, nicht „%1“</translation>
    </message>
    <message>
        <source>--digits must be a number from 0 to 15, not &quot;%1&quot;</source>
        <translation>--digits muss eine Zahl von 0 bis 15 sein, nicht „%1“</translation>
    </message>
    <message>
        <source>give the measurements: either --session or --table</source>
        <translation>Messwerte fehlen: Geben Sie entweder --session oder --table an</translation>
    </message>
    <message>
        <source>--decimal must be point or comma, not &quot;%1&quot;</source>
        <translation>--decimal muss point oder comma sein, nicht „%1“</translation>
    </message>
    <message>
        <source>the template is missing</source>
        <translation>die Vorlage fehlt</translation>
    </message>
    <message>
        <source>unexpected argument &quot;%1&quot;</source>
        <translation>unerwartetes Argument „%1“</translation>
    </message>
    <message>
        <source>the file to write is missing: -o OUT.pdf</source>
        <translation>die zu schreibende Datei fehlt: -o OUT.pdf</translation>
    </message>
    <message>
        <source>only one file can be read from standard input</source>
        <translation>nur eine Datei kann von der Standardeingabe gelesen werden</translation>
    </message>
    <message>
        <source>--language must be one of %1, not &quot;%2&quot;</source>
        <translation>--language muss einer der Werte %1 sein, nicht „%2“</translation>
    </message>
    <message>
        <source>a command is missing: render, stats, check or blocks</source>
        <translation>ein Befehl fehlt: render, stats, check oder blocks</translation>
    </message>
    <message>
        <source>unknown command &quot;%1&quot;; it must be render, stats, check or blocks</source>
        <translation>unbekannter Befehl „%1“; möglich sind render, stats, check und blocks</translation>
    </message>
    <message>
        <source>%1 (statreport --help tells more)</source>
        <translation>%1 (weitere Hilfe: statreport --help)</translation>
    </message>
</context>
<context>
    <name>KvCliSource</name>
    <message>
        <source>&lt;standard input&gt;</source>
        <translation>&lt;Standardeingabe&gt;</translation>
    </message>
    <message>
        <source>cannot be read</source>
        <translation>kann nicht gelesen werden</translation>
    </message>
</context>
<context>
    <name>KvRenderCommand</name>
    <message>
        <source>is a directory</source>
        <translation>ist ein Ordner</translation>
    </message>
    <message>
        <source>the file could not be written completely</source>
        <translation>die Datei konnte nicht vollständig geschrieben werden</translation>
    </message>
    <message>
        <source>cannot be written: %1</source>
        <translation>kann nicht geschrieben werden: %1</translation>
    </message>
</context>
<context>
    <name>KvStatsReport</name>
    <message>
        <source>Object Type</source>
        <translation>Objekttyp</translation>
    </message>
    <message>
        <source>Measurement Type</source>
        <translation>Messgröße</translation>
    </message>
    <message>
        <source>Unit</source>
        <translation>Einheit</translation>
    </message>
    <message>
        <source>Count</source>
        <translation>Anzahl</translation>
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
        <translation>Mittelwert</translation>
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
        <translation>ein Wahrheitswert</translation>
    </message>
    <message>
        <source>a number</source>
        <translation>eine Zahl</translation>
    </message>
    <message>
        <source>a string</source>
        <translation>eine Zeichenkette</translation>
    </message>
    <message>
        <source>an array</source>
        <translation>eine Liste</translation>
    </message>
    <message>
        <source>an object</source>
        <translation>ein Objekt</translation>
    </message>
    <message>
        <source>missing</source>
        <translation>nichts</translation>
    </message>
    <message>
        <source>&quot;%1&quot; is missing</source>
        <translation>„%1“ fehlt</translation>
    </message>
    <message>
        <source>&quot;%1&quot; is %2, not %3</source>
        <translation>„%1“: gefunden: %2, erwartet: %3</translation>
    </message>
    <message>
        <source>&quot;%1&quot; has a value that the block refuses</source>
        <translation>„%1“ hat einen Wert, den der Block ablehnt</translation>
    </message>
    <message>
        <source>the block refuses its settings</source>
        <translation>der Block lehnt seine Einstellungen ab</translation>
    </message>
    <message>
        <source>cannot be opened: %1</source>
        <translation>kann nicht geöffnet werden: %1</translation>
    </message>
    <message>
        <source>cannot be read: %1</source>
        <translation>kann nicht gelesen werden: %1</translation>
    </message>
    <message>
        <source>is larger than 256 MB</source>
        <translation>ist größer als 256 MB</translation>
    </message>
    <message>
        <source>is no JSON: %1</source>
        <translation>ist kein JSON: %1</translation>
    </message>
    <message>
        <source>is no template: the JSON document is no object</source>
        <translation>ist keine Vorlage: Das JSON-Dokument ist kein Objekt</translation>
    </message>
    <message>
        <source>is %1; the page keeps its defaults</source>
        <translation>gefunden: %1; die Seite behält ihre Standardwerte</translation>
    </message>
    <message>
        <source>is no whole number of pixels above 0</source>
        <translation>ist keine ganzzahlige Pixelanzahl größer als 0</translation>
    </message>
    <message>
        <source>page width %1 px</source>
        <translation>Seitenbreite %1&#xa0;px</translation>
    </message>
    <message>
        <source>is no fraction of the page width from 0 to 0.5</source>
        <translation>ist kein Anteil der Seitenbreite von 0 bis 0,5</translation>
    </message>
    <message>
        <source>is %1, not an object; it is off</source>
        <translation>gefunden: %1, erwartet: ein Objekt; bleibt aus</translation>
    </message>
    <message>
        <source>is %1, not a boolean; it is off</source>
        <translation>gefunden: %1, erwartet: ein Wahrheitswert; bleibt aus</translation>
    </message>
    <message>
        <source>is %1, not a string; the section is off</source>
        <translation>gefunden: %1, erwartet: eine Zeichenkette; der Abschnitt bleibt aus</translation>
    </message>
    <message>
        <source>is %1, not an array; there are no blocks</source>
        <translation>gefunden: %1, erwartet: eine Liste; es gibt keine Blöcke</translation>
    </message>
    <message>
        <source>is %1, not a string; the block is skipped</source>
        <translation>gefunden: %1, erwartet: eine Zeichenkette; der Block wird übersprungen</translation>
    </message>
    <message>
        <source>there is no block type &quot;%1&quot;; the block is skipped</source>
        <translation>es gibt keinen Blocktyp „%1“; der Block wird übersprungen</translation>
    </message>
    <message>
        <source>is %1, not an object</source>
        <translation>gefunden: %1, erwartet: ein Objekt</translation>
    </message>
    <message>
        <source>block &quot;%1&quot;</source>
        <translation>Block „%1“</translation>
    </message>
    <message>
        <source>is %1, not %2; it is ignored</source>
        <translation>gefunden: %1, erwartet: %2; wird nicht beachtet</translation>
    </message>
    <message>
        <source>unknown keyword %1; it stays as it is</source>
        <translation>unbekanntes Feld %1; es bleibt stehen</translation>
    </message>
</context>
<context>
    <name>KvTemplateCommands</name>
    <message>
        <source>warning: %1</source>
        <translation>Warnung: %1</translation>
    </message>
</context>
<context>
    <name>KvTerminalProgress</name>
    <message>
        <source>page %1 of %2</source>
        <translation>Seite %1 von %2</translation>
    </message>
</context>
<context>
    <name>QCommandLineParser</name>
    <message>
        <source>Usage: %1</source>
        <translation>Aufruf: %1</translation>
    </message>
    <message>
        <source>[options]</source>
        <translation>[Optionen]</translation>
    </message>
    <message>
        <source>Options:</source>
        <translation>Optionen:</translation>
    </message>
    <message>
        <source>Arguments:</source>
        <translation>Argumente:</translation>
    </message>
    <message>
        <source>Unknown option &apos;%1&apos;.</source>
        <translation>Unbekannte Option „%1“.</translation>
    </message>
    <message>
        <source>Unknown options: %1.</source>
        <translation>Unbekannte Optionen: %1.</translation>
    </message>
    <message>
        <source>Missing value after &apos;%1&apos;.</source>
        <translation>Nach „%1“ fehlt der Wert.</translation>
    </message>
    <message>
        <source>Unexpected value after &apos;%1&apos;.</source>
        <translation>Unerwarteter Wert nach „%1“.</translation>
    </message>
</context>
</TS>
