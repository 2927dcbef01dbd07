<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="de_DE" sourcelanguage="en_US">
<context>
    <name>GuiStatReportingPluginUi</name>
    <message>
        <source>Form</source>
        <translation>Formular</translation>
    </message>
    <message>
        <source>Open Templates Editor</source>
        <translation>Vorlageneditor öffnen</translation>
    </message>
    <message>
        <source>Opens Report Template Editor</source>
        <translation>Öffnet den Editor für Berichtsvorlagen</translation>
    </message>
    <message>
        <source>Generate Report File</source>
        <translation>Berichtsdatei erzeugen</translation>
    </message>
    <message>
        <source>Exports current measurments to pdf file.</source>
        <translation>Exportiert die aktuellen Messungen in eine PDF-Datei.</translation>
    </message>
    <message>
        <source>Open Statistics Window</source>
        <translation>Statistikfenster öffnen</translation>
    </message>
    <message>
        <source>Template:</source>
        <translation>Vorlage:</translation>
    </message>
    <message>
        <source>Browse Templates</source>
        <translation>Vorlage auswählen</translation>
    </message>
    <message>
        <source>Opens default template for report generation</source>
        <translation>Öffnet die Vorlage, nach der Berichte erzeugt werden</translation>
    </message>
</context>
<context>
    <name>KvAddImageDialog</name>
    <message>
        <source>Choose image file</source>
        <translation>Bilddatei auswählen</translation>
    </message>
    <message>
        <source>Image file(*.png *.jpg *.gif *.tif *.bmp)</source>
        <translation>Bilddatei (*.png *.jpg *.gif *.tif *.bmp)</translation>
    </message>
</context>
<context>
    <name>KvAddLinkDialogUi</name>
    <message>
        <source>Insert Link</source>
        <translation>Link einfügen</translation>
    </message>
    <message>
        <source>Title:</source>
        <translation>Titel:</translation>
    </message>
    <message>
        <source>URL:</source>
        <translation>URL:</translation>
    </message>
</context>
<context>
    <name>KvAlignmentOptionsRow</name>
    <message>
        <source>Align left</source>
        <translation>Linksbündig</translation>
    </message>
    <message>
        <source>Align center</source>
        <translation>Zentriert</translation>
    </message>
    <message>
        <source>Align right</source>
        <translation>Rechtsbündig</translation>
    </message>
</context>
<context>
    <name>KvBaseEditorNodeFactory</name>
    <message>
        <source>Measurements Table</source>
        <translation>Messwerttabelle</translation>
    </message>
    <message>
        <source>Text Document</source>
        <translation>Textdokument</translation>
    </message>
    <message>
        <source>Camera Image View</source>
        <translation>Kamerabild</translation>
    </message>
    <message>
        <source>Image View</source>
        <translation>Bild</translation>
    </message>
    <message>
        <source>Statistics</source>
        <translation>Statistik</translation>
    </message>
    <message>
        <source>Statistics Table</source>
        <translation>Statistiktabelle</translation>
    </message>
    <message>
        <source>Counters</source>
        <translation>Zähler</translation>
    </message>
    <message>
        <source>Min / Median / Max Box</source>
        <translation>Boxplot (Min/Median/Max)</translation>
    </message>
    <message>
        <source>Trend</source>
        <translation>Trend</translation>
    </message>
</context>
<context>
    <name>KvCameraImageNodeOptionsWidget</name>
    <message>
        <source>Camera image view</source>
        <translation>Kamerabild</translation>
    </message>
    <message>
        <source>Render measurements</source>
        <translation>Messungen einzeichnen</translation>
    </message>
    <message>
        <source>Draw the measurement objects on the picture</source>
        <translation>Messobjekte in das Bild einzeichnen</translation>
    </message>
</context>
<context>
    <name>KvCameraImageWidget</name>
    <message>
        <source>Camera Image View</source>
        <translation>Kamerabild</translation>
    </message>
</context>
<context>
    <name>KvColumnsOptionsRow</name>
    <message>
        <source>Select columns:</source>
        <translation>Spalten wählen:</translation>
    </message>
