<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="sk_SK" sourcelanguage="en_US">
<context>
    <name>GuiStatReportingPluginUi</name>
    <message>
        <source>Form</source>
        <translation>Formulár</translation>
    </message>
    <message>
        <source>Open Templates Editor</source>
        <translation>Otvoriť editor šablón</translation>
    </message>
    <message>
        <source>Opens Report Template Editor</source>
        <translation>Otvorí editor šablón protokolov</translation>
    </message>
    <message>
        <source>Generate Report File</source>
        <translation>Vytvoriť súbor protokolu</translation>
    </message>
    <message>
        <source>Exports current measurments to pdf file.</source>
        <translation>Exportuje aktuálne merania do súboru PDF.</translation>
    </message>
    <message>
        <source>Open Statistics Window</source>
        <translation>Otvoriť okno štatistiky</translation>
    </message>
    <message>
        <source>Template:</source>
        <translation>Šablóna:</translation>
    </message>
    <message>
        <source>Browse Templates</source>
        <translation>Prehľadávať šablóny</translation>
    </message>
    <message>
        <source>Opens default template for report generation</source>
        <translation>Otvorí predvolenú šablónu na vytvorenie protokolu</translation>
    </message>
</context>
<context>
    <name>KvAddImageDialog</name>
    <message>
        <source>Choose image file</source>
        <translation>Vyberte súbor s obrázkom</translation>
    </message>
    <message>
        <source>Image file(*.png *.jpg *.gif *.tif *.bmp)</source>
        <translation>Súbor s obrázkom (*.png *.jpg *.gif *.tif *.bmp)</translation>
    </message>
</context>
<context>
    <name>KvAddLinkDialogUi</name>
    <message>
        <source>Insert Link</source>
        <translation>Vložiť odkaz</translation>
    </message>
    <message>
        <source>Title:</source>
        <translation>Názov:</translation>
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
        <translation>Zarovnať vľavo</translation>
    </message>
    <message>
        <source>Align center</source>
        <translation>Zarovnať na stred</translation>
    </message>
    <message>
        <source>Align right</source>
        <translation>Zarovnať vpravo</translation>
    </message>
</context>
<context>
    <name>KvBaseEditorNodeFactory</name>
    <message>
        <source>Measurements Table</source>
        <translation>Tabuľka meraní</translation>
    </message>
    <message>
        <source>Text Document</source>
        <translation>Textový dokument</translation>
    </message>
    <message>
        <source>Camera Image View</source>
        <translation>Obraz z kamery</translation>
    </message>
    <message>
        <source>Image View</source>
        <translation>Obrázok</translation>
    </message>
    <message>
        <source>Statistics</source>
        <translation>Štatistika</translation>
    </message>
    <message>
        <source>Statistics Table</source>
        <translation>Tabuľka štatistiky</translation>
    </message>
    <message>
        <source>Counters</source>
        <translation>Počítadlá</translation>
    </message>
    <message>
        <source>Min / Median / Max Box</source>
        <translation>Krabicový graf</translation>
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
        <translation>Obraz z kamery</translation>
    </message>
    <message>
        <source>Render measurements</source>
        <translation>Vykresliť merania</translation>
    </message>
    <message>
        <source>Draw the measurement objects on the picture</source>
        <translation>Vykresliť merané objekty do obrázka</translation>
    </message>
</context>
<context>
    <name>KvCameraImageWidget</name>
    <message>
        <source>Camera Image View</source>
        <translation>Obraz z kamery</translation>
    </message>
</context>
<context>
    <name>KvColumnsOptionsRow</name>
    <message>
        <source>Select columns:</source>
        <translation>Výber stĺpcov:</translation>
    </message>
