<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="it_IT" sourcelanguage="en_US">
<context>
    <name>GuiStatReportingPluginUi</name>
    <message>
        <source>Form</source>
        <translation>Modulo</translation>
    </message>
    <message>
        <source>Open Templates Editor</source>
        <translation>Apri editor dei modelli</translation>
    </message>
    <message>
        <source>Opens Report Template Editor</source>
        <translation>Apri l&apos;editor dei modelli di report</translation>
    </message>
    <message>
        <source>Generate Report File</source>
        <translation>Genera file del report</translation>
    </message>
    <message>
        <source>Exports current measurments to pdf file.</source>
        <translation>Esporta le misure attuali in un file PDF.</translation>
    </message>
    <message>
        <source>Open Statistics Window</source>
        <translation>Apri finestra delle statistiche</translation>
    </message>
    <message>
        <source>Template:</source>
        <translation>Modello:</translation>
    </message>
    <message>
        <source>Browse Templates</source>
        <translation>Sfoglia modelli</translation>
    </message>
    <message>
        <source>Opens default template for report generation</source>
        <translation>Scegli il modello predefinito per generare i report</translation>
    </message>
</context>
<context>
    <name>KvAddImageDialog</name>
    <message>
        <source>Choose image file</source>
        <translation>Scegli file immagine</translation>
    </message>
    <message>
        <source>Image file(*.png *.jpg *.gif *.tif *.bmp)</source>
        <translation>File immagine (*.png *.jpg *.gif *.tif *.bmp)</translation>
    </message>
</context>
<context>
    <name>KvAddLinkDialogUi</name>
    <message>
        <source>Insert Link</source>
        <translation>Inserisci collegamento</translation>
    </message>
    <message>
        <source>Title:</source>
        <translation>Titolo:</translation>
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
        <translation>Allinea a sinistra</translation>
    </message>
    <message>
        <source>Align center</source>
        <translation>Allinea al centro</translation>
    </message>
    <message>
        <source>Align right</source>
        <translation>Allinea a destra</translation>
    </message>
</context>
<context>
    <name>KvBaseEditorNodeFactory</name>
    <message>
        <source>Measurements Table</source>
        <translation>Tabella delle misure</translation>
    </message>
    <message>
        <source>Text Document</source>
        <translation>Documento di testo</translation>
    </message>
    <message>
        <source>Camera Image View</source>
        <translation>Immagine telecamera</translation>
    </message>
    <message>
        <source>Image View</source>
        <translation>Immagine</translation>
    </message>
    <message>
        <source>Statistics</source>
        <translation>Statistiche</translation>
    </message>
    <message>
        <source>Statistics Table</source>
        <translation>Tabella statistica</translation>
    </message>
    <message>
        <source>Counters</source>
        <translation>Contatori</translation>
    </message>
    <message>
        <source>Min / Median / Max Box</source>
        <translation>Box min / mediana / max</translation>
    </message>
    <message>
        <source>Trend</source>
        <translation>Andamento</translation>
    </message>
</context>
<context>
    <name>KvCameraImageNodeOptionsWidget</name>
    <message>
        <source>Camera image view</source>
        <translation>Immagine telecamera</translation>
    </message>
    <message>
        <source>Render measurements</source>
        <translation>Mostra misure</translation>
    </message>
    <message>
        <source>Draw the measurement objects on the picture</source>
        <translation>Disegna gli oggetti misurati sull&apos;immagine</translation>
    </message>
</context>
<context>
    <name>KvCameraImageWidget</name>
    <message>
        <source>Camera Image View</source>
        <translation>Immagine telecamera</translation>
    </message>
</context>
<context>
    <name>KvColumnsOptionsRow</name>
    <message>
        <source>Select columns:</source>
        <translation>Seleziona colonne:</translation>
    </message>
