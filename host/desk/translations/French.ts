<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="fr_FR" sourcelanguage="en_US">
<context>
    <name>KvDeskActions</name>
    <message>
        <source>&amp;New session</source>
        <translation>&amp;Nouvelle session</translation>
    </message>
    <message>
        <source>Start an empty session</source>
        <translation>Commencer une session vide</translation>
    </message>
    <message>
        <source>Open &amp;image...</source>
        <translation>Ouvrir une &amp;image...</translation>
    </message>
    <message>
        <source>Open image</source>
        <translation>Ouvrir une image</translation>
    </message>
    <message>
        <source>&amp;Open session...</source>
        <translation>&amp;Ouvrir une session...</translation>
    </message>
    <message>
        <source>Open session</source>
        <translation>Ouvrir une session</translation>
    </message>
    <message>
        <source>Import &amp;table...</source>
        <translation>Importer un &amp;tableau...</translation>
    </message>
    <message>
        <source>Import table of measured values</source>
        <translation>Importer un tableau de valeurs mesurées</translation>
    </message>
    <message>
        <source>&amp;Save session</source>
        <translation>Enre&amp;gistrer la session</translation>
    </message>
    <message>
        <source>Save session</source>
        <translation>Enregistrer la session</translation>
    </message>
    <message>
        <source>Save session &amp;as...</source>
        <translation>Enregistrer la session &amp;sous...</translation>
    </message>
    <message>
        <source>Save session to another file</source>
        <translation>Enregistrer la session dans un autre fichier</translation>
    </message>
    <message>
        <source>&amp;Quit</source>
        <translation>&amp;Quitter</translation>
    </message>
    <message>
        <source>Quit the program</source>
        <translation>Quitter le programme</translation>
    </message>
    <message>
        <source>Zoom &amp;in</source>
        <translation>Zoom a&amp;vant</translation>
    </message>
    <message>
        <source>Zoom in</source>
        <translation>Zoom avant</translation>
    </message>
    <message>
        <source>Zoom &amp;out</source>
        <translation>Zoom a&amp;rrière</translation>
    </message>
    <message>
        <source>Zoom out</source>
        <translation>Zoom arrière</translation>
    </message>
    <message>
        <source>&amp;Fit to window</source>
        <translation>Ajuster à la &amp;fenêtre</translation>
    </message>
    <message>
        <source>Show the whole image</source>
        <translation>Afficher l’image entière</translation>
    </message>
    <message>
        <source>&amp;Actual size</source>
        <translation>&amp;Taille réelle</translation>
    </message>
    <message>
        <source>Show the image at 100 %</source>
        <translation>Afficher l’image à 100&#xa0;%</translation>
    </message>
    <message>
        <source>&amp;Measured values</source>
        <translation>Valeurs &amp;mesurées</translation>
    </message>
    <message>
        <source>Show or hide the measured values</source>
        <translation>Afficher ou masquer les valeurs mesurées</translation>
    </message>
    <message>
        <source>Stat&amp;us log</source>
        <translation>&amp;Journal d’état</translation>
    </message>
    <message>
        <source>Show or hide the status log</source>
        <translation>Afficher ou masquer le journal d’état</translation>
    </message>
    <message>
        <source>&amp;Dark or light theme</source>
        <translation>Thème &amp;sombre ou clair</translation>
    </message>
    <message>
        <source>Change between the dark and the light theme</source>
        <translation>Passer du thème sombre au thème clair et inversement</translation>
    </message>
    <message>
        <source>Settin&amp;gs...</source>
        <translation>&amp;Paramètres...</translation>
    </message>
    <message>
        <source>Settings</source>
        <translation>Paramètres</translation>
    </message>
    <message>
        <source>&amp;About Measuring Desk</source>
        <translation>À &amp;propos de Measuring Desk</translation>
    </message>
    <message>
        <source>About Measuring Desk</source>
        <translation>À propos de Measuring Desk</translation>
    </message>
    <message>
        <source>%1 (%2)</source>
        <comment>command (shortcut)</comment>
        <translation>%1 (%2)</translation>
    </message>
    <message>
        <source>&amp;Export measured values...</source>
        <translation>&amp;Exporter les valeurs mesurées...</translation>
    </message>
    <message>
        <source>Export measured values as a table</source>
        <translation>Exporter les valeurs mesurées sous forme de tableau</translation>
    </message>
    <message>
        <source>&amp;Undo</source>
        <translation>&amp;Annuler</translation>
    </message>
    <message>
        <source>Undo the last step</source>
        <translation>Annuler la dernière action</translation>
    </message>
    <message>
        <source>&amp;Redo</source>
        <translation>&amp;Rétablir</translation>
    </message>
    <message>
        <source>Redo what was undone</source>
        <translation>Rétablir l’action annulée</translation>
    </message>
    <message>
        <source>Cu&amp;t</source>
        <translation>Co&amp;uper</translation>
    </message>
    <message>
        <source>Cut the selected objects</source>
        <translation>Couper les objets sélectionnés</translation>
    </message>
    <message>
        <source>&amp;Copy</source>
        <translation>&amp;Copier</translation>
    </message>
    <message>
        <source>Copy the selected objects</source>
        <translation>Copier les objets sélectionnés</translation>
    </message>
    <message>
        <source>&amp;Paste</source>
        <translation>C&amp;oller</translation>
    </message>
    <message>
        <source>Paste copied objects</source>
        <translation>Coller les objets copiés</translation>
    </message>
    <message>
        <source>&amp;Delete</source>
        <translation>&amp;Supprimer</translation>
    </message>
    <message>
        <source>Delete the selected objects</source>
        <translation>Supprimer les objets sélectionnés</translation>
    </message>
    <message>
        <source>Select &amp;all</source>
        <translation>&amp;Tout sélectionner</translation>
    </message>
    <message>
        <source>Select all objects on the image</source>
        <translation>Sélectionner tous les objets de l’image</translation>
    </message>
    <message>
        <source>Re&amp;name</source>
        <translation>Re&amp;nommer</translation>
    </message>
    <message>
        <source>Give the selected object a name</source>
        <translation>Donner un nom à l’objet sélectionné</translation>
    </message>
    <message>
        <source>&amp;Find measured values</source>
        <translation>Rechercher des &amp;valeurs mesurées</translation>
    </message>
    <message>
        <source>Filter the measured values</source>
        <translation>Filtrer les valeurs mesurées</translation>
    </message>
    <message>
        <source>&amp;Select</source>
        <translation>&amp;Sélectionner</translation>
    </message>
    <message>
        <source>Select and change objects</source>
        <translation>Sélectionner et modifier des objets</translation>
    </message>
    <message>
        <source>&amp;Line</source>
        <translation>&amp;Ligne</translation>
    </message>
    <message>
        <source>Measure a length</source>
        <translation>Mesurer une longueur</translation>
    </message>
    <message>
        <source>&amp;Polyline</source>
        <translation>&amp;Polyligne</translation>
    </message>
    <message>
        <source>Measure the length of a way</source>
        <translation>Mesurer la longueur d’un tracé</translation>
    </message>
    <message>
        <source>Parallel &amp;distance</source>
        <translation>&amp;Distance parallèle</translation>
    </message>
    <message>
        <source>Measure the distance of a point from a line</source>
        <translation>Mesurer la distance d’un point à une ligne</translation>
    </message>
    <message>
        <source>&amp;Arc</source>
        <translation>&amp;Arc</translation>
    </message>
    <message>
        <source>Measure an arc through three points</source>
        <translation>Mesurer un arc passant par trois points</translation>
    </message>
    <message>
        <source>&amp;Circle</source>
        <translation>&amp;Cercle</translation>
    </message>
    <message>
        <source>Measure a circle</source>
        <translation>Mesurer un cercle</translation>
    </message>
    <message>
        <source>&amp;Rectangle</source>
        <translation>&amp;Rectangle</translation>
    </message>
    <message>
        <source>Measure a rectangle</source>
        <translation>Mesurer un rectangle</translation>
    </message>
    <message>
        <source>Poly&amp;gon</source>
        <translation>Poly&amp;gone</translation>
    </message>
    <message>
        <source>Measure the area of a polygon</source>
        <translation>Mesurer l’aire d’un polygone</translation>
    </message>
    <message>
        <source>Cou&amp;nter</source>
        <translation>Comp&amp;teur</translation>
    </message>
    <message>
        <source>Count by clicks</source>
        <translation>Compter par clics</translation>
    </message>
    <message>
        <source>&amp;Text note</source>
        <translation>&amp;Note de texte</translation>
    </message>
    <message>
        <source>Write on the image</source>
        <translation>Écrire sur l’image</translation>
    </message>
    <message>
        <source>Scale &amp;bar</source>
        <translation>&amp;Barre d’échelle</translation>
    </message>
    <message>
        <source>Draw a scale bar</source>
        <translation>Tracer une barre d’échelle</translation>
    </message>
    <message>
        <source>Cal&amp;ibration...</source>
        <translation>Étal&amp;onnage...</translation>
    </message>
    <message>
        <source>Say how large a pixel of the image is</source>
        <translation>Indiquer la taille d’un pixel de l’image</translation>
    </message>
    <message>
        <source>Use the file&apos;s pixel size</source>
        <translation>Utiliser la taille de pixel du fichier</translation>
    </message>
    <message>
        <source>Measure with the pixel size that the image&apos;s file states</source>
        <translation>Mesurer avec la taille de pixel indiquée par le fichier image</translation>
    </message>
    <message>
        <source>&amp;Take snapshot</source>
        <translation>&amp;Prendre un instantané</translation>
    </message>
    <message>
        <source>Save the image to the gallery</source>
        <translation>Enregistrer l’image dans la galerie</translation>
    </message>
    <message>
        <source>Snapshots &amp;with measurements</source>
        <translation>Instantanés avec &amp;mesures</translation>
    </message>
    <message>
        <source>Draw the measured objects on snapshots</source>
        <translation>Tracer les objets mesurés sur les instantanés</translation>
    </message>
    <message>
        <source>&amp;Freeze</source>
        <translation>&amp;Figer</translation>
    </message>
    <message>
        <source>Freeze the live image</source>
        <translation>Figer l’image en direct</translation>
    </message>
    <message>
        <source>&amp;Labels on the image</source>
        <translation>Éti&amp;quettes sur l’image</translation>
    </message>
    <message>
        <source>Show or hide the labels of objects</source>
        <translation>Afficher ou masquer les étiquettes des objets</translation>
    </message>
    <message>
        <source>&amp;Rulers</source>
        <translation>Règ&amp;les</translation>
    </message>
    <message>
        <source>Show or hide the rulers</source>
        <translation>Afficher ou masquer les règles</translation>
    </message>
    <message>
        <source>&amp;Scale bar on the image</source>
        <translation>&amp;Barre d’échelle sur l’image</translation>
    </message>
    <message>
        <source>Show or hide the scale bar, on reports, too</source>
        <translation>Afficher ou masquer la barre d’échelle, y compris dans les rapports</translation>
    </message>
    <message>
        <source>&amp;Gallery</source>
        <translation>&amp;Galerie</translation>
    </message>
    <message>
        <source>Show or hide the gallery</source>
        <translation>Afficher ou masquer la galerie</translation>
    </message>
    <message>
        <source>&amp;Start page</source>
        <translation>Page d’&amp;accueil</translation>
    </message>
    <message>
        <source>Show the first steps, the examples and the recent sessions</source>
        <translation>Afficher les premiers pas, les exemples et les sessions récentes</translation>
    </message>
    <message>
        <source>&amp;User guide</source>
        <translation>&amp;Guide de l’utilisateur</translation>
    </message>
    <message>
        <source>Read the user guide</source>
        <translation>Lire le guide de l’utilisateur</translation>
    </message>
