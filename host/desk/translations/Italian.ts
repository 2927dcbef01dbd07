<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="it_IT" sourcelanguage="en_US">
<context>
    <name>KvDeskActions</name>
    <message>
        <source>&amp;New session</source>
        <translation>&amp;Nuova sessione</translation>
    </message>
    <message>
        <source>Start an empty session</source>
        <translation>Inizia una sessione vuota</translation>
    </message>
    <message>
        <source>Open &amp;image...</source>
        <translation>Apri &amp;immagine...</translation>
    </message>
    <message>
        <source>Open image</source>
        <translation>Apri immagine</translation>
    </message>
    <message>
        <source>&amp;Open session...</source>
        <translation>&amp;Apri sessione...</translation>
    </message>
    <message>
        <source>Open session</source>
        <translation>Apri sessione</translation>
    </message>
    <message>
        <source>Import &amp;table...</source>
        <translation>Importa &amp;tabella...</translation>
    </message>
    <message>
        <source>Import table of measured values</source>
        <translation>Importa tabella di valori misurati</translation>
    </message>
    <message>
        <source>&amp;Save session</source>
        <translation>&amp;Salva sessione</translation>
    </message>
    <message>
        <source>Save session</source>
        <translation>Salva sessione</translation>
    </message>
    <message>
        <source>Save session &amp;as...</source>
        <translation>Salva sessione &amp;con nome...</translation>
    </message>
    <message>
        <source>Save session to another file</source>
        <translation>Salva la sessione in un altro file</translation>
    </message>
    <message>
        <source>&amp;Quit</source>
        <translation>&amp;Esci</translation>
    </message>
    <message>
        <source>Quit the program</source>
        <translation>Esci dal programma</translation>
    </message>
    <message>
        <source>Zoom &amp;in</source>
        <translation>&amp;Ingrandisci</translation>
    </message>
    <message>
        <source>Zoom in</source>
        <translation>Ingrandisci</translation>
    </message>
    <message>
        <source>Zoom &amp;out</source>
        <translation>&amp;Riduci</translation>
    </message>
    <message>
        <source>Zoom out</source>
        <translation>Riduci</translation>
    </message>
    <message>
        <source>&amp;Fit to window</source>
        <translation>&amp;Adatta alla finestra</translation>
    </message>
    <message>
        <source>Show the whole image</source>
        <translation>Mostra l&apos;intera immagine</translation>
    </message>
    <message>
        <source>&amp;Actual size</source>
        <translation>&amp;Dimensioni reali</translation>
    </message>
    <message>
        <source>Show the image at 100 %</source>
        <translation>Mostra l&apos;immagine al 100 %</translation>
    </message>
    <message>
        <source>&amp;Measured values</source>
        <translation>&amp;Valori misurati</translation>
    </message>
    <message>
        <source>Show or hide the measured values</source>
        <translation>Mostra o nascondi i valori misurati</translation>
    </message>
    <message>
        <source>Stat&amp;us log</source>
        <translation>Registro di &amp;stato</translation>
    </message>
    <message>
        <source>Show or hide the status log</source>
        <translation>Mostra o nascondi il registro di stato</translation>
    </message>
    <message>
        <source>&amp;Dark or light theme</source>
        <translation>&amp;Tema scuro o chiaro</translation>
    </message>
    <message>
        <source>Change between the dark and the light theme</source>
        <translation>Passa dal tema scuro a quello chiaro e viceversa</translation>
    </message>
    <message>
        <source>Settin&amp;gs...</source>
        <translation>Im&amp;postazioni...</translation>
    </message>
    <message>
        <source>Settings</source>
        <translation>Impostazioni</translation>
    </message>
    <message>
        <source>&amp;About Measuring Desk</source>
        <translation>&amp;Informazioni su Measuring Desk</translation>
    </message>
    <message>
        <source>About Measuring Desk</source>
        <translation>Informazioni su Measuring Desk</translation>
    </message>
    <message>
        <source>%1 (%2)</source>
        <comment>command (shortcut)</comment>
        <translation>%1 (%2)</translation>
    </message>
    <message>
        <source>&amp;Export measured values...</source>
        <translation>Esporta &amp;valori misurati...</translation>
    </message>
    <message>
        <source>Export measured values as a table</source>
        <translation>Esporta i valori misurati come tabella</translation>
    </message>
    <message>
        <source>&amp;Undo</source>
        <translation>&amp;Annulla</translation>
    </message>
    <message>
        <source>Undo the last step</source>
        <translation>Annulla l&apos;ultima operazione</translation>
    </message>
    <message>
        <source>&amp;Redo</source>
        <translation>&amp;Ripeti</translation>
    </message>
    <message>
        <source>Redo what was undone</source>
        <translation>Ripeti l&apos;operazione annullata</translation>
    </message>
    <message>
        <source>Cu&amp;t</source>
        <translation>&amp;Taglia</translation>
    </message>
    <message>
        <source>Cut the selected objects</source>
        <translation>Taglia gli oggetti selezionati</translation>
    </message>
    <message>
        <source>&amp;Copy</source>
        <translation>&amp;Copia</translation>
    </message>
    <message>
        <source>Copy the selected objects</source>
        <translation>Copia gli oggetti selezionati</translation>
    </message>
    <message>
        <source>&amp;Paste</source>
        <translation>&amp;Incolla</translation>
    </message>
    <message>
        <source>Paste copied objects</source>
        <translation>Incolla gli oggetti copiati</translation>
    </message>
    <message>
        <source>&amp;Delete</source>
        <translation>&amp;Elimina</translation>
    </message>
    <message>
        <source>Delete the selected objects</source>
        <translation>Elimina gli oggetti selezionati</translation>
    </message>
    <message>
        <source>Select &amp;all</source>
        <translation>Seleziona t&amp;utto</translation>
    </message>
    <message>
        <source>Select all objects on the image</source>
        <translation>Seleziona tutti gli oggetti sull&apos;immagine</translation>
    </message>
    <message>
        <source>Re&amp;name</source>
        <translation>Ri&amp;nomina</translation>
    </message>
    <message>
        <source>Give the selected object a name</source>
        <translation>Assegna un nome all&apos;oggetto selezionato</translation>
    </message>
    <message>
        <source>&amp;Find measured values</source>
        <translation>Tr&amp;ova valori misurati</translation>
    </message>
    <message>
        <source>Filter the measured values</source>
        <translation>Filtra i valori misurati</translation>
    </message>
    <message>
        <source>&amp;Select</source>
        <translation>&amp;Seleziona</translation>
    </message>
    <message>
        <source>Select and change objects</source>
        <translation>Seleziona e modifica oggetti</translation>
    </message>
    <message>
        <source>&amp;Line</source>
        <translation>&amp;Linea</translation>
    </message>
    <message>
        <source>Measure a length</source>
        <translation>Misura una lunghezza</translation>
    </message>
    <message>
        <source>&amp;Polyline</source>
        <translation>&amp;Polilinea</translation>
    </message>
    <message>
        <source>Measure the length of a way</source>
        <translation>Misura la lunghezza di un percorso</translation>
    </message>
    <message>
        <source>Parallel &amp;distance</source>
        <translation>&amp;Distanza punto-linea</translation>
    </message>
    <message>
        <source>Measure the distance of a point from a line</source>
        <translation>Misura la distanza di un punto da una linea</translation>
    </message>
    <message>
        <source>&amp;Arc</source>
        <translation>&amp;Arco</translation>
    </message>
    <message>
        <source>Measure an arc through three points</source>
        <translation>Misura un arco per tre punti</translation>
    </message>
    <message>
        <source>&amp;Circle</source>
        <translation>&amp;Cerchio</translation>
    </message>
    <message>
        <source>Measure a circle</source>
        <translation>Misura un cerchio</translation>
    </message>
    <message>
        <source>&amp;Rectangle</source>
        <translation>&amp;Rettangolo</translation>
    </message>
    <message>
        <source>Measure a rectangle</source>
        <translation>Misura un rettangolo</translation>
    </message>
    <message>
        <source>Poly&amp;gon</source>
        <translation>Poli&amp;gono</translation>
    </message>
    <message>
        <source>Measure the area of a polygon</source>
        <translation>Misura l&apos;area di un poligono</translation>
    </message>
    <message>
        <source>Cou&amp;nter</source>
        <translation>Co&amp;ntatore</translation>
    </message>
    <message>
        <source>Count by clicks</source>
        <translation>Conta con i clic</translation>
    </message>
    <message>
        <source>&amp;Text note</source>
        <translation>Nota di &amp;testo</translation>
    </message>
    <message>
        <source>Write on the image</source>
        <translation>Scrivi sull&apos;immagine</translation>
    </message>
    <message>
        <source>Scale &amp;bar</source>
        <translation>&amp;Barra di scala</translation>
    </message>
    <message>
        <source>Draw a scale bar</source>
        <translation>Disegna una barra di scala</translation>
    </message>
    <message>
        <source>Cal&amp;ibration...</source>
        <translation>Calibra&amp;zione...</translation>
    </message>
    <message>
        <source>Say how large a pixel of the image is</source>
        <translation>Indica la dimensione di un pixel dell&apos;immagine</translation>
    </message>
    <message>
        <source>Use the file&apos;s pixel size</source>
        <translation>Usa la dimensione pixel del file</translation>
    </message>
    <message>
        <source>Measure with the pixel size that the image&apos;s file states</source>
        <translation>Misura con la dimensione pixel indicata dal file immagine</translation>
    </message>
    <message>
        <source>&amp;Take snapshot</source>
        <translation>Scatta &amp;istantanea</translation>
    </message>
    <message>
        <source>Save the image to the gallery</source>
        <translation>Salva l&apos;immagine nella galleria</translation>
    </message>
    <message>
        <source>Snapshots &amp;with measurements</source>
        <translation>Istantanee con &amp;misure</translation>
    </message>
    <message>
        <source>Draw the measured objects on snapshots</source>
        <translation>Disegna gli oggetti misurati sulle istantanee</translation>
    </message>
    <message>
        <source>&amp;Freeze</source>
        <translation>&amp;Congela</translation>
    </message>
    <message>
        <source>Freeze the live image</source>
        <translation>Congela l&apos;immagine dal vivo</translation>
    </message>
    <message>
        <source>&amp;Labels on the image</source>
        <translation>&amp;Etichette sull&apos;immagine</translation>
    </message>
    <message>
        <source>Show or hide the labels of objects</source>
        <translation>Mostra o nascondi le etichette degli oggetti</translation>
    </message>
    <message>
        <source>&amp;Rulers</source>
        <translation>Righe&amp;lli</translation>
    </message>
    <message>
        <source>Show or hide the rulers</source>
        <translation>Mostra o nascondi i righelli</translation>
    </message>
    <message>
        <source>&amp;Scale bar on the image</source>
        <translation>&amp;Barra di scala sull&apos;immagine</translation>
    </message>
    <message>
        <source>Show or hide the scale bar, on reports, too</source>
        <translation>Mostra o nascondi la barra di scala, anche nei report</translation>
    </message>
    <message>
        <source>&amp;Gallery</source>
        <translation>&amp;Galleria</translation>
    </message>
    <message>
        <source>Show or hide the gallery</source>
        <translation>Mostra o nascondi la galleria</translation>
    </message>
    <message>
        <source>&amp;Start page</source>
        <translation>&amp;Pagina iniziale</translation>
    </message>
    <message>
        <source>Show the first steps, the examples and the recent sessions</source>
        <translation>Mostra i primi passi, gli esempi e le sessioni recenti</translation>
    </message>
    <message>
        <source>&amp;User guide</source>
        <translation>&amp;Guida utente</translation>
    </message>
    <message>
        <source>Read the user guide</source>
        <translation>Leggi la guida utente</translation>
    </message>
