<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="de_DE" sourcelanguage="en_US">
<context>
    <name>KvDeskActions</name>
    <message>
        <source>&amp;New session</source>
        <translation>&amp;Neue Sitzung</translation>
    </message>
    <message>
        <source>Start an empty session</source>
        <translation>Eine leere Sitzung beginnen</translation>
    </message>
    <message>
        <source>Open &amp;image...</source>
        <translation>Bi&amp;ld öffnen...</translation>
    </message>
    <message>
        <source>Open image</source>
        <translation>Bild öffnen</translation>
    </message>
    <message>
        <source>&amp;Open session...</source>
        <translation>Sitzung &amp;öffnen...</translation>
    </message>
    <message>
        <source>Open session</source>
        <translation>Sitzung öffnen</translation>
    </message>
    <message>
        <source>Import &amp;table...</source>
        <translation>&amp;Tabelle importieren...</translation>
    </message>
    <message>
        <source>Import table of measured values</source>
        <translation>Tabelle mit Messwerten importieren</translation>
    </message>
    <message>
        <source>&amp;Save session</source>
        <translation>&amp;Sitzung speichern</translation>
    </message>
    <message>
        <source>Save session</source>
        <translation>Sitzung speichern</translation>
    </message>
    <message>
        <source>Save session &amp;as...</source>
        <translation>Sitzung speichern &amp;unter...</translation>
    </message>
    <message>
        <source>Save session to another file</source>
        <translation>Sitzung in einer anderen Datei speichern</translation>
    </message>
    <message>
        <source>&amp;Quit</source>
        <translation>&amp;Beenden</translation>
    </message>
    <message>
        <source>Quit the program</source>
        <translation>Programm beenden</translation>
    </message>
    <message>
        <source>Zoom &amp;in</source>
        <translation>&amp;Vergrößern</translation>
    </message>
    <message>
        <source>Zoom in</source>
        <translation>Vergrößern</translation>
    </message>
    <message>
        <source>Zoom &amp;out</source>
        <translation>Ver&amp;kleinern</translation>
    </message>
    <message>
        <source>Zoom out</source>
        <translation>Verkleinern</translation>
    </message>
    <message>
        <source>&amp;Fit to window</source>
        <translation>An &amp;Fenster anpassen</translation>
    </message>
    <message>
        <source>Show the whole image</source>
        <translation>Das ganze Bild anzeigen</translation>
    </message>
    <message>
        <source>&amp;Actual size</source>
        <translation>&amp;Originalgröße</translation>
    </message>
    <message>
        <source>Show the image at 100 %</source>
        <translation>Bild mit 100&#xa0;% anzeigen</translation>
    </message>
    <message>
        <source>&amp;Measured values</source>
        <translation>Mess&amp;werte</translation>
    </message>
    <message>
        <source>Show or hide the measured values</source>
        <translation>Messwerte ein- oder ausblenden</translation>
    </message>
    <message>
        <source>Stat&amp;us log</source>
        <translation>&amp;Statusprotokoll</translation>
    </message>
    <message>
        <source>Show or hide the status log</source>
        <translation>Statusprotokoll ein- oder ausblenden</translation>
    </message>
    <message>
        <source>&amp;Dark or light theme</source>
        <translation>&amp;Dunkles oder helles Design</translation>
    </message>
    <message>
        <source>Change between the dark and the light theme</source>
        <translation>Zwischen dunklem und hellem Design wechseln</translation>
    </message>
    <message>
        <source>Settin&amp;gs...</source>
        <translation>E&amp;instellungen...</translation>
    </message>
    <message>
        <source>Settings</source>
        <translation>Einstellungen</translation>
    </message>
    <message>
        <source>&amp;About Measuring Desk</source>
        <translation>&amp;Über Measuring Desk</translation>
    </message>
    <message>
        <source>About Measuring Desk</source>
        <translation>Über Measuring Desk</translation>
    </message>
    <message>
        <source>%1 (%2)</source>
        <comment>command (shortcut)</comment>
        <translation>%1 (%2)</translation>
    </message>
    <message>
        <source>&amp;Export measured values...</source>
        <translation>Messwerte &amp;exportieren...</translation>
    </message>
    <message>
        <source>Export measured values as a table</source>
        <translation>Messwerte als Tabelle exportieren</translation>
    </message>
    <message>
        <source>&amp;Undo</source>
        <translation>&amp;Rückgängig</translation>
    </message>
    <message>
        <source>Undo the last step</source>
        <translation>Letzten Schritt rückgängig machen</translation>
    </message>
    <message>
        <source>&amp;Redo</source>
        <translation>&amp;Wiederholen</translation>
    </message>
    <message>
        <source>Redo what was undone</source>
        <translation>Rückgängig gemachten Schritt wiederholen</translation>
    </message>
    <message>
        <source>Cu&amp;t</source>
        <translation>&amp;Ausschneiden</translation>
    </message>
    <message>
        <source>Cut the selected objects</source>
        <translation>Ausgewählte Objekte ausschneiden</translation>
    </message>
    <message>
        <source>&amp;Copy</source>
        <translation>&amp;Kopieren</translation>
    </message>
    <message>
        <source>Copy the selected objects</source>
        <translation>Ausgewählte Objekte kopieren</translation>
    </message>
    <message>
        <source>&amp;Paste</source>
        <translation>&amp;Einfügen</translation>
    </message>
    <message>
        <source>Paste copied objects</source>
        <translation>Kopierte Objekte einfügen</translation>
    </message>
    <message>
        <source>&amp;Delete</source>
        <translation>&amp;Löschen</translation>
    </message>
    <message>
        <source>Delete the selected objects</source>
        <translation>Ausgewählte Objekte löschen</translation>
    </message>
    <message>
        <source>Select &amp;all</source>
        <translation>Alle&amp;s auswählen</translation>
    </message>
    <message>
        <source>Select all objects on the image</source>
        <translation>Alle Objekte im Bild auswählen</translation>
    </message>
    <message>
        <source>Re&amp;name</source>
        <translation>&amp;Umbenennen</translation>
    </message>
    <message>
        <source>Give the selected object a name</source>
        <translation>Dem ausgewählten Objekt einen Namen geben</translation>
    </message>
    <message>
        <source>&amp;Find measured values</source>
        <translation>&amp;Messwerte suchen</translation>
    </message>
    <message>
        <source>Filter the measured values</source>
        <translation>Messwerte filtern</translation>
    </message>
    <message>
        <source>&amp;Select</source>
        <translation>&amp;Auswählen</translation>
    </message>
    <message>
        <source>Select and change objects</source>
        <translation>Objekte auswählen und ändern</translation>
    </message>
    <message>
        <source>&amp;Line</source>
        <translation>&amp;Linie</translation>
    </message>
    <message>
        <source>Measure a length</source>
        <translation>Eine Länge messen</translation>
    </message>
    <message>
        <source>&amp;Polyline</source>
        <translation>&amp;Polylinie</translation>
    </message>
    <message>
        <source>Measure the length of a way</source>
        <translation>Länge eines Linienzugs messen</translation>
    </message>
    <message>
        <source>Parallel &amp;distance</source>
        <translation>Parallelabstan&amp;d</translation>
    </message>
    <message>
        <source>Measure the distance of a point from a line</source>
        <translation>Abstand eines Punktes von einer Linie messen</translation>
    </message>
    <message>
        <source>&amp;Arc</source>
        <translation>&amp;Bogen</translation>
    </message>
    <message>
        <source>Measure an arc through three points</source>
        <translation>Einen Bogen durch drei Punkte messen</translation>
    </message>
    <message>
        <source>&amp;Circle</source>
        <translation>&amp;Kreis</translation>
    </message>
    <message>
        <source>Measure a circle</source>
        <translation>Einen Kreis messen</translation>
    </message>
    <message>
        <source>&amp;Rectangle</source>
        <translation>&amp;Rechteck</translation>
    </message>
    <message>
        <source>Measure a rectangle</source>
        <translation>Ein Rechteck messen</translation>
    </message>
    <message>
        <source>Poly&amp;gon</source>
        <translation>Poly&amp;gon</translation>
    </message>
    <message>
        <source>Measure the area of a polygon</source>
        <translation>Fläche eines Polygons messen</translation>
    </message>
    <message>
        <source>Cou&amp;nter</source>
        <translation>&amp;Zähler</translation>
    </message>
    <message>
        <source>Count by clicks</source>
        <translation>Durch Klicken zählen</translation>
    </message>
    <message>
        <source>&amp;Text note</source>
        <translation>&amp;Textnotiz</translation>
    </message>
    <message>
        <source>Write on the image</source>
        <translation>In das Bild schreiben</translation>
    </message>
    <message>
        <source>Scale &amp;bar</source>
        <translation>&amp;Maßstabsbalken</translation>
    </message>
    <message>
        <source>Draw a scale bar</source>
        <translation>Einen Maßstabsbalken zeichnen</translation>
    </message>
    <message>
        <source>Cal&amp;ibration...</source>
        <translation>Kalibr&amp;ierung...</translation>
    </message>
    <message>
        <source>Say how large a pixel of the image is</source>
        <translation>Angeben, wie groß ein Pixel des Bildes ist</translation>
    </message>
    <message>
        <source>Use the file&apos;s pixel size</source>
        <translation>Pixelgröße der Datei verwenden</translation>
    </message>
    <message>
        <source>Measure with the pixel size that the image&apos;s file states</source>
        <translation>Mit der Pixelgröße messen, die in der Bilddatei angegeben ist</translation>
    </message>
    <message>
        <source>&amp;Take snapshot</source>
        <translation>&amp;Aufnahme machen</translation>
    </message>
    <message>
        <source>Save the image to the gallery</source>
        <translation>Bild in der Galerie speichern</translation>
    </message>
    <message>
        <source>Snapshots &amp;with measurements</source>
        <translation>Aufnahmen mit &amp;Messungen</translation>
    </message>
    <message>
        <source>Draw the measured objects on snapshots</source>
        <translation>Messobjekte in Aufnahmen einzeichnen</translation>
    </message>
    <message>
        <source>&amp;Freeze</source>
        <translation>&amp;Einfrieren</translation>
    </message>
    <message>
        <source>Freeze the live image</source>
        <translation>Livebild einfrieren</translation>
    </message>
    <message>
        <source>&amp;Labels on the image</source>
        <translation>&amp;Beschriftungen im Bild</translation>
    </message>
    <message>
        <source>Show or hide the labels of objects</source>
        <translation>Beschriftungen der Objekte ein- oder ausblenden</translation>
    </message>
    <message>
        <source>&amp;Rulers</source>
        <translation>&amp;Lineale</translation>
    </message>
    <message>
        <source>Show or hide the rulers</source>
        <translation>Lineale ein- oder ausblenden</translation>
    </message>
    <message>
        <source>&amp;Scale bar on the image</source>
        <translation>&amp;Maßstabsbalken im Bild</translation>
    </message>
    <message>
        <source>Show or hide the scale bar, on reports, too</source>
        <translation>Maßstabsbalken ein- oder ausblenden, auch in Berichten</translation>
    </message>
    <message>
        <source>&amp;Gallery</source>
        <translation>&amp;Galerie</translation>
    </message>
    <message>
        <source>Show or hide the gallery</source>
        <translation>Galerie ein- oder ausblenden</translation>
    </message>
    <message>
        <source>&amp;Start page</source>
        <translation>&amp;Startseite</translation>
    </message>
    <message>
        <source>Show the first steps, the examples and the recent sessions</source>
        <translation>Erste Schritte, Beispiele und zuletzt verwendete Sitzungen anzeigen</translation>
    </message>
    <message>
        <source>&amp;User guide</source>
        <translation>&amp;Benutzerhandbuch</translation>
    </message>
    <message>
        <source>Read the user guide</source>
        <translation>Benutzerhandbuch lesen</translation>
    </message>