</context>
<context>
    <name>KvDeskAutosave</name>
    <message>
        <source>the folder &quot;%1&quot; cannot be written</source>
        <translation>impossible d’écrire dans le dossier «&#xa0;%1&#xa0;»</translation>
    </message>
    <message>
        <source>Unsaved changes are not being copied: %1</source>
        <translation>Les modifications non enregistrées ne sont pas sauvegardées&#xa0;: %1</translation>
    </message>
</context>
<context>
    <name>KvDeskCalibrationCommands</name>
    <message>
        <source>The session measures with it already</source>
        <translation>La session mesure déjà avec celle-ci</translation>
    </message>
    <message>
        <source>The image&apos;s file does not state one</source>
        <translation>Le fichier image n’en indique pas</translation>
    </message>
</context>
<context>
    <name>KvDeskCalibrationDialog</name>
    <message>
        <source>Calibration</source>
        <translation>Étalonnage</translation>
    </message>
    <message>
        <source>Objective</source>
        <translation>Objectif</translation>
    </message>
    <message>
        <source>Choose an objective, or type the name of a new one</source>
        <translation>Choisissez un objectif ou saisissez le nom d’un nouveau</translation>
    </message>
    <message>
        <source>Such as 10x</source>
        <translation>P.&#xa0;ex. 10x</translation>
    </message>
    <message>
        <source>In use</source>
        <translation>Actuel</translation>
    </message>
    <message>
        <source>New calibration</source>
        <translation>Nouvel étalonnage</translation>
    </message>
    <message>
        <source>Known distance</source>
        <translation>Distance connue</translation>
    </message>
    <message>
        <source>Image file</source>
        <translation>Fichier image</translation>
    </message>
    <message>
        <source>Typed</source>
        <translation>Saisie</translation>
    </message>
    <message>
        <source>Name</source>
        <translation>Nom</translation>
    </message>
    <message>
        <source>Who</source>
        <translation>Opérateur</translation>
    </message>
    <message>
        <source>Note</source>
        <translation>Note</translation>
    </message>
    <message>
        <source>Calibrate</source>
        <translation>Étalonner</translation>
    </message>
    <message>
        <source>History of the objective</source>
        <translation>Historique de l’objectif</translation>
    </message>
    <message>
        <source>Calibrations of this objective appear here</source>
        <translation>Les étalonnages de cet objectif s’affichent ici</translation>
    </message>
    <message>
        <source>Use again</source>
        <translation>Réutiliser</translation>
    </message>
    <message>
        <source>Close</source>
        <translation>Fermer</translation>
    </message>
    <message>
        <source>New pixel size: %1</source>
        <translation>Nouvelle taille de pixel&#xa0;: %1</translation>
    </message>
    <message>
        <source>No pixel size yet</source>
        <translation>Pas encore de taille de pixel</translation>
    </message>
    <message>
        <source>Measure with this pixel size and remember it</source>
        <translation>Mesurer avec cette taille de pixel et la mémoriser</translation>
    </message>
    <message>
        <source>Complete the fields above first</source>
        <translation>Remplissez d’abord les champs ci-dessus</translation>
    </message>
    <message>
        <source>Measure with the selected calibration</source>
        <translation>Mesurer avec l’étalonnage sélectionné</translation>
    </message>
    <message>
        <source>Select a calibration in the table first</source>
        <translation>Sélectionnez d’abord un étalonnage dans le tableau</translation>
    </message>
</context>
<context>
    <name>KvDeskCalibrationHistory</name>
    <message>
        <source>Date</source>
        <translation>Date</translation>
    </message>
    <message>
        <source>Who</source>
        <translation>Opérateur</translation>
    </message>
    <message>
        <source>Pixel size</source>
        <translation>Taille de pixel</translation>
    </message>
    <message>
        <source>Origin</source>
        <translation>Origine</translation>
    </message>
    <message>
        <source>Name</source>
        <translation>Nom</translation>
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
        <translation>Distance connue</translation>
    </message>
    <message>
        <source>Image file</source>
        <translation>Fichier image</translation>
    </message>
    <message>
        <source>Typed</source>
        <translation>Saisie</translation>
    </message>
    <message>
        <source>Not calibrated</source>
        <translation>Non étalonné</translation>
    </message>
</context>
<context>
    <name>KvDeskCalibrationWay</name>
    <message>
        <source>Type a number such as 5.3 or 5,3</source>
        <translation>Saisissez un nombre tel que 5.3 ou 5,3</translation>
    </message>
    <message>
        <source>A pixel measures between %1 and %2</source>
        <translation>Un pixel mesure entre %1 et %2</translation>
    </message>
</context>
<context>
    <name>KvDeskCalibrator</name>
    <message>
        <source>%1 states pixels of %2; the session measures with %3</source>
        <translation>%1 indique une taille de pixel de %2&#xa0;; la session mesure avec %3</translation>
    </message>
    <message>
        <source>%1 states pixels of %2; the session measures in pixels</source>
        <translation>%1 indique une taille de pixel de %2&#xa0;; la session mesure en pixels</translation>
    </message>
    <message>
        <source>Calibrated: %1, %2 per pixel</source>
        <extracomment>%1 is an objective or a file, %2 the size of a pixel with its unit</extracomment>
        <translation>Étalonné&#xa0;: %1, %2 par pixel</translation>
    </message>
</context>
<context>
    <name>KvDeskCommandLine</name>
    <message>
        <source>There is no theme &quot;%1&quot;: use %2</source>
        <translation>Il n’existe pas de thème «&#xa0;%1&#xa0;»&#xa0;: utilisez %2</translation>
    </message>
    <message>
        <source> or </source>
        <translation> ou </translation>
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
        <translation>Utilisation&#xa0;: measuringdesk [OPTION...] [SESSION|IMAGE|TABLEAU|DOSSIER|VIDÉO...]
Mesure des objets sur des images et affiche leurs valeurs.

  --session FICHIER   ouvrir une session
  --image FICHIER     ouvrir une image
  --table FICHIER     importer un tableau de valeurs mesurées
  --theme Dark|Light  thème pour cette exécution
  --plugins DOSSIER   chercher aussi des plug-ins ici&#xa0;; répétable
  --help              afficher ce texte
  --version           afficher la version

La variable d’environnement STATREPORT_PLUGINS indique d’autres dossiers de plug-ins.
</translation>
    </message>
    <message>
        <source>%1 (measuringdesk --help tells more)</source>
        <translation>%1 (aide : measuringdesk --help)</translation>
    </message>
</context>
<context>
    <name>KvDeskCounterBar</name>
    <message>
        <source>Clicks count for</source>
        <translation>Clics comptés pour</translation>
    </message>
    <message>
        <source>The counter that gets the clicks (1 to 9)</source>
        <translation>Le compteur auquel les clics s’ajoutent (1 à 9)</translation>
    </message>
    <message>
        <source>Count another class</source>
        <translation>Compter une autre classe</translation>
    </message>
    <message>
        <source>A right click takes a place away</source>
        <translation>Un clic droit retire une marque</translation>
    </message>
    <message>
        <source>A new counter</source>
        <translation>Nouveau compteur</translation>
    </message>
</context>
<context>
    <name>KvDeskEditCommands</name>
    <message>
        <source>&amp;Undo %1</source>
        <extracomment>%1 is what is undone or redone, such as &quot;move of Line 3&quot;</extracomment>
        <translation>&amp;Annuler&#xa0;: %1</translation>
    </message>
    <message>
        <source>&amp;Undo</source>
        <translation>&amp;Annuler</translation>
    </message>
    <message>
        <source>&amp;Redo %1</source>
        <translation>&amp;Rétablir&#xa0;: %1</translation>
    </message>
    <message>
        <source>&amp;Redo</source>
        <translation>&amp;Rétablir</translation>
    </message>
    <message>
        <source>Nothing was done yet</source>
        <translation>Il n’y a encore rien à annuler</translation>
    </message>
    <message>
        <source>Nothing was undone</source>
        <translation>Il n’y a rien à rétablir</translation>
    </message>
    <message>
        <source>Select an object first</source>
        <translation>Sélectionnez d’abord un objet</translation>
    </message>
    <message>
        <source>Select one object first</source>
        <translation>Sélectionnez d’abord un seul objet</translation>
    </message>
    <message>
        <source>No measured objects were copied</source>
        <translation>Aucun objet mesuré n’a été copié</translation>
    </message>
    <message>
        <source>Finish or cancel what you have begun first</source>
        <translation>Terminez ou annulez d’abord ce que vous avez commencé</translation>
    </message>
</context>
<context>
    <name>KvDeskExamples</name>
    <message>
        <source>Coin: first length</source>
        <translation>Pièce&#xa0;: longueur</translation>
    </message>
    <message>
        <source>Plate: dimensions</source>
        <translation>Plaque&#xa0;: dimensions</translation>
    </message>
    <message>
        <source>Cells: counting</source>
        <translation>Cellules&#xa0;: comptage</translation>
    </message>
    <message>
        <source>Fibres: statistics</source>
        <translation>Fibres&#xa0;: statistiques</translation>
    </message>