</context>
<context>
    <name>KvDeskAutosave</name>
    <message>
        <source>the folder &quot;%1&quot; cannot be written</source>
        <translation>impossibile scrivere nella cartella “%1”</translation>
    </message>
    <message>
        <source>Unsaved changes are not being copied: %1</source>
        <translation>Le modifiche non salvate non vengono copiate: %1</translation>
    </message>
</context>
<context>
    <name>KvDeskCalibrationCommands</name>
    <message>
        <source>The session measures with it already</source>
        <translation>La sessione misura già con questa dimensione</translation>
    </message>
    <message>
        <source>The image&apos;s file does not state one</source>
        <translation>Il file immagine non ne indica alcuna</translation>
    </message>
</context>
<context>
    <name>KvDeskCalibrationDialog</name>
    <message>
        <source>Calibration</source>
        <translation>Calibrazione</translation>
    </message>
    <message>
        <source>Objective</source>
        <translation>Obiettivo</translation>
    </message>
    <message>
        <source>Choose an objective, or type the name of a new one</source>
        <translation>Scegliere un obiettivo o digitare il nome di uno nuovo</translation>
    </message>
    <message>
        <source>Such as 10x</source>
        <translation>Ad esempio 10x</translation>
    </message>
    <message>
        <source>In use</source>
        <translation>In uso</translation>
    </message>
    <message>
        <source>New calibration</source>
        <translation>Nuova calibrazione</translation>
    </message>
    <message>
        <source>Known distance</source>
        <translation>Distanza nota</translation>
    </message>
    <message>
        <source>Image file</source>
        <translation>File immagine</translation>
    </message>
    <message>
        <source>Typed</source>
        <translation>Manuale</translation>
    </message>
    <message>
        <source>Name</source>
        <translation>Nome</translation>
    </message>
    <message>
        <source>Who</source>
        <translation>Operatore</translation>
    </message>
    <message>
        <source>Note</source>
        <translation>Nota</translation>
    </message>
    <message>
        <source>Calibrate</source>
        <translation>Calibra</translation>
    </message>
    <message>
        <source>History of the objective</source>
        <translation>Cronologia dell&apos;obiettivo</translation>
    </message>
    <message>
        <source>Calibrations of this objective appear here</source>
        <translation>Qui appaiono le calibrazioni di questo obiettivo</translation>
    </message>
    <message>
        <source>Use again</source>
        <translation>Usa di nuovo</translation>
    </message>
    <message>
        <source>Close</source>
        <translation>Chiudi</translation>
    </message>
    <message>
        <source>New pixel size: %1</source>
        <translation>Nuova dimensione pixel: %1</translation>
    </message>
    <message>
        <source>No pixel size yet</source>
        <translation>Ancora nessuna dimensione pixel</translation>
    </message>
    <message>
        <source>Measure with this pixel size and remember it</source>
        <translation>Misura con questa dimensione pixel e memorizzala</translation>
    </message>
    <message>
        <source>Complete the fields above first</source>
        <translation>Compilare prima i campi qui sopra</translation>
    </message>
    <message>
        <source>Measure with the selected calibration</source>
        <translation>Misura con la calibrazione selezionata</translation>
    </message>
    <message>
        <source>Select a calibration in the table first</source>
        <translation>Selezionare prima una calibrazione nella tabella</translation>
    </message>
</context>
<context>
    <name>KvDeskCalibrationHistory</name>
    <message>
        <source>Date</source>
        <translation>Data</translation>
    </message>
    <message>
        <source>Who</source>
        <translation>Operatore</translation>
    </message>
    <message>
        <source>Pixel size</source>
        <translation>Dimensione pixel</translation>
    </message>
    <message>
        <source>Origin</source>
        <translation>Origine</translation>
    </message>
    <message>
        <source>Name</source>
        <translation>Nome</translation>
    </message>
</context>
<context>
    <name>KvDeskCalibrationText</name>
    <message>
        <source>%1 μm</source>
        <comment>size of a pixel</comment>
        <translation>%1 μm</translation>
    </message>
    <message>
        <source>%1 × %2 μm</source>
        <comment>width and height of a pixel</comment>
        <translation>%1 × %2 μm</translation>
    </message>
    <message>
        <source>Known distance</source>
        <translation>Distanza nota</translation>
    </message>
    <message>
        <source>Image file</source>
        <translation>File immagine</translation>
    </message>
    <message>
        <source>Typed</source>
        <translation>Manuale</translation>
    </message>
    <message>
        <source>Not calibrated</source>
        <translation>Non calibrato</translation>
    </message>
</context>
<context>
    <name>KvDeskCalibrationWay</name>
    <message>
        <source>Type a number such as 5.3 or 5,3</source>
        <translation>Digitare un numero come 5.3 o 5,3</translation>
    </message>
    <message>
        <source>A pixel measures between %1 and %2</source>
        <translation>Un pixel misura tra %1 e %2</translation>
    </message>
</context>
<context>
    <name>KvDeskCalibrator</name>
    <message>
        <source>%1 states pixels of %2; the session measures with %3</source>
        <translation>%1 indica una dimensione pixel di %2; la sessione misura con %3</translation>
    </message>
    <message>
        <source>%1 states pixels of %2; the session measures in pixels</source>
        <translation>%1 indica una dimensione pixel di %2; la sessione misura in pixel</translation>
    </message>
    <message>
        <source>Calibrated: %1, %2 per pixel</source>
        <extracomment>%1 is an objective or a file, %2 the size of a pixel with its unit</extracomment>
        <translation>Calibrato: %1, %2 per pixel</translation>
    </message>
</context>
<context>
    <name>KvDeskCommandLine</name>
    <message>
        <source>There is no theme &quot;%1&quot;: use %2</source>
        <translation>Il tema “%1” non esiste: usare %2</translation>
    </message>
    <message>
        <source> or </source>
        <translation> o </translation>
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
        <translation>Uso: measuringdesk [OPZIONE...] [SESSIONE|IMMAGINE|TABELLA|CARTELLA|VIDEO...]
Misura oggetti su immagini e ne mostra i valori.

  --session FILE      apre una sessione
  --image FILE        apre un&apos;immagine
  --table FILE        importa una tabella di valori misurati
  --theme Dark|Light  tema di questa esecuzione
  --plugins CARTELLA  cerca plug-in anche qui; si può indicare più volte
  --help              mostra questo testo
  --version           mostra la versione

La variabile d&apos;ambiente STATREPORT_PLUGINS indica altre cartelle con plug-in.
</translation>
    </message>
    <message>
        <source>%1 (measuringdesk --help tells more)</source>
        <translation>%1 (ulteriore aiuto: measuringdesk --help)</translation>
    </message>
</context>
<context>
    <name>KvDeskCounterBar</name>
    <message>
        <source>Clicks count for</source>
        <translation>I clic contano per</translation>
    </message>
    <message>
        <source>The counter that gets the clicks (1 to 9)</source>
        <translation>Contatore che riceve i clic (da 1 a 9)</translation>
    </message>
    <message>
        <source>Count another class</source>
        <translation>Conta un&apos;altra classe</translation>
    </message>
    <message>
        <source>A right click takes a place away</source>
        <translation>Il clic destro toglie un punto</translation>
    </message>
    <message>
        <source>A new counter</source>
        <translation>Nuovo contatore</translation>
    </message>
</context>
<context>
    <name>KvDeskEditCommands</name>
    <message>
        <source>&amp;Undo %1</source>
        <extracomment>%1 is what is undone or redone, such as &quot;move of Line 3&quot;</extracomment>
        <translation>&amp;Annulla: %1</translation>
    </message>
    <message>
        <source>&amp;Undo</source>
        <translation>&amp;Annulla</translation>
    </message>
    <message>
        <source>&amp;Redo %1</source>
        <translation>&amp;Ripeti: %1</translation>
    </message>
    <message>
        <source>&amp;Redo</source>
        <translation>&amp;Ripeti</translation>
    </message>
    <message>
        <source>Nothing was done yet</source>
        <translation>Ancora nulla da annullare</translation>
    </message>
    <message>
        <source>Nothing was undone</source>
        <translation>Nulla da ripetere</translation>
    </message>
    <message>
        <source>Select an object first</source>
        <translation>Selezionare prima un oggetto</translation>
    </message>
    <message>
        <source>Select one object first</source>
        <translation>Selezionare prima un solo oggetto</translation>
    </message>
    <message>
        <source>No measured objects were copied</source>
        <translation>Nessun oggetto misurato è stato copiato</translation>
    </message>
    <message>
        <source>Finish or cancel what you have begun first</source>
        <translation>Completare o annullare prima ciò che è stato iniziato</translation>
    </message>
