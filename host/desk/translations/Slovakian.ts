<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="sk_SK" sourcelanguage="en_US">
<context>
    <name>KvDeskActions</name>
    <message>
        <source>&amp;New session</source>
        <translation>&amp;Nová relácia</translation>
    </message>
    <message>
        <source>Start an empty session</source>
        <translation>Začať prázdnu reláciu</translation>
    </message>
    <message>
        <source>Open &amp;image...</source>
        <translation>Otvoriť o&amp;brázok...</translation>
    </message>
    <message>
        <source>Open image</source>
        <translation>Otvoriť obrázok</translation>
    </message>
    <message>
        <source>&amp;Open session...</source>
        <translation>&amp;Otvoriť reláciu...</translation>
    </message>
    <message>
        <source>Open session</source>
        <translation>Otvoriť reláciu</translation>
    </message>
    <message>
        <source>Import &amp;table...</source>
        <translation>Importovať &amp;tabuľku...</translation>
    </message>
    <message>
        <source>Import table of measured values</source>
        <translation>Importovať tabuľku nameraných hodnôt</translation>
    </message>
    <message>
        <source>&amp;Save session</source>
        <translation>&amp;Uložiť reláciu</translation>
    </message>
    <message>
        <source>Save session</source>
        <translation>Uložiť reláciu</translation>
    </message>
    <message>
        <source>Save session &amp;as...</source>
        <translation>Uložiť reláciu &amp;ako...</translation>
    </message>
    <message>
        <source>Save session to another file</source>
        <translation>Uložiť reláciu do iného súboru</translation>
    </message>
    <message>
        <source>&amp;Quit</source>
        <translation>U&amp;končiť</translation>
    </message>
    <message>
        <source>Quit the program</source>
        <translation>Ukončiť program</translation>
    </message>
    <message>
        <source>Zoom &amp;in</source>
        <translation>Pri&amp;blížiť</translation>
    </message>
    <message>
        <source>Zoom in</source>
        <translation>Priblížiť</translation>
    </message>
    <message>
        <source>Zoom &amp;out</source>
        <translation>Oddia&amp;liť</translation>
    </message>
    <message>
        <source>Zoom out</source>
        <translation>Oddialiť</translation>
    </message>
    <message>
        <source>&amp;Fit to window</source>
        <translation>&amp;Prispôsobiť oknu</translation>
    </message>
    <message>
        <source>Show the whole image</source>
        <translation>Zobraziť celý obrázok</translation>
    </message>
    <message>
        <source>&amp;Actual size</source>
        <translation>&amp;Skutočná veľkosť</translation>
    </message>
    <message>
        <source>Show the image at 100 %</source>
        <translation>Zobraziť obrázok na 100&#xa0;%</translation>
    </message>
    <message>
        <source>&amp;Measured values</source>
        <translation>&amp;Namerané hodnoty</translation>
    </message>
    <message>
        <source>Show or hide the measured values</source>
        <translation>Zobraziť alebo skryť namerané hodnoty</translation>
    </message>
    <message>
        <source>Stat&amp;us log</source>
        <translation>&amp;Denník správ</translation>
    </message>
    <message>
        <source>Show or hide the status log</source>
        <translation>Zobraziť alebo skryť denník správ</translation>
    </message>
    <message>
        <source>&amp;Dark or light theme</source>
        <translation>&amp;Tmavý alebo svetlý motív</translation>
    </message>
    <message>
        <source>Change between the dark and the light theme</source>
        <translation>Prepnúť medzi tmavým a svetlým motívom</translation>
    </message>
    <message>
        <source>Settin&amp;gs...</source>
        <translation>Na&amp;stavenia...</translation>
    </message>
    <message>
        <source>Settings</source>
        <translation>Nastavenia</translation>
    </message>
    <message>
        <source>&amp;About Measuring Desk</source>
        <translation>&amp;O programe Measuring Desk</translation>
    </message>
    <message>
        <source>About Measuring Desk</source>
        <translation>O programe Measuring Desk</translation>
    </message>
    <message>
        <source>%1 (%2)</source>
        <comment>command (shortcut)</comment>
        <translation>%1 (%2)</translation>
    </message>
    <message>
        <source>&amp;Export measured values...</source>
        <translation>E&amp;xportovať namerané hodnoty...</translation>
    </message>
    <message>
        <source>Export measured values as a table</source>
        <translation>Exportovať namerané hodnoty ako tabuľku</translation>
    </message>
    <message>
        <source>&amp;Undo</source>
        <translation>&amp;Vrátiť späť</translation>
    </message>
    <message>
        <source>Undo the last step</source>
        <translation>Vrátiť späť posledný krok</translation>
    </message>
    <message>
        <source>&amp;Redo</source>
        <translation>&amp;Zopakovať</translation>
    </message>
    <message>
        <source>Redo what was undone</source>
        <translation>Zopakovať vrátený krok</translation>
    </message>
    <message>
        <source>Cu&amp;t</source>
        <translation>V&amp;ystrihnúť</translation>
    </message>
    <message>
        <source>Cut the selected objects</source>
        <translation>Vystrihnúť vybrané objekty</translation>
    </message>
    <message>
        <source>&amp;Copy</source>
        <translation>&amp;Kopírovať</translation>
    </message>
    <message>
        <source>Copy the selected objects</source>
        <translation>Kopírovať vybrané objekty</translation>
    </message>
    <message>
        <source>&amp;Paste</source>
        <translation>&amp;Prilepiť</translation>
    </message>
    <message>
        <source>Paste copied objects</source>
        <translation>Prilepiť skopírované objekty</translation>
    </message>
    <message>
        <source>&amp;Delete</source>
        <translation>&amp;Odstrániť</translation>
    </message>
    <message>
        <source>Delete the selected objects</source>
        <translation>Odstrániť vybrané objekty</translation>
    </message>
    <message>
        <source>Select &amp;all</source>
        <translation>Vybrať vš&amp;etko</translation>
    </message>
    <message>
        <source>Select all objects on the image</source>
        <translation>Vybrať všetky objekty na obrázku</translation>
    </message>
    <message>
        <source>Re&amp;name</source>
        <translation>P&amp;remenovať</translation>
    </message>
    <message>
        <source>Give the selected object a name</source>
        <translation>Pomenovať vybraný objekt</translation>
    </message>
    <message>
        <source>&amp;Find measured values</source>
        <translation>&amp;Hľadať namerané hodnoty</translation>
    </message>
    <message>
        <source>Filter the measured values</source>
        <translation>Filtrovať namerané hodnoty</translation>
    </message>
    <message>
        <source>&amp;Select</source>
        <translation>&amp;Výber</translation>
    </message>
    <message>
        <source>Select and change objects</source>
        <translation>Vyberať a meniť objekty</translation>
    </message>
    <message>
        <source>&amp;Line</source>
        <translation>Ú&amp;sečka</translation>
    </message>
    <message>
        <source>Measure a length</source>
        <translation>Zmerať dĺžku</translation>
    </message>
    <message>
        <source>&amp;Polyline</source>
        <translation>&amp;Lomená čiara</translation>
    </message>
    <message>
        <source>Measure the length of a way</source>
        <translation>Zmerať dĺžku dráhy</translation>
    </message>
    <message>
        <source>Parallel &amp;distance</source>
        <translation>Vz&amp;dialenosť od priamky</translation>
    </message>
    <message>
        <source>Measure the distance of a point from a line</source>
        <translation>Zmerať vzdialenosť bodu od priamky</translation>
    </message>
    <message>
        <source>&amp;Arc</source>
        <translation>&amp;Oblúk</translation>
    </message>
    <message>
        <source>Measure an arc through three points</source>
        <translation>Zmerať oblúk určený tromi bodmi</translation>
    </message>
    <message>
        <source>&amp;Circle</source>
        <translation>&amp;Kružnica</translation>
    </message>
    <message>
        <source>Measure a circle</source>
        <translation>Zmerať kružnicu</translation>
    </message>
    <message>
        <source>&amp;Rectangle</source>
        <translation>O&amp;bdĺžnik</translation>
    </message>
    <message>
        <source>Measure a rectangle</source>
        <translation>Zmerať obdĺžnik</translation>
    </message>
    <message>
        <source>Poly&amp;gon</source>
        <translation>&amp;Mnohouholník</translation>
    </message>
    <message>
        <source>Measure the area of a polygon</source>
        <translation>Zmerať plochu mnohouholníka</translation>
    </message>
    <message>
        <source>Cou&amp;nter</source>
        <translation>&amp;Počítadlo</translation>
    </message>
    <message>
        <source>Count by clicks</source>
        <translation>Počítať klikaním</translation>
    </message>
    <message>
        <source>&amp;Text note</source>
        <translation>&amp;Textová poznámka</translation>
    </message>
    <message>
        <source>Write on the image</source>
        <translation>Písať do obrázka</translation>
    </message>
    <message>
        <source>Scale &amp;bar</source>
        <translation>Mi&amp;erka</translation>
    </message>
    <message>
        <source>Draw a scale bar</source>
        <translation>Nakresliť mierku</translation>
    </message>
    <message>
        <source>Cal&amp;ibration...</source>
        <translation>Kal&amp;ibrácia...</translation>
    </message>
    <message>
        <source>Say how large a pixel of the image is</source>
        <translation>Určiť veľkosť pixela obrázka</translation>
    </message>
    <message>
        <source>Use the file&apos;s pixel size</source>
        <translation>Použiť veľkosť pixela zo súboru</translation>
    </message>
    <message>
        <source>Measure with the pixel size that the image&apos;s file states</source>
        <translation>Merať s veľkosťou pixela, ktorú udáva súbor s obrázkom</translation>
    </message>
    <message>
        <source>&amp;Take snapshot</source>
        <translation>Vytvoriť &amp;snímku</translation>
    </message>
    <message>
        <source>Save the image to the gallery</source>
        <translation>Uložiť obrázok do galérie</translation>
    </message>
    <message>
        <source>Snapshots &amp;with measurements</source>
        <translation>Snímky s m&amp;eraniami</translation>
    </message>
    <message>
        <source>Draw the measured objects on snapshots</source>
        <translation>Vykresľovať merané objekty do snímok</translation>
    </message>
    <message>
        <source>&amp;Freeze</source>
        <translation>Z&amp;mraziť</translation>
    </message>
    <message>
        <source>Freeze the live image</source>
        <translation>Zmraziť živý obraz</translation>
    </message>
    <message>
        <source>&amp;Labels on the image</source>
        <translation>P&amp;opisky na obrázku</translation>
    </message>
    <message>
        <source>Show or hide the labels of objects</source>
        <translation>Zobraziť alebo skryť popisky objektov</translation>
    </message>
    <message>
        <source>&amp;Rulers</source>
        <translation>P&amp;ravítka</translation>
    </message>
    <message>
        <source>Show or hide the rulers</source>
        <translation>Zobraziť alebo skryť pravítka</translation>
    </message>
    <message>
        <source>&amp;Scale bar on the image</source>
        <translation>Mi&amp;erka na obrázku</translation>
    </message>
    <message>
        <source>Show or hide the scale bar, on reports, too</source>
        <translation>Zobraziť alebo skryť mierku, aj v protokoloch</translation>
    </message>
    <message>
        <source>&amp;Gallery</source>
        <translation>&amp;Galéria</translation>
    </message>
    <message>
        <source>Show or hide the gallery</source>
        <translation>Zobraziť alebo skryť galériu</translation>
    </message>
    <message>
        <source>&amp;Start page</source>
        <translation>Ú&amp;vodná stránka</translation>
    </message>
    <message>
        <source>Show the first steps, the examples and the recent sessions</source>
        <translation>Zobraziť prvé kroky, príklady a nedávne relácie</translation>
    </message>
    <message>
        <source>&amp;User guide</source>
        <translation>&amp;Používateľská príručka</translation>
    </message>
    <message>
        <source>Read the user guide</source>
        <translation>Prečítať používateľskú príručku</translation>
    </message>