</context>
<context>
    <name>KvDeskExportCommand</name>
    <message>
        <source>Nothing was measured yet</source>
        <translation>Rien n’a encore été mesuré</translation>
    </message>
    <message>
        <source>Measured values</source>
        <comment>file name</comment>
        <translation>Valeurs mesurées</translation>
    </message>
    <message>
        <source>JSON files</source>
        <translation>Fichiers JSON</translation>
    </message>
    <message>
        <source>CSV tables</source>
        <translation>Tableaux CSV</translation>
    </message>
    <message>
        <source>Export measured values</source>
        <translation>Exporter les valeurs mesurées</translation>
    </message>
    <message>
        <source>Export cancelled: %1</source>
        <translation>Exportation annulée&#xa0;: %1</translation>
    </message>
    <message>
        <source>The table &quot;%1&quot; was not written.</source>
        <translation>Le tableau «&#xa0;%1&#xa0;» n’a pas été écrit.</translation>
    </message>
    <message>
        <source>Measured values exported: %1</source>
        <translation>Valeurs mesurées exportées&#xa0;: %1</translation>
    </message>
    <message>
        <source>Exporting measured values</source>
        <translation>Exportation des valeurs mesurées</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Annuler</translation>
    </message>
</context>
<context>
    <name>KvDeskExportDialog</name>
    <message>
        <source>Export measured values</source>
        <translation>Exporter les valeurs mesurées</translation>
    </message>
    <message>
        <source>Table</source>
        <translation>Tableau</translation>
    </message>
    <message>
        <source>Numbers</source>
        <translation>Nombres</translation>
    </message>
    <message>
        <source>Byte order mark, for spreadsheets that do not expect UTF-8</source>
        <translation>Indicateur d’ordre des octets (BOM), pour les tableurs qui n’attendent pas l’UTF-8</translation>
    </message>
    <message>
        <source>Apostrophe before names that spreadsheets take for formulas</source>
        <translation>Apostrophe devant les noms que les tableurs prennent pour des formules</translation>
    </message>
    <message>
        <source>Changes names that begin with =, +, - or @: they are others when the table is imported again</source>
        <translation>Modifie les noms commençant par =, +, - ou @&#xa0;: ils seront différents si le tableau est réimporté</translation>
    </message>
    <message>
        <source>Export...</source>
        <translation>Exporter...</translation>
    </message>
    <message>
        <source>CSV, one row per value</source>
        <translation>CSV, une ligne par valeur</translation>
    </message>
    <message>
        <source>CSV, one row per object</source>
        <translation>CSV, une ligne par objet</translation>
    </message>
    <message>
        <source>JSON</source>
        <translation>JSON</translation>
    </message>
    <message>
        <source>1.5, commas between the fields</source>
        <translation>1.5, virgules entre les champs</translation>
    </message>
    <message>
        <source>1,5, semicolons between the fields (spreadsheets, %1)</source>
        <extracomment>%1 is the name of a language</extracomment>
        <translation>1,5, points-virgules entre les champs (tableurs, %1)</translation>
    </message>
    <message>
        <source>1.5, commas between the fields (spreadsheets, %1)</source>
        <translation>1.5, virgules entre les champs (tableurs, %1)</translation>
    </message>
    <message>
        <source>For statistics programs. Can be imported here again.</source>
        <translation>Pour les logiciels de statistiques. Peut être réimporté ici.</translation>
    </message>
    <message>
        <source>For spreadsheets. Headings name the units.</source>
        <translation>Pour les tableurs. Les en-têtes indiquent les unités.</translation>
    </message>
    <message>
        <source>For programs. Numbers always have a decimal point.</source>
        <translation>Pour les programmes. Les nombres ont toujours un point décimal.</translation>
    </message>
    <message>
        <source>No measured object is selected</source>
        <translation>Aucun objet mesuré n’est sélectionné</translation>
    </message>
    <message>
        <source>Concerns CSV tables only</source>
        <translation>Concerne uniquement les tableaux CSV</translation>
    </message>
    <message numerus="yes">
        <source>Only the selected object(s) (%n)</source>
        <translation>
            <numerusform>Uniquement l’objet sélectionné (%n)</numerusform>
            <numerusform>Uniquement les objets sélectionnés (%n)</numerusform>
        </translation>
    </message>
</context>
<context>
    <name>KvDeskExposureControl</name>
    <message>
        <source>E&amp;xposure</source>
        <translation>E&amp;xposition</translation>
    </message>
    <message>
        <source>Exposure time of the camera</source>
        <translation>Temps d’exposition de la caméra</translation>
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
        <translation>Sessions</translation>
    </message>
    <message>
        <source>All files</source>
        <translation>Tous les fichiers</translation>
    </message>
    <message>
        <source>Unsaved changes</source>
        <translation>Modifications non enregistrées</translation>
    </message>
    <message>
        <source>Save the changes to &quot;%1&quot;?</source>
        <translation>Enregistrer les modifications de «&#xa0;%1&#xa0;»&#xa0;?</translation>
    </message>
    <message>
        <source>The session &quot;%1&quot; was not opened.</source>
        <translation>La session «&#xa0;%1&#xa0;» n’a pas été ouverte.</translation>
    </message>
    <message>
        <source>Image missing</source>
        <translation>Image manquante</translation>
    </message>
    <message>
        <source>Open the session without its image?</source>
        <translation>Ouvrir la session sans son image&#xa0;?</translation>
    </message>
    <message>
        <source>The image &quot;%1&quot; was not opened.</source>
        <translation>L’image «&#xa0;%1&#xa0;» n’a pas été ouverte.</translation>
    </message>
    <message>
        <source>Image opened: %1</source>
        <translation>Image ouverte&#xa0;: %1</translation>
    </message>
    <message>
        <source>The table &quot;%1&quot; was not imported.</source>
        <translation>Le tableau «&#xa0;%1&#xa0;» n’a pas été importé.</translation>
    </message>
    <message>
        <source>%1: %2</source>
        <comment>file, remark</comment>
        <translation>%1&#xa0;: %2</translation>
    </message>
    <message>
        <source>The session &quot;%1&quot; was not saved.</source>
        <translation>La session «&#xa0;%1&#xa0;» n’a pas été enregistrée.</translation>
    </message>
    <message>
        <source>Session saved: %1</source>
        <translation>Session enregistrée&#xa0;: %1</translation>
    </message>
    <message>
        <source>Open session</source>
        <translation>Ouvrir une session</translation>
    </message>
    <message>
        <source>Open image</source>
        <translation>Ouvrir une image</translation>
    </message>
    <message>
        <source>Images</source>
        <translation>Images</translation>
    </message>
    <message>
        <source>Import table</source>
        <translation>Importer un tableau</translation>
    </message>
    <message>
        <source>Tables</source>
        <translation>Tableaux</translation>
    </message>
    <message>
        <source>Save session</source>
        <translation>Enregistrer la session</translation>
    </message>
    <message>
        <source>Measuring Desk</source>
        <translation>Measuring Desk</translation>
    </message>
    <message>
        <source>Only one session can be open; not opened: %1</source>
        <translation>Une seule session peut être ouverte&#xa0;; non ouverte&#xa0;: %1</translation>
    </message>
    <message>
        <source>Neither a session, an image nor a table: %1</source>
        <translation>Ni session, ni image, ni tableau&#xa0;: %1</translation>
    </message>
    <message>
        <source>There is not enough memory</source>
        <translation>Mémoire insuffisante</translation>
    </message>
    <message>
        <source>Opening &quot;%1&quot;</source>
        <translation>Ouverture de «&#xa0;%1&#xa0;»</translation>
    </message>
    <message>
        <source>The measurements were not restored.</source>
        <translation>Les mesures n’ont pas été restaurées.</translation>
    </message>
    <message>
        <source>Restoring measurements</source>
        <translation>Restauration des mesures</translation>
    </message>
    <message>
        <source>Importing &quot;%1&quot;</source>
        <translation>Importation de «&#xa0;%1&#xa0;»</translation>
    </message>
    <message>
        <source>Saving &quot;%1&quot;</source>
        <translation>Enregistrement de «&#xa0;%1&#xa0;»</translation>
    </message>
    <message>
        <source>Session changed by another program</source>
        <translation>Session modifiée par un autre programme</translation>
    </message>
    <message>
        <source>&quot;%1&quot; was changed by another program. Overwrite its changes?</source>
        <translation>«&#xa0;%1&#xa0;» a été modifiée par un autre programme. Écraser ces modifications&#xa0;?</translation>
    </message>
    <message>
        <source>Overwrite</source>
        <translation>Écraser</translation>
    </message>
    <message>
        <source>Save as...</source>
        <translation>Enregistrer sous...</translation>
    </message>
    <message numerus="yes">
        <source>%n files were not opened.</source>
        <extracomment>%n is 2 at least</extracomment>
        <translation>
            <numerusform>%n fichier n’a pas été ouvert.</numerusform>
            <numerusform>%n fichiers n’ont pas été ouverts.</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Session opened: %1 (%n object(s))</source>
        <translation>
            <numerusform>Session ouverte&#xa0;: %1 (%n objet)</numerusform>
            <numerusform>Session ouverte&#xa0;: %1 (%n objets)</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Measurements restored: %1 (%n object(s))</source>
        <translation>
            <numerusform>Mesures restaurées&#xa0;: %1 (%n objet)</numerusform>
            <numerusform>Mesures restaurées&#xa0;: %1 (%n objets)</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Table imported: %1 (%n object(s))</source>
        <translation>
            <numerusform>Tableau importé&#xa0;: %1 (%n objet)</numerusform>
            <numerusform>Tableau importé&#xa0;: %1 (%n objets)</numerusform>
        </translation>
    </message>