</context>
<context>
    <name>KvDeskExamples</name>
    <message>
        <source>Coin: first length</source>
        <translation>Moneta: lunghezza</translation>
    </message>
    <message>
        <source>Plate: dimensions</source>
        <translation>Piastra: dimensioni</translation>
    </message>
    <message>
        <source>Cells: counting</source>
        <translation>Cellule: conteggio</translation>
    </message>
    <message>
        <source>Fibres: statistics</source>
        <translation>Fibre: statistiche</translation>
    </message>
</context>
<context>
    <name>KvDeskExportCommand</name>
    <message>
        <source>Nothing was measured yet</source>
        <translation>Non è stato ancora misurato nulla</translation>
    </message>
    <message>
        <source>Measured values</source>
        <comment>file name</comment>
        <translation>Valori misurati</translation>
    </message>
    <message>
        <source>JSON files</source>
        <translation>File JSON</translation>
    </message>
    <message>
        <source>CSV tables</source>
        <translation>Tabelle CSV</translation>
    </message>
    <message>
        <source>Export measured values</source>
        <translation>Esporta valori misurati</translation>
    </message>
    <message>
        <source>Export cancelled: %1</source>
        <translation>Esportazione annullata: %1</translation>
    </message>
    <message>
        <source>The table &quot;%1&quot; was not written.</source>
        <translation>La tabella “%1” non è stata scritta.</translation>
    </message>
    <message>
        <source>Measured values exported: %1</source>
        <translation>Valori misurati esportati: %1</translation>
    </message>
    <message>
        <source>Exporting measured values</source>
        <translation>Esportazione dei valori misurati</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Annulla</translation>
    </message>
</context>
<context>
    <name>KvDeskExportDialog</name>
    <message>
        <source>Export measured values</source>
        <translation>Esporta valori misurati</translation>
    </message>
    <message>
        <source>Table</source>
        <translation>Tabella</translation>
    </message>
    <message>
        <source>Numbers</source>
        <translation>Numeri</translation>
    </message>
    <message>
        <source>Byte order mark, for spreadsheets that do not expect UTF-8</source>
        <translation>Byte order mark (BOM), per fogli di calcolo che non prevedono UTF-8</translation>
    </message>
    <message>
        <source>Apostrophe before names that spreadsheets take for formulas</source>
        <translation>Apostrofo prima dei nomi che i fogli di calcolo prendono per formule</translation>
    </message>
    <message>
        <source>Changes names that begin with =, +, - or @: they are others when the table is imported again</source>
        <translation>Modifica i nomi che iniziano con =, +, - o @: saranno diversi quando la tabella sarà importata di nuovo</translation>
    </message>
    <message>
        <source>Export...</source>
        <translation>Esporta...</translation>
    </message>
    <message>
        <source>CSV, one row per value</source>
        <translation>CSV, una riga per valore</translation>
    </message>
    <message>
        <source>CSV, one row per object</source>
        <translation>CSV, una riga per oggetto</translation>
    </message>
    <message>
        <source>JSON</source>
        <translation>JSON</translation>
    </message>
    <message>
        <source>1.5, commas between the fields</source>
        <translation>1.5, virgole tra i campi</translation>
    </message>
    <message>
        <source>1,5, semicolons between the fields (spreadsheets, %1)</source>
        <extracomment>%1 is the name of a language</extracomment>
        <translation>1,5, punti e virgola tra i campi (fogli di calcolo, %1)</translation>
    </message>
    <message>
        <source>1.5, commas between the fields (spreadsheets, %1)</source>
        <translation>1.5, virgole tra i campi (fogli di calcolo, %1)</translation>
    </message>
    <message>
        <source>For statistics programs. Can be imported here again.</source>
        <translation>Per programmi di statistica. Si può importare di nuovo qui.</translation>
    </message>
    <message>
        <source>For spreadsheets. Headings name the units.</source>
        <translation>Per fogli di calcolo. Le intestazioni indicano le unità.</translation>
    </message>
    <message>
        <source>For programs. Numbers always have a decimal point.</source>
        <translation>Per programmi. I numeri hanno sempre il punto decimale.</translation>
    </message>
    <message>
        <source>No measured object is selected</source>
        <translation>Nessun oggetto misurato è selezionato</translation>
    </message>
    <message>
        <source>Concerns CSV tables only</source>
        <translation>Riguarda solo le tabelle CSV</translation>
    </message>
    <message numerus="yes">
        <source>Only the selected object(s) (%n)</source>
        <translation>
            <numerusform>Solo l&apos;oggetto selezionato (%n)</numerusform>
            <numerusform>Solo gli oggetti selezionati (%n)</numerusform>
        </translation>
    </message>
</context>
<context>
    <name>KvDeskExposureControl</name>
    <message>
        <source>E&amp;xposure</source>
        <translation>&amp;Esposizione</translation>
    </message>
    <message>
        <source>Exposure time of the camera</source>
        <translation>Tempo di esposizione della telecamera</translation>
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
        <translation>Sessioni</translation>
    </message>
    <message>
        <source>All files</source>
        <translation>Tutti i file</translation>
    </message>
    <message>
        <source>Unsaved changes</source>
        <translation>Modifiche non salvate</translation>
    </message>
    <message>
        <source>Save the changes to &quot;%1&quot;?</source>
        <translation>Salvare le modifiche a “%1”?</translation>
    </message>
    <message>
        <source>The session &quot;%1&quot; was not opened.</source>
        <translation>La sessione “%1” non è stata aperta.</translation>
    </message>
    <message>
        <source>Image missing</source>
        <translation>Immagine mancante</translation>
    </message>
    <message>
        <source>Open the session without its image?</source>
        <translation>Aprire la sessione senza la sua immagine?</translation>
    </message>
    <message>
        <source>The image &quot;%1&quot; was not opened.</source>
        <translation>L&apos;immagine “%1” non è stata aperta.</translation>
    </message>
    <message>
        <source>Image opened: %1</source>
        <translation>Immagine aperta: %1</translation>
    </message>
    <message>
        <source>The table &quot;%1&quot; was not imported.</source>
        <translation>La tabella “%1” non è stata importata.</translation>
    </message>
    <message>
        <source>%1: %2</source>
        <comment>file, remark</comment>
        <translation>%1: %2</translation>
    </message>
    <message>
        <source>The session &quot;%1&quot; was not saved.</source>
        <translation>La sessione “%1” non è stata salvata.</translation>
    </message>
    <message>
        <source>Session saved: %1</source>
        <translation>Sessione salvata: %1</translation>
    </message>
    <message>
        <source>Open session</source>
        <translation>Apri sessione</translation>
    </message>
    <message>
        <source>Open image</source>
        <translation>Apri immagine</translation>
    </message>
    <message>
        <source>Images</source>
        <translation>Immagini</translation>
    </message>
    <message>
        <source>Import table</source>
        <translation>Importa tabella</translation>
    </message>
    <message>
        <source>Tables</source>
        <translation>Tabelle</translation>
    </message>
    <message>
        <source>Save session</source>
        <translation>Salva sessione</translation>
    </message>
    <message>
        <source>Measuring Desk</source>
        <translation>Measuring Desk</translation>
    </message>
    <message>
        <source>Only one session can be open; not opened: %1</source>
        <translation>Può essere aperta una sola sessione; non aperta: %1</translation>
    </message>
    <message>
        <source>Neither a session, an image nor a table: %1</source>
        <translation>Non è né una sessione, né un&apos;immagine, né una tabella: %1</translation>
    </message>
    <message>
        <source>There is not enough memory</source>
        <translation>Memoria insufficiente</translation>
    </message>
    <message>
        <source>Opening &quot;%1&quot;</source>
        <translation>Apertura di “%1”</translation>
    </message>
    <message>
        <source>The measurements were not restored.</source>
        <translation>Le misure non sono state recuperate.</translation>
    </message>
    <message>
        <source>Restoring measurements</source>
        <translation>Recupero delle misure</translation>
    </message>
    <message>
        <source>Importing &quot;%1&quot;</source>
        <translation>Importazione di “%1”</translation>
    </message>
    <message>
        <source>Saving &quot;%1&quot;</source>
        <translation>Salvataggio di “%1”</translation>
    </message>
    <message>
        <source>Session changed by another program</source>
        <translation>Sessione modificata da un altro programma</translation>
    </message>
    <message>
        <source>&quot;%1&quot; was changed by another program. Overwrite its changes?</source>
        <translation>“%1” è stata modificata da un altro programma. Sovrascriverne le modifiche?</translation>
    </message>
    <message>
        <source>Overwrite</source>
        <translation>Sovrascrivi</translation>
    </message>
    <message>
        <source>Save as...</source>
        <translation>Salva con nome...</translation>
    </message>
    <message numerus="yes">
        <source>%n files were not opened.</source>
        <extracomment>%n is 2 at least</extracomment>
        <translation>
            <numerusform>%n file non è stato aperto.</numerusform>
            <numerusform>%n file non sono stati aperti.</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Session opened: %1 (%n object(s))</source>
        <translation>
            <numerusform>Sessione aperta: %1 (%n oggetto)</numerusform>
            <numerusform>Sessione aperta: %1 (%n oggetti)</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Measurements restored: %1 (%n object(s))</source>
        <translation>
            <numerusform>Misure recuperate: %1 (%n oggetto)</numerusform>
            <numerusform>Misure recuperate: %1 (%n oggetti)</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Table imported: %1 (%n object(s))</source>
        <translation>
            <numerusform>Tabella importata: %1 (%n oggetto)</numerusform>
            <numerusform>Tabella importata: %1 (%n oggetti)</numerusform>
        </translation>
    </message>
</context>
<context>
    <name>KvDeskFilePixelSize</name>
    <message>
        <source>%1 states pixels of %2.</source>
        <comment>file, size</comment>
        <translation>%1 indica una dimensione pixel di %2.</translation>
    </message>
    <message>
        <source>The image&apos;s file does not state how large its pixels are.</source>
        <translation>Il file immagine non indica la dimensione dei suoi pixel.</translation>
    </message>