</context>
<context>
    <name>KvDeskAutosave</name>
    <message>
        <source>the folder &quot;%1&quot; cannot be written</source>
        <translation>do priečinka „%1“ sa nedá zapisovať</translation>
    </message>
    <message>
        <source>Unsaved changes are not being copied: %1</source>
        <translation>Kópie neuložených zmien sa nevytvárajú: %1</translation>
    </message>
</context>
<context>
    <name>KvDeskCalibrationCommands</name>
    <message>
        <source>The session measures with it already</source>
        <translation>Relácia s ňou už meria</translation>
    </message>
    <message>
        <source>The image&apos;s file does not state one</source>
        <translation>Súbor s obrázkom ju neudáva</translation>
    </message>
</context>
<context>
    <name>KvDeskCalibrationDialog</name>
    <message>
        <source>Calibration</source>
        <translation>Kalibrácia</translation>
    </message>
    <message>
        <source>Objective</source>
        <translation>Objektív</translation>
    </message>
    <message>
        <source>Choose an objective, or type the name of a new one</source>
        <translation>Vyberte objektív alebo napíšte názov nového</translation>
    </message>
    <message>
        <source>Such as 10x</source>
        <translation>Napríklad 10x</translation>
    </message>
    <message>
        <source>In use</source>
        <translation>Používa sa</translation>
    </message>
    <message>
        <source>New calibration</source>
        <translation>Nová kalibrácia</translation>
    </message>
    <message>
        <source>Known distance</source>
        <translation>Známa dĺžka</translation>
    </message>
    <message>
        <source>Image file</source>
        <translation>Súbor s obrázkom</translation>
    </message>
    <message>
        <source>Typed</source>
        <translation>Ručne</translation>
    </message>
    <message>
        <source>Name</source>
        <translation>Názov</translation>
    </message>
    <message>
        <source>Who</source>
        <translation>Vykonal</translation>
    </message>
    <message>
        <source>Note</source>
        <translation>Poznámka</translation>
    </message>
    <message>
        <source>Calibrate</source>
        <translation>Kalibrovať</translation>
    </message>
    <message>
        <source>History of the objective</source>
        <translation>História objektívu</translation>
    </message>
    <message>
        <source>Calibrations of this objective appear here</source>
        <translation>Tu sa objavia kalibrácie tohto objektívu</translation>
    </message>
    <message>
        <source>Use again</source>
        <translation>Použiť znova</translation>
    </message>
    <message>
        <source>Close</source>
        <translation>Zavrieť</translation>
    </message>
    <message>
        <source>New pixel size: %1</source>
        <translation>Nová veľkosť pixela: %1</translation>
    </message>
    <message>
        <source>No pixel size yet</source>
        <translation>Veľkosť pixela nie je určená</translation>
    </message>
    <message>
        <source>Measure with this pixel size and remember it</source>
        <translation>Merať s touto veľkosťou pixela a zapamätať si ju</translation>
    </message>
    <message>
        <source>Complete the fields above first</source>
        <translation>Najprv vyplňte polia vyššie</translation>
    </message>
    <message>
        <source>Measure with the selected calibration</source>
        <translation>Merať s vybranou kalibráciou</translation>
    </message>
    <message>
        <source>Select a calibration in the table first</source>
        <translation>Najprv vyberte kalibráciu v tabuľke</translation>
    </message>
</context>
<context>
    <name>KvDeskCalibrationHistory</name>
    <message>
        <source>Date</source>
        <translation>Dátum</translation>
    </message>
    <message>
        <source>Who</source>
        <translation>Vykonal</translation>
    </message>
    <message>
        <source>Pixel size</source>
        <translation>Veľkosť pixela</translation>
    </message>
    <message>
        <source>Origin</source>
        <translation>Spôsob</translation>
    </message>
    <message>
        <source>Name</source>
        <translation>Názov</translation>
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
        <translation>Známa dĺžka</translation>
    </message>
    <message>
        <source>Image file</source>
        <translation>Súbor s obrázkom</translation>
    </message>
    <message>
        <source>Typed</source>
        <translation>Ručne</translation>
    </message>
    <message>
        <source>Not calibrated</source>
        <translation>Nekalibrované</translation>
    </message>
</context>
<context>
    <name>KvDeskCalibrationWay</name>
    <message>
        <source>Type a number such as 5.3 or 5,3</source>
        <translation>Zadajte číslo, napríklad 5.3 alebo 5,3</translation>
    </message>
    <message>
        <source>A pixel measures between %1 and %2</source>
        <translation>Pixel meria od %1 do %2</translation>
    </message>
</context>
<context>
    <name>KvDeskCalibrator</name>
    <message>
        <source>%1 states pixels of %2; the session measures with %3</source>
        <translation>%1 udáva veľkosť pixela %2; relácia meria s %3</translation>
    </message>
    <message>
        <source>%1 states pixels of %2; the session measures in pixels</source>
        <translation>%1 udáva veľkosť pixela %2; relácia meria v pixeloch</translation>
    </message>
    <message>
        <source>Calibrated: %1, %2 per pixel</source>
        <extracomment>%1 is an objective or a file, %2 the size of a pixel with its unit</extracomment>
        <translation>Kalibrované: %1, %2 na pixel</translation>
    </message>
</context>
<context>
    <name>KvDeskCommandLine</name>
    <message>
        <source>There is no theme &quot;%1&quot;: use %2</source>
        <translation>Motív „%1“ neexistuje; použite %2</translation>
    </message>
    <message>
        <source> or </source>
        <translation> alebo </translation>
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
        <translation>Použitie: measuringdesk [VOĽBA...] [RELÁCIA|OBRÁZOK|TABUĽKA|PRIEČINOK|VIDEO...]
Meria objekty na obrázkoch a zobrazuje ich hodnoty.

  --session SÚBOR     otvoriť reláciu
  --image SÚBOR       otvoriť obrázok
  --table SÚBOR       importovať tabuľku nameraných hodnôt
  --theme Dark|Light  motív pre toto spustenie
  --plugins PRIEČINOK hľadať zásuvné moduly aj tu; možno zadať viackrát
  --help              zobraziť tento text
  --version           zobraziť verziu

Premenná prostredia STATREPORT_PLUGINS určuje ďalšie priečinky so zásuvnými modulmi.
</translation>
    </message>
    <message>
        <source>%1 (measuringdesk --help tells more)</source>
        <translation>%1 (ďalšia pomoc: measuringdesk --help)</translation>
    </message>
</context>
<context>
    <name>KvDeskCounterBar</name>
    <message>
        <source>Clicks count for</source>
        <translation>Kliknutia počíta</translation>
    </message>
    <message>
        <source>The counter that gets the clicks (1 to 9)</source>
        <translation>Počítadlo, ktorému sa započítavajú kliknutia (1 až 9)</translation>
    </message>
    <message>
        <source>Count another class</source>
        <translation>Počítať ďalšiu triedu</translation>
    </message>
    <message>
        <source>A right click takes a place away</source>
        <translation>Kliknutie pravým tlačidlom odstráni značku</translation>
    </message>
    <message>
        <source>A new counter</source>
        <translation>Nové počítadlo</translation>
    </message>
</context>
<context>
    <name>KvDeskEditCommands</name>
    <message>
        <source>&amp;Undo %1</source>
        <extracomment>%1 is what is undone or redone, such as &quot;move of Line 3&quot;</extracomment>
        <translation>&amp;Vrátiť späť %1</translation>
    </message>
    <message>
        <source>&amp;Undo</source>
        <translation>&amp;Vrátiť späť</translation>
    </message>
    <message>
        <source>&amp;Redo %1</source>
        <translation>&amp;Zopakovať %1</translation>
    </message>
    <message>
        <source>&amp;Redo</source>
        <translation>&amp;Zopakovať</translation>
    </message>
    <message>
        <source>Nothing was done yet</source>
        <translation>Zatiaľ sa nič neurobilo</translation>
    </message>
    <message>
        <source>Nothing was undone</source>
        <translation>Nič nebolo vrátené späť</translation>
    </message>
    <message>
        <source>Select an object first</source>
        <translation>Najprv vyberte objekt</translation>
    </message>
    <message>
        <source>Select one object first</source>
        <translation>Najprv vyberte jeden objekt</translation>
    </message>
    <message>
        <source>No measured objects were copied</source>
        <translation>Neboli skopírované žiadne merané objekty</translation>
    </message>
    <message>
        <source>Finish or cancel what you have begun first</source>
        <translation>Najprv dokončite alebo zrušte, čo ste začali</translation>
    </message>