</context>
<context>
    <name>KvDeskAutosave</name>
    <message>
        <source>the folder &quot;%1&quot; cannot be written</source>
        <translation>in den Ordner „%1“ kann nicht geschrieben werden</translation>
    </message>
    <message>
        <source>Unsaved changes are not being copied: %1</source>
        <translation>Ungespeicherte Änderungen werden nicht gesichert: %1</translation>
    </message>
</context>
<context>
    <name>KvDeskCalibrationCommands</name>
    <message>
        <source>The session measures with it already</source>
        <translation>Die Sitzung misst bereits damit</translation>
    </message>
    <message>
        <source>The image&apos;s file does not state one</source>
        <translation>In der Bilddatei ist keine angegeben</translation>
    </message>
</context>
<context>
    <name>KvDeskCalibrationDialog</name>
    <message>
        <source>Calibration</source>
        <translation>Kalibrierung</translation>
    </message>
    <message>
        <source>Objective</source>
        <translation>Objektiv</translation>
    </message>
    <message>
        <source>Choose an objective, or type the name of a new one</source>
        <translation>Ein Objektiv auswählen oder den Namen eines neuen eingeben</translation>
    </message>
    <message>
        <source>Such as 10x</source>
        <translation>Z.&#xa0;B. 10x</translation>
    </message>
    <message>
        <source>In use</source>
        <translation>Aktuell</translation>
    </message>
    <message>
        <source>New calibration</source>
        <translation>Neue Kalibrierung</translation>
    </message>
    <message>
        <source>Known distance</source>
        <translation>Bekannte Strecke</translation>
    </message>
    <message>
        <source>Image file</source>
        <translation>Bilddatei</translation>
    </message>
    <message>
        <source>Typed</source>
        <translation>Eingabe</translation>
    </message>
    <message>
        <source>Name</source>
        <translation>Name</translation>
    </message>
    <message>
        <source>Who</source>
        <translation>Erstellt von</translation>
    </message>
    <message>
        <source>Note</source>
        <translation>Notiz</translation>
    </message>
    <message>
        <source>Calibrate</source>
        <translation>Kalibrieren</translation>
    </message>
    <message>
        <source>History of the objective</source>
        <translation>Kalibrierverlauf</translation>
    </message>
    <message>
        <source>Calibrations of this objective appear here</source>
        <translation>Hier erscheinen die Kalibrierungen dieses Objektivs</translation>
    </message>
    <message>
        <source>Use again</source>
        <translation>Erneut verwenden</translation>
    </message>
    <message>
        <source>Close</source>
        <translation>Schließen</translation>
    </message>
    <message>
        <source>New pixel size: %1</source>
        <translation>Neue Pixelgröße: %1</translation>
    </message>
    <message>
        <source>No pixel size yet</source>
        <translation>Noch keine Pixelgröße</translation>
    </message>
    <message>
        <source>Measure with this pixel size and remember it</source>
        <translation>Mit dieser Pixelgröße messen und sie speichern</translation>
    </message>
    <message>
        <source>Complete the fields above first</source>
        <translation>Zuerst die Felder oben ausfüllen</translation>
    </message>
    <message>
        <source>Measure with the selected calibration</source>
        <translation>Mit der ausgewählten Kalibrierung messen</translation>
    </message>
    <message>
        <source>Select a calibration in the table first</source>
        <translation>Zuerst eine Kalibrierung in der Tabelle auswählen</translation>
    </message>
</context>
<context>
    <name>KvDeskCalibrationHistory</name>
    <message>
        <source>Date</source>
        <translation>Datum</translation>
    </message>
    <message>
        <source>Who</source>
        <translation>Erstellt von</translation>
    </message>
    <message>
        <source>Pixel size</source>
        <translation>Pixelgröße</translation>
    </message>
    <message>
        <source>Origin</source>
        <translation>Herkunft</translation>
    </message>
    <message>
        <source>Name</source>
        <translation>Name</translation>
    </message>
</context>
<context>
    <name>KvDeskCalibrationText</name>
    <message>
        <source>%1 μm</source>
        <comment>size of a pixel</comment>
        <translation>%1&#xa0;μm</translation>
    </message>
    <message>
        <source>%1 × %2 μm</source>
        <comment>width and height of a pixel</comment>
        <translation>%1 × %2&#xa0;μm</translation>
    </message>
    <message>
        <source>Known distance</source>
        <translation>Bekannte Strecke</translation>
    </message>
    <message>
        <source>Image file</source>
        <translation>Bilddatei</translation>
    </message>
    <message>
        <source>Typed</source>
        <translation>Eingabe</translation>
    </message>
    <message>
        <source>Not calibrated</source>
        <translation>Nicht kalibriert</translation>
    </message>
</context>
<context>
    <name>KvDeskCalibrationWay</name>
    <message>
        <source>Type a number such as 5.3 or 5,3</source>
        <translation>Geben Sie eine Zahl wie 5.3 oder 5,3 ein</translation>
    </message>
    <message>
        <source>A pixel measures between %1 and %2</source>
        <translation>Ein Pixel misst zwischen %1 und %2</translation>
    </message>
</context>
<context>
    <name>KvDeskCalibrator</name>
    <message>
        <source>%1 states pixels of %2; the session measures with %3</source>
        <translation>%1 gibt eine Pixelgröße von %2 an; die Sitzung misst mit %3</translation>
    </message>
    <message>
        <source>%1 states pixels of %2; the session measures in pixels</source>
        <translation>%1 gibt eine Pixelgröße von %2 an; die Sitzung misst in Pixeln</translation>
    </message>
    <message>
        <source>Calibrated: %1, %2 per pixel</source>
        <extracomment>%1 is an objective or a file, %2 the size of a pixel with its unit</extracomment>
        <translation>Kalibriert: %1, %2 pro Pixel</translation>
    </message>
</context>
<context>
    <name>KvDeskCommandLine</name>
    <message>
        <source>There is no theme &quot;%1&quot;: use %2</source>
        <translation>Es gibt kein Design „%1“: Verwenden Sie %2</translation>
    </message>
    <message>
        <source> or </source>
        <translation> oder </translation>
    </message>
    <message>
        <source>Usage: measuringdesk [OPTION...] [SESSION|IMAGE|TABLE|FOLDER|VIDEO...]
Measures objects on images and shows their values.

  --session FILE      open a session
  --image FILE        open an image
  --table FILE        import a table of measured values
  --theme Dark|Light  theme of this run
  --plugins DIR       look for plug-ins here, too; can be given several times
  --help              show this text
  --version           show the version

The environment variable STATREPORT_PLUGINS names more folders with plug-ins.
</source>
        <translation>Aufruf: measuringdesk [OPTION...] [SITZUNG|BILD|TABELLE|ORDNER|VIDEO...]
Misst Objekte in Bildern und zeigt ihre Messwerte.

  --session DATEI     eine Sitzung öffnen
  --image DATEI       ein Bild öffnen
  --table DATEI       eine Tabelle mit Messwerten importieren
  --theme Dark|Light  Design für diesen Programmlauf
  --plugins ORDNER    auch hier nach Plug-ins suchen; mehrfach möglich
  --help              diesen Text anzeigen
  --version           die Version anzeigen

Die Umgebungsvariable STATREPORT_PLUGINS nennt weitere Ordner mit Plug-ins.
</translation>
    </message>
    <message>
        <source>%1 (measuringdesk --help tells more)</source>
        <translation>%1 (weitere Hilfe: measuringdesk --help)</translation>
    </message>
</context>
<context>
    <name>KvDeskCounterBar</name>
    <message>
        <source>Clicks count for</source>
        <translation>Klicks zählen für</translation>
    </message>
    <message>
        <source>The counter that gets the clicks (1 to 9)</source>
        <translation>Der Zähler, für den die Klicks gelten (1 bis 9)</translation>
    </message>
    <message>
        <source>Count another class</source>
        <translation>Eine weitere Klasse zählen</translation>
    </message>
    <message>
        <source>A right click takes a place away</source>
        <translation>Ein Rechtsklick entfernt eine Markierung</translation>
    </message>
    <message>
        <source>A new counter</source>
        <translation>Neuer Zähler</translation>
    </message>
</context>
<context>
    <name>KvDeskEditCommands</name>
    <message>
        <source>&amp;Undo %1</source>
        <extracomment>%1 is what is undone or redone, such as &quot;move of Line 3&quot;</extracomment>
        <translation>&amp;Rückgängig: %1</translation>
    </message>
    <message>
        <source>&amp;Undo</source>
        <translation>&amp;Rückgängig</translation>
    </message>
    <message>
        <source>&amp;Redo %1</source>
        <translation>&amp;Wiederholen: %1</translation>
    </message>
    <message>
        <source>&amp;Redo</source>
        <translation>&amp;Wiederholen</translation>
    </message>
    <message>
        <source>Nothing was done yet</source>
        <translation>Es gibt noch nichts rückgängig zu machen</translation>
    </message>
    <message>
        <source>Nothing was undone</source>
        <translation>Es gibt nichts zu wiederholen</translation>
    </message>
    <message>
        <source>Select an object first</source>
        <translation>Zuerst ein Objekt auswählen</translation>
    </message>
    <message>
        <source>Select one object first</source>
        <translation>Zuerst ein einzelnes Objekt auswählen</translation>
    </message>
    <message>
        <source>No measured objects were copied</source>
        <translation>Es wurden keine Messobjekte kopiert</translation>
    </message>
    <message>
        <source>Finish or cancel what you have begun first</source>
        <translation>Schließen Sie zuerst ab, was Sie begonnen haben, oder brechen Sie es ab</translation>
    </message>