</context>
<context>
    <name>KvEditorAddImageExtWidgetUi</name>
    <message>
        <source>Width:</source>
        <translation>Breite:</translation>
    </message>
    <message>
        <source>Width in percent of the text&apos;s width</source>
        <translation>Breite in Prozent der Textbreite</translation>
    </message>
    <message>
        <source>Float:</source>
        <translation>Umfluss:</translation>
    </message>
    <message>
        <source>Side of the text at which the picture stands</source>
        <translation>Seite des Textes, an der das Bild steht</translation>
    </message>
    <message>
        <source>none</source>
        <translation>ohne</translation>
    </message>
    <message>
        <source>left</source>
        <translation>links</translation>
    </message>
    <message>
        <source>right</source>
        <translation>rechts</translation>
    </message>
</context>
<context>
    <name>KvEditorToolCombo</name>
    <message>
        <source>Group of blocks, open</source>
        <translation>Gruppe von Blöcken, geöffnet</translation>
    </message>
    <message>
        <source>Group of blocks, closed</source>
        <translation>Gruppe von Blöcken, geschlossen</translation>
    </message>
    <message>
        <source>Close the group (Enter)</source>
        <translation>Gruppe schließen (Enter)</translation>
    </message>
    <message>
        <source>Open the group (Enter)</source>
        <translation>Gruppe öffnen (Enter)</translation>
    </message>
</context>
<context>
    <name>KvEditorToolWidget</name>
    <message>
        <source>Drag onto the page, or press Enter to append</source>
        <translation>Auf die Seite ziehen oder mit Enter anhängen</translation>
    </message>
</context>
<context>
    <name>KvFileDialogs</name>
    <message>
        <source>%1 already exists.
Do you want to replace it?</source>
        <translation>%1 ist bereits vorhanden.
Möchten Sie die Datei ersetzen?</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>Speichern</translation>
    </message>
</context>
<context>
    <name>KvFooterWidget</name>
    <message>
        <source>Footer</source>
        <translation>Fußzeile</translation>
    </message>
</context>
<context>
    <name>KvGroupByOptionsRow</name>
    <message>
        <source>Group by:</source>
        <translation>Gruppierung:</translation>
    </message>
    <message>
        <source>Object</source>
        <translation>Objekt</translation>
    </message>
    <message>
        <source>Measurement</source>
        <translation>Messgröße</translation>
    </message>
</context>
<context>
    <name>KvHeaderWidget</name>
    <message>
        <source>Header</source>
        <translation>Kopfzeile</translation>
    </message>
</context>
<context>
    <name>KvImageFile</name>
    <message>
        <source>Cannot read the image file %1</source>
        <translation>Die Bilddatei %1 kann nicht gelesen werden</translation>
    </message>
    <message>
        <source>The image that the template holds of %1 is damaged</source>
        <translation>Das in der Vorlage gespeicherte Bild von %1 ist beschädigt</translation>
    </message>
</context>
<context>
    <name>KvImageNodeOptionsWidget</name>
    <message>
        <source>Image view</source>
        <translation>Bild</translation>
    </message>
    <message>
        <source>Browse</source>
        <translation>Wählen</translation>
    </message>
    <message>
        <source>Choose an image file</source>
        <translation>Eine Bilddatei auswählen</translation>
    </message>
    <message>
        <source>Choose image file</source>
        <translation>Bilddatei auswählen</translation>
    </message>
    <message>
        <source>Image file(*.png *.jpg *.gif *.tif *.bmp)</source>
        <translation>Bilddatei (*.png *.jpg *.gif *.tif *.bmp)</translation>
    </message>
</context>
<context>
    <name>KvImageWidget</name>
    <message>
        <source>Image View</source>
        <translation>Bild</translation>
    </message>
</context>
<context>
    <name>KvPageCountWidget</name>
    <message>
        <source>Page count</source>
        <translation>Seitenzahl</translation>
    </message>
</context>
<context>
    <name>KvPrintProgressDialog</name>
    <message>
        <source>Cancel</source>
        <translation>Abbrechen</translation>
    </message>
    <message>
        <source>Printing the report</source>
        <translation>Bericht wird gedruckt</translation>
    </message>
    <message>
        <source>Progress</source>
        <translation>Fortschritt</translation>
    </message>
    <message>
        <source>Cancel (Esc)</source>
        <translation>Abbrechen (Esc)</translation>
    </message>
    <message>
        <source>Page %1 of %2</source>
        <translation>Seite %1 von %2</translation>
    </message>