</context>
<context>
    <name>KvDeskGallery</name>
    <message>
        <source>Gallery</source>
        <translation>Galleria</translation>
    </message>
    <message>
        <source>Hide the gallery</source>
        <translation>Nascondi la galleria</translation>
    </message>
    <message>
        <source>&amp;Open image</source>
        <translation>&amp;Apri immagine</translation>
    </message>
    <message>
        <source>&amp;Show in folder</source>
        <translation>Mostra nella &amp;cartella</translation>
    </message>
    <message>
        <source>&amp;Copy path</source>
        <translation>Copia &amp;percorso</translation>
    </message>
    <message>
        <source>&amp;Move to trash...</source>
        <translation>Sposta nel c&amp;estino...</translation>
    </message>
    <message>
        <source>Choose &amp;folder...</source>
        <translation>Scegli ca&amp;rtella...</translation>
    </message>
    <message>
        <source>Show the images of a folder</source>
        <translation>Mostra le immagini di una cartella</translation>
    </message>
    <message>
        <source>Save s&amp;napshots in this folder</source>
        <translation>Salva ista&amp;ntanee in questa cartella</translation>
    </message>
    <message>
        <source>Folder of the gallery</source>
        <translation>Cartella della galleria</translation>
    </message>
    <message>
        <source>More commands of the gallery</source>
        <translation>Altri comandi della galleria</translation>
    </message>
    <message>
        <source>Snapshots</source>
        <translation>Istantanee</translation>
    </message>
    <message>
        <source>Choose folder</source>
        <translation>Scegli cartella</translation>
    </message>
    <message>
        <source>Snapshots are saved in %1</source>
        <translation>Le istantanee vengono salvate in %1</translation>
    </message>
    <message>
        <source>Snapshots (%1) and the images of a folder appear here; drag them onto report pages</source>
        <translation>Qui appaiono le istantanee (%1) e le immagini di una cartella; trascinarle sulle pagine del report</translation>
    </message>
    <message>
        <source>There are no images in %1</source>
        <translation>Nessuna immagine in %1</translation>
    </message>
    <message>
        <source>The folder %1 does not exist</source>
        <translation>La cartella %1 non esiste</translation>
    </message>
    <message>
        <source>Select an image first</source>
        <translation>Selezionare prima un&apos;immagine</translation>
    </message>
    <message>
        <source>Snapshots are saved in this folder already</source>
        <translation>Le istantanee vengono già salvate in questa cartella</translation>
    </message>
    <message>
        <source>Move &quot;%1&quot; to the trash?</source>
        <translation>Spostare “%1” nel cestino?</translation>
    </message>
    <message>
        <source>Move to trash</source>
        <translation>Sposta nel cestino</translation>
    </message>
    <message>
        <source>Moved to the trash: %1</source>
        <translation>Spostato nel cestino: %1</translation>
    </message>
    <message>
        <source>Not moved to the trash: %1</source>
        <translation>Non spostato nel cestino: %1</translation>
    </message>
    <message>
        <source>Measuring Desk</source>
        <translation>Measuring Desk</translation>
    </message>
    <message>
        <source>The files are still there. They are write-protected, or there is no trash for them.</source>
        <translation>I file sono ancora al loro posto. Sono protetti da scrittura oppure per loro non è disponibile un cestino.</translation>
    </message>
    <message numerus="yes">
        <source>Move %n selected image(s) to the trash?</source>
        <translation>
            <numerusform>Spostare %n immagine selezionata nel cestino?</numerusform>
            <numerusform>Spostare %n immagini selezionate nel cestino?</numerusform>
        </translation>
    </message>
</context>
<context>
    <name>KvDeskGalleryModel</name>
    <message>
        <source>%1 × %2 px</source>
        <comment>width, height</comment>
        <translation>%1 × %2 px</translation>
    </message>
</context>
<context>
    <name>KvDeskGalleryView</name>
    <message>
        <source>Gallery</source>
        <translation>Galleria</translation>
    </message>
</context>
<context>
    <name>KvDeskGuideCommand</name>
    <message>
        <source>The user guide is not installed</source>
        <translation>La guida utente non è installata</translation>
    </message>
</context>
<context>
    <name>KvDeskGuideWindow</name>
    <message>
        <source>User guide</source>
        <translation>Guida utente</translation>
    </message>
    <message>
        <source>Contents</source>
        <translation>Sommario</translation>
    </message>
    <message>
        <source>Back</source>
        <translation>Indietro</translation>
    </message>
    <message>
        <source>Forward</source>
        <translation>Avanti</translation>
    </message>
    <message>
        <source>Find in the guide</source>
        <translation>Trova nella guida</translation>
    </message>
    <message>
        <source>Find previous</source>
        <translation>Trova precedente</translation>
    </message>
    <message>
        <source>Find next</source>
        <translation>Trova successivo</translation>
    </message>
    <message>
        <source>This is the first place</source>
        <translation>Questo è il primo punto visitato</translation>
    </message>
    <message>
        <source>This is the last place</source>
        <translation>Questo è l&apos;ultimo punto visitato</translation>
    </message>
    <message>
        <source>Not found</source>
        <translation>Non trovato</translation>
    </message>
    <message>
        <source>Type what to find first</source>
        <translation>Digitare prima il testo da cercare</translation>
    </message>
</context>
<context>
    <name>KvDeskImageView</name>
    <message>
        <source>Image</source>
        <translation>Immagine</translation>
    </message>
    <message>
        <source>Open an image or a session to start</source>
        <translation>Aprire un&apos;immagine o una sessione per iniziare</translation>
    </message>
</context>
<context>
    <name>KvDeskInlineEditor</name>
    <message>
        <source>Text</source>
        <translation>Testo</translation>
    </message>
    <message>
        <source>Name</source>
        <translation>Nome</translation>
    </message>
</context>
<context>
    <name>KvDeskKnownDistance</name>
    <message>
        <source>inch</source>
        <translation>pollici</translation>
    </message>
    <message>
        <source>Use selected line</source>
        <translation>Usa linea selezionata</translation>
    </message>
    <message>
        <source>Length of the line</source>
        <translation>Lunghezza della linea</translation>
    </message>
    <message>
        <source>Unit of the length</source>
        <translation>Unità della lunghezza</translation>
    </message>
    <message>
        <source>Its length</source>
        <translation>Lunghezza</translation>
    </message>
    <message>
        <source>Draw a line over a distance that you know, such as on a stage micrometer, and select it.</source>
        <translation>Disegnare una linea su una distanza nota, ad esempio su un vetrino micrometrico, e selezionarla.</translation>
    </message>
    <message>
        <source>No line yet</source>
        <translation>Ancora nessuna linea</translation>
    </message>
    <message>
        <source>%1: %2</source>
        <comment>name and length of a line</comment>
        <translation>%1: %2</translation>
    </message>
    <message>
        <source>Take the selected line as the known distance</source>
        <translation>Usa la linea selezionata come distanza nota</translation>
    </message>
    <message>
        <source>Select one line on the image first</source>
        <translation>Selezionare prima una sola linea sull&apos;immagine</translation>
    </message>
</context>
<context>
    <name>KvDeskLiveBar</name>
    <message>
        <source>Live image</source>
        <translation>Immagine dal vivo</translation>
    </message>
    <message>
        <source>Freeze</source>
        <translation>Congela</translation>
    </message>
    <message>
        <source>%1 fps</source>
        <extracomment>frames per second</extracomment>
        <translation>%1 fps</translation>
    </message>
    <message>
        <source>%1 delivers no pictures any more; this is the last one</source>
        <translation>%1 non invia più immagini; questa è l&apos;ultima</translation>
    </message>
    <message>
        <source>%1 delivers no pictures</source>
        <translation>%1 non invia immagini</translation>
    </message>
    <message>
        <source>%1 is stopped</source>
        <translation>Sorgente ferma: %1</translation>
    </message>
    <message>
        <source>Waiting for the first picture of %1</source>
        <translation>In attesa della prima immagine di %1</translation>
    </message>
    <message>
        <source>Frozen: %1</source>
        <translation>Congelata: %1</translation>
    </message>
    <message>
        <source>Live: %1</source>
        <translation>Dal vivo: %1</translation>
    </message>
    <message>
        <source>This image is not live</source>
        <translation>Non è un&apos;immagine dal vivo</translation>
    </message>
    <message>
        <source>&amp;Reconnect</source>
        <translation>&amp;Riconnetti</translation>
    </message>
    <message>
        <source>&amp;Start</source>
        <translation>&amp;Avvia</translation>
    </message>
    <message>
        <source>Frames per second
Dropped, because newer ones came first: %1</source>
        <translation>Fotogrammi al secondo
Scartati perché ne sono arrivati di più recenti: %1</translation>
    </message>
    <message>
        <source>Stop the live image; other programs can use the camera then</source>
        <translation>Arresta l&apos;immagine dal vivo; la telecamera sarà poi disponibile per altri programmi</translation>
    </message>
</context>
<context>
    <name>KvDeskMainWindow</name>
    <message>
        <source>&amp;File</source>
        <translation>&amp;File</translation>
    </message>
    <message>
        <source>&amp;Recent sessions</source>
        <translation>Sessioni &amp;recenti</translation>
    </message>
    <message>
        <source>&amp;View</source>
        <translation>&amp;Visualizza</translation>
    </message>
    <message>
        <source>&amp;Help</source>
        <translation>Ai&amp;uto</translation>
    </message>
    <message>
        <source>Main tool bar</source>
        <translation>Barra degli strumenti principale</translation>
    </message>
    <message>
        <source>%1[*] - Measuring Desk</source>
        <extracomment>%1 is the name of a session; [*] is replaced by a star when it has unsaved changes</extracomment>
        <translation>%1[*] - Measuring Desk</translation>
    </message>
    <message>
        <source>None yet</source>
        <translation>Ancora nessuna</translation>
    </message>
    <message>
        <source>About Measuring Desk</source>
        <translation>Informazioni su Measuring Desk</translation>
    </message>
    <message>
        <source>&lt;b&gt;Measuring Desk %1&lt;/b&gt;&lt;p&gt;Measures objects on images, and hosts plug-ins such as the statistics reports.&lt;/p&gt;&lt;p&gt;%2, MIT licence&lt;/p&gt;</source>
        <translation>&lt;b&gt;Measuring Desk %1&lt;/b&gt;&lt;p&gt;Misura oggetti su immagini e ospita plug-in come i report statistici.&lt;/p&gt;&lt;p&gt;%2, licenza MIT&lt;/p&gt;</translation>
    </message>
    <message>
        <source>Measuring Desk</source>
        <translation>Measuring Desk</translation>
    </message>
    <message>
        <source>&amp;Edit</source>
        <translation>&amp;Modifica</translation>
    </message>
    <message>
        <source>&amp;Image</source>
        <translation>&amp;Immagine</translation>
    </message>
    <message>
        <source>&amp;Measure</source>
        <translation>Mi&amp;sura</translation>
    </message>
    <message>
        <source>Choose the image source</source>
        <translation>Scegli la sorgente immagine</translation>
    </message>