</context>
<context>
    <name>KvDeskExamples</name>
    <message>
        <source>Coin: first length</source>
        <translation>Minca: prvá dĺžka</translation>
    </message>
    <message>
        <source>Plate: dimensions</source>
        <translation>Platňa: rozmery</translation>
    </message>
    <message>
        <source>Cells: counting</source>
        <translation>Bunky: počítanie</translation>
    </message>
    <message>
        <source>Fibres: statistics</source>
        <translation>Vlákna: štatistika</translation>
    </message>
</context>
<context>
    <name>KvDeskExportCommand</name>
    <message>
        <source>Nothing was measured yet</source>
        <translation>Zatiaľ sa nič nezmeralo</translation>
    </message>
    <message>
        <source>Measured values</source>
        <comment>file name</comment>
        <translation>Namerané hodnoty</translation>
    </message>
    <message>
        <source>JSON files</source>
        <translation>Súbory JSON</translation>
    </message>
    <message>
        <source>CSV tables</source>
        <translation>Tabuľky CSV</translation>
    </message>
    <message>
        <source>Export measured values</source>
        <translation>Exportovať namerané hodnoty</translation>
    </message>
    <message>
        <source>Export cancelled: %1</source>
        <translation>Export zrušený: %1</translation>
    </message>
    <message>
        <source>The table &quot;%1&quot; was not written.</source>
        <translation>Tabuľka „%1“ nebola zapísaná.</translation>
    </message>
    <message>
        <source>Measured values exported: %1</source>
        <translation>Namerané hodnoty exportované: %1</translation>
    </message>
    <message>
        <source>Exporting measured values</source>
        <translation>Exportujú sa namerané hodnoty</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Zrušiť</translation>
    </message>
</context>
<context>
    <name>KvDeskExportDialog</name>
    <message>
        <source>Export measured values</source>
        <translation>Exportovať namerané hodnoty</translation>
    </message>
    <message>
        <source>Table</source>
        <translation>Tabuľka</translation>
    </message>
    <message>
        <source>Numbers</source>
        <translation>Čísla</translation>
    </message>
    <message>
        <source>Byte order mark, for spreadsheets that do not expect UTF-8</source>
        <translation>Značka poradia bajtov (BOM) pre tabuľkové procesory, ktoré neočakávajú UTF-8</translation>
    </message>
    <message>
        <source>Apostrophe before names that spreadsheets take for formulas</source>
        <translation>Apostrof pred názvami, ktoré tabuľkové procesory považujú za vzorce</translation>
    </message>
    <message>
        <source>Changes names that begin with =, +, - or @: they are others when the table is imported again</source>
        <translation>Zmení názvy, ktoré sa začínajú znakom =, +, - alebo @: po opätovnom importe tabuľky budú iné</translation>
    </message>
    <message>
        <source>Export...</source>
        <translation>Exportovať...</translation>
    </message>
    <message>
        <source>CSV, one row per value</source>
        <translation>CSV, jeden riadok na hodnotu</translation>
    </message>
    <message>
        <source>CSV, one row per object</source>
        <translation>CSV, jeden riadok na objekt</translation>
    </message>
    <message>
        <source>JSON</source>
        <translation>JSON</translation>
    </message>
    <message>
        <source>1.5, commas between the fields</source>
        <translation>1.5, polia oddelené čiarkou</translation>
    </message>
    <message>
        <source>1,5, semicolons between the fields (spreadsheets, %1)</source>
        <extracomment>%1 is the name of a language</extracomment>
        <translation>1,5, polia oddelené bodkočiarkou (tabuľkové procesory, %1)</translation>
    </message>
    <message>
        <source>1.5, commas between the fields (spreadsheets, %1)</source>
        <translation>1.5, polia oddelené čiarkou (tabuľkové procesory, %1)</translation>
    </message>
    <message>
        <source>For statistics programs. Can be imported here again.</source>
        <translation>Pre štatistické programy. Dá sa sem znova importovať.</translation>
    </message>
    <message>
        <source>For spreadsheets. Headings name the units.</source>
        <translation>Pre tabuľkové procesory. Jednotky sú uvedené v záhlaví.</translation>
    </message>
    <message>
        <source>For programs. Numbers always have a decimal point.</source>
        <translation>Pre programy. Čísla majú vždy desatinnú bodku.</translation>
    </message>
    <message>
        <source>No measured object is selected</source>
        <translation>Nie je vybraný žiadny meraný objekt</translation>
    </message>
    <message>
        <source>Concerns CSV tables only</source>
        <translation>Týka sa len tabuliek CSV</translation>
    </message>
    <message numerus="yes">
        <source>Only the selected object(s) (%n)</source>
        <translation>
            <numerusform>Iba vybraný objekt (%n)</numerusform>
            <numerusform>Iba vybrané objekty (%n)</numerusform>
            <numerusform>Iba vybrané objekty (%n)</numerusform>
        </translation>
    </message>
</context>
<context>
    <name>KvDeskExposureControl</name>
    <message>
        <source>E&amp;xposure</source>
        <translation>&amp;Expozícia</translation>
    </message>
    <message>
        <source>Exposure time of the camera</source>
        <translation>Expozičný čas kamery</translation>
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
        <translation>Relácie</translation>
    </message>
    <message>
        <source>All files</source>
        <translation>Všetky súbory</translation>
    </message>
    <message>
        <source>Unsaved changes</source>
        <translation>Neuložené zmeny</translation>
    </message>
    <message>
        <source>Save the changes to &quot;%1&quot;?</source>
        <translation>Uložiť zmeny do „%1“?</translation>
    </message>
    <message>
        <source>The session &quot;%1&quot; was not opened.</source>
        <translation>Relácia „%1“ sa neotvorila.</translation>
    </message>
    <message>
        <source>Image missing</source>
        <translation>Chýba obrázok</translation>
    </message>
    <message>
        <source>Open the session without its image?</source>
        <translation>Otvoriť reláciu bez jej obrázka?</translation>
    </message>
    <message>
        <source>The image &quot;%1&quot; was not opened.</source>
        <translation>Obrázok „%1“ sa neotvoril.</translation>
    </message>
    <message>
        <source>Image opened: %1</source>
        <translation>Obrázok otvorený: %1</translation>
    </message>
    <message>
        <source>The table &quot;%1&quot; was not imported.</source>
        <translation>Tabuľka „%1“ sa neimportovala.</translation>
    </message>
    <message>
        <source>%1: %2</source>
        <comment>file, remark</comment>
        <translation>%1: %2</translation>
    </message>
    <message>
        <source>The session &quot;%1&quot; was not saved.</source>
        <translation>Relácia „%1“ sa neuložila.</translation>
    </message>
    <message>
        <source>Session saved: %1</source>
        <translation>Relácia uložená: %1</translation>
    </message>
    <message>
        <source>Open session</source>
        <translation>Otvoriť reláciu</translation>
    </message>
    <message>
        <source>Open image</source>
        <translation>Otvoriť obrázok</translation>
    </message>
    <message>
        <source>Images</source>
        <translation>Obrázky</translation>
    </message>
    <message>
        <source>Import table</source>
        <translation>Importovať tabuľku</translation>
    </message>
    <message>
        <source>Tables</source>
        <translation>Tabuľky</translation>
    </message>
    <message>
        <source>Save session</source>
        <translation>Uložiť reláciu</translation>
    </message>
    <message>
        <source>Measuring Desk</source>
        <translation>Measuring Desk</translation>
    </message>
    <message>
        <source>Only one session can be open; not opened: %1</source>
        <translation>Otvorená môže byť iba jedna relácia; neotvorené: %1</translation>
    </message>
    <message>
        <source>Neither a session, an image nor a table: %1</source>
        <translation>Nie je to relácia, obrázok ani tabuľka: %1</translation>
    </message>
    <message>
        <source>There is not enough memory</source>
        <translation>Nie je dostatok pamäte</translation>
    </message>
    <message>
        <source>Opening &quot;%1&quot;</source>
        <translation>Otvára sa „%1“</translation>
    </message>
    <message>
        <source>The measurements were not restored.</source>
        <translation>Merania sa neobnovili.</translation>
    </message>
    <message>
        <source>Restoring measurements</source>
        <translation>Obnovujú sa merania</translation>
    </message>
    <message>
        <source>Importing &quot;%1&quot;</source>
        <translation>Importuje sa „%1“</translation>
    </message>
    <message>
        <source>Saving &quot;%1&quot;</source>
        <translation>Ukladá sa „%1“</translation>
    </message>
    <message>
        <source>Session changed by another program</source>
        <translation>Relácia zmenená iným programom</translation>
    </message>
    <message>
        <source>&quot;%1&quot; was changed by another program. Overwrite its changes?</source>
        <translation>„%1“ zmenil iný program. Prepísať jeho zmeny?</translation>
    </message>
    <message>
        <source>Overwrite</source>
        <translation>Prepísať</translation>
    </message>
    <message>
        <source>Save as...</source>
        <translation>Uložiť ako...</translation>
    </message>
    <message numerus="yes">
        <source>%n files were not opened.</source>
        <extracomment>%n is 2 at least</extracomment>
        <translation>
            <numerusform>%n súbor sa neotvoril.</numerusform>
            <numerusform>%n súbory sa neotvorili.</numerusform>
            <numerusform>%n súborov sa neotvorilo.</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Session opened: %1 (%n object(s))</source>
        <translation>
            <numerusform>Relácia otvorená: %1 (%n objekt)</numerusform>
            <numerusform>Relácia otvorená: %1 (%n objekty)</numerusform>
            <numerusform>Relácia otvorená: %1 (%n objektov)</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Measurements restored: %1 (%n object(s))</source>
        <translation>
            <numerusform>Merania obnovené: %1 (%n objekt)</numerusform>
            <numerusform>Merania obnovené: %1 (%n objekty)</numerusform>
            <numerusform>Merania obnovené: %1 (%n objektov)</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Table imported: %1 (%n object(s))</source>
        <translation>
            <numerusform>Tabuľka importovaná: %1 (%n objekt)</numerusform>
            <numerusform>Tabuľka importovaná: %1 (%n objekty)</numerusform>
            <numerusform>Tabuľka importovaná: %1 (%n objektov)</numerusform>
        </translation>
    </message>