</context>
<context>
    <name>KvReportGlyphs</name>
    <message>
        <source>No installed font has these characters, the report leaves them out: %1</source>
        <translation>Keine installierte Schriftart enthält diese Zeichen; im Bericht fehlen sie: %1</translation>
    </message>
    <message>
        <source>No installed font has these characters, the report leaves them out: %1 (fonts to install: %2)</source>
        <translation>Keine installierte Schriftart enthält diese Zeichen; im Bericht fehlen sie: %1 (zu installierende Schriftarten: %2)</translation>
    </message>
</context>
<context>
    <name>KvReportKeywords</name>
    <message>
        <source>Creation date (ISO)</source>
        <translation>Erstellungsdatum (ISO)</translation>
    </message>
    <message>
        <source>Creation date (Text)</source>
        <translation>Erstellungsdatum (Text)</translation>
    </message>
    <message>
        <source>Creation time</source>
        <translation>Erstellungszeit</translation>
    </message>
    <message>
        <source>Program name</source>
        <translation>Programmname</translation>
    </message>
    <message>
        <source>Program version</source>
        <translation>Programmversion</translation>
    </message>
    <message>
        <source>Program vendor</source>
        <translation>Programmhersteller</translation>
    </message>
</context>
<context>
    <name>KvReportTemplatesEditor</name>
    <message>
        <source>Report template editor</source>
        <translation>Editor für Berichtsvorlagen</translation>
    </message>
    <message>
        <source>Report template file (*.rtp)</source>
        <translation>Berichtsvorlage (*.rtp)</translation>
    </message>
</context>
<context>
    <name>KvRotationOptionsRow</name>
    <message>
        <source>Rotation</source>
        <translation>Drehung</translation>
    </message>
    <message>
        <source>Rotation of the picture, clockwise</source>
        <translation>Drehung des Bildes im Uhrzeigersinn</translation>
    </message>
</context>
<context>
    <name>KvSelectionOverlay</name>
    <message>
        <source>Delete block</source>
        <translation>Block löschen</translation>
    </message>
    <message>
        <source>Delete block (Del)</source>
        <translation>Block löschen (Del)</translation>
    </message>
</context>
<context>
    <name>KvStatisticsMeasurementsTableNodeCfg</name>
    <message>
        <source>Object Name</source>
        <translation>Objektname</translation>
    </message>
    <message>
        <source>Object Type</source>
        <translation>Objekttyp</translation>
    </message>
    <message>
        <source>Value Name</source>
        <translation>Messgröße</translation>
    </message>
    <message>
        <source>Value</source>
        <translation>Wert</translation>
    </message>
</context>
<context>
    <name>KvStatisticsMeasurementsTableOptionsWidget</name>
    <message>
        <source>Measurements table</source>
        <translation>Messwerttabelle</translation>
    </message>
    <message>
        <source>Order by:</source>
        <translation>Sortierung:</translation>
    </message>
    <message>
        <source>default</source>
        <translation>Standard</translation>
    </message>
    <message>
        <source>%1, ascending</source>
        <translation>%1, aufsteigend</translation>
    </message>
    <message>
        <source>%1, descending</source>
        <translation>%1, absteigend</translation>
    </message>
</context>
<context>
    <name>KvStatisticsMeasurementsTableWidget</name>
    <message>
        <source>Measurements Table</source>
        <translation>Messwerttabelle</translation>
    </message>
</context>
<context>
    <name>KvStatisticsStatsTableNodeCfg</name>
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
    <name>KvStatisticsStatsTableOptionsWidget</name>
    <message>
        <source>Statistics table</source>
        <translation>Statistiktabelle</translation>
    </message>
</context>
<context>
    <name>KvStatisticsStatsTableWidget</name>
    <message>
        <source>Statistics Table</source>
        <translation>Statistiktabelle</translation>
    </message>
    <message>
        <source>Object Type</source>
        <translation>Objekttyp</translation>
    </message>
    <message>
        <source>Measurement Type</source>
        <translation>Messgröße</translation>
    </message>