</context>
<context>
    <name>KvDeskNotice</name>
    <message>
        <source>Close this message</source>
        <translation>Chiudi questo messaggio</translation>
    </message>
</context>
<context>
    <name>KvDeskObjectClipboard</name>
    <message>
        <source>Type</source>
        <translation>Tipo</translation>
    </message>
    <message>
        <source>Object</source>
        <translation>Oggetto</translation>
    </message>
    <message>
        <source>Value name</source>
        <translation>Grandezza</translation>
    </message>
    <message>
        <source>Value</source>
        <translation>Valore</translation>
    </message>
</context>
<context>
    <name>KvDeskObjectEditor</name>
    <message numerus="yes">
        <source>%n objects</source>
        <comment>several measured objects</comment>
        <extracomment>%n is 2 at least</extracomment>
        <translation>
            <numerusform>%n oggetto</numerusform>
            <numerusform>%n oggetti</numerusform>
        </translation>
    </message>
    <message>
        <source>drawing of %1</source>
        <translation>disegno di %1</translation>
    </message>
    <message>
        <source>change of %1</source>
        <translation>modifica di %1</translation>
    </message>
    <message>
        <source>move of %1</source>
        <translation>spostamento di %1</translation>
    </message>
    <message>
        <source>renaming of %1</source>
        <translation>ridenominazione di %1</translation>
    </message>
    <message>
        <source>text of %1</source>
        <translation>testo di %1</translation>
    </message>
    <message>
        <source>showing of %1 of %2</source>
        <extracomment>%1 is a value, %2 an object</extracomment>
        <translation>visualizzazione di %1 di %2</translation>
    </message>
    <message>
        <source>hiding of %1 of %2</source>
        <translation>occultamento di %1 di %2</translation>
    </message>
    <message>
        <source>deletion of %1</source>
        <translation>eliminazione di %1</translation>
    </message>
    <message>
        <source>change of the calibration</source>
        <translation>modifica della calibrazione</translation>
    </message>
    <message>
        <source>place of %1</source>
        <translation>nuovo punto di %1</translation>
    </message>
    <message>
        <source>deletion of a place of %1</source>
        <translation>eliminazione di un punto di %1</translation>
    </message>
    <message>
        <source>pasting of %1</source>
        <translation>inserimento di %1</translation>
    </message>
    <message>
        <source>import of %1</source>
        <translation>importazione di %1</translation>
    </message>
</context>
<context>
    <name>KvDeskPlugins</name>
    <message>
        <source>No plug-ins were found</source>
        <translation>Nessun plug-in trovato</translation>
    </message>
    <message>
        <source>It is no plug-in for this program</source>
        <translation>Non è un plug-in per questo programma</translation>
    </message>
    <message>
        <source>Its tools &quot;%1&quot; could not be started</source>
        <translation>Impossibile avviare i suoi strumenti “%1”</translation>
    </message>
    <message>
        <source>Plug-in loaded: %1</source>
        <translation>Plug-in caricato: %1</translation>
    </message>
    <message>
        <source>Plug-in not loaded: %1: %2</source>
        <translation>Plug-in non caricato: %1: %2</translation>
    </message>
    <message>
        <source>It failed: %1</source>
        <translation>Si è verificato un errore: %1</translation>
    </message>
    <message>
        <source>It failed for a reason of its own</source>
        <translation>Si è verificato un errore sconosciuto</translation>
    </message>
</context>
<context>
    <name>KvDeskProgress</name>
    <message>
        <source>Cancel</source>
        <translation>Annulla</translation>
    </message>
    <message>
        <source>Leave everything as it was (Esc)</source>
        <translation>Lascia tutto com&apos;era (Esc)</translation>
    </message>
    <message>
        <source>This can no longer be cancelled</source>
        <translation>Non è più possibile annullare</translation>
    </message>
</context>
<context>
    <name>KvDeskRecovery</name>
    <message>
        <source>Untitled session</source>
        <translation>Sessione senza titolo</translation>
    </message>
    <message numerus="yes">
        <source>%1 (%n object(s))</source>
        <extracomment>%1 is the name of a session</extracomment>
        <translation>
            <numerusform>%1 (%n oggetto)</numerusform>
            <numerusform>%1 (%n oggetti)</numerusform>
        </translation>
    </message>
</context>
<context>
    <name>KvDeskRecoveryBar</name>
    <message>
        <source>Show other measurements that were not saved</source>
        <translation>Mostra altre misure non salvate</translation>
    </message>
    <message>
        <source>Restore</source>
        <translation>Recupera</translation>
    </message>
    <message>
        <source>Open these measurements as a session with unsaved changes</source>
        <translation>Apri queste misure come sessione con modifiche non salvate</translation>
    </message>
    <message>
        <source>Discard</source>
        <translation>Scarta</translation>
    </message>
    <message>
        <source>Delete these measurements for good</source>
        <translation>Elimina definitivamente queste misure</translation>
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
            <numerusform>%n altra</numerusform>
            <numerusform>%n altre</numerusform>
        </translation>
    </message>
    <message>
        <source>Measurements from %1 were not saved.</source>
        <translation>Ci sono misure non salvate (%1).</translation>
    </message>
</context>
<context>
    <name>KvDeskRuler</name>
    <message>
        <source>Horizontal ruler</source>
        <translation>Righello orizzontale</translation>
    </message>
    <message>
        <source>Vertical ruler</source>
        <translation>Righello verticale</translation>
    </message>
    <message>
        <source>Ruler in %1</source>
        <translation>Righello in %1</translation>
    </message>
</context>
<context>
    <name>KvDeskSelectionStatistics</name>
    <message>
        <source>n = %1, mean %2, SD %3, min %4, max %5</source>
        <extracomment>number of values, their mean, standard deviation, smallest and largest one</extracomment>
        <translation>n = %1, media %2, DS %3, min %4, max %5</translation>
    </message>
    <message>
        <source>Selected values: %1</source>
        <translation>Valori selezionati: %1</translation>
    </message>
    <message>
        <source>Mean: %1</source>
        <translation>Media: %1</translation>
    </message>
    <message>
        <source>Standard deviation: %1</source>
        <translation>Deviazione standard: %1</translation>
    </message>
    <message>
        <source>Smallest: %1</source>
        <translation>Minimo: %1</translation>
    </message>
    <message>
        <source>Largest: %1</source>
        <translation>Massimo: %1</translation>
    </message>
</context>
<context>
    <name>KvDeskSession</name>
    <message>
        <source>Untitled session</source>
        <translation>Sessione senza titolo</translation>
    </message>
</context>
<context>
    <name>KvDeskSettingsDialog</name>
    <message>
        <source>Settings</source>
        <translation>Impostazioni</translation>
    </message>
    <message>
        <source>Appearance</source>
        <translation>Aspetto</translation>
    </message>
    <message>
        <source>Theme</source>
        <translation>Tema</translation>
    </message>
    <message>
        <source>Dark</source>
        <translation>Scuro</translation>
    </message>
    <message>
        <source>Light</source>
        <translation>Chiaro</translation>
    </message>
    <message>
        <source>Language</source>
        <translation>Lingua</translation>
    </message>
    <message>
        <source>Another language takes effect when the program is started again.</source>
        <translation>Il cambio di lingua ha effetto al riavvio del programma.</translation>
    </message>
    <message>
        <source>Measured values</source>
        <translation>Valori misurati</translation>
    </message>
    <message>
        <source>Automatic</source>
        <translation>Automatico</translation>
    </message>
    <message>
        <source>Significant digits</source>
        <translation>Cifre significative</translation>
    </message>
    <message>
        <source>Length unit</source>
        <translation>Unità di lunghezza</translation>
    </message>
    <message>
        <source>Angle unit</source>
        <translation>Unità di angolo</translation>
    </message>
    <message>
        <source>Degrees (°)</source>
        <translation>Gradi (°)</translation>
    </message>
    <message>
        <source>Radians (rad)</source>
        <translation>Radianti (rad)</translation>
    </message>
    <message>
        <source>System default</source>
        <translation>Lingua di sistema</translation>
    </message>
    <message>
        <source>Nothing was changed yet</source>
        <translation>Non è stato ancora modificato nulla</translation>
    </message>
</context>
<context>
    <name>KvDeskSnapshotFile</name>
    <message>
        <source>The folder cannot be created</source>
        <translation>Impossibile creare la cartella</translation>
    </message>
    <message>
        <source>The picture cannot be encoded</source>
        <translation>Impossibile codificare l&apos;immagine</translation>
    </message>
</context>
<context>
    <name>KvDeskSnapshots</name>
    <message>
        <source>Open an image first</source>
        <translation>Aprire prima un&apos;immagine</translation>
    </message>
    <message>
        <source>No snapshot was taken: earlier ones are still being saved</source>
        <translation>Istantanea non scattata: è ancora in corso il salvataggio delle precedenti</translation>
    </message>
    <message>
        <source>Snapshot saved: %1</source>
        <translation>Istantanea salvata: %1</translation>
    </message>
    <message>
        <source>The snapshot was not saved. %1</source>
        <translation>L&apos;istantanea non è stata salvata. %1</translation>
    </message>
</context>
<context>
    <name>KvDeskSourceCommands</name>
    <message>
        <source>The image source &quot;%1&quot; was not opened.</source>
        <translation>La sorgente immagine “%1” non è stata aperta.</translation>
    </message>
    <message>
        <source>Image source: %1</source>
        <translation>Sorgente immagine: %1</translation>
    </message>
    <message>
        <source>Open image folder</source>
        <translation>Apri cartella di immagini</translation>
    </message>
    <message>
        <source>Open video</source>
        <translation>Apri video</translation>
    </message>
    <message>
        <source>Videos</source>
        <translation>Video</translation>
    </message>