</context>
<context>
    <name>KvDeskExamples</name>
    <message>
        <source>Coin: first length</source>
        <translation>Münze: erste Länge</translation>
    </message>
    <message>
        <source>Plate: dimensions</source>
        <translation>Platte: Maße</translation>
    </message>
    <message>
        <source>Cells: counting</source>
        <translation>Zellen: Zählung</translation>
    </message>
    <message>
        <source>Fibres: statistics</source>
        <translation>Fasern: Statistik</translation>
    </message>
</context>
<context>
    <name>KvDeskExportCommand</name>
    <message>
        <source>Nothing was measured yet</source>
        <translation>Es wurde noch nichts gemessen</translation>
    </message>
    <message>
        <source>Measured values</source>
        <comment>file name</comment>
        <translation>Messwerte</translation>
    </message>
    <message>
        <source>JSON files</source>
        <translation>JSON-Dateien</translation>
    </message>
    <message>
        <source>CSV tables</source>
        <translation>CSV-Tabellen</translation>
    </message>
    <message>
        <source>Export measured values</source>
        <translation>Messwerte exportieren</translation>
    </message>
    <message>
        <source>Export cancelled: %1</source>
        <translation>Export abgebrochen: %1</translation>
    </message>
    <message>
        <source>The table &quot;%1&quot; was not written.</source>
        <translation>Die Tabelle „%1“ wurde nicht geschrieben.</translation>
    </message>
    <message>
        <source>Measured values exported: %1</source>
        <translation>Messwerte exportiert: %1</translation>
    </message>
    <message>
        <source>Exporting measured values</source>
        <translation>Messwerte werden exportiert</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Abbrechen</translation>
    </message>
</context>
<context>
    <name>KvDeskExportDialog</name>
    <message>
        <source>Export measured values</source>
        <translation>Messwerte exportieren</translation>
    </message>
    <message>
        <source>Table</source>
        <translation>Tabelle</translation>
    </message>
    <message>
        <source>Numbers</source>
        <translation>Zahlen</translation>
    </message>
    <message>
        <source>Byte order mark, for spreadsheets that do not expect UTF-8</source>
        <translation>Byte Order Mark (BOM), für Tabellenkalkulationen, die kein UTF-8 erwarten</translation>
    </message>
    <message>
        <source>Apostrophe before names that spreadsheets take for formulas</source>
        <translation>Apostroph vor Namen, die Tabellenkalkulationen für Formeln halten</translation>
    </message>
    <message>
        <source>Changes names that begin with =, +, - or @: they are others when the table is imported again</source>
        <translation>Ändert Namen, die mit =, +, - oder @ beginnen: Wird die Tabelle wieder importiert, heißen sie anders</translation>
    </message>
    <message>
        <source>Export...</source>
        <translation>Exportieren...</translation>
    </message>
    <message>
        <source>CSV, one row per value</source>
        <translation>CSV, eine Zeile je Wert</translation>
    </message>
    <message>
        <source>CSV, one row per object</source>
        <translation>CSV, eine Zeile je Objekt</translation>
    </message>
    <message>
        <source>JSON</source>
        <translation>JSON</translation>
    </message>
    <message>
        <source>1.5, commas between the fields</source>
        <translation>1.5, Kommas zwischen den Feldern</translation>
    </message>
    <message>
        <source>1,5, semicolons between the fields (spreadsheets, %1)</source>
        <extracomment>%1 is the name of a language</extracomment>
        <translation>1,5, Semikolons zwischen den Feldern (Tabellen, %1)</translation>
    </message>
    <message>
        <source>1.5, commas between the fields (spreadsheets, %1)</source>
        <translation>1.5, Kommas zwischen den Feldern (Tabellen, %1)</translation>
    </message>
    <message>
        <source>For statistics programs. Can be imported here again.</source>
        <translation>Für Statistikprogramme. Kann hier wieder importiert werden.</translation>
    </message>
    <message>
        <source>For spreadsheets. Headings name the units.</source>
        <translation>Für Tabellenkalkulationen. Die Spaltenüberschriften nennen die Einheiten.</translation>
    </message>
    <message>
        <source>For programs. Numbers always have a decimal point.</source>
        <translation>Für Programme. Zahlen haben immer einen Dezimalpunkt.</translation>
    </message>
    <message>
        <source>No measured object is selected</source>
        <translation>Es ist kein Messobjekt ausgewählt</translation>
    </message>
    <message>
        <source>Concerns CSV tables only</source>
        <translation>Betrifft nur CSV-Tabellen</translation>
    </message>
    <message numerus="yes">
        <source>Only the selected object(s) (%n)</source>
        <translation>
            <numerusform>Nur das ausgewählte Objekt (%n)</numerusform>
            <numerusform>Nur die ausgewählten Objekte (%n)</numerusform>
        </translation>
    </message>
</context>
<context>
    <name>KvDeskExposureControl</name>
    <message>
        <source>E&amp;xposure</source>
        <translation>B&amp;elichtung</translation>
    </message>
    <message>
        <source>Exposure time of the camera</source>
        <translation>Belichtungszeit der Kamera</translation>
    </message>
    <message>
        <source> ms</source>
        <comment>milliseconds</comment>
        <translation> ms</translation>
    </message>
</context>
<context>
    <name>KvDeskFileCommands</name>
    <message>
        <source>Sessions</source>
        <translation>Sitzungen</translation>
    </message>
    <message>
        <source>All files</source>
        <translation>Alle Dateien</translation>
    </message>
    <message>
        <source>Unsaved changes</source>
        <translation>Ungespeicherte Änderungen</translation>
    </message>
    <message>
        <source>Save the changes to &quot;%1&quot;?</source>
        <translation>Änderungen an „%1“ speichern?</translation>
    </message>
    <message>
        <source>The session &quot;%1&quot; was not opened.</source>
        <translation>Die Sitzung „%1“ wurde nicht geöffnet.</translation>
    </message>
    <message>
        <source>Image missing</source>
        <translation>Bild fehlt</translation>
    </message>
    <message>
        <source>Open the session without its image?</source>
        <translation>Sitzung ohne ihr Bild öffnen?</translation>
    </message>
    <message>
        <source>The image &quot;%1&quot; was not opened.</source>
        <translation>Das Bild „%1“ wurde nicht geöffnet.</translation>
    </message>
    <message>
        <source>Image opened: %1</source>
        <translation>Bild geöffnet: %1</translation>
    </message>
    <message>
        <source>The table &quot;%1&quot; was not imported.</source>
        <translation>Die Tabelle „%1“ wurde nicht importiert.</translation>
    </message>
    <message>
        <source>%1: %2</source>
        <comment>file, remark</comment>
        <translation>%1: %2</translation>
    </message>
    <message>
        <source>The session &quot;%1&quot; was not saved.</source>
        <translation>Die Sitzung „%1“ wurde nicht gespeichert.</translation>
    </message>
    <message>
        <source>Session saved: %1</source>
        <translation>Sitzung gespeichert: %1</translation>
    </message>
    <message>
        <source>Open session</source>
        <translation>Sitzung öffnen</translation>
    </message>
    <message>
        <source>Open image</source>
        <translation>Bild öffnen</translation>
    </message>
    <message>
        <source>Images</source>
        <translation>Bilder</translation>
    </message>
    <message>
        <source>Import table</source>
        <translation>Tabelle importieren</translation>
    </message>
    <message>
        <source>Tables</source>
        <translation>Tabellen</translation>
    </message>
    <message>
        <source>Save session</source>
        <translation>Sitzung speichern</translation>
    </message>
    <message>
        <source>Measuring Desk</source>
        <translation>Measuring Desk</translation>
    </message>
    <message>
        <source>Only one session can be open; not opened: %1</source>
        <translation>Es kann nur eine Sitzung geöffnet sein; nicht geöffnet: %1</translation>
    </message>
    <message>
        <source>Neither a session, an image nor a table: %1</source>
        <translation>Weder Sitzung noch Bild noch Tabelle: %1</translation>
    </message>
    <message>
        <source>There is not enough memory</source>
        <translation>Der Arbeitsspeicher reicht nicht aus</translation>
    </message>
    <message>
        <source>Opening &quot;%1&quot;</source>
        <translation>„%1“ wird geöffnet</translation>
    </message>
    <message>
        <source>The measurements were not restored.</source>
        <translation>Die Messungen wurden nicht wiederhergestellt.</translation>
    </message>
    <message>
        <source>Restoring measurements</source>
        <translation>Messungen werden wiederhergestellt</translation>
    </message>
    <message>
        <source>Importing &quot;%1&quot;</source>
        <translation>„%1“ wird importiert</translation>
    </message>
    <message>
        <source>Saving &quot;%1&quot;</source>
        <translation>„%1“ wird gespeichert</translation>
    </message>
    <message>
        <source>Session changed by another program</source>
        <translation>Sitzung von einem anderen Programm geändert</translation>
    </message>
    <message>
        <source>&quot;%1&quot; was changed by another program. Overwrite its changes?</source>
        <translation>„%1“ wurde von einem anderen Programm geändert. Dessen Änderungen überschreiben?</translation>
    </message>
    <message>
        <source>Overwrite</source>
        <translation>Überschreiben</translation>
    </message>
    <message>
        <source>Save as...</source>
        <translation>Speichern unter...</translation>
    </message>
    <message numerus="yes">
        <source>%n files were not opened.</source>
        <extracomment>%n is 2 at least</extracomment>
        <translation>
            <numerusform>%n Datei wurde nicht geöffnet.</numerusform>
            <numerusform>%n Dateien wurden nicht geöffnet.</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Session opened: %1 (%n object(s))</source>
        <translation>
            <numerusform>Sitzung geöffnet: %1 (%n Objekt)</numerusform>
            <numerusform>Sitzung geöffnet: %1 (%n Objekte)</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Measurements restored: %1 (%n object(s))</source>
        <translation>
            <numerusform>Messungen wiederhergestellt: %1 (%n Objekt)</numerusform>
            <numerusform>Messungen wiederhergestellt: %1 (%n Objekte)</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Table imported: %1 (%n object(s))</source>
        <translation>
            <numerusform>Tabelle importiert: %1 (%n Objekt)</numerusform>
            <numerusform>Tabelle importiert: %1 (%n Objekte)</numerusform>
        </translation>
    </message>
</context>
<context>
    <name>KvDeskFilePixelSize</name>
    <message>
        <source>%1 states pixels of %2.</source>
        <comment>file, size</comment>
        <translation>%1 gibt eine Pixelgröße von %2 an.</translation>
    </message>
    <message>
        <source>The image&apos;s file does not state how large its pixels are.</source>
        <translation>In der Bilddatei ist nicht angegeben, wie groß ihre Pixel sind.</translation>
    </message>