</context>
<context>
    <name>KvEditorAddImageExtWidgetUi</name>
    <message>
        <source>Width:</source>
        <translation>Larghezza:</translation>
    </message>
    <message>
        <source>Width in percent of the text&apos;s width</source>
        <translation>Larghezza in percentuale della larghezza del testo</translation>
    </message>
    <message>
        <source>Float:</source>
        <translation>Lato:</translation>
    </message>
    <message>
        <source>Side of the text at which the picture stands</source>
        <translation>Lato del testo su cui si trova l&apos;immagine</translation>
    </message>
    <message>
        <source>none</source>
        <translation>nessuno</translation>
    </message>
    <message>
        <source>left</source>
        <translation>sinistro</translation>
    </message>
    <message>
        <source>right</source>
        <translation>destro</translation>
    </message>
</context>
<context>
    <name>KvEditorToolCombo</name>
    <message>
        <source>Group of blocks, open</source>
        <translation>Gruppo di blocchi, aperto</translation>
    </message>
    <message>
        <source>Group of blocks, closed</source>
        <translation>Gruppo di blocchi, chiuso</translation>
    </message>
    <message>
        <source>Close the group (Enter)</source>
        <translation>Chiudi il gruppo (Invio)</translation>
    </message>
    <message>
        <source>Open the group (Enter)</source>
        <translation>Apri il gruppo (Invio)</translation>
    </message>
</context>
<context>
    <name>KvEditorToolWidget</name>
    <message>
        <source>Drag onto the page, or press Enter to append</source>
        <translation>Trascinare sulla pagina o premere Invio per aggiungere in fondo</translation>
    </message>
</context>
<context>
    <name>KvFileDialogs</name>
    <message>
        <source>%1 already exists.
Do you want to replace it?</source>
        <translation>%1 esiste già.
Sostituirlo?</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>Salva</translation>
    </message>
</context>
<context>
    <name>KvFooterWidget</name>
    <message>
        <source>Footer</source>
        <translation>Piè di pagina</translation>
    </message>
</context>
<context>
    <name>KvGroupByOptionsRow</name>
    <message>
        <source>Group by:</source>
        <translation>Raggruppa per:</translation>
    </message>
    <message>
        <source>Object</source>
        <translation>Oggetto</translation>
    </message>
    <message>
        <source>Measurement</source>
        <translation>Misura</translation>
    </message>
</context>
<context>
    <name>KvHeaderWidget</name>
    <message>
        <source>Header</source>
        <translation>Intestazione</translation>
    </message>
</context>
<context>
    <name>KvImageFile</name>
    <message>
        <source>Cannot read the image file %1</source>
        <translation>Impossibile leggere il file immagine %1</translation>
    </message>
    <message>
        <source>The image that the template holds of %1 is damaged</source>
        <translation>L&apos;immagine di %1 contenuta nel modello è danneggiata</translation>
    </message>
</context>
<context>
    <name>KvImageNodeOptionsWidget</name>
    <message>
        <source>Image view</source>
        <translation>Immagine</translation>
    </message>
    <message>
        <source>Browse</source>
        <translation>Sfoglia</translation>
    </message>
    <message>
        <source>Choose an image file</source>
        <translation>Scegli un file immagine</translation>
    </message>
    <message>
        <source>Choose image file</source>
        <translation>Scegli file immagine</translation>
    </message>
    <message>
        <source>Image file(*.png *.jpg *.gif *.tif *.bmp)</source>
        <translation>File immagine (*.png *.jpg *.gif *.tif *.bmp)</translation>
    </message>
</context>
<context>
    <name>KvImageWidget</name>
    <message>
        <source>Image View</source>
        <translation>Immagine</translation>
    </message>
</context>
<context>
    <name>KvPageCountWidget</name>
    <message>
        <source>Page count</source>
        <translation>Numero di pagina</translation>
    </message>