</context>
<context>
    <name>KvStatisticsUnitConverter</name>
    <message>
        <source>deg</source>
        <translation>Grad</translation>
    </message>
    <message>
        <source>pcs</source>
        <translation>Stk.</translation>
    </message>
    <message>
        <source>%</source>
        <translation>%</translation>
    </message>
</context>
<context>
    <name>KvStatisticsWindow</name>
    <message>
        <source>Measurement statistics</source>
        <translation>Messstatistik</translation>
    </message>
    <message>
        <source>Choose a statistics view on the right.</source>
        <translation>Wählen Sie rechts eine Statistikansicht aus.</translation>
    </message>
    <message>
        <source>No statistics blocks are installed.</source>
        <translation>Es sind keine Statistikblöcke installiert.</translation>
    </message>
</context>
<context>
    <name>KvTemplateModel</name>
    <message>
        <source>Cannot read</source>
        <translation>Lesen nicht möglich</translation>
    </message>
    <message>
        <source>Cannot open file %1</source>
        <translation>Die Datei %1 kann nicht geöffnet werden</translation>
    </message>
    <message>
        <source>Error reading file</source>
        <translation>Fehler beim Lesen der Datei</translation>
    </message>
    <message>
        <source>Cannot read file %1</source>
        <translation>Die Datei %1 kann nicht gelesen werden</translation>
    </message>
    <message>
        <source>Cannot save</source>
        <translation>Speichern nicht möglich</translation>
    </message>
    <message>
        <source>Cannot create file %1</source>
        <translation>Die Datei %1 kann nicht angelegt werden</translation>
    </message>
</context>
<context>
    <name>KvTemplatesEditorWindow</name>
    <message>
        <source>Open a template file</source>
        <translation>Eine Vorlagendatei öffnen</translation>
    </message>
    <message>
        <source>Start a new, empty template</source>
        <translation>Eine neue, leere Vorlage beginnen</translation>
    </message>
    <message>
        <source>Save the template to another file</source>
        <translation>Vorlage in einer anderen Datei speichern</translation>
    </message>
    <message>
        <source>Save the template</source>
        <translation>Vorlage speichern</translation>
    </message>
    <message>
        <source>Print the report to a PDF file</source>
        <translation>Bericht in eine PDF-Datei drucken</translation>
    </message>
    <message>
        <source>Header on every page</source>
        <translation>Kopfzeile auf jeder Seite</translation>
    </message>
    <message>
        <source>Footer on every page</source>
        <translation>Fußzeile auf jeder Seite</translation>
    </message>
    <message>
        <source>Page numbers</source>
        <translation>Seitenzahlen</translation>
    </message>
    <message>
        <source>Report pages</source>
        <translation>Berichtsseiten</translation>
    </message>
    <message>
        <source>Blocks to add</source>
        <translation>Blöcke zum Hinzufügen</translation>
    </message>
    <message>
        <source>Are you sure?</source>
        <translation>Sind Sie sicher?</translation>
    </message>
    <message>
        <source>The template is modified, do you want to save it first?</source>
        <translation>Die Vorlage wurde geändert. Möchten Sie sie zuerst speichern?</translation>
    </message>
    <message>
        <source>Choose file to open</source>
        <translation>Datei zum Öffnen auswählen</translation>
    </message>
    <message>
        <source>Choose file to save</source>
        <translation>Datei zum Speichern auswählen</translation>
    </message>
    <message>
        <source>Choose file to print to</source>
        <translation>Zieldatei für den Druck auswählen</translation>
    </message>
    <message>
        <source>Pdf file (*.pdf)</source>
        <translation>PDF-Datei (*.pdf)</translation>
    </message>
    <message>
        <source>Save failed</source>
        <translation>Speichern fehlgeschlagen</translation>
    </message>
    <message>
        <source>Cannot write to file %1</source>
        <translation>In die Datei %1 kann nicht geschrieben werden</translation>
    </message>
    <message>
        <source>[new]</source>
        <translation>[neu]</translation>
    </message>