</context>
<context>
    <name>KvDeskGallery</name>
    <message>
        <source>Gallery</source>
        <translation>Galerie</translation>
    </message>
    <message>
        <source>Hide the gallery</source>
        <translation>Galerie ausblenden</translation>
    </message>
    <message>
        <source>&amp;Open image</source>
        <translation>&amp;Bild öffnen</translation>
    </message>
    <message>
        <source>&amp;Show in folder</source>
        <translation>Im &amp;Ordner anzeigen</translation>
    </message>
    <message>
        <source>&amp;Copy path</source>
        <translation>&amp;Pfad kopieren</translation>
    </message>
    <message>
        <source>&amp;Move to trash...</source>
        <translation>In den Papier&amp;korb verschieben...</translation>
    </message>
    <message>
        <source>Choose &amp;folder...</source>
        <translation>Ordner &amp;wählen...</translation>
    </message>
    <message>
        <source>Show the images of a folder</source>
        <translation>Bilder eines Ordners anzeigen</translation>
    </message>
    <message>
        <source>Save s&amp;napshots in this folder</source>
        <translation>Aufnahmen in diesem Ordner &amp;speichern</translation>
    </message>
    <message>
        <source>Folder of the gallery</source>
        <translation>Ordner der Galerie</translation>
    </message>
    <message>
        <source>More commands of the gallery</source>
        <translation>Weitere Befehle der Galerie</translation>
    </message>
    <message>
        <source>Snapshots</source>
        <translation>Aufnahmen</translation>
    </message>
    <message>
        <source>Choose folder</source>
        <translation>Ordner wählen</translation>
    </message>
    <message>
        <source>Snapshots are saved in %1</source>
        <translation>Aufnahmen werden in %1 gespeichert</translation>
    </message>
    <message>
        <source>Snapshots (%1) and the images of a folder appear here; drag them onto report pages</source>
        <translation>Hier erscheinen Aufnahmen (%1) und die Bilder eines Ordners; ziehen Sie sie auf Berichtsseiten</translation>
    </message>
    <message>
        <source>There are no images in %1</source>
        <translation>In %1 sind keine Bilder</translation>
    </message>
    <message>
        <source>The folder %1 does not exist</source>
        <translation>Der Ordner %1 ist nicht vorhanden</translation>
    </message>
    <message>
        <source>Select an image first</source>
        <translation>Zuerst ein Bild auswählen</translation>
    </message>
    <message>
        <source>Snapshots are saved in this folder already</source>
        <translation>Aufnahmen werden bereits in diesem Ordner gespeichert</translation>
    </message>
    <message>
        <source>Move &quot;%1&quot; to the trash?</source>
        <translation>„%1“ in den Papierkorb verschieben?</translation>
    </message>
    <message>
        <source>Move to trash</source>
        <translation>In den Papierkorb verschieben</translation>
    </message>
    <message>
        <source>Moved to the trash: %1</source>
        <translation>In den Papierkorb verschoben: %1</translation>
    </message>
    <message>
        <source>Not moved to the trash: %1</source>
        <translation>Nicht in den Papierkorb verschoben: %1</translation>
    </message>
    <message>
        <source>Measuring Desk</source>
        <translation>Measuring Desk</translation>
    </message>
    <message>
        <source>The files are still there. They are write-protected, or there is no trash for them.</source>
        <translation>Die Dateien sind noch da. Sie sind schreibgeschützt, oder es gibt für sie keinen Papierkorb.</translation>
    </message>
    <message numerus="yes">
        <source>Move %n selected image(s) to the trash?</source>
        <translation>
            <numerusform>%n ausgewähltes Bild in den Papierkorb verschieben?</numerusform>
            <numerusform>%n ausgewählte Bilder in den Papierkorb verschieben?</numerusform>
        </translation>
    </message>
</context>
<context>
    <name>KvDeskGalleryModel</name>
    <message>
        <source>%1 × %2 px</source>
        <comment>width, height</comment>
        <translation>%1 × %2&#xa0;px</translation>
    </message>
</context>
<context>
    <name>KvDeskGalleryView</name>
    <message>
        <source>Gallery</source>
        <translation>Galerie</translation>
    </message>
</context>
<context>
    <name>KvDeskGuideCommand</name>
    <message>
        <source>The user guide is not installed</source>
        <translation>Das Benutzerhandbuch ist nicht installiert</translation>
    </message>
</context>
<context>
    <name>KvDeskGuideWindow</name>
    <message>
        <source>User guide</source>
        <translation>Benutzerhandbuch</translation>
    </message>
    <message>
        <source>Contents</source>
        <translation>Inhalt</translation>
    </message>
    <message>
        <source>Back</source>
        <translation>Zurück</translation>
    </message>
    <message>
        <source>Forward</source>
        <translation>Vorwärts</translation>
    </message>
    <message>
        <source>Find in the guide</source>
        <translation>Im Handbuch suchen</translation>
    </message>
    <message>
        <source>Find previous</source>
        <translation>Vorherige Fundstelle</translation>
    </message>
    <message>
        <source>Find next</source>
        <translation>Nächste Fundstelle</translation>
    </message>
    <message>
        <source>This is the first place</source>
        <translation>Dies ist die erste aufgerufene Stelle</translation>
    </message>
    <message>
        <source>This is the last place</source>
        <translation>Dies ist die letzte aufgerufene Stelle</translation>
    </message>
    <message>
        <source>Not found</source>
        <translation>Nicht gefunden</translation>
    </message>
    <message>
        <source>Type what to find first</source>
        <translation>Geben Sie zuerst einen Suchbegriff ein</translation>
    </message>
</context>
<context>
    <name>KvDeskImageView</name>
    <message>
        <source>Image</source>
        <translation>Bild</translation>
    </message>
    <message>
        <source>Open an image or a session to start</source>
        <translation>Öffnen Sie zum Beginnen ein Bild oder eine Sitzung</translation>
    </message>
</context>
<context>
    <name>KvDeskInlineEditor</name>
    <message>
        <source>Text</source>
        <translation>Text</translation>
    </message>
    <message>
        <source>Name</source>
        <translation>Name</translation>
    </message>
</context>
<context>
    <name>KvDeskKnownDistance</name>
    <message>
        <source>inch</source>
        <translation>Zoll</translation>
    </message>
    <message>
        <source>Use selected line</source>
        <translation>Auswahl verwenden</translation>
    </message>
    <message>
        <source>Length of the line</source>
        <translation>Länge der Linie</translation>
    </message>
    <message>
        <source>Unit of the length</source>
        <translation>Einheit der Länge</translation>
    </message>
    <message>
        <source>Its length</source>
        <translation>Wahre Länge</translation>
    </message>
    <message>
        <source>Draw a line over a distance that you know, such as on a stage micrometer, and select it.</source>
        <translation>Zeichnen Sie eine Linie über eine Strecke, die Sie kennen, etwa auf einem Objektmikrometer, und wählen Sie sie aus.</translation>
    </message>
    <message>
        <source>No line yet</source>
        <translation>Noch keine Linie</translation>
    </message>
    <message>
        <source>%1: %2</source>
        <comment>name and length of a line</comment>
        <translation>%1: %2</translation>
    </message>
    <message>
        <source>Take the selected line as the known distance</source>
        <translation>Die ausgewählte Linie als bekannte Strecke verwenden</translation>
    </message>
    <message>
        <source>Select one line on the image first</source>
        <translation>Zuerst eine einzelne Linie im Bild auswählen</translation>
    </message>
</context>
<context>
    <name>KvDeskLiveBar</name>
    <message>
        <source>Live image</source>
        <translation>Livebild</translation>
    </message>
    <message>
        <source>Freeze</source>
        <translation>Einfrieren</translation>
    </message>
    <message>
        <source>%1 fps</source>
        <extracomment>frames per second</extracomment>
        <translation>%1&#xa0;fps</translation>
    </message>
    <message>
        <source>%1 delivers no pictures any more; this is the last one</source>
        <translation>%1 liefert keine Bilder mehr; dies ist das letzte</translation>
    </message>
    <message>
        <source>%1 delivers no pictures</source>
        <translation>%1 liefert keine Bilder</translation>
    </message>
    <message>
        <source>%1 is stopped</source>
        <translation>%1 ist angehalten</translation>
    </message>
    <message>
        <source>Waiting for the first picture of %1</source>
        <translation>Warten auf das erste Bild von %1</translation>
    </message>
    <message>
        <source>Frozen: %1</source>
        <translation>Eingefroren: %1</translation>
    </message>
    <message>
        <source>Live: %1</source>
        <translation>Live: %1</translation>
    </message>
    <message>
        <source>This image is not live</source>
        <translation>Dieses Bild ist kein Livebild</translation>
    </message>
    <message>
        <source>&amp;Reconnect</source>
        <translation>&amp;Neu verbinden</translation>
    </message>
    <message>
        <source>&amp;Start</source>
        <translation>&amp;Starten</translation>
    </message>
    <message>
        <source>Frames per second
Dropped, because newer ones came first: %1</source>
        <translation>Bilder pro Sekunde
Verworfen, weil neuere zuvorkamen: %1</translation>
    </message>
    <message>
        <source>Stop the live image; other programs can use the camera then</source>
        <translation>Livebild anhalten; andere Programme können die Kamera dann verwenden</translation>
    </message>
</context>
<context>
    <name>KvDeskMainWindow</name>
    <message>
        <source>&amp;File</source>
        <translation>&amp;Datei</translation>
    </message>
    <message>
        <source>&amp;Recent sessions</source>
        <translation>&amp;Zuletzt verwendete Sitzungen</translation>
    </message>
    <message>
        <source>&amp;View</source>
        <translation>&amp;Ansicht</translation>
    </message>
    <message>
        <source>&amp;Help</source>
        <translation>&amp;Hilfe</translation>
    </message>
    <message>
        <source>Main tool bar</source>
        <translation>Hauptsymbolleiste</translation>
    </message>
    <message>
        <source>%1[*] - Measuring Desk</source>
        <extracomment>%1 is the name of a session; [*] is replaced by a star when it has unsaved changes</extracomment>
        <translation>%1[*] – Measuring Desk</translation>
    </message>
    <message>
        <source>None yet</source>
        <translation>Noch keine</translation>
    </message>
    <message>
        <source>About Measuring Desk</source>
        <translation>Über Measuring Desk</translation>
    </message>
    <message>
        <source>&lt;b&gt;Measuring Desk %1&lt;/b&gt;&lt;p&gt;Measures objects on images, and hosts plug-ins such as the statistics reports.&lt;/p&gt;&lt;p&gt;%2, MIT licence&lt;/p&gt;</source>
        <translation>&lt;b&gt;Measuring Desk %1&lt;/b&gt;&lt;p&gt;Misst Objekte in Bildern und nimmt Plug-ins wie die Statistikberichte auf.&lt;/p&gt;&lt;p&gt;%2, MIT-Lizenz&lt;/p&gt;</translation>
    </message>
    <message>
        <source>Measuring Desk</source>
        <translation>Measuring Desk</translation>
    </message>
    <message>
        <source>&amp;Edit</source>
        <translation>&amp;Bearbeiten</translation>
    </message>
    <message>
        <source>&amp;Image</source>
        <translation>B&amp;ild</translation>
    </message>
    <message>
        <source>&amp;Measure</source>
        <translation>&amp;Messen</translation>
    </message>
    <message>
        <source>Choose the image source</source>
        <translation>Bildquelle auswählen</translation>
    </message>