</context>
<context>
    <name>KvPrintProgressDialog</name>
    <message>
        <source>Cancel</source>
        <translation>Annulla</translation>
    </message>
    <message>
        <source>Printing the report</source>
        <translation>Stampa del report</translation>
    </message>
    <message>
        <source>Progress</source>
        <translation>Avanzamento</translation>
    </message>
    <message>
        <source>Cancel (Esc)</source>
        <translation>Annulla (Esc)</translation>
    </message>
    <message>
        <source>Page %1 of %2</source>
        <translation>Pagina %1 di %2</translation>
    </message>
</context>
<context>
    <name>KvReportGlyphs</name>
    <message>
        <source>No installed font has these characters, the report leaves them out: %1</source>
        <translation>Nessun font installato contiene questi caratteri; il report li omette: %1</translation>
    </message>
    <message>
        <source>No installed font has these characters, the report leaves them out: %1 (fonts to install: %2)</source>
        <translation>Nessun font installato contiene questi caratteri; il report li omette: %1 (pacchetti di font da installare: %2)</translation>
    </message>
</context>
<context>
    <name>KvReportKeywords</name>
    <message>
        <source>Creation date (ISO)</source>
        <translation>Data di creazione (ISO)</translation>
    </message>
    <message>
        <source>Creation date (Text)</source>
        <translation>Data di creazione (testo)</translation>
    </message>
    <message>
        <source>Creation time</source>
        <translation>Ora di creazione</translation>
    </message>
    <message>
        <source>Program name</source>
        <translation>Nome del programma</translation>
    </message>
    <message>
        <source>Program version</source>
        <translation>Versione del programma</translation>
    </message>
    <message>
        <source>Program vendor</source>
        <translation>Produttore del programma</translation>
    </message>
</context>
<context>
    <name>KvReportTemplatesEditor</name>
    <message>
        <source>Report template editor</source>
        <translation>Editor dei modelli di report</translation>
    </message>
    <message>
        <source>Report template file (*.rtp)</source>
        <translation>File modello di report (*.rtp)</translation>
    </message>
</context>
<context>
    <name>KvRotationOptionsRow</name>
    <message>
        <source>Rotation</source>
        <translation>Rotazione</translation>
    </message>
    <message>
        <source>Rotation of the picture, clockwise</source>
        <translation>Rotazione dell&apos;immagine in senso orario</translation>
    </message>
</context>
<context>
    <name>KvSelectionOverlay</name>
    <message>
        <source>Delete block</source>
        <translation>Elimina blocco</translation>
    </message>
    <message>
        <source>Delete block (Del)</source>
        <translation>Elimina blocco (Canc)</translation>
    </message>
</context>
<context>
    <name>KvStatisticsMeasurementsTableNodeCfg</name>
    <message>
        <source>Object Name</source>
        <translation>Oggetto</translation>
    </message>
    <message>
        <source>Object Type</source>
        <translation>Tipo di oggetto</translation>
    </message>
    <message>
        <source>Value Name</source>
        <translation>Grandezza</translation>
    </message>
    <message>
        <source>Value</source>
        <translation>Valore</translation>
    </message>
</context>
<context>
    <name>KvStatisticsMeasurementsTableOptionsWidget</name>
    <message>
        <source>Measurements table</source>
        <translation>Tabella delle misure</translation>
    </message>
    <message>
        <source>Order by:</source>
        <translation>Ordina per:</translation>
    </message>
    <message>
        <source>default</source>
        <translation>predefinito</translation>
    </message>
    <message>
        <source>%1, ascending</source>
        <translation>%1, crescente</translation>
    </message>
    <message>
        <source>%1, descending</source>
        <translation>%1, decrescente</translation>
    </message>
</context>
<context>
    <name>KvStatisticsMeasurementsTableWidget</name>
    <message>
        <source>Measurements Table</source>
        <translation>Tabella delle misure</translation>
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
    <name>KvStatisticsStatsTableOptionsWidget</name>
    <message>
        <source>Statistics table</source>
        <translation>Tabella statistica</translation>
    </message>