</context>
<context>
    <name>KvEditorAddImageExtWidgetUi</name>
    <message>
        <source>Width:</source>
        <translation>Šírka:</translation>
    </message>
    <message>
        <source>Width in percent of the text&apos;s width</source>
        <translation>Šírka v percentách šírky textu</translation>
    </message>
    <message>
        <source>Float:</source>
        <translation>Obtekanie:</translation>
    </message>
    <message>
        <source>Side of the text at which the picture stands</source>
        <translation>Strana textu, na ktorej stojí obrázok</translation>
    </message>
    <message>
        <source>none</source>
        <translation>žiadne</translation>
    </message>
    <message>
        <source>left</source>
        <translation>vľavo</translation>
    </message>
    <message>
        <source>right</source>
        <translation>vpravo</translation>
    </message>
</context>
<context>
    <name>KvEditorToolCombo</name>
    <message>
        <source>Group of blocks, open</source>
        <translation>Skupina blokov, rozbalená</translation>
    </message>
    <message>
        <source>Group of blocks, closed</source>
        <translation>Skupina blokov, zbalená</translation>
    </message>
    <message>
        <source>Close the group (Enter)</source>
        <translation>Zbaliť skupinu (Enter)</translation>
    </message>
    <message>
        <source>Open the group (Enter)</source>
        <translation>Rozbaliť skupinu (Enter)</translation>
    </message>
</context>
<context>
    <name>KvEditorToolWidget</name>
    <message>
        <source>Drag onto the page, or press Enter to append</source>
        <translation>Presuňte na stranu alebo stlačením klávesu Enter pridajte na koniec</translation>
    </message>
</context>
<context>
    <name>KvFileDialogs</name>
    <message>
        <source>%1 already exists.
Do you want to replace it?</source>
        <translation>%1 už existuje.
Chcete ho nahradiť?</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>Uložiť</translation>
    </message>
</context>
<context>
    <name>KvFooterWidget</name>
    <message>
        <source>Footer</source>
        <translation>Päta</translation>
    </message>
</context>
<context>
    <name>KvGroupByOptionsRow</name>
    <message>
        <source>Group by:</source>
        <translation>Zoskupenie:</translation>
    </message>
    <message>
        <source>Object</source>
        <translation>Objekt</translation>
    </message>
    <message>
        <source>Measurement</source>
        <translation>Veličina</translation>
    </message>
</context>
<context>
    <name>KvHeaderWidget</name>
    <message>
        <source>Header</source>
        <translation>Hlavička</translation>
    </message>
</context>
<context>
    <name>KvImageFile</name>
    <message>
        <source>Cannot read the image file %1</source>
        <translation>Súbor s obrázkom %1 sa nedá prečítať</translation>
    </message>
    <message>
        <source>The image that the template holds of %1 is damaged</source>
        <translation>Obrázok %1 uložený v šablóne je poškodený</translation>
    </message>
</context>
<context>
    <name>KvImageNodeOptionsWidget</name>
    <message>
        <source>Image view</source>
        <translation>Obrázok</translation>
    </message>
    <message>
        <source>Browse</source>
        <translation>Prehľadávať</translation>
    </message>
    <message>
        <source>Choose an image file</source>
        <translation>Vybrať súbor s obrázkom</translation>
    </message>
    <message>
        <source>Choose image file</source>
        <translation>Vyberte súbor s obrázkom</translation>
    </message>
    <message>
        <source>Image file(*.png *.jpg *.gif *.tif *.bmp)</source>
        <translation>Súbor s obrázkom (*.png *.jpg *.gif *.tif *.bmp)</translation>
    </message>
</context>
<context>
    <name>KvImageWidget</name>
    <message>
        <source>Image View</source>
        <translation>Obrázok</translation>
    </message>
</context>
<context>
    <name>KvPageCountWidget</name>
    <message>
        <source>Page count</source>
        <translation>Číslovanie strán</translation>
    </message>
</context>
<context>
    <name>KvPrintProgressDialog</name>
    <message>
        <source>Cancel</source>
        <translation>Zrušiť</translation>
    </message>
    <message>
        <source>Printing the report</source>
        <translation>Tlačí sa protokol</translation>
    </message>
    <message>
        <source>Progress</source>
        <translation>Priebeh</translation>
    </message>
    <message>
        <source>Cancel (Esc)</source>
        <translation>Zrušiť (Esc)</translation>
    </message>
    <message>
        <source>Page %1 of %2</source>
        <translation>Strana %1 z %2</translation>
    </message>