</context>
<context>
    <name>KvDeskNotice</name>
    <message>
        <source>Close this message</source>
        <translation>Diese Meldung schließen</translation>
    </message>
</context>
<context>
    <name>KvDeskObjectClipboard</name>
    <message>
        <source>Type</source>
        <translation>Typ</translation>
    </message>
    <message>
        <source>Object</source>
        <translation>Objekt</translation>
    </message>
    <message>
        <source>Value name</source>
        <translation>Messgröße</translation>
    </message>
    <message>
        <source>Value</source>
        <translation>Wert</translation>
    </message>
</context>
<context>
    <name>KvDeskObjectEditor</name>
    <message numerus="yes">
        <source>%n objects</source>
        <comment>several measured objects</comment>
        <extracomment>%n is 2 at least</extracomment>
        <translation>
            <numerusform>%n Objekt</numerusform>
            <numerusform>%n Objekte</numerusform>
        </translation>
    </message>
    <message>
        <source>drawing of %1</source>
        <translation>%1 zeichnen</translation>
    </message>
    <message>
        <source>change of %1</source>
        <translation>%1 ändern</translation>
    </message>
    <message>
        <source>move of %1</source>
        <translation>%1 verschieben</translation>
    </message>
    <message>
        <source>renaming of %1</source>
        <translation>%1 umbenennen</translation>
    </message>
    <message>
        <source>text of %1</source>
        <translation>Text von %1 ändern</translation>
    </message>
    <message>
        <source>showing of %1 of %2</source>
        <extracomment>%1 is a value, %2 an object</extracomment>
        <translation>%1 von %2 einblenden</translation>
    </message>
    <message>
        <source>hiding of %1 of %2</source>
        <translation>%1 von %2 ausblenden</translation>
    </message>
    <message>
        <source>deletion of %1</source>
        <translation>%1 löschen</translation>
    </message>
    <message>
        <source>change of the calibration</source>
        <translation>Kalibrierung ändern</translation>
    </message>
    <message>
        <source>place of %1</source>
        <translation>Markierung von %1 setzen</translation>
    </message>
    <message>
        <source>deletion of a place of %1</source>
        <translation>Markierung von %1 löschen</translation>
    </message>
    <message>
        <source>pasting of %1</source>
        <translation>%1 einfügen</translation>
    </message>
    <message>
        <source>import of %1</source>
        <translation>%1 importieren</translation>
    </message>
</context>
<context>
    <name>KvDeskPlugins</name>
    <message>
        <source>No plug-ins were found</source>
        <translation>Es wurden keine Plug-ins gefunden</translation>
    </message>
    <message>
        <source>It is no plug-in for this program</source>
        <translation>Es ist kein Plug-in für dieses Programm</translation>
    </message>
    <message>
        <source>Its tools &quot;%1&quot; could not be started</source>
        <translation>Seine Werkzeuge „%1“ konnten nicht gestartet werden</translation>
    </message>
    <message>
        <source>Plug-in loaded: %1</source>
        <translation>Plug-in geladen: %1</translation>
    </message>
    <message>
        <source>Plug-in not loaded: %1: %2</source>
        <translation>Plug-in nicht geladen: %1: %2</translation>
    </message>
    <message>
        <source>It failed: %1</source>
        <translation>Es ist fehlgeschlagen: %1</translation>
    </message>
    <message>
        <source>It failed for a reason of its own</source>
        <translation>Es ist aus einem unbekannten Grund fehlgeschlagen</translation>
    </message>
</context>
<context>
    <name>KvDeskProgress</name>
    <message>
        <source>Cancel</source>
        <translation>Abbrechen</translation>
    </message>
    <message>
        <source>Leave everything as it was (Esc)</source>
        <translation>Alles so lassen, wie es war (Esc)</translation>
    </message>
    <message>
        <source>This can no longer be cancelled</source>
        <translation>Dies lässt sich nicht mehr abbrechen</translation>
    </message>
</context>
<context>
    <name>KvDeskRecovery</name>
    <message>
        <source>Untitled session</source>
        <translation>Unbenannte Sitzung</translation>
    </message>
    <message numerus="yes">
        <source>%1 (%n object(s))</source>
        <extracomment>%1 is the name of a session</extracomment>
        <translation>
            <numerusform>%1 (%n Objekt)</numerusform>
            <numerusform>%1 (%n Objekte)</numerusform>
        </translation>
    </message>
</context>
<context>
    <name>KvDeskRecoveryBar</name>
    <message>
        <source>Show other measurements that were not saved</source>
        <translation>Andere nicht gespeicherte Messungen anzeigen</translation>
    </message>
    <message>
        <source>Restore</source>
        <translation>Wiederherstellen</translation>
    </message>
    <message>
        <source>Open these measurements as a session with unsaved changes</source>
        <translation>Diese Messungen als Sitzung mit ungespeicherten Änderungen öffnen</translation>
    </message>
    <message>
        <source>Discard</source>
        <translation>Verwerfen</translation>
    </message>
    <message>
        <source>Delete these measurements for good</source>
        <translation>Diese Messungen endgültig löschen</translation>
    </message>
    <message>
        <source>%1: %2</source>
        <extracomment>%1 is a time, %2 a session</extracomment>
        <translation>%1: %2</translation>
    </message>
    <message numerus="yes">
        <source>%n more</source>
        <comment>measurements that were not saved</comment>
        <translation>
            <numerusform>%n weitere</numerusform>
            <numerusform>%n weitere</numerusform>
        </translation>
    </message>
    <message>
        <source>Measurements from %1 were not saved.</source>
        <translation>Messungen (%1) wurden nicht gespeichert.</translation>
    </message>
</context>
<context>
    <name>KvDeskRuler</name>
    <message>
        <source>Horizontal ruler</source>
        <translation>Horizontales Lineal</translation>
    </message>
    <message>
        <source>Vertical ruler</source>
        <translation>Vertikales Lineal</translation>
    </message>
    <message>
        <source>Ruler in %1</source>
        <translation>Lineal in %1</translation>
    </message>
</context>
<context>
    <name>KvDeskSelectionStatistics</name>
    <message>
        <source>n = %1, mean %2, SD %3, min %4, max %5</source>
        <extracomment>number of values, their mean, standard deviation, smallest and largest one</extracomment>
        <translation>n = %1, Mittelwert %2, SD %3, Min %4, Max %5</translation>
    </message>
    <message>
        <source>Selected values: %1</source>
        <translation>Ausgewählte Werte: %1</translation>
    </message>
    <message>
        <source>Mean: %1</source>
        <translation>Mittelwert: %1</translation>
    </message>
    <message>
        <source>Standard deviation: %1</source>
        <translation>Standardabweichung: %1</translation>
    </message>
    <message>
        <source>Smallest: %1</source>
        <translation>Kleinster Wert: %1</translation>
    </message>
    <message>
        <source>Largest: %1</source>
        <translation>Größter Wert: %1</translation>
    </message>
</context>
<context>
    <name>KvDeskSession</name>
    <message>
        <source>Untitled session</source>
        <translation>Unbenannte Sitzung</translation>
    </message>
</context>
<context>
    <name>KvDeskSettingsDialog</name>
    <message>
        <source>Settings</source>
        <translation>Einstellungen</translation>
    </message>
    <message>
        <source>Appearance</source>
        <translation>Darstellung</translation>
    </message>
    <message>
        <source>Theme</source>
        <translation>Design</translation>
    </message>
    <message>
        <source>Dark</source>
        <translation>Dunkel</translation>
    </message>
    <message>
        <source>Light</source>
        <translation>Hell</translation>
    </message>
    <message>
        <source>Language</source>
        <translation>Sprache</translation>
    </message>
    <message>
        <source>Another language takes effect when the program is started again.</source>
        <translation>Eine andere Sprache wird nach einem Neustart des Programms wirksam.</translation>
    </message>
    <message>
        <source>Measured values</source>
        <translation>Messwerte</translation>
    </message>
    <message>
        <source>Automatic</source>
        <translation>Automatisch</translation>
    </message>
    <message>
        <source>Significant digits</source>
        <translation>Signifikante Stellen</translation>
    </message>
    <message>
        <source>Length unit</source>
        <translation>Längeneinheit</translation>
    </message>
    <message>
        <source>Angle unit</source>
        <translation>Winkeleinheit</translation>
    </message>
    <message>
        <source>Degrees (°)</source>
        <translation>Grad (°)</translation>
    </message>
    <message>
        <source>Radians (rad)</source>
        <translation>Radiant (rad)</translation>
    </message>
    <message>
        <source>System default</source>
        <translation>Systemsprache</translation>
    </message>
    <message>
        <source>Nothing was changed yet</source>
        <translation>Es wurde noch nichts geändert</translation>
    </message>
</context>
<context>
    <name>KvDeskSnapshotFile</name>
    <message>
        <source>The folder cannot be created</source>
        <translation>Der Ordner kann nicht angelegt werden</translation>
    </message>
    <message>
        <source>The picture cannot be encoded</source>
        <translation>Das Bild kann nicht codiert werden</translation>
    </message>
</context>
<context>
    <name>KvDeskSnapshots</name>
    <message>
        <source>Open an image first</source>
        <translation>Zuerst ein Bild öffnen</translation>
    </message>
    <message>
        <source>No snapshot was taken: earlier ones are still being saved</source>
        <translation>Es wurde keine Aufnahme gemacht: Frühere werden noch gespeichert</translation>
    </message>
    <message>
        <source>Snapshot saved: %1</source>
        <translation>Aufnahme gespeichert: %1</translation>
    </message>
    <message>
        <source>The snapshot was not saved. %1</source>
        <translation>Die Aufnahme wurde nicht gespeichert. %1</translation>
    </message>
</context>
<context>
    <name>KvDeskSourceCommands</name>
    <message>
        <source>The image source &quot;%1&quot; was not opened.</source>
        <translation>Die Bildquelle „%1“ wurde nicht geöffnet.</translation>
    </message>
    <message>
        <source>Image source: %1</source>
        <translation>Bildquelle: %1</translation>
    </message>
    <message>
        <source>Open image folder</source>
        <translation>Bildordner öffnen</translation>
    </message>
    <message>
        <source>Open video</source>
        <translation>Video öffnen</translation>
    </message>
    <message>
        <source>Videos</source>
        <translation>Videos</translation>
    </message>