</context>
<context>
    <name>KvDeskFilePixelSize</name>
    <message>
        <source>%1 states pixels of %2.</source>
        <comment>file, size</comment>
        <translation>%1 udáva veľkosť pixela %2.</translation>
    </message>
    <message>
        <source>The image&apos;s file does not state how large its pixels are.</source>
        <translation>Súbor s obrázkom neudáva, aké veľké sú jeho pixely.</translation>
    </message>
</context>
<context>
    <name>KvDeskGallery</name>
    <message>
        <source>Gallery</source>
        <translation>Galéria</translation>
    </message>
    <message>
        <source>Hide the gallery</source>
        <translation>Skryť galériu</translation>
    </message>
    <message>
        <source>&amp;Open image</source>
        <translation>&amp;Otvoriť obrázok</translation>
    </message>
    <message>
        <source>&amp;Show in folder</source>
        <translation>&amp;Zobraziť v priečinku</translation>
    </message>
    <message>
        <source>&amp;Copy path</source>
        <translation>&amp;Kopírovať cestu</translation>
    </message>
    <message>
        <source>&amp;Move to trash...</source>
        <translation>&amp;Presunúť do koša...</translation>
    </message>
    <message>
        <source>Choose &amp;folder...</source>
        <translation>&amp;Vybrať priečinok...</translation>
    </message>
    <message>
        <source>Show the images of a folder</source>
        <translation>Zobraziť obrázky z priečinka</translation>
    </message>
    <message>
        <source>Save s&amp;napshots in this folder</source>
        <translation>Ukladať &amp;snímky do tohto priečinka</translation>
    </message>
    <message>
        <source>Folder of the gallery</source>
        <translation>Priečinok galérie</translation>
    </message>
    <message>
        <source>More commands of the gallery</source>
        <translation>Ďalšie príkazy galérie</translation>
    </message>
    <message>
        <source>Snapshots</source>
        <translation>Snímky</translation>
    </message>
    <message>
        <source>Choose folder</source>
        <translation>Vyberte priečinok</translation>
    </message>
    <message>
        <source>Snapshots are saved in %1</source>
        <translation>Snímky sa ukladajú do %1</translation>
    </message>
    <message>
        <source>Snapshots (%1) and the images of a folder appear here; drag them onto report pages</source>
        <translation>Tu sa objavia snímky (%1) a obrázky z priečinka; presúvajte ich na strany protokolu</translation>
    </message>
    <message>
        <source>There are no images in %1</source>
        <translation>V %1 nie sú žiadne obrázky</translation>
    </message>
    <message>
        <source>The folder %1 does not exist</source>
        <translation>Priečinok %1 neexistuje</translation>
    </message>
    <message>
        <source>Select an image first</source>
        <translation>Najprv vyberte obrázok</translation>
    </message>
    <message>
        <source>Snapshots are saved in this folder already</source>
        <translation>Snímky sa už ukladajú do tohto priečinka</translation>
    </message>
    <message>
        <source>Move &quot;%1&quot; to the trash?</source>
        <translation>Presunúť „%1“ do koša?</translation>
    </message>
    <message>
        <source>Move to trash</source>
        <translation>Presunúť do koša</translation>
    </message>
    <message>
        <source>Moved to the trash: %1</source>
        <translation>Presunuté do koša: %1</translation>
    </message>
    <message>
        <source>Not moved to the trash: %1</source>
        <translation>Nepresunuté do koša: %1</translation>
    </message>
    <message>
        <source>Measuring Desk</source>
        <translation>Measuring Desk</translation>
    </message>
    <message>
        <source>The files are still there. They are write-protected, or there is no trash for them.</source>
        <translation>Súbory sú stále na svojom mieste. Sú chránené proti zápisu alebo pre ne neexistuje kôš.</translation>
    </message>
    <message numerus="yes">
        <source>Move %n selected image(s) to the trash?</source>
        <translation>
            <numerusform>Presunúť %n vybraný obrázok do koša?</numerusform>
            <numerusform>Presunúť %n vybrané obrázky do koša?</numerusform>
            <numerusform>Presunúť %n vybraných obrázkov do koša?</numerusform>
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
        <translation>Galéria</translation>
    </message>
</context>
<context>
    <name>KvDeskGuideCommand</name>
    <message>
        <source>The user guide is not installed</source>
        <translation>Používateľská príručka nie je nainštalovaná</translation>
    </message>
</context>
<context>
    <name>KvDeskGuideWindow</name>
    <message>
        <source>User guide</source>
        <translation>Používateľská príručka</translation>
    </message>
    <message>
        <source>Contents</source>
        <translation>Obsah</translation>
    </message>
    <message>
        <source>Back</source>
        <translation>Späť</translation>
    </message>
    <message>
        <source>Forward</source>
        <translation>Dopredu</translation>
    </message>
    <message>
        <source>Find in the guide</source>
        <translation>Hľadať v príručke</translation>
    </message>
    <message>
        <source>Find previous</source>
        <translation>Hľadať predchádzajúce</translation>
    </message>
    <message>
        <source>Find next</source>
        <translation>Hľadať ďalšie</translation>
    </message>
    <message>
        <source>This is the first place</source>
        <translation>Toto je prvé navštívené miesto</translation>
    </message>
    <message>
        <source>This is the last place</source>
        <translation>Toto je posledné navštívené miesto</translation>
    </message>
    <message>
        <source>Not found</source>
        <translation>Nenájdené</translation>
    </message>
    <message>
        <source>Type what to find first</source>
        <translation>Najprv zadajte hľadaný text</translation>
    </message>
</context>
<context>
    <name>KvDeskImageView</name>
    <message>
        <source>Image</source>
        <translation>Obrázok</translation>
    </message>
    <message>
        <source>Open an image or a session to start</source>
        <translation>Začnite otvorením obrázka alebo relácie</translation>
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
        <translation>Názov</translation>
    </message>
</context>
<context>
    <name>KvDeskKnownDistance</name>
    <message>
        <source>inch</source>
        <translation>palec</translation>
    </message>
    <message>
        <source>Use selected line</source>
        <translation>Použiť vybranú úsečku</translation>
    </message>
    <message>
        <source>Length of the line</source>
        <translation>Dĺžka úsečky</translation>
    </message>
    <message>
        <source>Unit of the length</source>
        <translation>Jednotka dĺžky</translation>
    </message>
    <message>
        <source>Its length</source>
        <translation>Jej dĺžka</translation>
    </message>
    <message>
        <source>Draw a line over a distance that you know, such as on a stage micrometer, and select it.</source>
        <translation>Nakreslite úsečku cez známu dĺžku, napríklad na objektovom mikrometri, a vyberte ju.</translation>
    </message>
    <message>
        <source>No line yet</source>
        <translation>Zatiaľ bez úsečky</translation>
    </message>
    <message>
        <source>%1: %2</source>
        <comment>name and length of a line</comment>
        <translation>%1: %2</translation>
    </message>
    <message>
        <source>Take the selected line as the known distance</source>
        <translation>Použiť vybranú úsečku ako známu dĺžku</translation>
    </message>
    <message>
        <source>Select one line on the image first</source>
        <translation>Najprv vyberte jednu úsečku na obrázku</translation>
    </message>
</context>
<context>
    <name>KvDeskLiveBar</name>
    <message>
        <source>Live image</source>
        <translation>Živý obraz</translation>
    </message>
    <message>
        <source>Freeze</source>
        <translation>Zmraziť</translation>
    </message>
    <message>
        <source>%1 fps</source>
        <extracomment>frames per second</extracomment>
        <translation>%1&#xa0;sn./s</translation>
    </message>
    <message>
        <source>%1 delivers no pictures any more; this is the last one</source>
        <translation>%1 už neposiela obraz; toto je posledný</translation>
    </message>
    <message>
        <source>%1 delivers no pictures</source>
        <translation>%1 neposiela obraz</translation>
    </message>
    <message>
        <source>%1 is stopped</source>
        <translation>%1: zastavené</translation>
    </message>
    <message>
        <source>Waiting for the first picture of %1</source>
        <translation>Čaká sa na prvý obraz: %1</translation>
    </message>
    <message>
        <source>Frozen: %1</source>
        <translation>Zmrazené: %1</translation>
    </message>
    <message>
        <source>Live: %1</source>
        <translation>Naživo: %1</translation>
    </message>
    <message>
        <source>This image is not live</source>
        <translation>Tento obraz nie je živý</translation>
    </message>
    <message>
        <source>&amp;Reconnect</source>
        <translation>Zno&amp;va pripojiť</translation>
    </message>
    <message>
        <source>&amp;Start</source>
        <translation>Sp&amp;ustiť</translation>
    </message>
    <message>
        <source>Frames per second
Dropped, because newer ones came first: %1</source>
        <translation>Snímky za sekundu
Vynechané, pretože medzitým prišli novšie: %1</translation>
    </message>
    <message>
        <source>Stop the live image; other programs can use the camera then</source>
        <translation>Zastaviť živý obraz; kameru potom môžu používať iné programy</translation>
    </message>
</context>
<context>
    <name>KvDeskMainWindow</name>
    <message>
        <source>&amp;File</source>
        <translation>&amp;Súbor</translation>
    </message>
    <message>
        <source>&amp;Recent sessions</source>
        <translation>N&amp;edávne relácie</translation>
    </message>
    <message>
        <source>&amp;View</source>
        <translation>&amp;Zobraziť</translation>
    </message>
    <message>
        <source>&amp;Help</source>
        <translation>&amp;Pomocník</translation>
    </message>
    <message>
        <source>Main tool bar</source>
        <translation>Hlavný panel nástrojov</translation>
    </message>
    <message>
        <source>%1[*] - Measuring Desk</source>
        <extracomment>%1 is the name of a session; [*] is replaced by a star when it has unsaved changes</extracomment>
        <translation>%1[*] – Measuring Desk</translation>
    </message>
    <message>
        <source>None yet</source>
        <translation>Zatiaľ žiadne</translation>
    </message>
    <message>
        <source>About Measuring Desk</source>
        <translation>O programe Measuring Desk</translation>
    </message>
    <message>
        <source>&lt;b&gt;Measuring Desk %1&lt;/b&gt;&lt;p&gt;Measures objects on images, and hosts plug-ins such as the statistics reports.&lt;/p&gt;&lt;p&gt;%2, MIT licence&lt;/p&gt;</source>
        <translation>&lt;b&gt;Measuring Desk %1&lt;/b&gt;&lt;p&gt;Meria objekty na obrázkoch a je základom pre zásuvné moduly, napríklad pre štatistické protokoly.&lt;/p&gt;&lt;p&gt;%2, licencia MIT&lt;/p&gt;</translation>
    </message>
    <message>
        <source>Measuring Desk</source>
        <translation>Measuring Desk</translation>
    </message>
    <message>
        <source>&amp;Edit</source>
        <translation>Úp&amp;ravy</translation>
    </message>
    <message>
        <source>&amp;Image</source>
        <translation>&amp;Obrázok</translation>
    </message>
    <message>
        <source>&amp;Measure</source>
        <translation>&amp;Meranie</translation>
    </message>
    <message>
        <source>Choose the image source</source>
        <translation>Vybrať zdroj obrazu</translation>
    </message>