</context>
<context>
    <name>KvStatisticsStatsTableWidget</name>
    <message>
        <source>Statistics Table</source>
        <translation>Tabella statistica</translation>
    </message>
    <message>
        <source>Object Type</source>
        <translation>Tipo di oggetto</translation>
    </message>
    <message>
        <source>Measurement Type</source>
        <translation>Tipo di misura</translation>
    </message>
</context>
<context>
    <name>KvStatisticsUnitConverter</name>
    <message>
        <source>deg</source>
        <translation>gradi</translation>
    </message>
    <message>
        <source>pcs</source>
        <translation>pz</translation>
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
        <translation>Statistiche delle misure</translation>
    </message>
    <message>
        <source>Choose a statistics view on the right.</source>
        <translation>Scegliere a destra una vista delle statistiche.</translation>
    </message>
    <message>
        <source>No statistics blocks are installed.</source>
        <translation>Nessun blocco di statistiche installato.</translation>
    </message>
</context>
<context>
    <name>KvTemplateModel</name>
    <message>
        <source>Cannot read</source>
        <translation>Errore di lettura</translation>
    </message>
    <message>
        <source>Cannot open file %1</source>
        <translation>Impossibile aprire il file %1</translation>
    </message>
    <message>
        <source>Error reading file</source>
        <translation>Errore durante la lettura del file</translation>
    </message>
    <message>
        <source>Cannot read file %1</source>
        <translation>Impossibile leggere il file %1</translation>
    </message>
    <message>
        <source>Cannot save</source>
        <translation>Errore di salvataggio</translation>
    </message>
    <message>
        <source>Cannot create file %1</source>
        <translation>Impossibile creare il file %1</translation>
    </message>
</context>
<context>
    <name>KvTemplatesEditorWindow</name>
    <message>
        <source>Open a template file</source>
        <translation>Apri un file modello</translation>
    </message>
    <message>
        <source>Start a new, empty template</source>
        <translation>Inizia un nuovo modello vuoto</translation>
    </message>
    <message>
        <source>Save the template to another file</source>
        <translation>Salva il modello in un altro file</translation>
    </message>
    <message>
        <source>Save the template</source>
        <translation>Salva il modello</translation>
    </message>
    <message>
        <source>Print the report to a PDF file</source>
        <translation>Stampa il report in un file PDF</translation>
    </message>
    <message>
        <source>Header on every page</source>
        <translation>Intestazione su ogni pagina</translation>
    </message>
    <message>
        <source>Footer on every page</source>
        <translation>Piè di pagina su ogni pagina</translation>
    </message>
    <message>
        <source>Page numbers</source>
        <translation>Numeri di pagina</translation>
    </message>
    <message>
        <source>Report pages</source>
        <translation>Pagine del report</translation>
    </message>
    <message>
        <source>Blocks to add</source>
        <translation>Blocchi da aggiungere</translation>
    </message>
    <message>
        <source>Are you sure?</source>
        <translation>Conferma</translation>
    </message>
    <message>
        <source>The template is modified, do you want to save it first?</source>
        <translation>Il modello è stato modificato. Salvarlo prima?</translation>
    </message>
    <message>
        <source>Choose file to open</source>
        <translation>Scegli il file da aprire</translation>
    </message>
    <message>
        <source>Choose file to save</source>
        <translation>Scegli il file in cui salvare</translation>
    </message>
    <message>
        <source>Choose file to print to</source>
        <translation>Scegli il file in cui stampare</translation>
    </message>
    <message>
        <source>Pdf file (*.pdf)</source>
        <translation>File PDF (*.pdf)</translation>
    </message>
    <message>
        <source>Save failed</source>
        <translation>Errore di salvataggio</translation>
    </message>
    <message>
        <source>Cannot write to file %1</source>
        <translation>Impossibile scrivere nel file %1</translation>
    </message>
    <message>
        <source>[new]</source>
        <translation>[nuovo]</translation>
    </message>