</context>
<context>
    <name>KvDeskFilePixelSize</name>
    <message>
        <source>%1 states pixels of %2.</source>
        <comment>file, size</comment>
        <translation>%1 indique une taille de pixel de %2.</translation>
    </message>
    <message>
        <source>The image&apos;s file does not state how large its pixels are.</source>
        <translation>Le fichier image n’indique pas la taille de ses pixels.</translation>
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
        <translation>Masquer la galerie</translation>
    </message>
    <message>
        <source>&amp;Open image</source>
        <translation>&amp;Ouvrir l’image</translation>
    </message>
    <message>
        <source>&amp;Show in folder</source>
        <translation>Afficher dans le &amp;dossier</translation>
    </message>
    <message>
        <source>&amp;Copy path</source>
        <translation>&amp;Copier le chemin</translation>
    </message>
    <message>
        <source>&amp;Move to trash...</source>
        <translation>Mettre à la cor&amp;beille...</translation>
    </message>
    <message>
        <source>Choose &amp;folder...</source>
        <translation>C&amp;hoisir un dossier...</translation>
    </message>
    <message>
        <source>Show the images of a folder</source>
        <translation>Afficher les images d’un dossier</translation>
    </message>
    <message>
        <source>Save s&amp;napshots in this folder</source>
        <translation>&amp;Enregistrer les instantanés dans ce dossier</translation>
    </message>
    <message>
        <source>Folder of the gallery</source>
        <translation>Dossier de la galerie</translation>
    </message>
    <message>
        <source>More commands of the gallery</source>
        <translation>Autres commandes de la galerie</translation>
    </message>
    <message>
        <source>Snapshots</source>
        <translation>Instantanés</translation>
    </message>
    <message>
        <source>Choose folder</source>
        <translation>Choisir un dossier</translation>
    </message>
    <message>
        <source>Snapshots are saved in %1</source>
        <translation>Les instantanés sont enregistrés dans %1</translation>
    </message>
    <message>
        <source>Snapshots (%1) and the images of a folder appear here; drag them onto report pages</source>
        <translation>Les instantanés (%1) et les images d’un dossier s’affichent ici&#xa0;; faites-les glisser sur les pages du rapport</translation>
    </message>
    <message>
        <source>There are no images in %1</source>
        <translation>Il n’y a pas d’image dans %1</translation>
    </message>
    <message>
        <source>The folder %1 does not exist</source>
        <translation>Le dossier %1 n’existe pas</translation>
    </message>
    <message>
        <source>Select an image first</source>
        <translation>Sélectionnez d’abord une image</translation>
    </message>
    <message>
        <source>Snapshots are saved in this folder already</source>
        <translation>Les instantanés sont déjà enregistrés dans ce dossier</translation>
    </message>
    <message>
        <source>Move &quot;%1&quot; to the trash?</source>
        <translation>Mettre «&#xa0;%1&#xa0;» à la corbeille&#xa0;?</translation>
    </message>
    <message>
        <source>Move to trash</source>
        <translation>Mettre à la corbeille</translation>
    </message>
    <message>
        <source>Moved to the trash: %1</source>
        <translation>Mis à la corbeille&#xa0;: %1</translation>
    </message>
    <message>
        <source>Not moved to the trash: %1</source>
        <translation>Non mis à la corbeille&#xa0;: %1</translation>
    </message>
    <message>
        <source>Measuring Desk</source>
        <translation>Measuring Desk</translation>
    </message>
    <message>
        <source>The files are still there. They are write-protected, or there is no trash for them.</source>
        <translation>Les fichiers sont toujours là. Ils sont protégés en écriture, ou il n’y a pas de corbeille pour eux.</translation>
    </message>
    <message numerus="yes">
        <source>Move %n selected image(s) to the trash?</source>
        <translation>
            <numerusform>Mettre %n image sélectionnée à la corbeille&#xa0;?</numerusform>
            <numerusform>Mettre %n images sélectionnées à la corbeille&#xa0;?</numerusform>
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
        <translation>Le guide de l’utilisateur n’est pas installé</translation>
    </message>
</context>
<context>
    <name>KvDeskGuideWindow</name>
    <message>
        <source>User guide</source>
        <translation>Guide de l’utilisateur</translation>
    </message>
    <message>
        <source>Contents</source>
        <translation>Sommaire</translation>
    </message>
    <message>
        <source>Back</source>
        <translation>Précédent</translation>
    </message>
    <message>
        <source>Forward</source>
        <translation>Suivant</translation>
    </message>
    <message>
        <source>Find in the guide</source>
        <translation>Rechercher dans le guide</translation>
    </message>
    <message>
        <source>Find previous</source>
        <translation>Occurrence précédente</translation>
    </message>
    <message>
        <source>Find next</source>
        <translation>Occurrence suivante</translation>
    </message>
    <message>
        <source>This is the first place</source>
        <translation>C’est le premier endroit consulté</translation>
    </message>
    <message>
        <source>This is the last place</source>
        <translation>C’est le dernier endroit consulté</translation>
    </message>
    <message>
        <source>Not found</source>
        <translation>Introuvable</translation>
    </message>
    <message>
        <source>Type what to find first</source>
        <translation>Saisissez d’abord le texte à rechercher</translation>
    </message>
</context>
<context>
    <name>KvDeskImageView</name>
    <message>
        <source>Image</source>
        <translation>Image</translation>
    </message>
    <message>
        <source>Open an image or a session to start</source>
        <translation>Pour commencer, ouvrez une image ou une session</translation>
    </message>
</context>
<context>
    <name>KvDeskInlineEditor</name>
    <message>
        <source>Text</source>
        <translation>Texte</translation>
    </message>
    <message>
        <source>Name</source>
        <translation>Nom</translation>
    </message>
</context>
<context>
    <name>KvDeskKnownDistance</name>
    <message>
        <source>inch</source>
        <translation>pouce</translation>
    </message>
    <message>
        <source>Use selected line</source>
        <translation>Utiliser la sélection</translation>
    </message>
    <message>
        <source>Length of the line</source>
        <translation>Longueur de la ligne</translation>
    </message>
    <message>
        <source>Unit of the length</source>
        <translation>Unité de la longueur</translation>
    </message>
    <message>
        <source>Its length</source>
        <translation>Longueur réelle</translation>
    </message>
    <message>
        <source>Draw a line over a distance that you know, such as on a stage micrometer, and select it.</source>
        <translation>Tracez une ligne sur une distance que vous connaissez, par exemple sur un micromètre objet, et sélectionnez-la.</translation>
    </message>
    <message>
        <source>No line yet</source>
        <translation>Pas encore de ligne</translation>
    </message>
    <message>
        <source>%1: %2</source>
        <comment>name and length of a line</comment>
        <translation>%1&#xa0;: %2</translation>
    </message>
    <message>
        <source>Take the selected line as the known distance</source>
        <translation>Prendre la ligne sélectionnée comme distance connue</translation>
    </message>
    <message>
        <source>Select one line on the image first</source>
        <translation>Sélectionnez d’abord une seule ligne sur l’image</translation>
    </message>
</context>
<context>
    <name>KvDeskLiveBar</name>
    <message>
        <source>Live image</source>
        <translation>Image en direct</translation>
    </message>
    <message>
        <source>Freeze</source>
        <translation>Figer</translation>
    </message>
    <message>
        <source>%1 fps</source>
        <extracomment>frames per second</extracomment>
        <translation>%1&#xa0;i/s</translation>
    </message>
    <message>
        <source>%1 delivers no pictures any more; this is the last one</source>
        <translation>%1 ne fournit plus d’images&#xa0;; celle-ci est la dernière</translation>
    </message>
    <message>
        <source>%1 delivers no pictures</source>
        <translation>%1 ne fournit pas d’images</translation>
    </message>
    <message>
        <source>%1 is stopped</source>
        <translation>%1 est à l’arrêt</translation>
    </message>
    <message>
        <source>Waiting for the first picture of %1</source>
        <translation>En attente de la première image de %1</translation>
    </message>
    <message>
        <source>Frozen: %1</source>
        <translation>Image figée&#xa0;: %1</translation>
    </message>
    <message>
        <source>Live: %1</source>
        <translation>En direct&#xa0;: %1</translation>
    </message>
    <message>
        <source>This image is not live</source>
        <translation>Cette image n’est pas en direct</translation>
    </message>
    <message>
        <source>&amp;Reconnect</source>
        <translation>&amp;Reconnecter</translation>
    </message>
    <message>
        <source>&amp;Start</source>
        <translation>Démarr&amp;er</translation>
    </message>
    <message>
        <source>Frames per second
Dropped, because newer ones came first: %1</source>
        <translation>Images par seconde
Ignorées au profit de plus récentes&#xa0;: %1</translation>
    </message>
    <message>
        <source>Stop the live image; other programs can use the camera then</source>
        <translation>Arrêter l’image en direct&#xa0;; d’autres programmes pourront alors utiliser la caméra</translation>
    </message>
</context>
<context>
    <name>KvDeskMainWindow</name>
    <message>
        <source>&amp;File</source>
        <translation>&amp;Fichier</translation>
    </message>
    <message>
        <source>&amp;Recent sessions</source>
        <translation>Sessions &amp;récentes</translation>
    </message>
    <message>
        <source>&amp;View</source>
        <translation>Affic&amp;hage</translation>
    </message>
    <message>
        <source>&amp;Help</source>
        <translation>&amp;Aide</translation>
    </message>
    <message>
        <source>Main tool bar</source>
        <translation>Barre d’outils principale</translation>
    </message>
    <message>
        <source>%1[*] - Measuring Desk</source>
        <extracomment>%1 is the name of a session; [*] is replaced by a star when it has unsaved changes</extracomment>
        <translation>%1[*] – Measuring Desk</translation>
    </message>
    <message>
        <source>None yet</source>
        <translation>Aucune pour l’instant</translation>
    </message>
    <message>
        <source>About Measuring Desk</source>
        <translation>À propos de Measuring Desk</translation>
    </message>
    <message>
        <source>&lt;b&gt;Measuring Desk %1&lt;/b&gt;&lt;p&gt;Measures objects on images, and hosts plug-ins such as the statistics reports.&lt;/p&gt;&lt;p&gt;%2, MIT licence&lt;/p&gt;</source>
        <translation>&lt;b&gt;Measuring Desk %1&lt;/b&gt;&lt;p&gt;Mesure des objets sur des images et accueille des plug-ins tels que les rapports statistiques.&lt;/p&gt;&lt;p&gt;%2, licence MIT&lt;/p&gt;</translation>
    </message>
    <message>
        <source>Measuring Desk</source>
        <translation>Measuring Desk</translation>
    </message>
    <message>
        <source>&amp;Edit</source>
        <translation>É&amp;dition</translation>
    </message>
    <message>
        <source>&amp;Image</source>
        <translation>&amp;Image</translation>
    </message>
    <message>
        <source>&amp;Measure</source>
        <translation>&amp;Mesurer</translation>
    </message>
    <message>
        <source>Choose the image source</source>
        <translation>Choisir la source d’image</translation>
    </message>