</context>
<context>
    <name>KvDeskSourceMenu</name>
    <message>
        <source>Image &amp;source</source>
        <translation>Bild&amp;quelle</translation>
    </message>
    <message>
        <source>Still &amp;image...</source>
        <translation>&amp;Standbild...</translation>
    </message>
    <message>
        <source>Image &amp;folder...</source>
        <translation>Bild&amp;ordner...</translation>
    </message>
    <message>
        <source>Play the images of a folder like a camera</source>
        <translation>Bilder eines Ordners wie von einer Kamera abspielen</translation>
    </message>
    <message>
        <source>&amp;Video...</source>
        <translation>&amp;Video...</translation>
    </message>
    <message>
        <source>Play a video like a camera</source>
        <translation>Ein Video wie von einer Kamera abspielen</translation>
    </message>
    <message>
        <source>Looking for cameras...</source>
        <translation>Kameras werden gesucht...</translation>
    </message>
    <message>
        <source>No camera is connected</source>
        <translation>Keine Kamera angeschlossen</translation>
    </message>
</context>
<context>
    <name>KvDeskStartPage</name>
    <message>
        <source>From an image to a report</source>
        <translation>Vom Bild zum Bericht</translation>
    </message>
    <message>
        <source>Back to the image</source>
        <translation>Zurück zum Bild</translation>
    </message>
    <message>
        <source>%1 (%2)</source>
        <comment>command (shortcut)</comment>
        <translation>%1 (%2)</translation>
    </message>
    <message>
        <source>Open an image</source>
        <translation>Bild öffnen</translation>
    </message>
    <message>
        <source>A picture file, or the live image of a camera.</source>
        <translation>Eine Bilddatei oder das Livebild einer Kamera.</translation>
    </message>
    <message>
        <source>Choose a camera or another source</source>
        <translation>Eine Kamera oder eine andere Quelle auswählen</translation>
    </message>
    <message>
        <source>Calibrate</source>
        <translation>Kalibrieren</translation>
    </message>
    <message>
        <source>Say how large a pixel is. The examples are calibrated already.</source>
        <translation>Geben Sie an, wie groß ein Pixel ist. Die Beispiele sind bereits kalibriert.</translation>
    </message>
    <message>
        <source>Measure and report</source>
        <translation>Messen und Bericht erstellen</translation>
    </message>
    <message>
        <source>Drag a line over the image: its length is listed at once. The report panel makes a PDF of all values.</source>
        <translation>Ziehen Sie eine Linie über das Bild: Ihre Länge erscheint sofort in der Liste. Der Berichtsbereich erzeugt ein PDF mit allen Werten.</translation>
    </message>
    <message>
        <source>Examples to try</source>
        <translation>Beispiele zum Ausprobieren</translation>
    </message>
    <message>
        <source>Recent sessions</source>
        <translation>Zuletzt verwendete Sitzungen</translation>
    </message>
    <message>
        <source>Open an image first</source>
        <translation>Zuerst ein Bild öffnen</translation>
    </message>
    <message>
        <source>Open a copy of this example</source>
        <translation>Eine Kopie dieses Beispiels öffnen</translation>
    </message>
</context>
<context>
    <name>KvDeskStatus</name>
    <message>
        <source>Warning</source>
        <translation>Warnung</translation>
    </message>
    <message>
        <source>Error</source>
        <translation>Fehler</translation>
    </message>
    <message>
        <source>Information</source>
        <translation>Information</translation>
    </message>
</context>
<context>
    <name>KvDeskStatusBar</name>
    <message>
        <source>%1 × %2 px</source>
        <translation>%1 × %2&#xa0;px</translation>
    </message>
    <message>
        <source>%1 %</source>
        <comment>zoom</comment>
        <translation>%1&#xa0;%</translation>
    </message>
    <message>
        <source>x %1, y %2</source>
        <comment>pixel below the pointer</comment>
        <translation>x %1, y %2</translation>
    </message>
    <message>
        <source>Statistics of the selected values</source>
        <translation>Statistik der ausgewählten Werte</translation>
    </message>
    <message>
        <source>, %1</source>
        <comment>objective</comment>
        <translation>, %1</translation>
    </message>
    <message>
        <source>, %1/px</source>
        <comment>size of a pixel</comment>
        <translation>, %1/px</translation>
    </message>
</context>
<context>
    <name>KvDeskStatusLog</name>
    <message>
        <source>Status log</source>
        <translation>Statusprotokoll</translation>
    </message>
    <message>
        <source>Hide the status log</source>
        <translation>Statusprotokoll ausblenden</translation>
    </message>
    <message>
        <source>Clear the status log</source>
        <translation>Statusprotokoll leeren</translation>
    </message>
    <message>
        <source>Messages of the program and its plug-ins appear here</source>
        <translation>Hier erscheinen Meldungen des Programms und seiner Plug-ins</translation>
    </message>
    <message>
        <source>There are no messages</source>
        <translation>Es gibt keine Meldungen</translation>
    </message>
</context>
<context>
    <name>KvDeskStatusLogModel</name>
    <message>
        <source>%1
Reported by %2</source>
        <comment>message, source</comment>
        <translation>%1
Gemeldet von %2</translation>
    </message>
    <message>
        <source>Category</source>
        <translation>Kategorie</translation>
    </message>
    <message>
        <source>Time</source>
        <translation>Uhrzeit</translation>
    </message>
    <message>
        <source>Message</source>
        <translation>Meldung</translation>
    </message>
</context>
<context>
    <name>KvDeskTableView</name>
    <message>
        <source>Copy</source>
        <translation>Kopieren</translation>
    </message>
</context>
<context>
    <name>KvDeskToolStrip</name>
    <message>
        <source>Measuring tools</source>
        <translation>Messwerkzeuge</translation>
    </message>
</context>
<context>
    <name>KvDeskTypedPixelSize</name>
    <message>
        <source>Width of a pixel in micrometres</source>
        <translation>Breite eines Pixels in Mikrometern</translation>
    </message>
    <message>
        <source>Height of a pixel in micrometres</source>
        <translation>Höhe eines Pixels in Mikrometern</translation>
    </message>
    <message>
        <source>Same size in both directions</source>
        <translation>Gleiche Größe in beiden Richtungen</translation>
    </message>
    <message>
        <source>Width</source>
        <translation>Breite</translation>
    </message>
    <message>
        <source>Height</source>
        <translation>Höhe</translation>
    </message>
    <message>
        <source>Type how large a pixel of the image is in reality.</source>
        <translation>Geben Sie ein, wie groß ein Pixel des Bildes in Wirklichkeit ist.</translation>
    </message>
</context>
<context>
    <name>KvDeskValueCommands</name>
    <message>
        <source>Rename</source>
        <translation>Umbenennen</translation>
    </message>
    <message>
        <source>Delete object</source>
        <translation>Objekt löschen</translation>
    </message>
    <message>
        <source>Hide value</source>
        <translation>Wert ausblenden</translation>
    </message>
    <message>
        <source>Show all values of the object</source>
        <translation>Alle Werte des Objekts anzeigen</translation>
    </message>
    <message>
        <source>Select one object first</source>
        <translation>Zuerst ein einzelnes Objekt auswählen</translation>
    </message>
    <message>
        <source>Select an object first</source>
        <translation>Zuerst ein Objekt auswählen</translation>
    </message>
    <message>
        <source>Select a value first</source>
        <translation>Zuerst einen Wert auswählen</translation>
    </message>
    <message>
        <source>No value of the selected object is hidden</source>
        <translation>Kein Wert des ausgewählten Objekts ist ausgeblendet</translation>
    </message>
    <message>
        <source>showing of values</source>
        <translation>Werte einblenden</translation>
    </message>
    <message>
        <source>hiding of values</source>
        <translation>Werte ausblenden</translation>
    </message>
</context>
<context>
    <name>KvDeskValueTable</name>
    <message>
        <source>Measured values</source>
        <translation>Messwerte</translation>
    </message>
    <message>
        <source>Hide the measured values</source>
        <translation>Messwerte ausblenden</translation>
    </message>
    <message>
        <source>Filter by type, object or value name</source>
        <translation>Nach Typ, Objekt oder Messgröße filtern</translation>
    </message>
    <message>
        <source>Filter of the measured values</source>
        <translation>Filter der Messwerte</translation>
    </message>
    <message>
        <source>Shows only rows that have all of these words</source>
        <translation>Zeigt nur Zeilen, die alle diese Wörter enthalten</translation>
    </message>
    <message>
        <source>No measured value matches the filter</source>
        <translation>Kein Messwert entspricht dem Filter</translation>
    </message>
    <message>
        <source>Clear the filter</source>
        <translation>Filter löschen</translation>
    </message>
    <message>
        <source>%1 of %2</source>
        <extracomment>rows that match the filter, all rows</extracomment>
        <translation>%1 von %2</translation>
    </message>
    <message>
        <source>Measured values appear here once something is measured or imported</source>
        <translation>Hier erscheinen Messwerte, sobald etwas gemessen oder importiert wurde</translation>
    </message>
    <message>
        <source>There are no measured values yet</source>
        <translation>Es gibt noch keine Messwerte</translation>
    </message>
</context>
<context>
    <name>KvDeskValueTableModel</name>
    <message>
        <source>Type</source>
        <translation>Typ</translation>
    </message>
    <message>
        <source>Object</source>
        <translation>Objekt</translation>
    </message>
    <message>
        <source>Value name</source>
        <translation>Messgröße</translation>
    </message>
    <message>
        <source>Value</source>
        <translation>Wert</translation>
    </message>
</context>
<context>
    <name>KvToolBase</name>
    <message>
        <source>Reset</source>
        <translation>Zurücksetzen</translation>
    </message>
    <message>
        <source>Reset to the default values</source>
        <translation>Auf die Standardwerte zurücksetzen</translation>
    </message>
</context>
<context>
    <name>QPlatformTheme</name>
    <message>
        <source>OK</source>
        <translation>OK</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Abbrechen</translation>
    </message>
    <message>
        <source>Apply</source>
        <translation>Anwenden</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>Speichern</translation>
    </message>
    <message>
        <source>Open</source>
        <translation>Öffnen</translation>
    </message>
    <message>
        <source>Close</source>
        <translation>Schließen</translation>
    </message>
    <message>
        <source>Discard</source>
        <translation>Verwerfen</translation>
    </message>
    <message>
        <source>&amp;Yes</source>
        <translation>&amp;Ja</translation>
    </message>
    <message>
        <source>&amp;No</source>
        <translation>&amp;Nein</translation>
    </message>