</context>
<context>
    <name>KvTemplatesEditorWindowUi</name>
    <message>
        <source>Open File</source>
        <translation>Apri file</translation>
    </message>
    <message>
        <source>Clear</source>
        <translation>Svuota</translation>
    </message>
    <message>
        <source>Save as ...</source>
        <translation>Salva con nome...</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>Salva</translation>
    </message>
    <message>
        <source>Print</source>
        <translation>Stampa</translation>
    </message>
    <message>
        <source>Add block</source>
        <translation>Aggiungi blocco</translation>
    </message>
    <message>
        <source>The template is empty. Drag a block from here onto the page.</source>
        <translation>Il modello è vuoto. Trascinare un blocco da qui sulla pagina.</translation>
    </message>
</context>
<context>
    <name>KvTextDocumentNodeOptionsWidget</name>
    <message>
        <source>Text</source>
        <translation>Testo</translation>
    </message>
    <message>
        <source>Font size in points</source>
        <translation>Dimensione del carattere in punti</translation>
    </message>
    <message>
        <source>Font size</source>
        <translation>Dimensione carattere</translation>
    </message>
    <message>
        <source>Text color</source>
        <translation>Colore del testo</translation>
    </message>
    <message>
        <source>Bold</source>
        <translation>Grassetto</translation>
    </message>
    <message>
        <source>Italic</source>
        <translation>Corsivo</translation>
    </message>
    <message>
        <source>Underline</source>
        <translation>Sottolineato</translation>
    </message>
    <message>
        <source>Align left</source>
        <translation>Allinea a sinistra</translation>
    </message>
    <message>
        <source>Align center</source>
        <translation>Allinea al centro</translation>
    </message>
    <message>
        <source>Align right</source>
        <translation>Allinea a destra</translation>
    </message>
    <message>
        <source>Justify</source>
        <translation>Giustifica</translation>
    </message>
    <message>
        <source>Superscript</source>
        <translation>Apice</translation>
    </message>
    <message>
        <source>Subscript</source>
        <translation>Pedice</translation>
    </message>
    <message>
        <source>Insert link</source>
        <translation>Inserisci collegamento</translation>
    </message>
    <message>
        <source>Insert picture</source>
        <translation>Inserisci immagine</translation>
    </message>
    <message>
        <source>Insert tag</source>
        <translation>Inserisci campo</translation>
    </message>
    <message>
        <source>Insert a tag that the report replaces by its value</source>
        <translation>Inserisci un campo che il report sostituisce con il suo valore</translation>
    </message>
</context>
<context>
    <name>KvTextDocumentNodeWidget</name>
    <message>
        <source>Text</source>
        <translation>Testo</translation>
    </message>
</context>
<context>
    <name>KvThemeOptionsRow</name>
    <message>
        <source>Color theme:</source>
        <translation>Tema di colore:</translation>
    </message>
    <message>
        <source>Dark</source>
        <translation>Scuro</translation>
    </message>
    <message>
        <source>Light</source>
        <translation>Chiaro</translation>
    </message>
</context>
<context>
    <name>KvWidthOptionsRow</name>
    <message>
        <source>W</source>
        <comment>short for width</comment>
        <translation>L</translation>
    </message>
    <message>
        <source>Width in percent</source>
        <translation>Larghezza in percentuale</translation>
    </message>
    <message>
        <source>Width in percent of the page&apos;s content</source>
        <translation>Larghezza in percentuale del contenuto della pagina</translation>
    </message>
</context>
<context>
    <name>KvWindowTitleBar</name>
    <message>
        <source>Close</source>
        <translation>Chiudi</translation>
    </message>
</context>
<context>
    <name>StatReportingPlugin</name>
    <message>
        <source>Statistics tools</source>
        <translation>Report e statistiche</translation>
    </message>
    <message>
        <source>Select Template File</source>
        <translation>Seleziona file modello</translation>
    </message>
    <message>
        <source>Report Template File (*.rtp)</source>
        <translation>File modello di report (*.rtp)</translation>
    </message>
    <message>
        <source>No report template selected.</source>
        <translation>Nessun modello di report selezionato.</translation>
    </message>
</context>
</TS>