</context>
<context>
    <name>KvDeskNotice</name>
    <message>
        <source>Close this message</source>
        <translation>Fermer ce message</translation>
    </message>
</context>
<context>
    <name>KvDeskObjectClipboard</name>
    <message>
        <source>Type</source>
        <translation>Type</translation>
    </message>
    <message>
        <source>Object</source>
        <translation>Objet</translation>
    </message>
    <message>
        <source>Value name</source>
        <translation>Grandeur</translation>
    </message>
    <message>
        <source>Value</source>
        <translation>Valeur</translation>
    </message>
</context>
<context>
    <name>KvDeskObjectEditor</name>
    <message numerus="yes">
        <source>%n objects</source>
        <comment>several measured objects</comment>
        <extracomment>%n is 2 at least</extracomment>
        <translation>
            <numerusform>%n objet</numerusform>
            <numerusform>%n objets</numerusform>
        </translation>
    </message>
    <message>
        <source>drawing of %1</source>
        <translation>tracer %1</translation>
    </message>
    <message>
        <source>change of %1</source>
        <translation>modifier %1</translation>
    </message>
    <message>
        <source>move of %1</source>
        <translation>déplacer %1</translation>
    </message>
    <message>
        <source>renaming of %1</source>
        <translation>renommer %1</translation>
    </message>
    <message>
        <source>text of %1</source>
        <translation>modifier le texte (%1)</translation>
    </message>
    <message>
        <source>showing of %1 of %2</source>
        <extracomment>%1 is a value, %2 an object</extracomment>
        <translation>afficher %1 (%2)</translation>
    </message>
    <message>
        <source>hiding of %1 of %2</source>
        <translation>masquer %1 (%2)</translation>
    </message>
    <message>
        <source>deletion of %1</source>
        <translation>supprimer %1</translation>
    </message>
    <message>
        <source>change of the calibration</source>
        <translation>modifier l’étalonnage</translation>
    </message>
    <message>
        <source>place of %1</source>
        <translation>ajouter une marque (%1)</translation>
    </message>
    <message>
        <source>deletion of a place of %1</source>
        <translation>supprimer une marque (%1)</translation>
    </message>
    <message>
        <source>pasting of %1</source>
        <translation>coller %1</translation>
    </message>
    <message>
        <source>import of %1</source>
        <translation>importation de %1</translation>
    </message>
</context>
<context>
    <name>KvDeskPlugins</name>
    <message>
        <source>No plug-ins were found</source>
        <translation>Aucun plug-in n’a été trouvé</translation>
    </message>
    <message>
        <source>It is no plug-in for this program</source>
        <translation>Ce n’est pas un plug-in pour ce programme</translation>
    </message>
    <message>
        <source>Its tools &quot;%1&quot; could not be started</source>
        <translation>Ses outils «&#xa0;%1&#xa0;» n’ont pas pu être démarrés</translation>
    </message>
    <message>
        <source>Plug-in loaded: %1</source>
        <translation>Plug-in chargé&#xa0;: %1</translation>
    </message>
    <message>
        <source>Plug-in not loaded: %1: %2</source>
        <translation>Plug-in non chargé&#xa0;: %1&#xa0;: %2</translation>
    </message>
    <message>
        <source>It failed: %1</source>
        <translation>Il a échoué&#xa0;: %1</translation>
    </message>
    <message>
        <source>It failed for a reason of its own</source>
        <translation>Il a échoué pour une raison inconnue</translation>
    </message>
</context>
<context>
    <name>KvDeskProgress</name>
    <message>
        <source>Cancel</source>
        <translation>Annuler</translation>
    </message>
    <message>
        <source>Leave everything as it was (Esc)</source>
        <translation>Tout laisser en l’état (Esc)</translation>
    </message>
    <message>
        <source>This can no longer be cancelled</source>
        <translation>Il n’est plus possible d’annuler</translation>
    </message>
</context>
<context>
    <name>KvDeskRecovery</name>
    <message>
        <source>Untitled session</source>
        <translation>Session sans titre</translation>
    </message>
    <message numerus="yes">
        <source>%1 (%n object(s))</source>
        <extracomment>%1 is the name of a session</extracomment>
        <translation>
            <numerusform>%1 (%n objet)</numerusform>
            <numerusform>%1 (%n objets)</numerusform>
        </translation>
    </message>
</context>
<context>
    <name>KvDeskRecoveryBar</name>
    <message>
        <source>Show other measurements that were not saved</source>
        <translation>Afficher d’autres mesures qui n’ont pas été enregistrées</translation>
    </message>
    <message>
        <source>Restore</source>
        <translation>Restaurer</translation>
    </message>
    <message>
        <source>Open these measurements as a session with unsaved changes</source>
        <translation>Ouvrir ces mesures comme session avec des modifications non enregistrées</translation>
    </message>
    <message>
        <source>Discard</source>
        <translation>Supprimer</translation>
    </message>
    <message>
        <source>Delete these measurements for good</source>
        <translation>Supprimer définitivement ces mesures</translation>
    </message>
    <message>
        <source>%1: %2</source>
        <extracomment>%1 is a time, %2 a session</extracomment>
        <translation>%1&#xa0;: %2</translation>
    </message>
    <message numerus="yes">
        <source>%n more</source>
        <comment>measurements that were not saved</comment>
        <translation>
            <numerusform>%n autre</numerusform>
            <numerusform>%n autres</numerusform>
        </translation>
    </message>
    <message>
        <source>Measurements from %1 were not saved.</source>
        <translation>Les mesures (%1) n’ont pas été enregistrées.</translation>
    </message>
</context>
<context>
    <name>KvDeskRuler</name>
    <message>
        <source>Horizontal ruler</source>
        <translation>Règle horizontale</translation>
    </message>
    <message>
        <source>Vertical ruler</source>
        <translation>Règle verticale</translation>
    </message>
    <message>
        <source>Ruler in %1</source>
        <translation>Règle en %1</translation>
    </message>
</context>
<context>
    <name>KvDeskSelectionStatistics</name>
    <message>
        <source>n = %1, mean %2, SD %3, min %4, max %5</source>
        <extracomment>number of values, their mean, standard deviation, smallest and largest one</extracomment>
        <translation>n = %1, moyenne %2, ET %3, min %4, max %5</translation>
    </message>
    <message>
        <source>Selected values: %1</source>
        <translation>Valeurs sélectionnées&#xa0;: %1</translation>
    </message>
    <message>
        <source>Mean: %1</source>
        <translation>Moyenne&#xa0;: %1</translation>
    </message>
    <message>
        <source>Standard deviation: %1</source>
        <translation>Écart-type&#xa0;: %1</translation>
    </message>
    <message>
        <source>Smallest: %1</source>
        <translation>Minimum&#xa0;: %1</translation>
    </message>
    <message>
        <source>Largest: %1</source>
        <translation>Maximum&#xa0;: %1</translation>
    </message>
</context>
<context>
    <name>KvDeskSession</name>
    <message>
        <source>Untitled session</source>
        <translation>Session sans titre</translation>
    </message>
</context>
<context>
    <name>KvDeskSettingsDialog</name>
    <message>
        <source>Settings</source>
        <translation>Paramètres</translation>
    </message>
    <message>
        <source>Appearance</source>
        <translation>Apparence</translation>
    </message>
    <message>
        <source>Theme</source>
        <translation>Thème</translation>
    </message>
    <message>
        <source>Dark</source>
        <translation>Sombre</translation>
    </message>
    <message>
        <source>Light</source>
        <translation>Clair</translation>
    </message>
    <message>
        <source>Language</source>
        <translation>Langue</translation>
    </message>
    <message>
        <source>Another language takes effect when the program is started again.</source>
        <translation>Le changement de langue prend effet au redémarrage du programme.</translation>
    </message>
    <message>
        <source>Measured values</source>
        <translation>Valeurs mesurées</translation>
    </message>
    <message>
        <source>Automatic</source>
        <translation>Automatique</translation>
    </message>
    <message>
        <source>Significant digits</source>
        <translation>Chiffres significatifs</translation>
    </message>
    <message>
        <source>Length unit</source>
        <translation>Unité de longueur</translation>
    </message>
    <message>
        <source>Angle unit</source>
        <translation>Unité d’angle</translation>
    </message>
    <message>
        <source>Degrees (°)</source>
        <translation>Degrés (°)</translation>
    </message>
    <message>
        <source>Radians (rad)</source>
        <translation>Radians (rad)</translation>
    </message>
    <message>
        <source>System default</source>
        <translation>Langue du système</translation>
    </message>
    <message>
        <source>Nothing was changed yet</source>
        <translation>Rien n’a encore été modifié</translation>
    </message>
</context>
<context>
    <name>KvDeskSnapshotFile</name>
    <message>
        <source>The folder cannot be created</source>
        <translation>Impossible de créer le dossier</translation>
    </message>
    <message>
        <source>The picture cannot be encoded</source>
        <translation>Impossible d’encoder l’image</translation>
    </message>
</context>
<context>
    <name>KvDeskSnapshots</name>
    <message>
        <source>Open an image first</source>
        <translation>Ouvrez d’abord une image</translation>
    </message>
    <message>
        <source>No snapshot was taken: earlier ones are still being saved</source>
        <translation>Aucun instantané n’a été pris&#xa0;: les précédents sont encore en cours d’enregistrement</translation>
    </message>
    <message>
        <source>Snapshot saved: %1</source>
        <translation>Instantané enregistré&#xa0;: %1</translation>
    </message>
    <message>
        <source>The snapshot was not saved. %1</source>
        <translation>L’instantané n’a pas été enregistré. %1</translation>
    </message>
</context>
<context>
    <name>KvDeskSourceCommands</name>
    <message>
        <source>The image source &quot;%1&quot; was not opened.</source>
        <translation>La source d’image «&#xa0;%1&#xa0;» n’a pas été ouverte.</translation>
    </message>
    <message>
        <source>Image source: %1</source>
        <translation>Source d’image&#xa0;: %1</translation>
    </message>
    <message>
        <source>Open image folder</source>
        <translation>Ouvrir un dossier d’images</translation>
    </message>
    <message>
        <source>Open video</source>
        <translation>Ouvrir une vidéo</translation>
    </message>
    <message>
        <source>Videos</source>
        <translation>Vidéos</translation>
    </message>