</context>
<context>
    <name>KvDeskSourceMenu</name>
    <message>
        <source>Image &amp;source</source>
        <translation>&amp;Sorgente immagine</translation>
    </message>
    <message>
        <source>Still &amp;image...</source>
        <translation>&amp;Immagine fissa...</translation>
    </message>
    <message>
        <source>Image &amp;folder...</source>
        <translation>&amp;Cartella di immagini...</translation>
    </message>
    <message>
        <source>Play the images of a folder like a camera</source>
        <translation>Riproduci le immagini di una cartella come una telecamera</translation>
    </message>
    <message>
        <source>&amp;Video...</source>
        <translation>&amp;Video...</translation>
    </message>
    <message>
        <source>Play a video like a camera</source>
        <translation>Riproduci un video come una telecamera</translation>
    </message>
    <message>
        <source>Looking for cameras...</source>
        <translation>Ricerca di telecamere...</translation>
    </message>
    <message>
        <source>No camera is connected</source>
        <translation>Nessuna telecamera collegata</translation>
    </message>
</context>
<context>
    <name>KvDeskStartPage</name>
    <message>
        <source>From an image to a report</source>
        <translation>Dall&apos;immagine al report</translation>
    </message>
    <message>
        <source>Back to the image</source>
        <translation>Torna all&apos;immagine</translation>
    </message>
    <message>
        <source>%1 (%2)</source>
        <comment>command (shortcut)</comment>
        <translation>%1 (%2)</translation>
    </message>
    <message>
        <source>Open an image</source>
        <translation>Apri un&apos;immagine</translation>
    </message>
    <message>
        <source>A picture file, or the live image of a camera.</source>
        <translation>Un file immagine o l&apos;immagine dal vivo di una telecamera.</translation>
    </message>
    <message>
        <source>Choose a camera or another source</source>
        <translation>Scegli una telecamera o un&apos;altra sorgente</translation>
    </message>
    <message>
        <source>Calibrate</source>
        <translation>Calibra</translation>
    </message>
    <message>
        <source>Say how large a pixel is. The examples are calibrated already.</source>
        <translation>Indicare la dimensione di un pixel. Gli esempi sono già calibrati.</translation>
    </message>
    <message>
        <source>Measure and report</source>
        <translation>Misura e crea il report</translation>
    </message>
    <message>
        <source>Drag a line over the image: its length is listed at once. The report panel makes a PDF of all values.</source>
        <translation>Tracciare una linea sull&apos;immagine: la sua lunghezza appare subito nell&apos;elenco. Il pannello del report crea un PDF con tutti i valori.</translation>
    </message>
    <message>
        <source>Examples to try</source>
        <translation>Esempi da provare</translation>
    </message>
    <message>
        <source>Recent sessions</source>
        <translation>Sessioni recenti</translation>
    </message>
    <message>
        <source>Open an image first</source>
        <translation>Aprire prima un&apos;immagine</translation>
    </message>
    <message>
        <source>Open a copy of this example</source>
        <translation>Apri una copia di questo esempio</translation>
    </message>
</context>
<context>
    <name>KvDeskStatus</name>
    <message>
        <source>Warning</source>
        <translation>Avviso</translation>
    </message>
    <message>
        <source>Error</source>
        <translation>Errore</translation>
    </message>
    <message>
        <source>Information</source>
        <translation>Informazioni</translation>
    </message>
</context>
<context>
    <name>KvDeskStatusBar</name>
    <message>
        <source>%1 × %2 px</source>
        <translation>%1 × %2 px</translation>
    </message>
    <message>
        <source>%1 %</source>
        <comment>zoom</comment>
        <translation>%1 %</translation>
    </message>
    <message>
        <source>x %1, y %2</source>
        <comment>pixel below the pointer</comment>
        <translation>x %1, y %2</translation>
    </message>
    <message>
        <source>Statistics of the selected values</source>
        <translation>Statistiche dei valori selezionati</translation>
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
        <translation>Registro di stato</translation>
    </message>
    <message>
        <source>Hide the status log</source>
        <translation>Nascondi il registro di stato</translation>
    </message>
    <message>
        <source>Clear the status log</source>
        <translation>Svuota il registro di stato</translation>
    </message>
    <message>
        <source>Messages of the program and its plug-ins appear here</source>
        <translation>Qui appaiono i messaggi del programma e dei suoi plug-in</translation>
    </message>
    <message>
        <source>There are no messages</source>
        <translation>Non ci sono messaggi</translation>
    </message>
</context>
<context>
    <name>KvDeskStatusLogModel</name>
    <message>
        <source>%1
Reported by %2</source>
        <comment>message, source</comment>
        <translation>%1
Segnalato da %2</translation>
    </message>
    <message>
        <source>Category</source>
        <translation>Categoria</translation>
    </message>
    <message>
        <source>Time</source>
        <translation>Ora</translation>
    </message>
    <message>
        <source>Message</source>
        <translation>Messaggio</translation>
    </message>
</context>
<context>
    <name>KvDeskTableView</name>
    <message>
        <source>Copy</source>
        <translation>Copia</translation>
    </message>
</context>
<context>
    <name>KvDeskToolStrip</name>
    <message>
        <source>Measuring tools</source>
        <translation>Strumenti di misura</translation>
    </message>
</context>
<context>
    <name>KvDeskTypedPixelSize</name>
    <message>
        <source>Width of a pixel in micrometres</source>
        <translation>Larghezza di un pixel in micrometri</translation>
    </message>
    <message>
        <source>Height of a pixel in micrometres</source>
        <translation>Altezza di un pixel in micrometri</translation>
    </message>
    <message>
        <source>Same size in both directions</source>
        <translation>Stessa dimensione nelle due direzioni</translation>
    </message>
    <message>
        <source>Width</source>
        <translation>Larghezza</translation>
    </message>
    <message>
        <source>Height</source>
        <translation>Altezza</translation>
    </message>
    <message>
        <source>Type how large a pixel of the image is in reality.</source>
        <translation>Digitare la dimensione reale di un pixel dell&apos;immagine.</translation>
    </message>
</context>
<context>
    <name>KvDeskValueCommands</name>
    <message>
        <source>Rename</source>
        <translation>Rinomina</translation>
    </message>
    <message>
        <source>Delete object</source>
        <translation>Elimina oggetto</translation>
    </message>
    <message>
        <source>Hide value</source>
        <translation>Nascondi valore</translation>
    </message>
    <message>
        <source>Show all values of the object</source>
        <translation>Mostra tutti i valori dell&apos;oggetto</translation>
    </message>
    <message>
        <source>Select one object first</source>
        <translation>Selezionare prima un solo oggetto</translation>
    </message>
    <message>
        <source>Select an object first</source>
        <translation>Selezionare prima un oggetto</translation>
    </message>
    <message>
        <source>Select a value first</source>
        <translation>Selezionare prima un valore</translation>
    </message>
    <message>
        <source>No value of the selected object is hidden</source>
        <translation>Nessun valore dell&apos;oggetto selezionato è nascosto</translation>
    </message>
    <message>
        <source>showing of values</source>
        <translation>visualizzazione di valori</translation>
    </message>
    <message>
        <source>hiding of values</source>
        <translation>occultamento di valori</translation>
    </message>
</context>
<context>
    <name>KvDeskValueTable</name>
    <message>
        <source>Measured values</source>
        <translation>Valori misurati</translation>
    </message>
    <message>
        <source>Hide the measured values</source>
        <translation>Nascondi i valori misurati</translation>
    </message>
    <message>
        <source>Filter by type, object or value name</source>
        <translation>Filtra per tipo, oggetto o grandezza</translation>
    </message>
    <message>
        <source>Filter of the measured values</source>
        <translation>Filtro dei valori misurati</translation>
    </message>
    <message>
        <source>Shows only rows that have all of these words</source>
        <translation>Mostra solo le righe che contengono tutte queste parole</translation>
    </message>
    <message>
        <source>No measured value matches the filter</source>
        <translation>Nessun valore misurato corrisponde al filtro</translation>
    </message>
    <message>
        <source>Clear the filter</source>
        <translation>Cancella il filtro</translation>
    </message>
    <message>
        <source>%1 of %2</source>
        <extracomment>rows that match the filter, all rows</extracomment>
        <translation>%1 di %2</translation>
    </message>
    <message>
        <source>Measured values appear here once something is measured or imported</source>
        <translation>I valori misurati appaiono qui non appena si misura o si importa qualcosa</translation>
    </message>
    <message>
        <source>There are no measured values yet</source>
        <translation>Non ci sono ancora valori misurati</translation>
    </message>
</context>
<context>
    <name>KvDeskValueTableModel</name>
    <message>
        <source>Type</source>
        <translation>Tipo</translation>
    </message>
    <message>
        <source>Object</source>
        <translation>Oggetto</translation>
    </message>
    <message>
        <source>Value name</source>
        <translation>Grandezza</translation>
    </message>
    <message>
        <source>Value</source>
        <translation>Valore</translation>
    </message>
</context>
<context>
    <name>KvToolBase</name>
    <message>
        <source>Reset</source>
        <translation>Ripristina</translation>
    </message>
    <message>
        <source>Reset to the default values</source>
        <translation>Ripristina i valori predefiniti</translation>
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
        <translation>Annulla</translation>
    </message>
    <message>
        <source>Apply</source>
        <translation>Applica</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>Salva</translation>
    </message>
    <message>
        <source>Open</source>
        <translation>Apri</translation>
    </message>
    <message>
        <source>Close</source>
        <translation>Chiudi</translation>
    </message>
    <message>
        <source>Discard</source>
        <translation>Scarta</translation>
    </message>
    <message>
        <source>&amp;Yes</source>
        <translation>&amp;Sì</translation>
    </message>
    <message>
        <source>&amp;No</source>
        <translation>&amp;No</translation>
    </message>