</context>
<context>
    <name>KvReportGlyphs</name>
    <message>
        <source>No installed font has these characters, the report leaves them out: %1</source>
        <translation>Tieto znaky nie sú v žiadnom nainštalovanom písme; v protokole chýbajú: %1</translation>
    </message>
    <message>
        <source>No installed font has these characters, the report leaves them out: %1 (fonts to install: %2)</source>
        <translation>Tieto znaky nie sú v žiadnom nainštalovanom písme; v protokole chýbajú: %1 (písma na inštaláciu: %2)</translation>
    </message>
</context>
<context>
    <name>KvReportKeywords</name>
    <message>
        <source>Creation date (ISO)</source>
        <translation>Dátum vytvorenia (ISO)</translation>
    </message>
    <message>
        <source>Creation date (Text)</source>
        <translation>Dátum vytvorenia (text)</translation>
    </message>
    <message>
        <source>Creation time</source>
        <translation>Čas vytvorenia</translation>
    </message>
    <message>
        <source>Program name</source>
        <translation>Názov programu</translation>
    </message>
    <message>
        <source>Program version</source>
        <translation>Verzia programu</translation>
    </message>
    <message>
        <source>Program vendor</source>
        <translation>Výrobca programu</translation>
    </message>
</context>
<context>
    <name>KvReportTemplatesEditor</name>
    <message>
        <source>Report template editor</source>
        <translation>Editor šablón protokolov</translation>
    </message>
    <message>
        <source>Report template file (*.rtp)</source>
        <translation>Súbor šablóny protokolu (*.rtp)</translation>
    </message>
</context>
<context>
    <name>KvRotationOptionsRow</name>
    <message>
        <source>Rotation</source>
        <translation>Otočenie</translation>
    </message>
    <message>
        <source>Rotation of the picture, clockwise</source>
        <translation>Otočenie obrázka v smere hodinových ručičiek</translation>
    </message>
</context>
<context>
    <name>KvSelectionOverlay</name>
    <message>
        <source>Delete block</source>
        <translation>Odstrániť blok</translation>
    </message>
    <message>
        <source>Delete block (Del)</source>
        <translation>Odstrániť blok (Del)</translation>
    </message>
</context>
<context>
    <name>KvStatisticsMeasurementsTableNodeCfg</name>
    <message>
        <source>Object Name</source>
        <translation>Názov objektu</translation>
    </message>
    <message>
        <source>Object Type</source>
        <translation>Typ objektu</translation>
    </message>
    <message>
        <source>Value Name</source>
        <translation>Veličina</translation>
    </message>
    <message>
        <source>Value</source>
        <translation>Hodnota</translation>
    </message>
</context>
<context>
    <name>KvStatisticsMeasurementsTableOptionsWidget</name>
    <message>
        <source>Measurements table</source>
        <translation>Tabuľka meraní</translation>
    </message>
    <message>
        <source>Order by:</source>
        <translation>Zoradenie:</translation>
    </message>
    <message>
        <source>default</source>
        <translation>predvolené</translation>
    </message>
    <message>
        <source>%1, ascending</source>
        <translation>%1, vzostupne</translation>
    </message>
    <message>
        <source>%1, descending</source>
        <translation>%1, zostupne</translation>
    </message>
</context>
<context>
    <name>KvStatisticsMeasurementsTableWidget</name>
    <message>
        <source>Measurements Table</source>
        <translation>Tabuľka meraní</translation>
    </message>
</context>
<context>
    <name>KvStatisticsStatsTableNodeCfg</name>
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
    <name>KvStatisticsStatsTableOptionsWidget</name>
    <message>
        <source>Statistics table</source>
        <translation>Tabuľka štatistiky</translation>
    </message>