</context>
<context>
    <name>KvTemplatesEditorWindowUi</name>
    <message>
        <source>Open File</source>
        <translation>Öffnen</translation>
    </message>
    <message>
        <source>Clear</source>
        <translation>Leeren</translation>
    </message>
    <message>
        <source>Save as ...</source>
        <translation>Speichern unter...</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>Speichern</translation>
    </message>
    <message>
        <source>Print</source>
        <translation>Drucken</translation>
    </message>
    <message>
        <source>Add block</source>
        <translation>Block hinzufügen</translation>
    </message>
    <message>
        <source>The template is empty. Drag a block from here onto the page.</source>
        <translation>Die Vorlage ist leer. Ziehen Sie einen Block von hier auf die Seite.</translation>
    </message>
</context>
<context>
    <name>KvTextDocumentNodeOptionsWidget</name>
    <message>
        <source>Text</source>
        <translation>Text</translation>
    </message>
    <message>
        <source>Font size in points</source>
        <translation>Schriftgröße in Punkt</translation>
    </message>
    <message>
        <source>Font size</source>
        <translation>Schriftgröße</translation>
    </message>
    <message>
        <source>Text color</source>
        <translation>Textfarbe</translation>
    </message>
    <message>
        <source>Bold</source>
        <translation>Fett</translation>
    </message>
    <message>
        <source>Italic</source>
        <translation>Kursiv</translation>
    </message>
    <message>
        <source>Underline</source>
        <translation>Unterstrichen</translation>
    </message>
    <message>
        <source>Align left</source>
        <translation>Linksbündig</translation>
    </message>
    <message>
        <source>Align center</source>
        <translation>Zentriert</translation>
    </message>
    <message>
        <source>Align right</source>
        <translation>Rechtsbündig</translation>
    </message>
    <message>
        <source>Justify</source>
        <translation>Blocksatz</translation>
    </message>
    <message>
        <source>Superscript</source>
        <translation>Hochgestellt</translation>
    </message>
    <message>
        <source>Subscript</source>
        <translation>Tiefgestellt</translation>
    </message>
    <message>
        <source>Insert link</source>
        <translation>Link einfügen</translation>
    </message>
    <message>
        <source>Insert picture</source>
        <translation>Bild einfügen</translation>
    </message>
    <message>
        <source>Insert tag</source>
        <translation>Feld einfügen</translation>
    </message>
    <message>
        <source>Insert a tag that the report replaces by its value</source>
        <translation>Ein Feld einfügen, das im Bericht durch seinen Wert ersetzt wird</translation>
    </message>
</context>
<context>
    <name>KvTextDocumentNodeWidget</name>
    <message>
        <source>Text</source>
        <translation>Text</translation>
    </message>
</context>
<context>
    <name>KvThemeOptionsRow</name>
    <message>
        <source>Color theme:</source>
        <translation>Design:</translation>
    </message>
    <message>
        <source>Dark</source>
        <translation>Dunkel</translation>
    </message>
    <message>
        <source>Light</source>
        <translation>Hell</translation>
    </message>
</context>
<context>
    <name>KvWidthOptionsRow</name>
    <message>
        <source>W</source>
        <comment>short for width</comment>
        <translation>B</translation>
    </message>
    <message>
        <source>Width in percent</source>
        <translation>Breite in Prozent</translation>
    </message>
    <message>
        <source>Width in percent of the page&apos;s content</source>
        <translation>Breite in Prozent des Seiteninhalts</translation>
    </message>
</context>
<context>
    <name>KvWindowTitleBar</name>
    <message>
        <source>Close</source>
        <translation>Schließen</translation>
    </message>
</context>
<context>
    <name>StatReportingPlugin</name>
    <message>
        <source>Statistics tools</source>
        <translation>Bericht und Statistik</translation>
    </message>
    <message>
        <source>Select Template File</source>
        <translation>Vorlagendatei auswählen</translation>
    </message>
    <message>
        <source>Report Template File (*.rtp)</source>
        <translation>Berichtsvorlage (*.rtp)</translation>
    </message>
    <message>
        <source>No report template selected.</source>
        <translation>Keine Berichtsvorlage ausgewählt.</translation>
    </message>
</context>
</TS>