</context>
<context>
    <name>KvDeskSourceMenu</name>
    <message>
        <source>Image &amp;source</source>
        <translation>&amp;Source d’image</translation>
    </message>
    <message>
        <source>Still &amp;image...</source>
        <translation>Image &amp;fixe...</translation>
    </message>
    <message>
        <source>Image &amp;folder...</source>
        <translation>&amp;Dossier d’images...</translation>
    </message>
    <message>
        <source>Play the images of a folder like a camera</source>
        <translation>Lire les images d’un dossier comme celles d’une caméra</translation>
    </message>
    <message>
        <source>&amp;Video...</source>
        <translation>&amp;Vidéo...</translation>
    </message>
    <message>
        <source>Play a video like a camera</source>
        <translation>Lire une vidéo comme les images d’une caméra</translation>
    </message>
    <message>
        <source>Looking for cameras...</source>
        <translation>Recherche de caméras...</translation>
    </message>
    <message>
        <source>No camera is connected</source>
        <translation>Aucune caméra n’est connectée</translation>
    </message>
</context>
<context>
    <name>KvDeskStartPage</name>
    <message>
        <source>From an image to a report</source>
        <translation>De l’image au rapport</translation>
    </message>
    <message>
        <source>Back to the image</source>
        <translation>Retour à l’image</translation>
    </message>
    <message>
        <source>%1 (%2)</source>
        <comment>command (shortcut)</comment>
        <translation>%1 (%2)</translation>
    </message>
    <message>
        <source>Open an image</source>
        <translation>Ouvrir une image</translation>
    </message>
    <message>
        <source>A picture file, or the live image of a camera.</source>
        <translation>Un fichier image ou l’image en direct d’une caméra.</translation>
    </message>
    <message>
        <source>Choose a camera or another source</source>
        <translation>Choisir une caméra ou une autre source</translation>
    </message>
    <message>
        <source>Calibrate</source>
        <translation>Étalonner</translation>
    </message>
    <message>
        <source>Say how large a pixel is. The examples are calibrated already.</source>
        <translation>Indiquez la taille d’un pixel. Les exemples sont déjà étalonnés.</translation>
    </message>
    <message>
        <source>Measure and report</source>
        <translation>Mesurer et créer un rapport</translation>
    </message>
    <message>
        <source>Drag a line over the image: its length is listed at once. The report panel makes a PDF of all values.</source>
        <translation>Tracez une ligne sur l’image en faisant glisser la souris&#xa0;: sa longueur s’affiche aussitôt dans la liste. Le panneau de rapport crée un PDF avec toutes les valeurs.</translation>
    </message>
    <message>
        <source>Examples to try</source>
        <translation>Exemples à essayer</translation>
    </message>
    <message>
        <source>Recent sessions</source>
        <translation>Sessions récentes</translation>
    </message>
    <message>
        <source>Open an image first</source>
        <translation>Ouvrez d’abord une image</translation>
    </message>
    <message>
        <source>Open a copy of this example</source>
        <translation>Ouvrir une copie de cet exemple</translation>
    </message>
</context>
<context>
    <name>KvDeskStatus</name>
    <message>
        <source>Warning</source>
        <translation>Avertissement</translation>
    </message>
    <message>
        <source>Error</source>
        <translation>Erreur</translation>
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
        <translation>Statistiques des valeurs sélectionnées</translation>
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
        <translation>Journal d’état</translation>
    </message>
    <message>
        <source>Hide the status log</source>
        <translation>Masquer le journal d’état</translation>
    </message>
    <message>
        <source>Clear the status log</source>
        <translation>Effacer le journal d’état</translation>
    </message>
    <message>
        <source>Messages of the program and its plug-ins appear here</source>
        <translation>Les messages du programme et de ses plug-ins s’affichent ici</translation>
    </message>
    <message>
        <source>There are no messages</source>
        <translation>Il n’y a aucun message</translation>
    </message>
</context>
<context>
    <name>KvDeskStatusLogModel</name>
    <message>
        <source>%1
Reported by %2</source>
        <comment>message, source</comment>
        <translation>%1
Signalé par %2</translation>
    </message>
    <message>
        <source>Category</source>
        <translation>Catégorie</translation>
    </message>
    <message>
        <source>Time</source>
        <translation>Heure</translation>
    </message>
    <message>
        <source>Message</source>
        <translation>Message</translation>
    </message>
</context>
<context>
    <name>KvDeskTableView</name>
    <message>
        <source>Copy</source>
        <translation>Copier</translation>
    </message>
</context>
<context>
    <name>KvDeskToolStrip</name>
    <message>
        <source>Measuring tools</source>
        <translation>Outils de mesure</translation>
    </message>
</context>
<context>
    <name>KvDeskTypedPixelSize</name>
    <message>
        <source>Width of a pixel in micrometres</source>
        <translation>Largeur d’un pixel en micromètres</translation>
    </message>
    <message>
        <source>Height of a pixel in micrometres</source>
        <translation>Hauteur d’un pixel en micromètres</translation>
    </message>
    <message>
        <source>Same size in both directions</source>
        <translation>Même taille dans les deux directions</translation>
    </message>
    <message>
        <source>Width</source>
        <translation>Largeur</translation>
    </message>
    <message>
        <source>Height</source>
        <translation>Hauteur</translation>
    </message>
    <message>
        <source>Type how large a pixel of the image is in reality.</source>
        <translation>Saisissez la taille réelle d’un pixel de l’image.</translation>
    </message>
</context>
<context>
    <name>KvDeskValueCommands</name>
    <message>
        <source>Rename</source>
        <translation>Renommer</translation>
    </message>
    <message>
        <source>Delete object</source>
        <translation>Supprimer l’objet</translation>
    </message>
    <message>
        <source>Hide value</source>
        <translation>Masquer la valeur</translation>
    </message>
    <message>
        <source>Show all values of the object</source>
        <translation>Afficher toutes les valeurs de l’objet</translation>
    </message>
    <message>
        <source>Select one object first</source>
        <translation>Sélectionnez d’abord un seul objet</translation>
    </message>
    <message>
        <source>Select an object first</source>
        <translation>Sélectionnez d’abord un objet</translation>
    </message>
    <message>
        <source>Select a value first</source>
        <translation>Sélectionnez d’abord une valeur</translation>
    </message>
    <message>
        <source>No value of the selected object is hidden</source>
        <translation>Aucune valeur de l’objet sélectionné n’est masquée</translation>
    </message>
    <message>
        <source>showing of values</source>
        <translation>afficher des valeurs</translation>
    </message>
    <message>
        <source>hiding of values</source>
        <translation>masquer des valeurs</translation>
    </message>
</context>
<context>
    <name>KvDeskValueTable</name>
    <message>
        <source>Measured values</source>
        <translation>Valeurs mesurées</translation>
    </message>
    <message>
        <source>Hide the measured values</source>
        <translation>Masquer les valeurs mesurées</translation>
    </message>
    <message>
        <source>Filter by type, object or value name</source>
        <translation>Filtrer par type, objet ou grandeur</translation>
    </message>
    <message>
        <source>Filter of the measured values</source>
        <translation>Filtre des valeurs mesurées</translation>
    </message>
    <message>
        <source>Shows only rows that have all of these words</source>
        <translation>N’affiche que les lignes qui contiennent tous ces mots</translation>
    </message>
    <message>
        <source>No measured value matches the filter</source>
        <translation>Aucune valeur mesurée ne correspond au filtre</translation>
    </message>
    <message>
        <source>Clear the filter</source>
        <translation>Effacer le filtre</translation>
    </message>
    <message>
        <source>%1 of %2</source>
        <extracomment>rows that match the filter, all rows</extracomment>
        <translation>%1 sur %2</translation>
    </message>
    <message>
        <source>Measured values appear here once something is measured or imported</source>
        <translation>Les valeurs mesurées s’affichent ici dès qu’une mesure est effectuée ou importée</translation>
    </message>
    <message>
        <source>There are no measured values yet</source>
        <translation>Il n’y a pas encore de valeurs mesurées</translation>
    </message>
</context>
<context>
    <name>KvDeskValueTableModel</name>
    <message>
        <source>Type</source>
        <translation>Type</translation>
    </message>
    <message>
        <source>Object</source>
        <translation>Objet</translation>
    </message>
    <message>
        <source>Value name</source>
        <translation>Grandeur</translation>
    </message>
    <message>
        <source>Value</source>
        <translation>Valeur</translation>
    </message>
</context>
<context>
    <name>KvToolBase</name>
    <message>
        <source>Reset</source>
        <translation>Réinitialiser</translation>
    </message>
    <message>
        <source>Reset to the default values</source>
        <translation>Rétablir les valeurs par défaut</translation>
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
        <translation>Annuler</translation>
    </message>
    <message>
        <source>Apply</source>
        <translation>Appliquer</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>Enregistrer</translation>
    </message>
    <message>
        <source>Open</source>
        <translation>Ouvrir</translation>
    </message>
    <message>
        <source>Close</source>
        <translation>Fermer</translation>
    </message>
    <message>
        <source>Discard</source>
        <translation>Ne pas enregistrer</translation>
    </message>
    <message>
        <source>&amp;Yes</source>
        <translation>&amp;Oui</translation>
    </message>
    <message>
        <source>&amp;No</source>
        <translation>&amp;Non</translation>
    </message>
</context>
<context>
    <name>ZtAppSettings</name>
    <message>
        <source>The settings could not be saved to %1. Check that the folder is writable.</source>
        <translation>Les paramètres n’ont pas pu être enregistrés dans %1. Vérifiez que le dossier est accessible en écriture.</translation>
    </message>
    <message>
        <source>The settings file %1 cannot be read. Changes to the settings will not be kept.</source>
        <translation>Impossible de lire le fichier de paramètres %1. Les modifications des paramètres ne seront pas conservées.</translation>
    </message>
    <message>
        <source>The settings file %1 is damaged. It was renamed to %2; all settings are back at their defaults.</source>
        <translation>Le fichier de paramètres %1 est endommagé. Il a été renommé en %2&#xa0;; tous les paramètres ont repris leur valeur par défaut.</translation>
    </message>
    <message>
        <source>The settings file %1 is damaged and could not be renamed to %2. Changes to the settings will not be kept.</source>
        <translation>Le fichier de paramètres %1 est endommagé et n’a pas pu être renommé en %2. Les modifications des paramètres ne seront pas conservées.</translation>
    </message>
