<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="fr_FR" sourcelanguage="en_US">
<context>
    <name>KvCliHost</name>
    <message>
        <source>%1: the image %2 is missing</source>
        <translation>%1&#xa0;: l’image %2 est introuvable</translation>
    </message>
</context>
<context>
    <name>KvCliOutput</name>
    <message>
        <source>cannot be written: %1</source>
        <translation>écriture impossible&#xa0;: %1</translation>
    </message>
    <message>
        <source>note: %1</source>
        <translation>remarque&#xa0;: %1</translation>
    </message>
    <message>
        <source>&lt;standard output&gt;</source>
        <translation>&lt;sortie standard&gt;</translation>
    </message>
</context>
<context>
    <name>KvCliParser</name>
    <message>
        <source>Language of messages and reports, such as German or de; otherwise the system&apos;s.</source>
        <translation>Langue des messages et des rapports, p. ex. German ou de&#xa0;; sinon celle du système.</translation>
    </message>
    <message>
        <source>Prints a report: template and measurements in, PDF out.</source>
        <translation>Imprime un rapport&#xa0;: un modèle et des mesures donnent un PDF.</translation>
    </message>
    <message>
        <source>Prints the statistics of every measured value, in the table&apos;s own units.</source>
        <translation>Affiche les statistiques de chaque grandeur mesurée, dans les unités du tableau.</translation>
    </message>
    <message>
        <source>Says what a template holds and what would be skipped or refused.</source>
        <translation>Indique ce que contient un modèle et ce qui serait ignoré ou refusé.</translation>
    </message>
    <message>
        <source>Lists the block types and their settings with defaults.</source>
        <translation>Liste les types de blocs et leurs paramètres, avec les valeurs par défaut.</translation>
    </message>
    <message>
        <source>Turns measurements and a report template into a PDF report, without a display.</source>
        <translation>Produit un rapport PDF à partir de mesures et d’un modèle de rapport, sans écran.</translation>
    </message>
    <message>
        <source>Commands:</source>
        <translation>Commandes&#xa0;:</translation>
    </message>
    <message>
        <source>Options everywhere:</source>
        <translation>Options communes&#xa0;:</translation>
    </message>
    <message>
        <source>Shows this text, or that of a command.</source>
        <translation>Affiche ce texte ou celui d’une commande.</translation>
    </message>
    <message>
        <source>Shows the version.</source>
        <translation>Affiche la version.</translation>
    </message>
    <message>
        <source>Writes no notes and no progress.</source>
        <translation>N’affiche ni remarques ni progression.</translation>
    </message>
    <message>
        <source>Writes errors as one line of JSON each.</source>
        <translation>Écrit chaque erreur sur une ligne JSON.</translation>
    </message>
    <message>
        <source>&quot;-&quot; as a file name is standard input or output.</source>
        <translation>«&#xa0;-&#xa0;» comme nom de fichier désigne l’entrée ou la sortie standard.</translation>
    </message>
    <message>
        <source>Exit codes: 0 done, 1 the work failed, 2 wrong usage.</source>
        <translation>Codes de retour&#xa0;: 0 terminé, 1 échec, 2 utilisation incorrecte.</translation>
    </message>
    <message>
        <source>Shows this text.</source>
        <translation>Affiche ce texte.</translation>
    </message>
    <message>
        <source>Measurements: a session of the Measuring Desk.</source>
        <translation>Mesures&#xa0;: une session de Measuring Desk.</translation>
    </message>
    <message>
        <source>Measurements: a table (CSV, TSV, ImageJ results).</source>
        <translation>Mesures&#xa0;: un tableau (CSV, TSV, résultats d’ImageJ).</translation>
    </message>
    <message>
        <source>Unit of the table&apos;s values that state none, or Name=unit for one value. May be given several times.</source>
        <translation>Unité des valeurs du tableau qui n’en ont pas, ou Nom=unité pour une grandeur. Peut être indiquée plusieurs fois.</translation>
    </message>
    <message>
        <source>The table&apos;s column with the object types.</source>
        <translation>La colonne du tableau qui contient les types d’objets.</translation>
    </message>
    <message>
        <source>The table&apos;s column with the object names.</source>
        <translation>La colonne du tableau qui contient les noms des objets.</translation>
    </message>
    <message>
        <source>Decimal mark of the table: point or comma.</source>
        <translation>Séparateur décimal du tableau&#xa0;: point ou comma.</translation>
    </message>
    <message>
        <source>Significant digits of measured values; 0 is automatic.</source>
        <translation>Chiffres significatifs des valeurs mesurées&#xa0;; 0 = automatique.</translation>
    </message>
    <message>
        <source>Output: text, csv or json.</source>
        <translation>Sortie&#xa0;: text, csv ou json.</translation>
    </message>
    <message>
        <source>Output: text or json.</source>
        <translation>Sortie&#xa0;: text ou json.</translation>
    </message>
    <message>
        <source>The report template.</source>
        <translation>Le modèle de rapport.</translation>
    </message>
    <message>
        <source>The image that was measured.</source>
        <translation>L’image mesurée.</translation>
    </message>
    <message>
        <source>The PDF file to write.</source>
        <translation>Le fichier PDF à écrire.</translation>
    </message>
    <message>
        <source>Groups: object (type and value) or measurement.</source>
        <translation>Groupes&#xa0;: object (type et grandeur) ou measurement.</translation>
    </message>
    <message>
        <source>--format must be %1, not &quot;%2&quot;</source>
        <translation>--format doit être %1, et non «&#xa0;%2&#xa0;»</translation>
    </message>
    <message>
        <source>text, csv or json</source>
        <translation>text, csv ou json</translation>
    </message>
    <message>
        <source>text or json</source>
        <translation>text ou json</translation>
    </message>
    <message>
        <source>--group-by must be object or measurement, not &quot;%1&quot;</source>
        <translation>--group-by doit être object ou measurement, et non «&#xa0;%1&#xa0;»</translation>
    </message>
    <message>
        <source>--digits must be a number from 0 to 15, not &quot;%1&quot;</source>
        <translation>--digits doit être un nombre de 0 à 15, et non «&#xa0;%1&#xa0;»</translation>
    </message>
    <message>
        <source>give the measurements: either --session or --table</source>
        <translation>indiquez les mesures&#xa0;: --session ou bien --table</translation>
    </message>
    <message>
        <source>--decimal must be point or comma, not &quot;%1&quot;</source>
        <translation>--decimal doit être point ou comma, et non «&#xa0;%1&#xa0;»</translation>
    </message>
    <message>
        <source>the template is missing</source>
        <translation>modèle manquant</translation>
    </message>
    <message>
        <source>unexpected argument &quot;%1&quot;</source>
        <translation>argument inattendu «&#xa0;%1&#xa0;»</translation>
    </message>
    <message>
        <source>the file to write is missing: -o OUT.pdf</source>
        <translation>fichier à écrire manquant&#xa0;: -o OUT.pdf</translation>
    </message>
    <message>
        <source>only one file can be read from standard input</source>
        <translation>un seul fichier peut être lu depuis l’entrée standard</translation>
    </message>
    <message>
        <source>--language must be one of %1, not &quot;%2&quot;</source>
        <translation>--language doit être l’une de ces valeurs&#xa0;: %1, et non «&#xa0;%2&#xa0;»</translation>
    </message>
    <message>
        <source>a command is missing: render, stats, check or blocks</source>
        <translation>commande manquante&#xa0;: render, stats, check ou blocks</translation>
    </message>
    <message>
        <source>unknown command &quot;%1&quot;; it must be render, stats, check or blocks</source>
        <translation>commande inconnue «&#xa0;%1&#xa0;»&#xa0;; utilisez render, stats, check ou blocks</translation>
    </message>
    <message>
        <source>%1 (statreport --help tells more)</source>
        <translation>%1 (aide&#xa0;: statreport --help)</translation>
    </message>
</context>
<context>
    <name>KvCliSource</name>
    <message>
        <source>&lt;standard input&gt;</source>
        <translation>&lt;entrée standard&gt;</translation>
    </message>
    <message>
        <source>cannot be read</source>
        <translation>lecture impossible</translation>
    </message>
</context>
<context>
    <name>KvRenderCommand</name>
    <message>
        <source>is a directory</source>
        <translation>est un dossier</translation>
    </message>
    <message>
        <source>the file could not be written completely</source>
        <translation>le fichier n’a pas pu être écrit entièrement</translation>
    </message>
    <message>
        <source>cannot be written: %1</source>
        <translation>écriture impossible&#xa0;: %1</translation>
    </message>
</context>
<context>
    <name>KvStatsReport</name>
    <message>
        <source>Object Type</source>
        <translation>Type d’objet</translation>
    </message>
    <message>
        <source>Measurement Type</source>
        <translation>Grandeur</translation>
    </message>
    <message>
        <source>Unit</source>
        <translation>Unité</translation>
    </message>
    <message>
        <source>Count</source>
        <translation>Nombre</translation>
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
        <translation>Moyenne</translation>
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
        <translation>un booléen</translation>
    </message>
    <message>
        <source>a number</source>
        <translation>un nombre</translation>
    </message>
    <message>
        <source>a string</source>
        <translation>une chaîne</translation>
    </message>
    <message>
        <source>an array</source>
        <translation>un tableau JSON</translation>
    </message>
    <message>
        <source>an object</source>
        <translation>un objet</translation>
    </message>
    <message>
        <source>missing</source>
        <translation>rien</translation>
    </message>
    <message>
        <source>&quot;%1&quot; is missing</source>
        <translation>«&#xa0;%1&#xa0;» manque</translation>
    </message>
    <message>
        <source>&quot;%1&quot; is %2, not %3</source>
        <translation>«&#xa0;%1&#xa0;»&#xa0;: trouvé&#xa0;: %2, attendu&#xa0;: %3</translation>
    </message>
    <message>
        <source>&quot;%1&quot; has a value that the block refuses</source>
        <translation>«&#xa0;%1&#xa0;» a une valeur que le bloc refuse</translation>
    </message>
    <message>
        <source>the block refuses its settings</source>
        <translation>le bloc refuse ses paramètres</translation>
    </message>
    <message>
        <source>cannot be opened: %1</source>
        <translation>ouverture impossible&#xa0;: %1</translation>
    </message>
    <message>
        <source>cannot be read: %1</source>
        <translation>lecture impossible&#xa0;: %1</translation>
    </message>
    <message>
        <source>is larger than 256 MB</source>
        <translation>dépasse 256 Mo</translation>
    </message>
    <message>
        <source>is no JSON: %1</source>
        <translation>n’est pas du JSON&#xa0;: %1</translation>
    </message>
    <message>
        <source>is no template: the JSON document is no object</source>
        <translation>n’est pas un modèle&#xa0;: le document JSON n’est pas un objet</translation>
    </message>
    <message>
        <source>is %1; the page keeps its defaults</source>
        <translation>trouvé&#xa0;: %1&#xa0;; la page garde ses valeurs par défaut</translation>
    </message>
    <message>
        <source>is no whole number of pixels above 0</source>
        <translation>n’est pas un nombre entier de pixels supérieur à 0</translation>
    </message>
    <message>
        <source>page width %1 px</source>
        <translation>largeur de page %1&#xa0;px</translation>
    </message>
    <message>
        <source>is no fraction of the page width from 0 to 0.5</source>
        <translation>n’est pas une fraction de la largeur de page de 0 à 0,5</translation>
    </message>
    <message>
        <source>is %1, not an object; it is off</source>
        <translation>trouvé&#xa0;: %1, attendu&#xa0;: un objet&#xa0;; désactivé</translation>
    </message>
    <message>
        <source>is %1, not a boolean; it is off</source>
        <translation>trouvé&#xa0;: %1, attendu&#xa0;: un booléen&#xa0;; désactivé</translation>
    </message>
    <message>
        <source>is %1, not a string; the section is off</source>
        <translation>trouvé&#xa0;: %1, attendu&#xa0;: une chaîne&#xa0;; la section est désactivée</translation>
    </message>
    <message>
        <source>is %1, not an array; there are no blocks</source>
        <translation>trouvé&#xa0;: %1, attendu&#xa0;: un tableau JSON&#xa0;; il n’y a pas de blocs</translation>
    </message>
    <message>
        <source>is %1, not a string; the block is skipped</source>
        <translation>trouvé&#xa0;: %1, attendu&#xa0;: une chaîne&#xa0;; le bloc est ignoré</translation>
    </message>
    <message>
        <source>there is no block type &quot;%1&quot;; the block is skipped</source>
        <translation>le type de bloc «&#xa0;%1&#xa0;» n’existe pas&#xa0;; le bloc est ignoré</translation>
    </message>
    <message>
        <source>is %1, not an object</source>
        <translation>trouvé&#xa0;: %1, attendu&#xa0;: un objet</translation>
    </message>
    <message>
        <source>block &quot;%1&quot;</source>
        <translation>bloc «&#xa0;%1&#xa0;»</translation>
    </message>
    <message>
        <source>is %1, not %2; it is ignored</source>
        <translation>trouvé&#xa0;: %1, attendu&#xa0;: %2&#xa0;; ignoré</translation>
    </message>
    <message>
        <source>unknown keyword %1; it stays as it is</source>
        <translation>champ inconnu %1&#xa0;; il reste tel quel</translation>
    </message>
</context>
<context>
    <name>KvTemplateCommands</name>
    <message>
        <source>warning: %1</source>
        <translation>avertissement&#xa0;: %1</translation>
    </message>
</context>
<context>
    <name>KvTerminalProgress</name>
    <message>
        <source>page %1 of %2</source>
        <translation>page %1 sur %2</translation>
    </message>
</context>
<context>
    <name>QCommandLineParser</name>
    <message>
        <source>Usage: %1</source>
        <translation>Utilisation&#xa0;: %1</translation>
    </message>
    <message>
        <source>[options]</source>
        <translation>[options]</translation>
    </message>
    <message>
        <source>Options:</source>
        <translation>Options&#xa0;:</translation>
    </message>
    <message>
        <source>Arguments:</source>
        <translation>Arguments&#xa0;:</translation>
    </message>
    <message>
        <source>Unknown option &apos;%1&apos;.</source>
        <translation>Option inconnue «&#xa0;%1&#xa0;».</translation>
    </message>
    <message>
        <source>Unknown options: %1.</source>
        <translation>Options inconnues&#xa0;: %1.</translation>
    </message>
    <message>
        <source>Missing value after &apos;%1&apos;.</source>
        <translation>Il manque une valeur après «&#xa0;%1&#xa0;».</translation>
    </message>
    <message>
        <source>Unexpected value after &apos;%1&apos;.</source>
        <translation>Valeur inattendue après «&#xa0;%1&#xa0;».</translation>
    </message>
</context>
</TS>