</context>
<context>
    <name>KvStatisticsStatsTableWidget</name>
    <message>
        <source>Statistics Table</source>
        <translation>Tabuľka štatistiky</translation>
    </message>
    <message>
        <source>Object Type</source>
        <translation>Typ objektu</translation>
    </message>
    <message>
        <source>Measurement Type</source>
        <translation>Veličina</translation>
    </message>
</context>
<context>
    <name>KvStatisticsUnitConverter</name>
    <message>
        <source>deg</source>
        <translation>stup.</translation>
    </message>
    <message>
        <source>pcs</source>
        <translation>ks</translation>
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
        <translation>Štatistika meraní</translation>
    </message>
    <message>
        <source>Choose a statistics view on the right.</source>
        <translation>Vyberte vpravo zobrazenie štatistiky.</translation>
    </message>
    <message>
        <source>No statistics blocks are installed.</source>
        <translation>Nie sú nainštalované žiadne bloky štatistiky.</translation>
    </message>
</context>
<context>
    <name>KvTemplateModel</name>
    <message>
        <source>Cannot read</source>
        <translation>Nedá sa čítať</translation>
    </message>
    <message>
        <source>Cannot open file %1</source>
        <translation>Súbor %1 sa nedá otvoriť</translation>
    </message>
    <message>
        <source>Error reading file</source>
        <translation>Chyba pri čítaní súboru</translation>
    </message>
    <message>
        <source>Cannot read file %1</source>
        <translation>Súbor %1 sa nedá prečítať</translation>
    </message>
    <message>
        <source>Cannot save</source>
        <translation>Nedá sa uložiť</translation>
    </message>
    <message>
        <source>Cannot create file %1</source>
        <translation>Súbor %1 sa nedá vytvoriť</translation>
    </message>
</context>
<context>
    <name>KvTemplatesEditorWindow</name>
    <message>
        <source>Open a template file</source>
        <translation>Otvoriť súbor šablóny</translation>
    </message>
    <message>
        <source>Start a new, empty template</source>
        <translation>Začať novú prázdnu šablónu</translation>
    </message>
    <message>
        <source>Save the template to another file</source>
        <translation>Uložiť šablónu do iného súboru</translation>
    </message>
    <message>
        <source>Save the template</source>
        <translation>Uložiť šablónu</translation>
    </message>
    <message>
        <source>Print the report to a PDF file</source>
        <translation>Vytlačiť protokol do súboru PDF</translation>
    </message>
    <message>
        <source>Header on every page</source>
        <translation>Hlavička na každej strane</translation>
    </message>
    <message>
        <source>Footer on every page</source>
        <translation>Päta na každej strane</translation>
    </message>
    <message>
        <source>Page numbers</source>
        <translation>Čísla strán</translation>
    </message>
    <message>
        <source>Report pages</source>
        <translation>Strany protokolu</translation>
    </message>
    <message>
        <source>Blocks to add</source>
        <translation>Dostupné bloky</translation>
    </message>
    <message>
        <source>Are you sure?</source>
        <translation>Ste si istí?</translation>
    </message>
    <message>
        <source>The template is modified, do you want to save it first?</source>
        <translation>Šablóna bola zmenená. Chcete ju najprv uložiť?</translation>
    </message>
    <message>
        <source>Choose file to open</source>
        <translation>Vyberte súbor na otvorenie</translation>
    </message>
    <message>
        <source>Choose file to save</source>
        <translation>Vyberte súbor na uloženie</translation>
    </message>
    <message>
        <source>Choose file to print to</source>
        <translation>Vyberte súbor na tlač</translation>
    </message>
    <message>
        <source>Pdf file (*.pdf)</source>
        <translation>Súbor PDF (*.pdf)</translation>
    </message>
    <message>
        <source>Save failed</source>
        <translation>Uloženie zlyhalo</translation>
    </message>
    <message>
        <source>Cannot write to file %1</source>
        <translation>Do súboru %1 sa nedá zapisovať</translation>
    </message>
    <message>
        <source>[new]</source>
        <translation>[nová]</translation>
    </message>