</context>
<context>
    <name>KvDeskNotice</name>
    <message>
        <source>Close this message</source>
        <translation>Zavrieť túto správu</translation>
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
        <translation>Veličina</translation>
    </message>
    <message>
        <source>Value</source>
        <translation>Hodnota</translation>
    </message>
</context>
<context>
    <name>KvDeskObjectEditor</name>
    <message numerus="yes">
        <source>%n objects</source>
        <comment>several measured objects</comment>
        <extracomment>%n is 2 at least</extracomment>
        <translation>
            <numerusform>%n objekt</numerusform>
            <numerusform>%n objekty</numerusform>
            <numerusform>%n objektov</numerusform>
        </translation>
    </message>
    <message>
        <source>drawing of %1</source>
        <translation>kreslenie: %1</translation>
    </message>
    <message>
        <source>change of %1</source>
        <translation>zmenu: %1</translation>
    </message>
    <message>
        <source>move of %1</source>
        <translation>presun: %1</translation>
    </message>
    <message>
        <source>renaming of %1</source>
        <translation>premenovanie: %1</translation>
    </message>
    <message>
        <source>text of %1</source>
        <translation>zmenu textu: %1</translation>
    </message>
    <message>
        <source>showing of %1 of %2</source>
        <extracomment>%1 is a value, %2 an object</extracomment>
        <translation>zobrazenie hodnoty „%1“: %2</translation>
    </message>
    <message>
        <source>hiding of %1 of %2</source>
        <translation>skrytie hodnoty „%1“: %2</translation>
    </message>
    <message>
        <source>deletion of %1</source>
        <translation>odstránenie: %1</translation>
    </message>
    <message>
        <source>change of the calibration</source>
        <translation>zmenu kalibrácie</translation>
    </message>
    <message>
        <source>place of %1</source>
        <translation>pridanie značky: %1</translation>
    </message>
    <message>
        <source>deletion of a place of %1</source>
        <translation>odstránenie značky: %1</translation>
    </message>
    <message>
        <source>pasting of %1</source>
        <translation>prilepenie: %1</translation>
    </message>
    <message>
        <source>import of %1</source>
        <translation>import %1</translation>
    </message>
</context>
<context>
    <name>KvDeskPlugins</name>
    <message>
        <source>No plug-ins were found</source>
        <translation>Nenašli sa žiadne zásuvné moduly</translation>
    </message>
    <message>
        <source>It is no plug-in for this program</source>
        <translation>Nie je to zásuvný modul pre tento program</translation>
    </message>
    <message>
        <source>Its tools &quot;%1&quot; could not be started</source>
        <translation>Jeho nástroje „%1“ sa nepodarilo spustiť</translation>
    </message>
    <message>
        <source>Plug-in loaded: %1</source>
        <translation>Zásuvný modul načítaný: %1</translation>
    </message>
    <message>
        <source>Plug-in not loaded: %1: %2</source>
        <translation>Zásuvný modul nenačítaný: %1: %2</translation>
    </message>
    <message>
        <source>It failed: %1</source>
        <translation>Zlyhal: %1</translation>
    </message>
    <message>
        <source>It failed for a reason of its own</source>
        <translation>Zlyhal z neznámeho dôvodu</translation>
    </message>
</context>
<context>
    <name>KvDeskProgress</name>
    <message>
        <source>Cancel</source>
        <translation>Zrušiť</translation>
    </message>
    <message>
        <source>Leave everything as it was (Esc)</source>
        <translation>Nechať všetko tak, ako to bolo (Esc)</translation>
    </message>
    <message>
        <source>This can no longer be cancelled</source>
        <translation>Už sa to nedá zrušiť</translation>
    </message>
</context>
<context>
    <name>KvDeskRecovery</name>
    <message>
        <source>Untitled session</source>
        <translation>Relácia bez názvu</translation>
    </message>
    <message numerus="yes">
        <source>%1 (%n object(s))</source>
        <extracomment>%1 is the name of a session</extracomment>
        <translation>
            <numerusform>%1 (%n objekt)</numerusform>
            <numerusform>%1 (%n objekty)</numerusform>
            <numerusform>%1 (%n objektov)</numerusform>
        </translation>
    </message>
</context>
<context>
    <name>KvDeskRecoveryBar</name>
    <message>
        <source>Show other measurements that were not saved</source>
        <translation>Zobraziť ďalšie neuložené merania</translation>
    </message>
    <message>
        <source>Restore</source>
        <translation>Obnoviť</translation>
    </message>
    <message>
        <source>Open these measurements as a session with unsaved changes</source>
        <translation>Otvoriť tieto merania ako reláciu s neuloženými zmenami</translation>
    </message>
    <message>
        <source>Discard</source>
        <translation>Zahodiť</translation>
    </message>
    <message>
        <source>Delete these measurements for good</source>
        <translation>Natrvalo odstrániť tieto merania</translation>
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
            <numerusform>%n ďalšie</numerusform>
            <numerusform>%n ďalšie</numerusform>
            <numerusform>%n ďalších</numerusform>
        </translation>
    </message>
    <message>
        <source>Measurements from %1 were not saved.</source>
        <translation>Merania (%1) neboli uložené.</translation>
    </message>
</context>
<context>
    <name>KvDeskRuler</name>
    <message>
        <source>Horizontal ruler</source>
        <translation>Vodorovné pravítko</translation>
    </message>
    <message>
        <source>Vertical ruler</source>
        <translation>Zvislé pravítko</translation>
    </message>
    <message>
        <source>Ruler in %1</source>
        <translation>Pravítko (%1)</translation>
    </message>
</context>
<context>
    <name>KvDeskSelectionStatistics</name>
    <message>
        <source>n = %1, mean %2, SD %3, min %4, max %5</source>
        <extracomment>number of values, their mean, standard deviation, smallest and largest one</extracomment>
        <translation>n = %1, str. hodnota %2, sm. odch. %3, min. %4, max. %5</translation>
    </message>
    <message>
        <source>Selected values: %1</source>
        <translation>Vybrané hodnoty: %1</translation>
    </message>
    <message>
        <source>Mean: %1</source>
        <translation>Stredná hodnota: %1</translation>
    </message>
    <message>
        <source>Standard deviation: %1</source>
        <translation>Smerodajná odchýlka: %1</translation>
    </message>
    <message>
        <source>Smallest: %1</source>
        <translation>Najmenšia: %1</translation>
    </message>
    <message>
        <source>Largest: %1</source>
        <translation>Najväčšia: %1</translation>
    </message>
</context>
<context>
    <name>KvDeskSession</name>
    <message>
        <source>Untitled session</source>
        <translation>Relácia bez názvu</translation>
    </message>
</context>
<context>
    <name>KvDeskSettingsDialog</name>
    <message>
        <source>Settings</source>
        <translation>Nastavenia</translation>
    </message>
    <message>
        <source>Appearance</source>
        <translation>Vzhľad</translation>
    </message>
    <message>
        <source>Theme</source>
        <translation>Motív</translation>
    </message>
    <message>
        <source>Dark</source>
        <translation>Tmavý</translation>
    </message>
    <message>
        <source>Light</source>
        <translation>Svetlý</translation>
    </message>
    <message>
        <source>Language</source>
        <translation>Jazyk</translation>
    </message>
    <message>
        <source>Another language takes effect when the program is started again.</source>
        <translation>Zmena jazyka sa prejaví po opätovnom spustení programu.</translation>
    </message>
    <message>
        <source>Measured values</source>
        <translation>Namerané hodnoty</translation>
    </message>
    <message>
        <source>Automatic</source>
        <translation>Automaticky</translation>
    </message>
    <message>
        <source>Significant digits</source>
        <translation>Platné číslice</translation>
    </message>
    <message>
        <source>Length unit</source>
        <translation>Jednotka dĺžky</translation>
    </message>
    <message>
        <source>Angle unit</source>
        <translation>Jednotka uhla</translation>
    </message>
    <message>
        <source>Degrees (°)</source>
        <translation>Stupne (°)</translation>
    </message>
    <message>
        <source>Radians (rad)</source>
        <translation>Radiány (rad)</translation>
    </message>
    <message>
        <source>System default</source>
        <translation>Podľa systému</translation>
    </message>
    <message>
        <source>Nothing was changed yet</source>
        <translation>Zatiaľ sa nič nezmenilo</translation>
    </message>
</context>
<context>
    <name>KvDeskSnapshotFile</name>
    <message>
        <source>The folder cannot be created</source>
        <translation>Priečinok sa nedá vytvoriť</translation>
    </message>
    <message>
        <source>The picture cannot be encoded</source>
        <translation>Obrázok sa nedá zakódovať</translation>
    </message>
</context>
<context>
    <name>KvDeskSnapshots</name>
    <message>
        <source>Open an image first</source>
        <translation>Najprv otvorte obrázok</translation>
    </message>
    <message>
        <source>No snapshot was taken: earlier ones are still being saved</source>
        <translation>Snímka nebola vytvorená: predchádzajúce sa ešte ukladajú</translation>
    </message>
    <message>
        <source>Snapshot saved: %1</source>
        <translation>Snímka uložená: %1</translation>
    </message>
    <message>
        <source>The snapshot was not saved. %1</source>
        <translation>Snímka sa neuložila. %1</translation>
    </message>