</context>
<context>
    <name>ZtAppSettings</name>
    <message>
        <source>The settings could not be saved to %1. Check that the folder is writable.</source>
        <translation>Impossibile salvare le impostazioni in %1. Verificare che la cartella sia scrivibile.</translation>
    </message>
    <message>
        <source>The settings file %1 cannot be read. Changes to the settings will not be kept.</source>
        <translation>Impossibile leggere il file delle impostazioni %1. Le modifiche alle impostazioni non verranno conservate.</translation>
    </message>
    <message>
        <source>The settings file %1 is damaged. It was renamed to %2; all settings are back at their defaults.</source>
        <translation>Il file delle impostazioni %1 è danneggiato. È stato rinominato in %2; tutte le impostazioni sono tornate ai valori predefiniti.</translation>
    </message>
    <message>
        <source>The settings file %1 is damaged and could not be renamed to %2. Changes to the settings will not be kept.</source>
        <translation>Il file delle impostazioni %1 è danneggiato e non è stato possibile rinominarlo in %2. Le modifiche alle impostazioni non verranno conservate.</translation>
    </message>
</context>
<context>
    <name>ZtAravisSource</name>
    <message>
        <source>%1 is disconnected; its last picture stays</source>
        <translation>%1 è scollegata; la sua ultima immagine rimane</translation>
    </message>
    <message>
        <source>%1 delivers pictures of a kind that cannot be shown</source>
        <translation>%1 invia immagini in un formato che non può essere visualizzato</translation>
    </message>
    <message>
        <source>The camera does not take the setting (%1)</source>
        <translation>La telecamera non accetta l&apos;impostazione (%1)</translation>
    </message>
    <message>
        <source>%1 cannot be opened (%2)</source>
        <translation>Impossibile aprire %1 (%2)</translation>
    </message>
</context>
<context>
    <name>ZtCalibrationStore</name>
    <message>
        <source>This is not a calibration</source>
        <translation>Questa non è una calibrazione</translation>
    </message>
    <message>
        <source>A calibration in the settings is damaged and was left out (%1: %2)</source>
        <translation>Una calibrazione nelle impostazioni è danneggiata ed è stata tralasciata (%1: %2)</translation>
    </message>
</context>
<context>
    <name>ZtCsvReader</name>
    <message>
        <source>A quoted text does not end</source>
        <translation>Un testo tra virgolette non è chiuso</translation>
    </message>
    <message>
        <source>There is text after a closing quote</source>
        <translation>C&apos;è del testo dopo le virgolette di chiusura</translation>
    </message>
    <message>
        <source>Reading was cancelled</source>
        <translation>Lettura annullata</translation>
    </message>
</context>
<context>
    <name>ZtDrawnType</name>
    <message>
        <source>Rectangle</source>
        <translation>Rettangolo</translation>
    </message>
    <message>
        <source>Width</source>
        <translation>Larghezza</translation>
    </message>
    <message>
        <source>Height</source>
        <translation>Altezza</translation>
    </message>
    <message>
        <source>Area</source>
        <translation>Area</translation>
    </message>
    <message>
        <source>Line</source>
        <translation>Linea</translation>
    </message>
    <message>
        <source>Length</source>
        <translation>Lunghezza</translation>
    </message>
    <message>
        <source>Arc</source>
        <translation>Arco</translation>
    </message>
    <message>
        <source>Angle</source>
        <translation>Angolo</translation>
    </message>
    <message>
        <source>Arc length</source>
        <translation>Lunghezza d&apos;arco</translation>
    </message>
    <message>
        <source>Polygon</source>
        <translation>Poligono</translation>
    </message>
    <message>
        <source>Perimeter</source>
        <translation>Perimetro</translation>
    </message>
    <message>
        <source>Polyline</source>
        <translation>Polilinea</translation>
    </message>
    <message>
        <source>Parallel distance</source>
        <translation>Distanza punto-linea</translation>
    </message>
    <message>
        <source>Distance</source>
        <translation>Distanza</translation>
    </message>
    <message>
        <source>Text note</source>
        <translation>Nota di testo</translation>
    </message>
    <message>
        <source>Scale bar</source>
        <translation>Barra di scala</translation>
    </message>
    <message>
        <source>Counter</source>
        <translation>Contatore</translation>
    </message>
    <message>
        <source>Count</source>
        <translation>Conteggio</translation>
    </message>
    <message>
        <source>Share</source>
        <translation>Percentuale</translation>
    </message>
    <message>
        <source>Circle</source>
        <translation>Cerchio</translation>
    </message>
    <message>
        <source>Diameter</source>
        <translation>Diametro</translation>
    </message>
</context>
<context>
    <name>ZtFileFault</name>
    <message>
        <source>No such file or directory</source>
        <translation>file o directory non esistente</translation>
    </message>
    <message>
        <source>Permission denied</source>
        <translation>permesso negato</translation>
    </message>
    <message>
        <source>Is a directory</source>
        <translation>è una directory</translation>
    </message>
    <message>
        <source>Not a directory</source>
        <translation>non è una directory</translation>
    </message>
    <message>
        <source>File name too long</source>
        <translation>nome del file troppo lungo</translation>
    </message>
    <message>
        <source>No space left on device</source>
        <translation>spazio esaurito sul device</translation>
    </message>
    <message>
        <source>Read-only file system</source>
        <translation>file system in sola lettura</translation>
    </message>
    <message>
        <source>Input/output error</source>
        <translation>errore di input/output</translation>
    </message>
</context>
<context>
    <name>ZtFrameSourceCatalogue</name>
    <message>
        <source>This program cannot play videos</source>
        <translation>Questo programma non può riprodurre video</translation>
    </message>
    <message>
        <source>This program knows no cameras of this kind</source>
        <translation>Questo programma non riconosce telecamere di questo tipo</translation>
    </message>
</context>
<context>
    <name>ZtImageFolderSource</name>
    <message>
        <source>%1: no picture of the folder can be shown</source>
        <translation>%1: nessuna immagine della cartella può essere mostrata</translation>
    </message>
    <message>
        <source>The folder does not exist</source>
        <translation>La cartella non esiste</translation>
    </message>
    <message>
        <source>The folder cannot be read</source>
        <translation>Impossibile leggere la cartella</translation>
    </message>
    <message>
        <source>The folder holds no pictures</source>
        <translation>La cartella non contiene immagini</translation>
    </message>
</context>
<context>
    <name>ZtKernelImage</name>
    <message>
        <source>%1 delivers pictures again</source>
        <translation>%1 invia di nuovo immagini</translation>
    </message>
</context>
<context>
    <name>ZtLiveFrameSource</name>
    <message>
        <source>%1 has stopped delivering pictures; the last one stays</source>
        <translation>%1 non invia più immagini; rimane l&apos;ultima</translation>
    </message>
</context>
<context>
    <name>ZtMeasureFormat</name>
    <message>
        <source>pcs</source>
        <translation>pz</translation>
    </message>
</context>
<context>
    <name>ZtSession</name>
    <message>
        <source>The file is empty</source>
        <translation>Il file è vuoto</translation>
    </message>
    <message>
        <source>The file is not a session</source>
        <translation>Il file non è una sessione</translation>
    </message>
    <message>
        <source>The file cannot be written (%1)</source>
        <translation>Impossibile scrivere il file (%1)</translation>
    </message>
    <message>
        <source>This must be a list</source>
        <translation>Deve essere un elenco</translation>
    </message>
    <message>
        <source>This must be a text</source>
        <translation>Deve essere un testo</translation>
    </message>
    <message>
        <source>This must be a whole number from 1</source>
        <translation>Deve essere un numero intero a partire da 1</translation>
    </message>
    <message>
        <source>This must be a number</source>
        <translation>Deve essere un numero</translation>
    </message>
    <message>
        <source>This must be a number greater than 0</source>
        <translation>Deve essere un numero maggiore di 0</translation>
    </message>
    <message>
        <source>Another object of this type has the same number</source>
        <translation>Un altro oggetto di questo tipo ha lo stesso numero</translation>
    </message>
    <message>
        <source>This must be an object</source>
        <translation>Deve essere un oggetto JSON</translation>
    </message>
    <message>
        <source>&quot;%1&quot; is not a type of objects</source>
        <translation>“%1” non è un tipo di oggetto</translation>
    </message>
    <message>
        <source>An object of type &quot;%1&quot; cannot have this number of points (%2)</source>
        <translation>Un oggetto di tipo “%1” non può avere questo numero di punti (%2)</translation>
    </message>
    <message>
        <source>A point must be a list of two numbers between -1e9 and 1e9</source>
        <translation>Un punto deve essere un elenco di due numeri tra -1e9 e 1e9</translation>
    </message>
    <message>
        <source>This must be the name of a value</source>
        <translation>Deve essere il nome di un valore</translation>
    </message>
    <message>
        <source>The type has no name</source>
        <translation>Il tipo non ha nome</translation>
    </message>
    <message>
        <source>A value must have a name of its own</source>
        <translation>Ogni valore deve avere un nome univoco</translation>
    </message>
    <message>
        <source>The numbers of the rows must rise</source>
        <translation>I numeri delle righe devono essere crescenti</translation>
    </message>
    <message>
        <source>A row must be a list of number, name and values</source>
        <translation>Una riga deve essere un elenco di numero, nome e valori</translation>
    </message>
    <message>
        <source>This must be a text or null</source>
        <translation>Deve essere un testo o null</translation>
    </message>
    <message>
        <source>This must be a list or an object</source>
        <translation>Deve essere un elenco o un oggetto JSON</translation>
    </message>
    <message>
        <source>The table has no such value</source>
        <translation>La tabella non ha questo valore</translation>
    </message>
    <message>
        <source>This must be the text of a number</source>
        <translation>Deve essere il testo di un numero</translation>
    </message>
    <message>
        <source>The unit does not fit that of the value</source>
        <translation>L&apos;unità non è compatibile con quella del valore</translation>
    </message>
    <message>
        <source>The file is nested too deeply</source>
        <translation>Il file ha troppi livelli di annidamento</translation>
    </message>
    <message>
        <source>The file is not valid JSON (%1)</source>
        <translation>Il file non è JSON valido (%1)</translation>
    </message>
    <message>
        <source>The file does not exist</source>
        <translation>Il file non esiste</translation>
    </message>
    <message>
        <source>This is a folder, not a file</source>
        <translation>È una cartella, non un file</translation>
    </message>
    <message>
        <source>The file cannot be read (%1)</source>
        <translation>Impossibile leggere il file (%1)</translation>
    </message>
    <message>
        <source>The file is too large for a session</source>
        <translation>Il file è troppo grande per una sessione</translation>
    </message>
    <message>
        <source>This must be a date such as 2026-01-31T12:00:00Z</source>
        <translation>Deve essere una data come 2026-01-31T12:00:00Z</translation>
    </message>
    <message>
        <source>This must be &quot;knownDistance&quot;, &quot;metadata&quot; or &quot;typed&quot;</source>
        <translation>Deve essere &quot;knownDistance&quot;, &quot;metadata&quot; o &quot;typed&quot;</translation>
    </message>
    <message>
        <source>The file is write-protected</source>
        <translation>Il file è protetto da scrittura</translation>
    </message>
    <message>
        <source>Writing was cancelled</source>
        <translation>Scrittura annullata</translation>
    </message>
    <message>
        <source>Reading was cancelled</source>
        <translation>Lettura annullata</translation>
    </message>
    <message>
        <source>The session is of the newer version %1; this program reads versions up to %2</source>
        <translation>La sessione è della versione più recente %1; questo programma legge le versioni fino alla %2</translation>
    </message>
    <message>
        <source>Sessions of version %1 are not known; this program reads versions %2 to %3</source>
        <translation>Le sessioni della versione %1 non sono riconosciute; questo programma legge le versioni dalla %2 alla %3</translation>
    </message>
    <message>
        <source>This file is a table of values; import it</source>
        <translation>Questo file è una tabella di valori; importarla</translation>
    </message>