</context>
<context>
    <name>KvTemplatesEditorWindowUi</name>
    <message>
        <source>Open File</source>
        <translation>Otvoriť súbor</translation>
    </message>
    <message>
        <source>Clear</source>
        <translation>Vymazať</translation>
    </message>
    <message>
        <source>Save as ...</source>
        <translation>Uložiť ako...</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>Uložiť</translation>
    </message>
    <message>
        <source>Print</source>
        <translation>Tlačiť</translation>
    </message>
    <message>
        <source>Add block</source>
        <translation>Pridať blok</translation>
    </message>
    <message>
        <source>The template is empty. Drag a block from here onto the page.</source>
        <translation>Šablóna je prázdna. Presuňte blok odtiaľto na stranu.</translation>
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
        <translation>Veľkosť písma v bodoch</translation>
    </message>
    <message>
        <source>Font size</source>
        <translation>Veľkosť písma</translation>
    </message>
    <message>
        <source>Text color</source>
        <translation>Farba textu</translation>
    </message>
    <message>
        <source>Bold</source>
        <translation>Tučné</translation>
    </message>
    <message>
        <source>Italic</source>
        <translation>Kurzíva</translation>
    </message>
    <message>
        <source>Underline</source>
        <translation>Podčiarknuté</translation>
    </message>
    <message>
        <source>Align left</source>
        <translation>Zarovnať vľavo</translation>
    </message>
    <message>
        <source>Align center</source>
        <translation>Zarovnať na stred</translation>
    </message>
    <message>
        <source>Align right</source>
        <translation>Zarovnať vpravo</translation>
    </message>
    <message>
        <source>Justify</source>
        <translation>Zarovnať do bloku</translation>
    </message>
    <message>
        <source>Superscript</source>
        <translation>Horný index</translation>
    </message>
    <message>
        <source>Subscript</source>
        <translation>Dolný index</translation>
    </message>
    <message>
        <source>Insert link</source>
        <translation>Vložiť odkaz</translation>
    </message>
    <message>
        <source>Insert picture</source>
        <translation>Vložiť obrázok</translation>
    </message>
    <message>
        <source>Insert tag</source>
        <translation>Vložiť pole</translation>
    </message>
    <message>
        <source>Insert a tag that the report replaces by its value</source>
        <translation>Vložiť pole, ktoré protokol nahradí jeho hodnotou</translation>
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
        <translation>Farebný motív:</translation>
    </message>
    <message>
        <source>Dark</source>
        <translation>Tmavý</translation>
    </message>
    <message>
        <source>Light</source>
        <translation>Svetlý</translation>
    </message>
</context>
<context>
    <name>KvWidthOptionsRow</name>
    <message>
        <source>W</source>
        <comment>short for width</comment>
        <translation>Š</translation>
    </message>
    <message>
        <source>Width in percent</source>
        <translation>Šírka v percentách</translation>
    </message>
    <message>
        <source>Width in percent of the page&apos;s content</source>
        <translation>Šírka v percentách obsahu strany</translation>
    </message>
</context>
<context>
    <name>KvWindowTitleBar</name>
    <message>
        <source>Close</source>
        <translation>Zavrieť</translation>
    </message>
</context>
<context>
    <name>StatReportingPlugin</name>
    <message>
        <source>Statistics tools</source>
        <translation>Protokol a štatistika</translation>
    </message>
    <message>
        <source>Select Template File</source>
        <translation>Vyberte súbor šablóny</translation>
    </message>
    <message>
        <source>Report Template File (*.rtp)</source>
        <translation>Súbor šablóny protokolu (*.rtp)</translation>
    </message>
    <message>
        <source>No report template selected.</source>
        <translation>Nie je vybraná šablóna protokolu.</translation>
    </message>
</context>
</TS>