</context>
<context>
    <name>KvDeskSourceCommands</name>
    <message>
        <source>The image source &quot;%1&quot; was not opened.</source>
        <translation>Zdroj obrazu „%1“ sa neotvoril.</translation>
    </message>
    <message>
        <source>Image source: %1</source>
        <translation>Zdroj obrazu: %1</translation>
    </message>
    <message>
        <source>Open image folder</source>
        <translation>Otvoriť priečinok s obrázkami</translation>
    </message>
    <message>
        <source>Open video</source>
        <translation>Otvoriť video</translation>
    </message>
    <message>
        <source>Videos</source>
        <translation>Videá</translation>
    </message>
</context>
<context>
    <name>KvDeskSourceMenu</name>
    <message>
        <source>Image &amp;source</source>
        <translation>&amp;Zdroj obrazu</translation>
    </message>
    <message>
        <source>Still &amp;image...</source>
        <translation>Statický &amp;obrázok...</translation>
    </message>
    <message>
        <source>Image &amp;folder...</source>
        <translation>&amp;Priečinok s obrázkami...</translation>
    </message>
    <message>
        <source>Play the images of a folder like a camera</source>
        <translation>Prehrávať obrázky z priečinka ako z kamery</translation>
    </message>
    <message>
        <source>&amp;Video...</source>
        <translation>&amp;Video...</translation>
    </message>
    <message>
        <source>Play a video like a camera</source>
        <translation>Prehrávať video ako z kamery</translation>
    </message>
    <message>
        <source>Looking for cameras...</source>
        <translation>Hľadajú sa kamery...</translation>
    </message>
    <message>
        <source>No camera is connected</source>
        <translation>Nie je pripojená žiadna kamera</translation>
    </message>
</context>
<context>
    <name>KvDeskStartPage</name>
    <message>
        <source>From an image to a report</source>
        <translation>Od obrázka k protokolu</translation>
    </message>
    <message>
        <source>Back to the image</source>
        <translation>Späť k obrázku</translation>
    </message>
    <message>
        <source>%1 (%2)</source>
        <comment>command (shortcut)</comment>
        <translation>%1 (%2)</translation>
    </message>
    <message>
        <source>Open an image</source>
        <translation>Otvoriť obrázok</translation>
    </message>
    <message>
        <source>A picture file, or the live image of a camera.</source>
        <translation>Súbor s obrázkom alebo živý obraz z kamery.</translation>
    </message>
    <message>
        <source>Choose a camera or another source</source>
        <translation>Vybrať kameru alebo iný zdroj</translation>
    </message>
    <message>
        <source>Calibrate</source>
        <translation>Kalibrovať</translation>
    </message>
    <message>
        <source>Say how large a pixel is. The examples are calibrated already.</source>
        <translation>Určte, aký veľký je pixel. Príklady sú už kalibrované.</translation>
    </message>
    <message>
        <source>Measure and report</source>
        <translation>Merať a vytvoriť protokol</translation>
    </message>
    <message>
        <source>Drag a line over the image: its length is listed at once. The report panel makes a PDF of all values.</source>
        <translation>Potiahnite myšou úsečku cez obrázok: jej dĺžka sa hneď objaví v zozname. Panel protokolu vytvorí PDF so všetkými hodnotami.</translation>
    </message>
    <message>
        <source>Examples to try</source>
        <translation>Príklady na vyskúšanie</translation>
    </message>
    <message>
        <source>Recent sessions</source>
        <translation>Nedávne relácie</translation>
    </message>
    <message>
        <source>Open an image first</source>
        <translation>Najprv otvorte obrázok</translation>
    </message>
    <message>
        <source>Open a copy of this example</source>
        <translation>Otvoriť kópiu tohto príkladu</translation>
    </message>
</context>
<context>
    <name>KvDeskStatus</name>
    <message>
        <source>Warning</source>
        <translation>Upozornenie</translation>
    </message>
    <message>
        <source>Error</source>
        <translation>Chyba</translation>
    </message>
    <message>
        <source>Information</source>
        <translation>Informácia</translation>
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
        <translation>Štatistika vybraných hodnôt</translation>
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
        <translation>Denník správ</translation>
    </message>
    <message>
        <source>Hide the status log</source>
        <translation>Skryť denník správ</translation>
    </message>
    <message>
        <source>Clear the status log</source>
        <translation>Vymazať denník správ</translation>
    </message>
    <message>
        <source>Messages of the program and its plug-ins appear here</source>
        <translation>Tu sa zobrazujú správy programu a jeho zásuvných modulov</translation>
    </message>
    <message>
        <source>There are no messages</source>
        <translation>Nie sú žiadne správy</translation>
    </message>
</context>
<context>
    <name>KvDeskStatusLogModel</name>
    <message>
        <source>%1
Reported by %2</source>
        <comment>message, source</comment>
        <translation>%1
Ohlásil: %2</translation>
    </message>
    <message>
        <source>Category</source>
        <translation>Kategória</translation>
    </message>
    <message>
        <source>Time</source>
        <translation>Čas</translation>
    </message>
    <message>
        <source>Message</source>
        <translation>Správa</translation>
    </message>
</context>
<context>
    <name>KvDeskTableView</name>
    <message>
        <source>Copy</source>
        <translation>Kopírovať</translation>
    </message>
</context>
<context>
    <name>KvDeskToolStrip</name>
    <message>
        <source>Measuring tools</source>
        <translation>Meracie nástroje</translation>
    </message>
</context>
<context>
    <name>KvDeskTypedPixelSize</name>
    <message>
        <source>Width of a pixel in micrometres</source>
        <translation>Šírka pixela v mikrometroch</translation>
    </message>
    <message>
        <source>Height of a pixel in micrometres</source>
        <translation>Výška pixela v mikrometroch</translation>
    </message>
    <message>
        <source>Same size in both directions</source>
        <translation>Rovnaká veľkosť v oboch smeroch</translation>
    </message>
    <message>
        <source>Width</source>
        <translation>Šírka</translation>
    </message>
    <message>
        <source>Height</source>
        <translation>Výška</translation>
    </message>
    <message>
        <source>Type how large a pixel of the image is in reality.</source>
        <translation>Zadajte, aký veľký je pixel obrázka v skutočnosti.</translation>
    </message>
</context>
<context>
    <name>KvDeskValueCommands</name>
    <message>
        <source>Rename</source>
        <translation>Premenovať</translation>
    </message>
    <message>
        <source>Delete object</source>
        <translation>Odstrániť objekt</translation>
    </message>
    <message>
        <source>Hide value</source>
        <translation>Skryť hodnotu</translation>
    </message>
    <message>
        <source>Show all values of the object</source>
        <translation>Zobraziť všetky hodnoty objektu</translation>
    </message>
    <message>
        <source>Select one object first</source>
        <translation>Najprv vyberte jeden objekt</translation>
    </message>
    <message>
        <source>Select an object first</source>
        <translation>Najprv vyberte objekt</translation>
    </message>
    <message>
        <source>Select a value first</source>
        <translation>Najprv vyberte hodnotu</translation>
    </message>
    <message>
        <source>No value of the selected object is hidden</source>
        <translation>Vybraný objekt nemá žiadnu skrytú hodnotu</translation>
    </message>
    <message>
        <source>showing of values</source>
        <translation>zobrazenie hodnôt</translation>
    </message>
    <message>
        <source>hiding of values</source>
        <translation>skrytie hodnôt</translation>
    </message>
</context>
<context>
    <name>KvDeskValueTable</name>
    <message>
        <source>Measured values</source>
        <translation>Namerané hodnoty</translation>
    </message>
    <message>
        <source>Hide the measured values</source>
        <translation>Skryť namerané hodnoty</translation>
    </message>
    <message>
        <source>Filter by type, object or value name</source>
        <translation>Filtrovať podľa typu, objektu alebo veličiny</translation>
    </message>
    <message>
        <source>Filter of the measured values</source>
        <translation>Filter nameraných hodnôt</translation>
    </message>
    <message>
        <source>Shows only rows that have all of these words</source>
        <translation>Zobrazí iba riadky, ktoré obsahujú všetky tieto slová</translation>
    </message>
    <message>
        <source>No measured value matches the filter</source>
        <translation>Filtru nezodpovedá žiadna nameraná hodnota</translation>
    </message>
    <message>
        <source>Clear the filter</source>
        <translation>Vymazať filter</translation>
    </message>
    <message>
        <source>%1 of %2</source>
        <extracomment>rows that match the filter, all rows</extracomment>
        <translation>%1 z %2</translation>
    </message>
    <message>
        <source>Measured values appear here once something is measured or imported</source>
        <translation>Namerané hodnoty sa tu objavia po meraní alebo importe</translation>
    </message>
    <message>
        <source>There are no measured values yet</source>
        <translation>Zatiaľ nie sú žiadne namerané hodnoty</translation>
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
        <translation>Veličina</translation>
    </message>
    <message>
        <source>Value</source>
        <translation>Hodnota</translation>
    </message>
</context>
<context>
    <name>KvToolBase</name>
    <message>
        <source>Reset</source>
        <translation>Resetovať</translation>
    </message>
    <message>
        <source>Reset to the default values</source>
        <translation>Obnoviť predvolené hodnoty</translation>
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
        <translation>Zrušiť</translation>
    </message>
    <message>
        <source>Apply</source>
        <translation>Použiť</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>Uložiť</translation>
    </message>
    <message>
        <source>Open</source>
        <translation>Otvoriť</translation>
    </message>
    <message>
        <source>Close</source>
        <translation>Zavrieť</translation>
    </message>
    <message>
        <source>Discard</source>
        <translation>Zahodiť</translation>
    </message>
    <message>
        <source>&amp;Yes</source>
        <translation>Án&amp;o</translation>
    </message>
    <message>
        <source>&amp;No</source>
        <translation>&amp;Nie</translation>
    </message>
</context>
<context>
    <name>ZtAppSettings</name>
    <message>
        <source>The settings could not be saved to %1. Check that the folder is writable.</source>
        <translation>Nastavenia sa nepodarilo uložiť do %1. Skontrolujte, či sa do priečinka dá zapisovať.</translation>
    </message>
    <message>
        <source>The settings file %1 cannot be read. Changes to the settings will not be kept.</source>
        <translation>Súbor s nastaveniami %1 sa nedá prečítať. Zmeny nastavení sa nezachovajú.</translation>
    </message>
    <message>
        <source>The settings file %1 is damaged. It was renamed to %2; all settings are back at their defaults.</source>
        <translation>Súbor s nastaveniami %1 je poškodený. Bol premenovaný na %2; všetky nastavenia majú opäť predvolené hodnoty.</translation>
    </message>
    <message>
        <source>The settings file %1 is damaged and could not be renamed to %2. Changes to the settings will not be kept.</source>
        <translation>Súbor s nastaveniami %1 je poškodený a nepodarilo sa ho premenovať na %2. Zmeny nastavení sa nezachovajú.</translation>
    </message>