</context>
<context>
    <name>ZtAppSettings</name>
    <message>
        <source>The settings could not be saved to %1. Check that the folder is writable.</source>
        <translation>Die Einstellungen konnten nicht in %1 gespeichert werden. Prüfen Sie, ob der Ordner beschreibbar ist.</translation>
    </message>
    <message>
        <source>The settings file %1 cannot be read. Changes to the settings will not be kept.</source>
        <translation>Die Einstellungsdatei %1 kann nicht gelesen werden. Änderungen an den Einstellungen bleiben nicht erhalten.</translation>
    </message>
    <message>
        <source>The settings file %1 is damaged. It was renamed to %2; all settings are back at their defaults.</source>
        <translation>Die Einstellungsdatei %1 ist beschädigt. Sie wurde in %2 umbenannt; alle Einstellungen haben wieder ihre Standardwerte.</translation>
    </message>
    <message>
        <source>The settings file %1 is damaged and could not be renamed to %2. Changes to the settings will not be kept.</source>
        <translation>Die Einstellungsdatei %1 ist beschädigt und konnte nicht in %2 umbenannt werden. Änderungen an den Einstellungen bleiben nicht erhalten.</translation>
    </message>
</context>
<context>
    <name>ZtAravisSource</name>
    <message>
        <source>%1 is disconnected; its last picture stays</source>
        <translation>%1 ist getrennt; das letzte Bild bleibt stehen</translation>
    </message>
    <message>
        <source>%1 delivers pictures of a kind that cannot be shown</source>
        <translation>%1 liefert Bilder einer Art, die nicht angezeigt werden kann</translation>
    </message>
    <message>
        <source>The camera does not take the setting (%1)</source>
        <translation>Die Kamera nimmt die Einstellung nicht an (%1)</translation>
    </message>
    <message>
        <source>%1 cannot be opened (%2)</source>
        <translation>%1 kann nicht geöffnet werden (%2)</translation>
    </message>
</context>
<context>
    <name>ZtCalibrationStore</name>
    <message>
        <source>This is not a calibration</source>
        <translation>Dies ist keine Kalibrierung</translation>
    </message>
    <message>
        <source>A calibration in the settings is damaged and was left out (%1: %2)</source>
        <translation>Eine Kalibrierung in den Einstellungen ist beschädigt und wurde ausgelassen (%1: %2)</translation>
    </message>
</context>
<context>
    <name>ZtCsvReader</name>
    <message>
        <source>A quoted text does not end</source>
        <translation>Ein Text in Anführungszeichen endet nicht</translation>
    </message>
    <message>
        <source>There is text after a closing quote</source>
        <translation>Nach einem schließenden Anführungszeichen folgt Text</translation>
    </message>
    <message>
        <source>Reading was cancelled</source>
        <translation>Das Lesen wurde abgebrochen</translation>
    </message>
</context>
<context>
    <name>ZtDrawnType</name>
    <message>
        <source>Rectangle</source>
        <translation>Rechteck</translation>
    </message>
    <message>
        <source>Width</source>
        <translation>Breite</translation>
    </message>
    <message>
        <source>Height</source>
        <translation>Höhe</translation>
    </message>
    <message>
        <source>Area</source>
        <translation>Fläche</translation>
    </message>
    <message>
        <source>Line</source>
        <translation>Linie</translation>
    </message>
    <message>
        <source>Length</source>
        <translation>Länge</translation>
    </message>
    <message>
        <source>Arc</source>
        <translation>Bogen</translation>
    </message>
    <message>
        <source>Angle</source>
        <translation>Winkel</translation>
    </message>
    <message>
        <source>Arc length</source>
        <translation>Bogenlänge</translation>
    </message>
    <message>
        <source>Polygon</source>
        <translation>Polygon</translation>
    </message>
    <message>
        <source>Perimeter</source>
        <translation>Umfang</translation>
    </message>
    <message>
        <source>Polyline</source>
        <translation>Polylinie</translation>
    </message>
    <message>
        <source>Parallel distance</source>
        <translation>Parallelabstand</translation>
    </message>
    <message>
        <source>Distance</source>
        <translation>Abstand</translation>
    </message>
    <message>
        <source>Text note</source>
        <translation>Textnotiz</translation>
    </message>
    <message>
        <source>Scale bar</source>
        <translation>Maßstabsbalken</translation>
    </message>
    <message>
        <source>Counter</source>
        <translation>Zähler</translation>
    </message>
    <message>
        <source>Count</source>
        <translation>Anzahl</translation>
    </message>
    <message>
        <source>Share</source>
        <translation>Anteil</translation>
    </message>
    <message>
        <source>Circle</source>
        <translation>Kreis</translation>
    </message>
    <message>
        <source>Diameter</source>
        <translation>Durchmesser</translation>
    </message>
</context>
<context>
    <name>ZtFileFault</name>
    <message>
        <source>No such file or directory</source>
        <translation>Datei oder Verzeichnis nicht gefunden</translation>
    </message>
    <message>
        <source>Permission denied</source>
        <translation>keine Berechtigung</translation>
    </message>
    <message>
        <source>Is a directory</source>
        <translation>ist ein Verzeichnis</translation>
    </message>
    <message>
        <source>Not a directory</source>
        <translation>ist kein Verzeichnis</translation>
    </message>
    <message>
        <source>File name too long</source>
        <translation>der Dateiname ist zu lang</translation>
    </message>
    <message>
        <source>No space left on device</source>
        <translation>auf dem Gerät ist kein Speicherplatz mehr verfügbar</translation>
    </message>
    <message>
        <source>Read-only file system</source>
        <translation>das Dateisystem ist nur lesbar</translation>
    </message>
    <message>
        <source>Input/output error</source>
        <translation>Eingabe-/Ausgabefehler</translation>
    </message>
</context>
<context>
    <name>ZtFrameSourceCatalogue</name>
    <message>
        <source>This program cannot play videos</source>
        <translation>Dieses Programm kann keine Videos abspielen</translation>
    </message>
    <message>
        <source>This program knows no cameras of this kind</source>
        <translation>Dieses Programm kennt keine Kameras dieser Art</translation>
    </message>
</context>
<context>
    <name>ZtImageFolderSource</name>
    <message>
        <source>%1: no picture of the folder can be shown</source>
        <translation>%1: Kein Bild des Ordners kann angezeigt werden</translation>
    </message>
    <message>
        <source>The folder does not exist</source>
        <translation>Der Ordner ist nicht vorhanden</translation>
    </message>
    <message>
        <source>The folder cannot be read</source>
        <translation>Der Ordner kann nicht gelesen werden</translation>
    </message>
    <message>
        <source>The folder holds no pictures</source>
        <translation>Der Ordner enthält keine Bilder</translation>
    </message>
</context>
<context>
    <name>ZtKernelImage</name>
    <message>
        <source>%1 delivers pictures again</source>
        <translation>%1 liefert wieder Bilder</translation>
    </message>
</context>
<context>
    <name>ZtLiveFrameSource</name>
    <message>
        <source>%1 has stopped delivering pictures; the last one stays</source>
        <translation>%1 liefert keine Bilder mehr; das letzte bleibt stehen</translation>
    </message>
</context>
<context>
    <name>ZtMeasureFormat</name>
    <message>
        <source>pcs</source>
        <translation>Stk.</translation>
    </message>
</context>
<context>
    <name>ZtSession</name>
    <message>
        <source>The file is empty</source>
        <translation>Die Datei ist leer</translation>
    </message>
    <message>
        <source>The file is not a session</source>
        <translation>Die Datei ist keine Sitzung</translation>
    </message>
    <message>
        <source>The file cannot be written (%1)</source>
        <translation>Die Datei kann nicht geschrieben werden (%1)</translation>
    </message>
    <message>
        <source>This must be a list</source>
        <translation>Hier muss eine Liste stehen</translation>
    </message>
    <message>
        <source>This must be a text</source>
        <translation>Hier muss ein Text stehen</translation>
    </message>
    <message>
        <source>This must be a whole number from 1</source>
        <translation>Hier muss eine ganze Zahl ab 1 stehen</translation>
    </message>
    <message>
        <source>This must be a number</source>
        <translation>Hier muss eine Zahl stehen</translation>
    </message>
    <message>
        <source>This must be a number greater than 0</source>
        <translation>Hier muss eine Zahl größer als 0 stehen</translation>
    </message>
    <message>
        <source>Another object of this type has the same number</source>
        <translation>Ein anderes Objekt dieses Typs hat dieselbe Nummer</translation>
    </message>
    <message>
        <source>This must be an object</source>
        <translation>Hier muss ein Objekt stehen</translation>
    </message>
    <message>
        <source>&quot;%1&quot; is not a type of objects</source>
        <translation>„%1“ ist kein Objekttyp</translation>
    </message>
    <message>
        <source>An object of type &quot;%1&quot; cannot have this number of points (%2)</source>
        <translation>Ein Objekt vom Typ „%1“ kann nicht diese Anzahl von Punkten haben (%2)</translation>
    </message>
    <message>
        <source>A point must be a list of two numbers between -1e9 and 1e9</source>
        <translation>Ein Punkt muss eine Liste aus zwei Zahlen zwischen -1e9 und 1e9 sein</translation>
    </message>
    <message>
        <source>This must be the name of a value</source>
        <translation>Hier muss der Name eines Werts stehen</translation>
    </message>
    <message>
        <source>The type has no name</source>
        <translation>Der Typ hat keinen Namen</translation>
    </message>
    <message>
        <source>A value must have a name of its own</source>
        <translation>Jeder Wert muss einen eigenen Namen haben</translation>
    </message>
    <message>
        <source>The numbers of the rows must rise</source>
        <translation>Die Nummern der Zeilen müssen ansteigen</translation>
    </message>
    <message>
        <source>A row must be a list of number, name and values</source>
        <translation>Eine Zeile muss eine Liste aus Nummer, Name und Werten sein</translation>
    </message>
    <message>
        <source>This must be a text or null</source>
        <translation>Hier muss ein Text oder null stehen</translation>
    </message>
    <message>
        <source>This must be a list or an object</source>
        <translation>Hier muss eine Liste oder ein Objekt stehen</translation>
    </message>
    <message>
        <source>The table has no such value</source>
        <translation>Die Tabelle hat keinen solchen Wert</translation>
    </message>
    <message>
        <source>This must be the text of a number</source>
        <translation>Hier muss eine Zahl als Text stehen</translation>
    </message>
    <message>
        <source>The unit does not fit that of the value</source>
        <translation>Die Einheit passt nicht zu der des Werts</translation>
    </message>
    <message>
        <source>The file is nested too deeply</source>
        <translation>Die Datei ist zu tief verschachtelt</translation>
    </message>
    <message>
        <source>The file is not valid JSON (%1)</source>
        <translation>Die Datei ist kein gültiges JSON (%1)</translation>
    </message>
    <message>
        <source>The file does not exist</source>
        <translation>Die Datei ist nicht vorhanden</translation>
    </message>
    <message>
        <source>This is a folder, not a file</source>
        <translation>Dies ist ein Ordner, keine Datei</translation>
    </message>
    <message>
        <source>The file cannot be read (%1)</source>
        <translation>Die Datei kann nicht gelesen werden (%1)</translation>
    </message>
    <message>
        <source>The file is too large for a session</source>
        <translation>Die Datei ist für eine Sitzung zu groß</translation>
    </message>
    <message>
        <source>This must be a date such as 2026-01-31T12:00:00Z</source>
        <translation>Hier muss ein Datum wie 2026-01-31T12:00:00Z stehen</translation>
    </message>
    <message>
        <source>This must be &quot;knownDistance&quot;, &quot;metadata&quot; or &quot;typed&quot;</source>
        <translation>Hier muss &quot;knownDistance&quot;, &quot;metadata&quot; oder &quot;typed&quot; stehen</translation>
    </message>
    <message>
        <source>The file is write-protected</source>
        <translation>Die Datei ist schreibgeschützt</translation>
    </message>
    <message>
        <source>Writing was cancelled</source>
        <translation>Das Schreiben wurde abgebrochen</translation>
    </message>
    <message>
        <source>Reading was cancelled</source>
        <translation>Das Lesen wurde abgebrochen</translation>
    </message>
    <message>
        <source>The session is of the newer version %1; this program reads versions up to %2</source>
        <translation>Die Sitzung hat die neuere Version %1; dieses Programm liest Versionen bis %2</translation>
    </message>
    <message>
        <source>Sessions of version %1 are not known; this program reads versions %2 to %3</source>
        <translation>Sitzungen der Version %1 sind nicht bekannt; dieses Programm liest die Versionen %2 bis %3</translation>
    </message>
    <message>
        <source>This file is a table of values; import it</source>
        <translation>Diese Datei ist eine Wertetabelle; importieren Sie sie</translation>
    </message>