</context>
<context>
    <name>ZtStillImageSource</name>
    <message>
        <source>The picture does not exist</source>
        <translation>L&apos;immagine non esiste</translation>
    </message>
    <message>
        <source>This is a folder, not a picture</source>
        <translation>È una cartella, non un&apos;immagine</translation>
    </message>
    <message>
        <source>The picture cannot be read</source>
        <translation>Impossibile leggere l&apos;immagine</translation>
    </message>
    <message>
        <source>The picture has %1 x %2 pixels, which is too many</source>
        <translation>L&apos;immagine ha %1 x %2 pixel, che sono troppi</translation>
    </message>
    <message>
        <source>The picture cannot be decoded (%1)</source>
        <translation>Impossibile decodificare l&apos;immagine (%1)</translation>
    </message>
    <message>
        <source>the file is empty</source>
        <translation>il file è vuoto</translation>
    </message>
    <message>
        <source>it has no size</source>
        <translation>non ha dimensioni</translation>
    </message>
    <message>
        <source>the file is damaged</source>
        <translation>il file è danneggiato</translation>
    </message>
    <message>
        <source>the file is too short for its picture</source>
        <translation>il file è troppo corto per la sua immagine</translation>
    </message>
    <message>
        <source>there is not enough memory</source>
        <translation>memoria insufficiente</translation>
    </message>
</context>
<context>
    <name>ZtTableImport</name>
    <message>
        <source>&quot;%1&quot; already has a value &quot;%2&quot; in line %3</source>
        <translation>“%1” ha già un valore “%2” alla riga %3</translation>
    </message>
    <message>
        <source>The file does not exist</source>
        <translation>Il file non esiste</translation>
    </message>
    <message>
        <source>This is a folder, not a file</source>
        <translation>È una cartella, non un file</translation>
    </message>
    <message>
        <source>The file cannot be read (%1)</source>
        <translation>Impossibile leggere il file (%1)</translation>
    </message>
    <message>
        <source>The table is not open for reading</source>
        <translation>La tabella non è aperta in lettura</translation>
    </message>
    <message>
        <source>The table has no rows</source>
        <translation>La tabella non ha righe</translation>
    </message>
    <message>
        <source>The row and the header differ in their number of fields (%1 and %2)</source>
        <translation>La riga e l&apos;intestazione hanno un numero diverso di campi (%1 e %2)</translation>
    </message>
    <message>
        <source>%1 is not a finite number</source>
        <translation>%1 non è un numero finito</translation>
    </message>
    <message>
        <source>%1 is not a number</source>
        <translation>%1 non è un numero</translation>
    </message>
    <message>
        <source>&quot;%1&quot; of &quot;%2&quot; is given in &quot;%3&quot; here, but in &quot;%4&quot; before</source>
        <translation>“%1” di “%2” ha qui l&apos;unità “%3”, ma prima “%4”</translation>
    </message>
    <message>
        <source>There is no column %1; the columns are %2</source>
        <translation>Non c&apos;è una colonna %1; le colonne sono %2</translation>
    </message>
    <message>
        <source>Object</source>
        <translation>Oggetto</translation>
    </message>
    <message>
        <source>There is no value %1 to give a unit; the values are %2</source>
        <translation>Non c&apos;è un valore %1 a cui assegnare un&apos;unità; i valori sono %2</translation>
    </message>
    <message>
        <source>The first line announces rows without values</source>
        <translation>La prima riga del file annuncia righe senza valori</translation>
    </message>
    <message>
        <source>There is no column %1; the columns of this table have no names</source>
        <translation>Non c&apos;è una colonna %1; le colonne di questa tabella non hanno nome</translation>
    </message>
    <message>
        <source>%1 is not the index of a class; they go from 0 to %2</source>
        <translation>%1 non è l&apos;indice di una classe; vanno da 0 a %2</translation>
    </message>
    <message>
        <source>Value %1</source>
        <translation>Valore %1</translation>
    </message>
    <message>
        <source>The file is larger than %1 MB</source>
        <translation>Il file supera %1 MB</translation>
    </message>
    <message>
        <source>The file is empty</source>
        <translation>Il file è vuoto</translation>
    </message>
    <message>
        <source>The first line does not name the columns</source>
        <translation>La prima riga non indica i nomi delle colonne</translation>
    </message>
    <message>
        <source>Column %1 is not part of a list of values and was left out</source>
        <translation>La colonna %1 non fa parte di un elenco di valori ed è stata tralasciata</translation>
    </message>
    <message>
        <source>Columns %1 are not part of a list of values and were left out</source>
        <translation>Le colonne %1 non fanno parte di un elenco di valori e sono state tralasciate</translation>
    </message>
    <message>
        <source>The value has no name</source>
        <translation>Il valore non ha nome</translation>
    </message>
    <message>
        <source>The row does not say which object it belongs to</source>
        <translation>La riga non indica a quale oggetto appartiene</translation>
    </message>
    <message>
        <source>%1 is not a unit</source>
        <translation>%1 non è un&apos;unità</translation>
    </message>
    <message>
        <source>There is no column of numbers</source>
        <translation>Non c&apos;è alcuna colonna di numeri</translation>
    </message>
    <message>
        <source>Column %1</source>
        <translation>Colonna %1</translation>
    </message>
    <message>
        <source>Column %1 holds text and was left out</source>
        <translation>La colonna %1 contiene testo ed è stata tralasciata</translation>
    </message>
    <message>
        <source>Columns %1 hold text and were left out</source>
        <translation>Le colonne %1 contengono testo e sono state tralasciate</translation>
    </message>
    <message>
        <source>Reading was cancelled</source>
        <translation>Lettura annullata</translation>
    </message>
    <message numerus="yes">
        <source>The table has %n row(s), its first line announces %1</source>
        <translation>
            <numerusform>La tabella ha %n riga, ma la prima riga del file ne annuncia %1</numerusform>
            <numerusform>La tabella ha %n righe, ma la prima riga del file ne annuncia %1</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>The row has %n field(s) instead of %1</source>
        <translation>
            <numerusform>La riga ha %n campo invece di %1</numerusform>
            <numerusform>La riga ha %n campi invece di %1</numerusform>
        </translation>
    </message>
    <message>
        <source>The records have too many different names</source>
        <translation>I record hanno troppi nomi diversi</translation>
    </message>
    <message>
        <source>This file is a session, not a table; open it</source>
        <translation>Questo file è una sessione, non una tabella; aprirla</translation>
    </message>
    <message>
        <source>The file is neither a list of records nor an export of values</source>
        <translation>Il file non è né un elenco di record né un’esportazione di valori</translation>
    </message>
    <message>
        <source>This name comes twice</source>
        <translation>Questo nome compare due volte</translation>
    </message>
    <message>
        <source>This must be a text, a number or null</source>
        <translation>Qui deve esserci un testo, un numero o null</translation>
    </message>
    <message>
        <source>The table is of version %1; this program reads version %2</source>
        <translation>La tabella è della versione %1; questo programma legge la versione %2</translation>
    </message>
</context>
<context>
    <name>ZtTextDecoder</name>
    <message>
        <source>The file is not a text file: it holds a NUL character</source>
        <translation>Il file non è un file di testo: contiene un carattere NUL</translation>
    </message>
    <message>
        <source>The file is not valid UTF-16 text</source>
        <translation>Il file non è un testo UTF-16 valido</translation>
    </message>
    <message>
        <source>The text is not valid UTF-8</source>
        <translation>Il testo non è UTF-8 valido</translation>
    </message>
</context>
<context>
    <name>ZtUvcCameraSource</name>
    <message>
        <source>%1 is not connected</source>
        <translation>%1 non è collegata</translation>
    </message>
    <message>
        <source>%1 is disconnected or in use (%2)</source>
        <translation>%1 è scollegata o in uso (%2)</translation>
    </message>
</context>
<context>
    <name>ZtVideoFileSource</name>
    <message>
        <source>The video does not exist</source>
        <translation>Il video non esiste</translation>
    </message>
    <message>
        <source>The video cannot be read</source>
        <translation>Impossibile leggere il video</translation>
    </message>
    <message>
        <source>The video is empty</source>
        <translation>Il video è vuoto</translation>
    </message>
    <message>
        <source>there is only sound in it</source>
        <translation>contiene solo audio</translation>
    </message>
    <message>
        <source>The video %1 cannot be played (%2)</source>
        <translation>Impossibile riprodurre il video %1 (%2)</translation>
    </message>
    <message>
        <source>the file is damaged</source>
        <translation>il file è danneggiato</translation>
    </message>
</context>
<context>
    <name>acss</name>
    <message>
        <source>The icon %1 is missing.</source>
        <translation>Manca l&apos;icona %1.</translation>
    </message>
</context>
</TS>