</context>
<context>
    <name>ZtAravisSource</name>
    <message>
        <source>%1 is disconnected; its last picture stays</source>
        <translation>%1: odpojené; zostáva posledný obraz</translation>
    </message>
    <message>
        <source>%1 delivers pictures of a kind that cannot be shown</source>
        <translation>%1 posiela obraz vo formáte, ktorý sa nedá zobraziť</translation>
    </message>
    <message>
        <source>The camera does not take the setting (%1)</source>
        <translation>Kamera neprijala nastavenie (%1)</translation>
    </message>
    <message>
        <source>%1 cannot be opened (%2)</source>
        <translation>%1 sa nedá otvoriť (%2)</translation>
    </message>
</context>
<context>
    <name>ZtCalibrationStore</name>
    <message>
        <source>This is not a calibration</source>
        <translation>Toto nie je kalibrácia</translation>
    </message>
    <message>
        <source>A calibration in the settings is damaged and was left out (%1: %2)</source>
        <translation>Kalibrácia v nastaveniach je poškodená a bola vynechaná (%1: %2)</translation>
    </message>
</context>
<context>
    <name>ZtCsvReader</name>
    <message>
        <source>A quoted text does not end</source>
        <translation>Text v úvodzovkách nie je ukončený</translation>
    </message>
    <message>
        <source>There is text after a closing quote</source>
        <translation>Za zatváracou úvodzovkou je text</translation>
    </message>
    <message>
        <source>Reading was cancelled</source>
        <translation>Čítanie bolo zrušené</translation>
    </message>
</context>
<context>
    <name>ZtDrawnType</name>
    <message>
        <source>Rectangle</source>
        <translation>Obdĺžnik</translation>
    </message>
    <message>
        <source>Width</source>
        <translation>Šírka</translation>
    </message>
    <message>
        <source>Height</source>
        <translation>Výška</translation>
    </message>
    <message>
        <source>Area</source>
        <translation>Plocha</translation>
    </message>
    <message>
        <source>Line</source>
        <translation>Úsečka</translation>
    </message>
    <message>
        <source>Length</source>
        <translation>Dĺžka</translation>
    </message>
    <message>
        <source>Arc</source>
        <translation>Oblúk</translation>
    </message>
    <message>
        <source>Angle</source>
        <translation>Uhol</translation>
    </message>
    <message>
        <source>Arc length</source>
        <translation>Dĺžka oblúka</translation>
    </message>
    <message>
        <source>Polygon</source>
        <translation>Mnohouholník</translation>
    </message>
    <message>
        <source>Perimeter</source>
        <translation>Obvod</translation>
    </message>
    <message>
        <source>Polyline</source>
        <translation>Lomená čiara</translation>
    </message>
    <message>
        <source>Parallel distance</source>
        <translation>Vzdialenosť od priamky</translation>
    </message>
    <message>
        <source>Distance</source>
        <translation>Vzdialenosť</translation>
    </message>
    <message>
        <source>Text note</source>
        <translation>Textová poznámka</translation>
    </message>
    <message>
        <source>Scale bar</source>
        <translation>Mierka</translation>
    </message>
    <message>
        <source>Counter</source>
        <translation>Počítadlo</translation>
    </message>
    <message>
        <source>Count</source>
        <translation>Počet</translation>
    </message>
    <message>
        <source>Share</source>
        <translation>Podiel</translation>
    </message>
    <message>
        <source>Circle</source>
        <translation>Kružnica</translation>
    </message>
    <message>
        <source>Diameter</source>
        <translation>Priemer</translation>
    </message>
</context>
<context>
    <name>ZtFileFault</name>
    <message>
        <source>No such file or directory</source>
        <translation>adresár alebo súbor neexistuje</translation>
    </message>
    <message>
        <source>Permission denied</source>
        <translation>prístup odmietnutý</translation>
    </message>
    <message>
        <source>Is a directory</source>
        <translation>je adresár</translation>
    </message>
    <message>
        <source>Not a directory</source>
        <translation>nie je adresár</translation>
    </message>
    <message>
        <source>File name too long</source>
        <translation>meno súboru príliš dlhé</translation>
    </message>
    <message>
        <source>No space left on device</source>
        <translation>na zariadení už nie je žiadne miesto</translation>
    </message>
    <message>
        <source>Read-only file system</source>
        <translation>súborový systém dovoľuje len čítanie</translation>
    </message>
    <message>
        <source>Input/output error</source>
        <translation>chyba vstupu/výstupu</translation>
    </message>
</context>
<context>
    <name>ZtFrameSourceCatalogue</name>
    <message>
        <source>This program cannot play videos</source>
        <translation>Tento program nedokáže prehrávať videá</translation>
    </message>
    <message>
        <source>This program knows no cameras of this kind</source>
        <translation>Tento program nepozná kamery tohto druhu</translation>
    </message>
</context>
<context>
    <name>ZtImageFolderSource</name>
    <message>
        <source>%1: no picture of the folder can be shown</source>
        <translation>%1: z priečinka sa nedá zobraziť žiadny obrázok</translation>
    </message>
    <message>
        <source>The folder does not exist</source>
        <translation>Priečinok neexistuje</translation>
    </message>
    <message>
        <source>The folder cannot be read</source>
        <translation>Priečinok sa nedá prečítať</translation>
    </message>
    <message>
        <source>The folder holds no pictures</source>
        <translation>V priečinku nie sú žiadne obrázky</translation>
    </message>
</context>
<context>
    <name>ZtKernelImage</name>
    <message>
        <source>%1 delivers pictures again</source>
        <translation>%1 znova posiela obraz</translation>
    </message>
</context>
<context>
    <name>ZtLiveFrameSource</name>
    <message>
        <source>%1 has stopped delivering pictures; the last one stays</source>
        <translation>%1 už neposiela obraz; zostáva posledný</translation>
    </message>
</context>
<context>
    <name>ZtMeasureFormat</name>
    <message>
        <source>pcs</source>
        <translation>ks</translation>
    </message>
</context>
<context>
    <name>ZtSession</name>
    <message>
        <source>The file is empty</source>
        <translation>Súbor je prázdny</translation>
    </message>
    <message>
        <source>The file is not a session</source>
        <translation>Súbor nie je relácia</translation>
    </message>
    <message>
        <source>The file cannot be written (%1)</source>
        <translation>Do súboru sa nedá zapisovať (%1)</translation>
    </message>
    <message>
        <source>This must be a list</source>
        <translation>Tu musí byť zoznam</translation>
    </message>
    <message>
        <source>This must be a text</source>
        <translation>Tu musí byť text</translation>
    </message>
    <message>
        <source>This must be a whole number from 1</source>
        <translation>Tu musí byť celé číslo od 1</translation>
    </message>
    <message>
        <source>This must be a number</source>
        <translation>Tu musí byť číslo</translation>
    </message>
    <message>
        <source>This must be a number greater than 0</source>
        <translation>Tu musí byť číslo väčšie ako 0</translation>
    </message>
    <message>
        <source>Another object of this type has the same number</source>
        <translation>Iný objekt tohto typu má rovnaké číslo</translation>
    </message>
    <message>
        <source>This must be an object</source>
        <translation>Tu musí byť objekt</translation>
    </message>
    <message>
        <source>&quot;%1&quot; is not a type of objects</source>
        <translation>„%1“ nie je typ objektu</translation>
    </message>
    <message>
        <source>An object of type &quot;%1&quot; cannot have this number of points (%2)</source>
        <translation>Objekt typu „%1“ nemôže mať tento počet bodov (%2)</translation>
    </message>
    <message>
        <source>A point must be a list of two numbers between -1e9 and 1e9</source>
        <translation>Bod musí byť zoznam dvoch čísel od -1e9 do 1e9</translation>
    </message>
    <message>
        <source>This must be the name of a value</source>
        <translation>Tu musí byť názov veličiny</translation>
    </message>
    <message>
        <source>The type has no name</source>
        <translation>Typ nemá názov</translation>
    </message>
    <message>
        <source>A value must have a name of its own</source>
        <translation>Veličina musí mať vlastný názov</translation>
    </message>
    <message>
        <source>The numbers of the rows must rise</source>
        <translation>Čísla riadkov musia stúpať</translation>
    </message>
    <message>
        <source>A row must be a list of number, name and values</source>
        <translation>Riadok musí byť zoznam čísla, názvu a hodnôt</translation>
    </message>
    <message>
        <source>This must be a text or null</source>
        <translation>Tu musí byť text alebo null</translation>
    </message>
    <message>
        <source>This must be a list or an object</source>
        <translation>Tu musí byť zoznam alebo objekt</translation>
    </message>
    <message>
        <source>The table has no such value</source>
        <translation>Tabuľka nemá takú veličinu</translation>
    </message>
    <message>
        <source>This must be the text of a number</source>
        <translation>Tu musí byť text čísla</translation>
    </message>
    <message>
        <source>The unit does not fit that of the value</source>
        <translation>Jednotka nezodpovedá jednotke veličiny</translation>
    </message>
    <message>
        <source>The file is nested too deeply</source>
        <translation>Štruktúra súboru je príliš hlboko vnorená</translation>
    </message>
    <message>
        <source>The file is not valid JSON (%1)</source>
        <translation>Súbor nie je platný JSON (%1)</translation>
    </message>
    <message>
        <source>The file does not exist</source>
        <translation>Súbor neexistuje</translation>
    </message>
    <message>
        <source>This is a folder, not a file</source>
        <translation>Toto je priečinok, nie súbor</translation>
    </message>
    <message>
        <source>The file cannot be read (%1)</source>
        <translation>Súbor sa nedá prečítať (%1)</translation>
    </message>
    <message>
        <source>The file is too large for a session</source>
        <translation>Súbor je príliš veľký na reláciu</translation>
    </message>
    <message>
        <source>This must be a date such as 2026-01-31T12:00:00Z</source>
        <translation>Tu musí byť dátum v tvare 2026-01-31T12:00:00Z</translation>
    </message>
    <message>
        <source>This must be &quot;knownDistance&quot;, &quot;metadata&quot; or &quot;typed&quot;</source>
        <translation>Tu musí byť &quot;knownDistance&quot;, &quot;metadata&quot; alebo &quot;typed&quot;</translation>
    </message>
    <message>
        <source>The file is write-protected</source>
        <translation>Súbor je chránený proti zápisu</translation>
    </message>
    <message>
        <source>Writing was cancelled</source>
        <translation>Zápis bol zrušený</translation>
    </message>
    <message>
        <source>Reading was cancelled</source>
        <translation>Čítanie bolo zrušené</translation>
    </message>
    <message>
        <source>The session is of the newer version %1; this program reads versions up to %2</source>
        <translation>Relácia má novšiu verziu %1; tento program číta verzie po %2</translation>
    </message>
    <message>
        <source>Sessions of version %1 are not known; this program reads versions %2 to %3</source>
        <translation>Relácie verzie %1 nie sú známe; tento program číta verzie %2 až %3</translation>
    </message>
    <message>
        <source>This file is a table of values; import it</source>
        <translation>Tento súbor je tabuľka hodnôt; importujte ho</translation>
    </message>