</context>
<context>
    <name>ZtAravisSource</name>
    <message>
        <source>%1 is disconnected; its last picture stays</source>
        <translation>%1 est déconnectée&#xa0;; sa dernière image reste affichée</translation>
    </message>
    <message>
        <source>%1 delivers pictures of a kind that cannot be shown</source>
        <translation>%1 fournit des images d’un type qui ne peut pas être affiché</translation>
    </message>
    <message>
        <source>The camera does not take the setting (%1)</source>
        <translation>La caméra n’accepte pas le réglage (%1)</translation>
    </message>
    <message>
        <source>%1 cannot be opened (%2)</source>
        <translation>Impossible d’ouvrir %1 (%2)</translation>
    </message>
</context>
<context>
    <name>ZtCalibrationStore</name>
    <message>
        <source>This is not a calibration</source>
        <translation>Ceci n’est pas un étalonnage</translation>
    </message>
    <message>
        <source>A calibration in the settings is damaged and was left out (%1: %2)</source>
        <translation>Un étalonnage des paramètres est endommagé et a été ignoré (%1&#xa0;: %2)</translation>
    </message>
</context>
<context>
    <name>ZtCsvReader</name>
    <message>
        <source>A quoted text does not end</source>
        <translation>Un texte entre guillemets n’est pas terminé</translation>
    </message>
    <message>
        <source>There is text after a closing quote</source>
        <translation>Du texte suit un guillemet fermant</translation>
    </message>
    <message>
        <source>Reading was cancelled</source>
        <translation>La lecture a été annulée</translation>
    </message>
</context>
<context>
    <name>ZtDrawnType</name>
    <message>
        <source>Rectangle</source>
        <translation>Rectangle</translation>
    </message>
    <message>
        <source>Width</source>
        <translation>Largeur</translation>
    </message>
    <message>
        <source>Height</source>
        <translation>Hauteur</translation>
    </message>
    <message>
        <source>Area</source>
        <translation>Aire</translation>
    </message>
    <message>
        <source>Line</source>
        <translation>Ligne</translation>
    </message>
    <message>
        <source>Length</source>
        <translation>Longueur</translation>
    </message>
    <message>
        <source>Arc</source>
        <translation>Arc</translation>
    </message>
    <message>
        <source>Angle</source>
        <translation>Angle</translation>
    </message>
    <message>
        <source>Arc length</source>
        <translation>Longueur d’arc</translation>
    </message>
    <message>
        <source>Polygon</source>
        <translation>Polygone</translation>
    </message>
    <message>
        <source>Perimeter</source>
        <translation>Périmètre</translation>
    </message>
    <message>
        <source>Polyline</source>
        <translation>Polyligne</translation>
    </message>
    <message>
        <source>Parallel distance</source>
        <translation>Distance parallèle</translation>
    </message>
    <message>
        <source>Distance</source>
        <translation>Distance</translation>
    </message>
    <message>
        <source>Text note</source>
        <translation>Note de texte</translation>
    </message>
    <message>
        <source>Scale bar</source>
        <translation>Barre d’échelle</translation>
    </message>
    <message>
        <source>Counter</source>
        <translation>Compteur</translation>
    </message>
    <message>
        <source>Count</source>
        <translation>Nombre</translation>
    </message>
    <message>
        <source>Share</source>
        <translation>Part</translation>
    </message>
    <message>
        <source>Circle</source>
        <translation>Cercle</translation>
    </message>
    <message>
        <source>Diameter</source>
        <translation>Diamètre</translation>
    </message>
</context>
<context>
    <name>ZtFileFault</name>
    <message>
        <source>No such file or directory</source>
        <translation>aucun fichier ou dossier de ce type</translation>
    </message>
    <message>
        <source>Permission denied</source>
        <translation>permission non accordée</translation>
    </message>
    <message>
        <source>Is a directory</source>
        <translation>est un dossier</translation>
    </message>
    <message>
        <source>Not a directory</source>
        <translation>n’est pas un dossier</translation>
    </message>
    <message>
        <source>File name too long</source>
        <translation>nom de fichier trop long</translation>
    </message>
    <message>
        <source>No space left on device</source>
        <translation>aucun espace disponible sur le périphérique</translation>
    </message>
    <message>
        <source>Read-only file system</source>
        <translation>système de fichiers accessible en lecture seulement</translation>
    </message>
    <message>
        <source>Input/output error</source>
        <translation>erreur d’entrée/sortie</translation>
    </message>
</context>
<context>
    <name>ZtFrameSourceCatalogue</name>
    <message>
        <source>This program cannot play videos</source>
        <translation>Ce programme ne peut pas lire de vidéos</translation>
    </message>
    <message>
        <source>This program knows no cameras of this kind</source>
        <translation>Ce programme ne connaît pas de caméras de ce type</translation>
    </message>
</context>
<context>
    <name>ZtImageFolderSource</name>
    <message>
        <source>%1: no picture of the folder can be shown</source>
        <translation>%1&#xa0;: aucune image du dossier ne peut être affichée</translation>
    </message>
    <message>
        <source>The folder does not exist</source>
        <translation>Le dossier n’existe pas</translation>
    </message>
    <message>
        <source>The folder cannot be read</source>
        <translation>Impossible de lire le dossier</translation>
    </message>
    <message>
        <source>The folder holds no pictures</source>
        <translation>Le dossier ne contient pas d’images</translation>
    </message>
</context>
<context>
    <name>ZtKernelImage</name>
    <message>
        <source>%1 delivers pictures again</source>
        <translation>%1 fournit de nouveau des images</translation>
    </message>
</context>
<context>
    <name>ZtLiveFrameSource</name>
    <message>
        <source>%1 has stopped delivering pictures; the last one stays</source>
        <translation>%1 ne fournit plus d’images&#xa0;; la dernière reste affichée</translation>
    </message>
</context>
<context>
    <name>ZtMeasureFormat</name>
    <message>
        <source>pcs</source>
        <translation>pcs</translation>
    </message>
</context>
<context>
    <name>ZtSession</name>
    <message>
        <source>The file is empty</source>
        <translation>Le fichier est vide</translation>
    </message>
    <message>
        <source>The file is not a session</source>
        <translation>Le fichier n’est pas une session</translation>
    </message>
    <message>
        <source>The file cannot be written (%1)</source>
        <translation>Impossible d’écrire le fichier (%1)</translation>
    </message>
    <message>
        <source>This must be a list</source>
        <translation>Une liste est attendue ici</translation>
    </message>
    <message>
        <source>This must be a text</source>
        <translation>Un texte est attendu ici</translation>
    </message>
    <message>
        <source>This must be a whole number from 1</source>
        <translation>Un nombre entier supérieur ou égal à 1 est attendu ici</translation>
    </message>
    <message>
        <source>This must be a number</source>
        <translation>Un nombre est attendu ici</translation>
    </message>
    <message>
        <source>This must be a number greater than 0</source>
        <translation>Un nombre supérieur à 0 est attendu ici</translation>
    </message>
    <message>
        <source>Another object of this type has the same number</source>
        <translation>Un autre objet de ce type a le même numéro</translation>
    </message>
    <message>
        <source>This must be an object</source>
        <translation>Un objet est attendu ici</translation>
    </message>
    <message>
        <source>&quot;%1&quot; is not a type of objects</source>
        <translation>«&#xa0;%1&#xa0;» n’est pas un type d’objet</translation>
    </message>
    <message>
        <source>An object of type &quot;%1&quot; cannot have this number of points (%2)</source>
        <translation>Un objet de type «&#xa0;%1&#xa0;» ne peut pas avoir ce nombre de points (%2)</translation>
    </message>
    <message>
        <source>A point must be a list of two numbers between -1e9 and 1e9</source>
        <translation>Un point doit être une liste de deux nombres entre -1e9 et 1e9</translation>
    </message>
    <message>
        <source>This must be the name of a value</source>
        <translation>Le nom d’une valeur est attendu ici</translation>
    </message>
    <message>
        <source>The type has no name</source>
        <translation>Le type n’a pas de nom</translation>
    </message>
    <message>
        <source>A value must have a name of its own</source>
        <translation>Chaque valeur doit avoir un nom qui lui est propre</translation>
    </message>
    <message>
        <source>The numbers of the rows must rise</source>
        <translation>Les numéros des lignes doivent être croissants</translation>
    </message>
    <message>
        <source>A row must be a list of number, name and values</source>
        <translation>Une ligne doit être une liste composée d’un numéro, d’un nom et de valeurs</translation>
    </message>
    <message>
        <source>This must be a text or null</source>
        <translation>Un texte ou null est attendu ici</translation>
    </message>
    <message>
        <source>This must be a list or an object</source>
        <translation>Une liste ou un objet est attendu ici</translation>
    </message>
    <message>
        <source>The table has no such value</source>
        <translation>Le tableau ne contient pas cette valeur</translation>
    </message>
    <message>
        <source>This must be the text of a number</source>
        <translation>Un nombre sous forme de texte est attendu ici</translation>
    </message>
    <message>
        <source>The unit does not fit that of the value</source>
        <translation>L’unité n’est pas compatible avec celle de la valeur</translation>
    </message>
    <message>
        <source>The file is nested too deeply</source>
        <translation>Le fichier comporte trop de niveaux d’imbrication</translation>
    </message>
    <message>
        <source>The file is not valid JSON (%1)</source>
        <translation>Le fichier n’est pas du JSON valide (%1)</translation>
    </message>
    <message>
        <source>The file does not exist</source>
        <translation>Le fichier n’existe pas</translation>
    </message>
    <message>
        <source>This is a folder, not a file</source>
        <translation>C’est un dossier, pas un fichier</translation>
    </message>
    <message>
        <source>The file cannot be read (%1)</source>
        <translation>Impossible de lire le fichier (%1)</translation>
    </message>
    <message>
        <source>The file is too large for a session</source>
        <translation>Le fichier est trop volumineux pour une session</translation>
    </message>
    <message>
        <source>This must be a date such as 2026-01-31T12:00:00Z</source>
        <translation>Une date telle que 2026-01-31T12:00:00Z est attendue ici</translation>
    </message>
    <message>
        <source>This must be &quot;knownDistance&quot;, &quot;metadata&quot; or &quot;typed&quot;</source>
        <translation>&quot;knownDistance&quot;, &quot;metadata&quot; ou &quot;typed&quot; est attendu ici</translation>
    </message>
    <message>
        <source>The file is write-protected</source>
        <translation>Le fichier est protégé en écriture</translation>
    </message>
    <message>
        <source>Writing was cancelled</source>
        <translation>L’écriture a été annulée</translation>
    </message>
    <message>
        <source>Reading was cancelled</source>
        <translation>La lecture a été annulée</translation>
    </message>
    <message>
        <source>The session is of the newer version %1; this program reads versions up to %2</source>
        <translation>La session est dans la version %1, plus récente&#xa0;; ce programme lit les versions jusqu’à %2</translation>
    </message>
    <message>
        <source>Sessions of version %1 are not known; this program reads versions %2 to %3</source>
        <translation>Les sessions de version %1 ne sont pas connues&#xa0;; ce programme lit les versions %2 à %3</translation>
    </message>
    <message>
        <source>This file is a table of values; import it</source>
        <translation>Ce fichier est un tableau de valeurs ; importez-le</translation>
    </message>
</context>
<context>
    <name>ZtStillImageSource</name>
    <message>
        <source>The picture does not exist</source>
        <translation>L’image n’existe pas</translation>
    </message>
    <message>
        <source>This is a folder, not a picture</source>
        <translation>C’est un dossier, pas une image</translation>
    </message>
    <message>
        <source>The picture cannot be read</source>
        <translation>Impossible de lire l’image</translation>
    </message>
    <message>
        <source>The picture has %1 x %2 pixels, which is too many</source>
        <translation>L’image comporte %1 x %2 pixels, ce qui est trop</translation>
    </message>
    <message>
        <source>The picture cannot be decoded (%1)</source>
        <translation>Impossible de décoder l’image (%1)</translation>
    </message>
    <message>
        <source>the file is empty</source>
        <translation>le fichier est vide</translation>
    </message>
    <message>
        <source>it has no size</source>
        <translation>elle n’a pas de dimensions</translation>
    </message>
    <message>
        <source>the file is damaged</source>
        <translation>le fichier est endommagé</translation>
    </message>
    <message>
        <source>the file is too short for its picture</source>
        <translation>le fichier est trop court pour son image</translation>
    </message>
    <message>
        <source>there is not enough memory</source>
        <translation>mémoire insuffisante</translation>
    </message>
</context>
<context>
    <name>ZtTableImport</name>
    <message>
        <source>&quot;%1&quot; already has a value &quot;%2&quot; in line %3</source>
        <translation>«&#xa0;%1&#xa0;» a déjà une valeur «&#xa0;%2&#xa0;» à la ligne %3</translation>
    </message>
    <message>
        <source>The file does not exist</source>
        <translation>Le fichier n’existe pas</translation>
    </message>
    <message>
        <source>This is a folder, not a file</source>
        <translation>C’est un dossier, pas un fichier</translation>
    </message>
    <message>
        <source>The file cannot be read (%1)</source>
        <translation>Impossible de lire le fichier (%1)</translation>
    </message>
    <message>
        <source>The table is not open for reading</source>
        <translation>Le tableau n’est pas ouvert en lecture</translation>
    </message>
    <message>
        <source>The table has no rows</source>
        <translation>Le tableau n’a pas de lignes</translation>
    </message>
    <message>
        <source>The row and the header differ in their number of fields (%1 and %2)</source>
        <translation>La ligne et l’en-tête n’ont pas le même nombre de champs (%1 et %2)</translation>
    </message>
    <message>
        <source>%1 is not a finite number</source>
        <translation>%1 n’est pas un nombre fini</translation>
    </message>
    <message>
        <source>%1 is not a number</source>
        <translation>%1 n’est pas un nombre</translation>
    </message>
    <message>
        <source>&quot;%1&quot; of &quot;%2&quot; is given in &quot;%3&quot; here, but in &quot;%4&quot; before</source>
        <translation>«&#xa0;%1&#xa0;» de «&#xa0;%2&#xa0;» est en «&#xa0;%3&#xa0;» ici, mais en «&#xa0;%4&#xa0;» auparavant</translation>
    </message>
    <message>
        <source>There is no column %1; the columns are %2</source>
        <translation>Il n’y a pas de colonne %1&#xa0;; les colonnes sont %2</translation>
    </message>
    <message>
        <source>Object</source>
        <translation>Objet</translation>
    </message>
    <message>
        <source>There is no value %1 to give a unit; the values are %2</source>
        <translation>Il n’y a pas de valeur %1 à laquelle attribuer une unité&#xa0;; les valeurs sont %2</translation>
    </message>
    <message>
        <source>The first line announces rows without values</source>
        <translation>La première ligne annonce des lignes sans valeurs</translation>
    </message>
    <message>
        <source>There is no column %1; the columns of this table have no names</source>
        <translation>Il n’y a pas de colonne %1&#xa0;; les colonnes de ce tableau n’ont pas de nom</translation>
    </message>
    <message>
        <source>%1 is not the index of a class; they go from 0 to %2</source>
        <translation>%1 n’est pas l’indice d’une classe&#xa0;; les indices vont de 0 à %2</translation>
    </message>
    <message>
        <source>Value %1</source>
        <translation>Valeur %1</translation>
    </message>
    <message>
        <source>The file is larger than %1 MB</source>
        <translation>Le fichier dépasse %1&#xa0;Mo</translation>
    </message>
    <message>
        <source>The file is empty</source>
        <translation>Le fichier est vide</translation>
    </message>
    <message>
        <source>The first line does not name the columns</source>
        <translation>La première ligne n’indique pas le nom des colonnes</translation>
    </message>
    <message>
        <source>Column %1 is not part of a list of values and was left out</source>
        <translation>La colonne %1 ne fait pas partie d’une liste de valeurs et a été ignorée</translation>
    </message>
    <message>
        <source>Columns %1 are not part of a list of values and were left out</source>
        <translation>Les colonnes %1 ne font pas partie d’une liste de valeurs et ont été ignorées</translation>
    </message>
    <message>
        <source>The value has no name</source>
        <translation>La valeur n’a pas de nom</translation>
    </message>
    <message>
        <source>The row does not say which object it belongs to</source>
        <translation>La ligne n’indique pas à quel objet elle appartient</translation>
    </message>
    <message>
        <source>%1 is not a unit</source>
        <translation>%1 n’est pas une unité</translation>
    </message>
    <message>
        <source>There is no column of numbers</source>
        <translation>Il n’y a pas de colonne de nombres</translation>
    </message>
    <message>
        <source>Column %1</source>
        <translation>Colonne %1</translation>
    </message>
    <message>
        <source>Column %1 holds text and was left out</source>
        <translation>La colonne %1 contient du texte et a été ignorée</translation>
    </message>
    <message>
        <source>Columns %1 hold text and were left out</source>
        <translation>Les colonnes %1 contiennent du texte et ont été ignorées</translation>
    </message>
    <message>
        <source>Reading was cancelled</source>
        <translation>La lecture a été annulée</translation>
    </message>
    <message numerus="yes">
        <source>The table has %n row(s), its first line announces %1</source>
        <translation>
            <numerusform>Le tableau a %n ligne, sa première ligne en annonce %1</numerusform>
            <numerusform>Le tableau a %n lignes, sa première ligne en annonce %1</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>The row has %n field(s) instead of %1</source>
        <translation>
            <numerusform>La ligne a %n champ au lieu de %1</numerusform>
            <numerusform>La ligne a %n champs au lieu de %1</numerusform>
        </translation>
    </message>
    <message>
        <source>The records have too many different names</source>
        <translation>Les enregistrements ont trop de noms différents</translation>
    </message>
    <message>
        <source>This file is a session, not a table; open it</source>
        <translation>Ce fichier est une session, pas un tableau ; ouvrez-le</translation>
    </message>
    <message>
        <source>The file is neither a list of records nor an export of values</source>
        <translation>Le fichier n’est ni une liste d’enregistrements ni une exportation de valeurs</translation>
    </message>
    <message>
        <source>This name comes twice</source>
        <translation>Ce nom apparaît deux fois</translation>
    </message>
    <message>
        <source>This must be a text, a number or null</source>
        <translation>Il faut ici un texte, un nombre ou null</translation>
    </message>
    <message>
        <source>The table is of version %1; this program reads version %2</source>
        <translation>Le tableau est de version %1 ; ce programme lit la version %2</translation>
    </message>
</context>
<context>
    <name>ZtTextDecoder</name>
    <message>
        <source>The file is not a text file: it holds a NUL character</source>
        <translation>Le fichier n’est pas un fichier texte&#xa0;: il contient un caractère NUL</translation>
    </message>
    <message>
        <source>The file is not valid UTF-16 text</source>
        <translation>Le fichier n’est pas un texte UTF-16 valide</translation>
    </message>
    <message>
        <source>The text is not valid UTF-8</source>
        <translation>Le texte n’est pas de l’UTF-8 valide</translation>
    </message>
</context>
<context>
    <name>ZtUvcCameraSource</name>
    <message>
        <source>%1 is not connected</source>
        <translation>%1 n’est pas connectée</translation>
    </message>
    <message>
        <source>%1 is disconnected or in use (%2)</source>
        <translation>%1 est déconnectée ou déjà utilisée (%2)</translation>
    </message>
</context>
<context>
    <name>ZtVideoFileSource</name>
    <message>
        <source>The video does not exist</source>
        <translation>La vidéo n’existe pas</translation>
    </message>
    <message>
        <source>The video cannot be read</source>
        <translation>Impossible de lire la vidéo</translation>
    </message>
    <message>
        <source>The video is empty</source>
        <translation>La vidéo est vide</translation>
    </message>
    <message>
        <source>there is only sound in it</source>
        <translation>elle ne contient que du son</translation>
    </message>
    <message>
        <source>The video %1 cannot be played (%2)</source>
        <translation>Impossible de lire la vidéo %1 (%2)</translation>
    </message>
    <message>
        <source>the file is damaged</source>
        <translation>le fichier est endommagé</translation>
    </message>
</context>
<context>
    <name>acss</name>
    <message>
        <source>The icon %1 is missing.</source>
        <translation>L’icône %1 est manquante.</translation>
    </message>
</context>
</TS>