</context>
<context>
    <name>ZtStillImageSource</name>
    <message>
        <source>The picture does not exist</source>
        <translation>Das Bild ist nicht vorhanden</translation>
    </message>
    <message>
        <source>This is a folder, not a picture</source>
        <translation>Dies ist ein Ordner, kein Bild</translation>
    </message>
    <message>
        <source>The picture cannot be read</source>
        <translation>Das Bild kann nicht gelesen werden</translation>
    </message>
    <message>
        <source>The picture has %1 x %2 pixels, which is too many</source>
        <translation>Das Bild hat %1 x %2 Pixel; das sind zu viele</translation>
    </message>
    <message>
        <source>The picture cannot be decoded (%1)</source>
        <translation>Das Bild kann nicht decodiert werden (%1)</translation>
    </message>
    <message>
        <source>the file is empty</source>
        <translation>die Datei ist leer</translation>
    </message>
    <message>
        <source>it has no size</source>
        <translation>es hat keine Größe</translation>
    </message>
    <message>
        <source>the file is damaged</source>
        <translation>die Datei ist beschädigt</translation>
    </message>
    <message>
        <source>the file is too short for its picture</source>
        <translation>die Datei ist zu kurz für ihr Bild</translation>
    </message>
    <message>
        <source>there is not enough memory</source>
        <translation>der Arbeitsspeicher reicht nicht aus</translation>
    </message>
</context>
<context>
    <name>ZtTableImport</name>
    <message>
        <source>&quot;%1&quot; already has a value &quot;%2&quot; in line %3</source>
        <translation>„%1“ hat bereits einen Wert „%2“ in Zeile %3</translation>
    </message>
    <message>
        <source>The file does not exist</source>
        <translation>Die Datei ist nicht vorhanden</translation>
    </message>
    <message>
        <source>This is a folder, not a file</source>
        <translation>Dies ist ein Ordner, keine Datei</translation>
    </message>
    <message>
        <source>The file cannot be read (%1)</source>
        <translation>Die Datei kann nicht gelesen werden (%1)</translation>
    </message>
    <message>
        <source>The table is not open for reading</source>
        <translation>Die Tabelle ist nicht zum Lesen geöffnet</translation>
    </message>
    <message>
        <source>The table has no rows</source>
        <translation>Die Tabelle hat keine Zeilen</translation>
    </message>
    <message>
        <source>The row and the header differ in their number of fields (%1 and %2)</source>
        <translation>Zeile und Kopfzeile haben unterschiedlich viele Felder (%1 und %2)</translation>
    </message>
    <message>
        <source>%1 is not a finite number</source>
        <translation>%1 ist keine endliche Zahl</translation>
    </message>
    <message>
        <source>%1 is not a number</source>
        <translation>%1 ist keine Zahl</translation>
    </message>
    <message>
        <source>&quot;%1&quot; of &quot;%2&quot; is given in &quot;%3&quot; here, but in &quot;%4&quot; before</source>
        <translation>„%1“ von „%2“ ist hier in „%3“ angegeben, zuvor aber in „%4“</translation>
    </message>
    <message>
        <source>There is no column %1; the columns are %2</source>
        <translation>Es gibt keine Spalte %1; die Spalten sind %2</translation>
    </message>
    <message>
        <source>Object</source>
        <translation>Objekt</translation>
    </message>
    <message>
        <source>There is no value %1 to give a unit; the values are %2</source>
        <translation>Es gibt keinen Wert %1, der eine Einheit erhalten könnte; die Werte sind %2</translation>
    </message>
    <message>
        <source>The first line announces rows without values</source>
        <translation>Die erste Zeile kündigt Datenzeilen ohne Werte an</translation>
    </message>
    <message>
        <source>There is no column %1; the columns of this table have no names</source>
        <translation>Es gibt keine Spalte %1; die Spalten dieser Tabelle haben keine Namen</translation>
    </message>
    <message>
        <source>%1 is not the index of a class; they go from 0 to %2</source>
        <translation>%1 ist kein Index einer Klasse; die Indizes reichen von 0 bis %2</translation>
    </message>
    <message>
        <source>Value %1</source>
        <translation>Wert %1</translation>
    </message>
    <message>
        <source>The file is larger than %1 MB</source>
        <translation>Die Datei ist größer als %1&#xa0;MB</translation>
    </message>
    <message>
        <source>The file is empty</source>
        <translation>Die Datei ist leer</translation>
    </message>
    <message>
        <source>The first line does not name the columns</source>
        <translation>Die erste Zeile nennt die Spalten nicht</translation>
    </message>
    <message>
        <source>Column %1 is not part of a list of values and was left out</source>
        <translation>Die Spalte %1 gehört nicht zu einer Liste von Werten und wurde ausgelassen</translation>
    </message>
    <message>
        <source>Columns %1 are not part of a list of values and were left out</source>
        <translation>Die Spalten %1 gehören nicht zu einer Liste von Werten und wurden ausgelassen</translation>
    </message>
    <message>
        <source>The value has no name</source>
        <translation>Der Wert hat keinen Namen</translation>
    </message>
    <message>
        <source>The row does not say which object it belongs to</source>
        <translation>In der Zeile fehlt, zu welchem Objekt sie gehört</translation>
    </message>
    <message>
        <source>%1 is not a unit</source>
        <translation>%1 ist keine Einheit</translation>
    </message>
    <message>
        <source>There is no column of numbers</source>
        <translation>Es gibt keine Spalte mit Zahlen</translation>
    </message>
    <message>
        <source>Column %1</source>
        <translation>Spalte %1</translation>
    </message>
    <message>
        <source>Column %1 holds text and was left out</source>
        <translation>Die Spalte %1 enthält Text und wurde ausgelassen</translation>
    </message>
    <message>
        <source>Columns %1 hold text and were left out</source>
        <translation>Die Spalten %1 enthalten Text und wurden ausgelassen</translation>
    </message>
    <message>
        <source>Reading was cancelled</source>
        <translation>Das Lesen wurde abgebrochen</translation>
    </message>
    <message numerus="yes">
        <source>The table has %n row(s), its first line announces %1</source>
        <translation>
            <numerusform>Die Tabelle hat %n Datenzeile, ihre erste Zeile kündigt %1 an</numerusform>
            <numerusform>Die Tabelle hat %n Datenzeilen, ihre erste Zeile kündigt %1 an</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>The row has %n field(s) instead of %1</source>
        <translation>
            <numerusform>Die Zeile hat %n Feld statt %1</numerusform>
            <numerusform>Die Zeile hat %n Felder statt %1</numerusform>
        </translation>
    </message>
    <message>
        <source>The records have too many different names</source>
        <translation>Die Datensätze haben zu viele verschiedene Namen</translation>
    </message>
    <message>
        <source>This file is a session, not a table; open it</source>
        <translation>Diese Datei ist eine Sitzung, keine Tabelle; öffnen Sie sie</translation>
    </message>
    <message>
        <source>The file is neither a list of records nor an export of values</source>
        <translation>Die Datei ist weder eine Liste von Datensätzen noch ein Export von Messwerten</translation>
    </message>
    <message>
        <source>This name comes twice</source>
        <translation>Dieser Name kommt doppelt vor</translation>
    </message>
    <message>
        <source>This must be a text, a number or null</source>
        <translation>Hier muss ein Text, eine Zahl oder null stehen</translation>
    </message>
    <message>
        <source>The table is of version %1; this program reads version %2</source>
        <translation>Die Tabelle hat die Version %1; dieses Programm liest Version %2</translation>
    </message>
</context>
<context>
    <name>ZtTextDecoder</name>
    <message>
        <source>The file is not a text file: it holds a NUL character</source>
        <translation>Die Datei ist keine Textdatei: Sie enthält ein NUL-Zeichen</translation>
    </message>
    <message>
        <source>The file is not valid UTF-16 text</source>
        <translation>Die Datei ist kein gültiger UTF-16-Text</translation>
    </message>
    <message>
        <source>The text is not valid UTF-8</source>
        <translation>Der Text ist kein gültiges UTF-8</translation>
    </message>
</context>
<context>
    <name>ZtUvcCameraSource</name>
    <message>
        <source>%1 is not connected</source>
        <translation>%1 ist nicht angeschlossen</translation>
    </message>
    <message>
        <source>%1 is disconnected or in use (%2)</source>
        <translation>%1 ist getrennt oder wird bereits verwendet (%2)</translation>
    </message>
</context>
<context>
    <name>ZtVideoFileSource</name>
    <message>
        <source>The video does not exist</source>
        <translation>Das Video ist nicht vorhanden</translation>
    </message>
    <message>
        <source>The video cannot be read</source>
        <translation>Das Video kann nicht gelesen werden</translation>
    </message>
    <message>
        <source>The video is empty</source>
        <translation>Das Video ist leer</translation>
    </message>
    <message>
        <source>there is only sound in it</source>
        <translation>es enthält nur Ton</translation>
    </message>
    <message>
        <source>The video %1 cannot be played (%2)</source>
        <translation>Das Video %1 kann nicht abgespielt werden (%2)</translation>
    </message>
    <message>
        <source>the file is damaged</source>
        <translation>die Datei ist beschädigt</translation>
    </message>
</context>
<context>
    <name>acss</name>
    <message>
        <source>The icon %1 is missing.</source>
        <translation>Das Symbol %1 fehlt.</translation>
    </message>
</context>
</TS>