</context>
<context>
    <name>ZtStillImageSource</name>
    <message>
        <source>The picture does not exist</source>
        <translation>Obrázok neexistuje</translation>
    </message>
    <message>
        <source>This is a folder, not a picture</source>
        <translation>Toto je priečinok, nie obrázok</translation>
    </message>
    <message>
        <source>The picture cannot be read</source>
        <translation>Obrázok sa nedá prečítať</translation>
    </message>
    <message>
        <source>The picture has %1 x %2 pixels, which is too many</source>
        <translation>Obrázok má %1 x %2 pixelov, čo je príliš veľa</translation>
    </message>
    <message>
        <source>The picture cannot be decoded (%1)</source>
        <translation>Obrázok sa nedá dekódovať (%1)</translation>
    </message>
    <message>
        <source>the file is empty</source>
        <translation>súbor je prázdny</translation>
    </message>
    <message>
        <source>it has no size</source>
        <translation>nemá veľkosť</translation>
    </message>
    <message>
        <source>the file is damaged</source>
        <translation>súbor je poškodený</translation>
    </message>
    <message>
        <source>the file is too short for its picture</source>
        <translation>súbor je na svoj obrázok príliš krátky</translation>
    </message>
    <message>
        <source>there is not enough memory</source>
        <translation>nie je dostatok pamäte</translation>
    </message>
</context>
<context>
    <name>ZtTableImport</name>
    <message>
        <source>&quot;%1&quot; already has a value &quot;%2&quot; in line %3</source>
        <translation>„%1“ už má veličinu „%2“ v riadku %3</translation>
    </message>
    <message>
        <source>The file does not exist</source>
        <translation>Súbor neexistuje</translation>
    </message>
    <message>
        <source>This is a folder, not a file</source>
        <translation>Toto je priečinok, nie súbor</translation>
    </message>
    <message>
        <source>The file cannot be read (%1)</source>
        <translation>Súbor sa nedá prečítať (%1)</translation>
    </message>
    <message>
        <source>The table is not open for reading</source>
        <translation>Tabuľka nie je otvorená na čítanie</translation>
    </message>
    <message>
        <source>The table has no rows</source>
        <translation>Tabuľka nemá žiadne riadky</translation>
    </message>
    <message>
        <source>The row and the header differ in their number of fields (%1 and %2)</source>
        <translation>Riadok a hlavička majú rôzny počet polí (%1 a %2)</translation>
    </message>
    <message>
        <source>%1 is not a finite number</source>
        <translation>%1 nie je konečné číslo</translation>
    </message>
    <message>
        <source>%1 is not a number</source>
        <translation>%1 nie je číslo</translation>
    </message>
    <message>
        <source>&quot;%1&quot; of &quot;%2&quot; is given in &quot;%3&quot; here, but in &quot;%4&quot; before</source>
        <translation>„%1“ pre „%2“ je tu uvedené v „%3“, ale predtým v „%4“</translation>
    </message>
    <message>
        <source>There is no column %1; the columns are %2</source>
        <translation>Stĺpec %1 neexistuje; stĺpce sú %2</translation>
    </message>
    <message>
        <source>Object</source>
        <translation>Objekt</translation>
    </message>
    <message>
        <source>There is no value %1 to give a unit; the values are %2</source>
        <translation>Neexistuje veličina %1, ktorej by sa dala priradiť jednotka; veličiny sú %2</translation>
    </message>
    <message>
        <source>The first line announces rows without values</source>
        <translation>Prvý riadok ohlasuje riadky bez hodnôt</translation>
    </message>
    <message>
        <source>There is no column %1; the columns of this table have no names</source>
        <translation>Stĺpec %1 neexistuje; stĺpce tejto tabuľky nemajú názvy</translation>
    </message>
    <message>
        <source>%1 is not the index of a class; they go from 0 to %2</source>
        <translation>%1 nie je index triedy; indexy sú od 0 do %2</translation>
    </message>
    <message>
        <source>Value %1</source>
        <translation>Veličina %1</translation>
    </message>
    <message>
        <source>The file is larger than %1 MB</source>
        <translation>Súbor je väčší ako %1 MB</translation>
    </message>
    <message>
        <source>The file is empty</source>
        <translation>Súbor je prázdny</translation>
    </message>
    <message>
        <source>The first line does not name the columns</source>
        <translation>Prvý riadok neuvádza názvy stĺpcov</translation>
    </message>
    <message>
        <source>Column %1 is not part of a list of values and was left out</source>
        <translation>Stĺpec %1 nie je súčasťou zoznamu hodnôt a bol vynechaný</translation>
    </message>
    <message>
        <source>Columns %1 are not part of a list of values and were left out</source>
        <translation>Stĺpce %1 nie sú súčasťou zoznamu hodnôt a boli vynechané</translation>
    </message>
    <message>
        <source>The value has no name</source>
        <translation>Hodnota nemá uvedenú veličinu</translation>
    </message>
    <message>
        <source>The row does not say which object it belongs to</source>
        <translation>Riadok neuvádza, ku ktorému objektu patrí</translation>
    </message>
    <message>
        <source>%1 is not a unit</source>
        <translation>%1 nie je jednotka</translation>
    </message>
    <message>
        <source>There is no column of numbers</source>
        <translation>Neexistuje stĺpec s číslami</translation>
    </message>
    <message>
        <source>Column %1</source>
        <translation>Stĺpec %1</translation>
    </message>
    <message>
        <source>Column %1 holds text and was left out</source>
        <translation>Stĺpec %1 obsahuje text a bol vynechaný</translation>
    </message>
    <message>
        <source>Columns %1 hold text and were left out</source>
        <translation>Stĺpce %1 obsahujú text a boli vynechané</translation>
    </message>
    <message>
        <source>Reading was cancelled</source>
        <translation>Čítanie bolo zrušené</translation>
    </message>
    <message numerus="yes">
        <source>The table has %n row(s), its first line announces %1</source>
        <translation>
            <numerusform>Tabuľka má %n riadok, ale jej prvý riadok ohlasuje %1</numerusform>
            <numerusform>Tabuľka má %n riadky, ale jej prvý riadok ohlasuje %1</numerusform>
            <numerusform>Tabuľka má %n riadkov, ale jej prvý riadok ohlasuje %1</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>The row has %n field(s) instead of %1</source>
        <translation>
            <numerusform>Riadok má %n pole namiesto %1</numerusform>
            <numerusform>Riadok má %n polia namiesto %1</numerusform>
            <numerusform>Riadok má %n polí namiesto %1</numerusform>
        </translation>
    </message>
    <message>
        <source>The records have too many different names</source>
        <translation>Záznamy majú priveľa rôznych názvov</translation>
    </message>
    <message>
        <source>This file is a session, not a table; open it</source>
        <translation>Tento súbor je relácia, nie tabuľka; otvorte ho</translation>
    </message>
    <message>
        <source>The file is neither a list of records nor an export of values</source>
        <translation>Súbor nie je ani zoznam záznamov, ani export hodnôt</translation>
    </message>
    <message>
        <source>This name comes twice</source>
        <translation>Tento názov sa vyskytuje dvakrát</translation>
    </message>
    <message>
        <source>This must be a text, a number or null</source>
        <translation>Tu musí byť text, číslo alebo null</translation>
    </message>
    <message>
        <source>The table is of version %1; this program reads version %2</source>
        <translation>Tabuľka má verziu %1; tento program číta verziu %2</translation>
    </message>
</context>
<context>
    <name>ZtTextDecoder</name>
    <message>
        <source>The file is not a text file: it holds a NUL character</source>
        <translation>Súbor nie je textový: obsahuje znak NUL</translation>
    </message>
    <message>
        <source>The file is not valid UTF-16 text</source>
        <translation>Súbor nie je platný text UTF-16</translation>
    </message>
    <message>
        <source>The text is not valid UTF-8</source>
        <translation>Text nie je platný UTF-8</translation>
    </message>
</context>
<context>
    <name>ZtUvcCameraSource</name>
    <message>
        <source>%1 is not connected</source>
        <translation>%1: nie je pripojené</translation>
    </message>
    <message>
        <source>%1 is disconnected or in use (%2)</source>
        <translation>%1: odpojené alebo sa používa (%2)</translation>
    </message>
</context>
<context>
    <name>ZtVideoFileSource</name>
    <message>
        <source>The video does not exist</source>
        <translation>Video neexistuje</translation>
    </message>
    <message>
        <source>The video cannot be read</source>
        <translation>Video sa nedá prečítať</translation>
    </message>
    <message>
        <source>The video is empty</source>
        <translation>Video je prázdne</translation>
    </message>
    <message>
        <source>there is only sound in it</source>
        <translation>obsahuje iba zvuk</translation>
    </message>
    <message>
        <source>The video %1 cannot be played (%2)</source>
        <translation>Video %1 sa nedá prehrať (%2)</translation>
    </message>
    <message>
        <source>the file is damaged</source>
        <translation>súbor je poškodený</translation>
    </message>
</context>
<context>
    <name>acss</name>
    <message>
        <source>The icon %1 is missing.</source>
        <translation>Chýba ikona %1.</translation>
    </message>
</context>
</TS>
