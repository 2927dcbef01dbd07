<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="fr_FR" sourcelanguage="en_US">
<context>
    <name>GuiStatReportingPluginUi</name>
    <message>
        <source>Form</source>
        <translation>Formulaire</translation>
    </message>
    <message>
        <source>Open Templates Editor</source>
        <translation>Ouvrir l’éditeur de modèles</translation>
    </message>
    <message>
        <source>Opens Report Template Editor</source>
        <translation>Ouvre l’éditeur de modèles de rapport</translation>
    </message>
    <message>
        <source>Generate Report File</source>
        <translation>Générer le rapport</translation>
    </message>
    <message>
        <source>Exports current measurments to pdf file.</source>
        <translation>Exporte les mesures actuelles dans un fichier PDF.</translation>
    </message>
    <message>
        <source>Open Statistics Window</source>
        <translation>Ouvrir la fenêtre des statistiques</translation>
    </message>
    <message>
        <source>Template:</source>
        <translation>Modèle&#xa0;:</translation>
    </message>
    <message>
        <source>Browse Templates</source>
        <translation>Choisir un modèle</translation>
    </message>
    <message>
        <source>Opens default template for report generation</source>
        <translation>Ouvre le modèle à partir duquel les rapports sont générés</translation>
    </message>
</context>
<context>
    <name>KvAddImageDialog</name>
    <message>
        <source>Choose image file</source>
        <translation>Choisir un fichier image</translation>
    </message>
    <message>
        <source>Image file(*.png *.jpg *.gif *.tif *.bmp)</source>
        <translation>Fichier image (*.png *.jpg *.gif *.tif *.bmp)</translation>
    </message>
</context>
<context>
    <name>KvAddLinkDialogUi</name>
    <message>
        <source>Insert Link</source>
        <translation>Insérer un lien</translation>
    </message>
    <message>
        <source>Title:</source>
        <translation>Titre&#xa0;:</translation>
    </message>
    <message>
        <source>URL:</source>
        <translation>URL&#xa0;:</translation>
    </message>
</context>
<context>
    <name>KvAlignmentOptionsRow</name>
    <message>
        <source>Align left</source>
        <translation>Aligner à gauche</translation>
    </message>
    <message>
        <source>Align center</source>
        <translation>Centrer</translation>
    </message>
    <message>
        <source>Align right</source>
        <translation>Aligner à droite</translation>
    </message>
</context>
<context>
    <name>KvBaseEditorNodeFactory</name>
    <message>
        <source>Measurements Table</source>
        <translation>Tableau de mesures</translation>
    </message>
    <message>
        <source>Text Document</source>
        <translation>Document texte</translation>
    </message>
    <message>
        <source>Camera Image View</source>
        <translation>Image de la caméra</translation>
    </message>
    <message>
        <source>Image View</source>
        <translation>Image</translation>
    </message>
    <message>
        <source>Statistics</source>
        <translation>Statistiques</translation>
    </message>
    <message>
        <source>Statistics Table</source>
        <translation>Tableau statistique</translation>
    </message>
    <message>
        <source>Counters</source>
        <translation>Compteurs</translation>
    </message>
    <message>
        <source>Min / Median / Max Box</source>
        <translation>Boîte à moustaches</translation>
    </message>
    <message>
        <source>Trend</source>
        <translation>Tendance</translation>
    </message>
</context>
<context>
    <name>KvCameraImageNodeOptionsWidget</name>
    <message>
        <source>Camera image view</source>
        <translation>Image de la caméra</translation>
    </message>
    <message>
        <source>Render measurements</source>
        <translation>Tracer les mesures</translation>
    </message>
    <message>
        <source>Draw the measurement objects on the picture</source>
        <translation>Tracer les objets mesurés sur l’image</translation>
    </message>
</context>
<context>
    <name>KvCameraImageWidget</name>
    <message>
        <source>Camera Image View</source>
        <translation>Image de la caméra</translation>
    </message>
</context>
<context>
    <name>KvColumnsOptionsRow</name>
    <message>
        <source>Select columns:</source>
        <translation>Choix des colonnes&#xa0;:</translation>
    </message>
</context>
<context>
    <name>KvEditorAddImageExtWidgetUi</name>
    <message>
        <source>Width:</source>
        <translation>Largeur&#xa0;:</translation>
    </message>
    <message>
        <source>Width in percent of the text&apos;s width</source>
        <translation>Largeur en pourcentage de celle du texte</translation>
    </message>
    <message>
        <source>Float:</source>
        <translation>Habillage&#xa0;:</translation>
    </message>
    <message>
        <source>Side of the text at which the picture stands</source>
        <translation>Côté du texte où se place l’image</translation>
    </message>
    <message>
        <source>none</source>
        <translation>aucun</translation>
    </message>
    <message>
        <source>left</source>
        <translation>gauche</translation>
    </message>
    <message>
        <source>right</source>
        <translation>droite</translation>
    </message>
</context>
<context>
    <name>KvEditorToolCombo</name>
    <message>
        <source>Group of blocks, open</source>
        <translation>Groupe de blocs, ouvert</translation>
    </message>
    <message>
        <source>Group of blocks, closed</source>
        <translation>Groupe de blocs, fermé</translation>
    </message>
    <message>
        <source>Close the group (Enter)</source>
        <translation>Fermer le groupe (Enter)</translation>
    </message>
    <message>
        <source>Open the group (Enter)</source>
        <translation>Ouvrir le groupe (Enter)</translation>
    </message>
</context>
<context>
    <name>KvEditorToolWidget</name>
    <message>
        <source>Drag onto the page, or press Enter to append</source>
        <translation>Faites glisser sur la page ou appuyez sur Enter pour ajouter à la fin</translation>
    </message>
</context>
<context>
    <name>KvFileDialogs</name>
    <message>
        <source>%1 already exists.
Do you want to replace it?</source>
        <translation>%1 existe déjà.
Voulez-vous le remplacer&#xa0;?</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>Enregistrer</translation>
    </message>
</context>
<context>
    <name>KvFooterWidget</name>
    <message>
        <source>Footer</source>
        <translation>Pied de page</translation>
    </message>
</context>
<context>
    <name>KvGroupByOptionsRow</name>
    <message>
        <source>Group by:</source>
        <translation>Grouper par&#xa0;:</translation>
    </message>
    <message>
        <source>Object</source>
        <translation>Objet</translation>
    </message>
    <message>
        <source>Measurement</source>
        <translation>Grandeur</translation>
    </message>
</context>
<context>
    <name>KvHeaderWidget</name>
    <message>
        <source>Header</source>
        <translation>En-tête</translation>
    </message>
</context>
<context>
    <name>KvImageFile</name>
    <message>
        <source>Cannot read the image file %1</source>
        <translation>Impossible de lire le fichier image %1</translation>
    </message>
    <message>
        <source>The image that the template holds of %1 is damaged</source>
        <translation>L’image de %1 contenue dans le modèle est endommagée</translation>
    </message>
</context>
<context>
    <name>KvImageNodeOptionsWidget</name>
    <message>
        <source>Image view</source>
        <translation>Image</translation>
    </message>
    <message>
        <source>Browse</source>
        <translation>Choisir</translation>
    </message>
    <message>
        <source>Choose an image file</source>
        <translation>Choisir un fichier image</translation>
    </message>
    <message>
        <source>Choose image file</source>
        <translation>Choisir un fichier image</translation>
    </message>
    <message>
        <source>Image file(*.png *.jpg *.gif *.tif *.bmp)</source>
        <translation>Fichier image (*.png *.jpg *.gif *.tif *.bmp)</translation>
    </message>
</context>
<context>
    <name>KvImageWidget</name>
    <message>
        <source>Image View</source>
        <translation>Image</translation>
    </message>
</context>
<context>
    <name>KvPageCountWidget</name>
    <message>
        <source>Page count</source>
        <translation>Numéro de page</translation>
    </message>
</context>
<context>
    <name>KvPrintProgressDialog</name>
    <message>
        <source>Cancel</source>
        <translation>Annuler</translation>
    </message>
    <message>
        <source>Printing the report</source>
        <translation>Impression du rapport</translation>
    </message>
    <message>
        <source>Progress</source>
        <translation>Progression</translation>
    </message>
    <message>
        <source>Cancel (Esc)</source>
        <translation>Annuler (Esc)</translation>
    </message>
    <message>
        <source>Page %1 of %2</source>
        <translation>Page %1 sur %2</translation>
    </message>
</context>
<context>
    <name>KvReportGlyphs</name>
    <message>
        <source>No installed font has these characters, the report leaves them out: %1</source>
        <translation>Aucune police installée ne contient ces caractères&#xa0;; le rapport les omet&#xa0;: %1</translation>
    </message>
    <message>
        <source>No installed font has these characters, the report leaves them out: %1 (fonts to install: %2)</source>
        <translation>Aucune police installée ne contient ces caractères&#xa0;; le rapport les omet&#xa0;: %1 (polices à installer&#xa0;: %2)</translation>
    </message>
</context>
<context>
    <name>KvReportKeywords</name>
    <message>
        <source>Creation date (ISO)</source>
        <translation>Date de création (ISO)</translation>
    </message>
    <message>
        <source>Creation date (Text)</source>
        <translation>Date de création (texte)</translation>
    </message>
    <message>
        <source>Creation time</source>
        <translation>Heure de création</translation>
    </message>
    <message>
        <source>Program name</source>
        <translation>Nom du programme</translation>
    </message>
    <message>
        <source>Program version</source>
        <translation>Version du programme</translation>
    </message>
    <message>
        <source>Program vendor</source>
        <translation>Éditeur du programme</translation>
    </message>
</context>
<context>
    <name>KvReportTemplatesEditor</name>
    <message>
        <source>Report template editor</source>
        <translation>Éditeur de modèles de rapport</translation>
    </message>
    <message>
        <source>Report template file (*.rtp)</source>
        <translation>Modèle de rapport (*.rtp)</translation>
    </message>
</context>
<context>
    <name>KvRotationOptionsRow</name>
    <message>
        <source>Rotation</source>
        <translation>Rotation</translation>
    </message>
    <message>
        <source>Rotation of the picture, clockwise</source>
        <translation>Rotation de l’image, dans le sens horaire</translation>
    </message>
</context>
<context>
    <name>KvSelectionOverlay</name>
    <message>
        <source>Delete block</source>
        <translation>Supprimer le bloc</translation>
    </message>
    <message>
        <source>Delete block (Del)</source>
        <translation>Supprimer le bloc (Del)</translation>
    </message>
</context>
<context>
    <name>KvStatisticsMeasurementsTableNodeCfg</name>
    <message>
        <source>Object Name</source>
        <translation>Nom de l’objet</translation>
    </message>
    <message>
        <source>Object Type</source>
        <translation>Type d’objet</translation>
    </message>
    <message>
        <source>Value Name</source>
        <translation>Grandeur</translation>
    </message>
    <message>
        <source>Value</source>
        <translation>Valeur</translation>
    </message>
</context>
<context>
    <name>KvStatisticsMeasurementsTableOptionsWidget</name>
    <message>
        <source>Measurements table</source>
        <translation>Tableau de mesures</translation>
    </message>
    <message>
        <source>Order by:</source>
        <translation>Trier par&#xa0;:</translation>
    </message>
    <message>
        <source>default</source>
        <translation>défaut</translation>
    </message>
    <message>
        <source>%1, ascending</source>
        <translation>%1, croissant</translation>
    </message>
    <message>
        <source>%1, descending</source>
        <translation>%1, décroissant</translation>
    </message>
</context>
<context>
    <name>KvStatisticsMeasurementsTableWidget</name>
    <message>
        <source>Measurements Table</source>
        <translation>Tableau de mesures</translation>
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
    <name>KvStatisticsStatsTableOptionsWidget</name>
    <message>
        <source>Statistics table</source>
        <translation>Tableau statistique</translation>
    </message>
</context>
<context>
    <name>KvStatisticsStatsTableWidget</name>
    <message>
        <source>Statistics Table</source>
        <translation>Tableau statistique</translation>
    </message>
    <message>
        <source>Object Type</source>
        <translation>Type d’objet</translation>
    </message>
    <message>
        <source>Measurement Type</source>
        <translation>Grandeur</translation>
    </message>
</context>
<context>
    <name>KvStatisticsUnitConverter</name>
    <message>
        <source>deg</source>
        <translation>deg</translation>
    </message>
    <message>
        <source>pcs</source>
        <translation>pcs</translation>
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
        <translation>Statistiques des mesures</translation>
    </message>
    <message>
        <source>Choose a statistics view on the right.</source>
        <translation>Choisissez une vue statistique à droite.</translation>
    </message>
    <message>
        <source>No statistics blocks are installed.</source>
        <translation>Aucun bloc statistique n’est installé.</translation>
    </message>
</context>
<context>
    <name>KvTemplateModel</name>
    <message>
        <source>Cannot read</source>
        <translation>Lecture impossible</translation>
    </message>
    <message>
        <source>Cannot open file %1</source>
        <translation>Impossible d’ouvrir le fichier %1</translation>
    </message>
    <message>
        <source>Error reading file</source>
        <translation>Erreur de lecture du fichier</translation>
    </message>
    <message>
        <source>Cannot read file %1</source>
        <translation>Impossible de lire le fichier %1</translation>
    </message>
    <message>
        <source>Cannot save</source>
        <translation>Enregistrement impossible</translation>
    </message>
    <message>
        <source>Cannot create file %1</source>
        <translation>Impossible de créer le fichier %1</translation>
    </message>
</context>
<context>
    <name>KvTemplatesEditorWindow</name>
    <message>
        <source>Open a template file</source>
        <translation>Ouvrir un fichier de modèle</translation>
    </message>
    <message>
        <source>Start a new, empty template</source>
        <translation>Commencer un nouveau modèle vide</translation>
    </message>
    <message>
        <source>Save the template to another file</source>
        <translation>Enregistrer le modèle dans un autre fichier</translation>
    </message>
    <message>
        <source>Save the template</source>
        <translation>Enregistrer le modèle</translation>
    </message>
    <message>
        <source>Print the report to a PDF file</source>
        <translation>Imprimer le rapport dans un fichier PDF</translation>
    </message>
    <message>
        <source>Header on every page</source>
        <translation>En-tête sur chaque page</translation>
    </message>
    <message>
        <source>Footer on every page</source>
        <translation>Pied de page sur chaque page</translation>
    </message>
    <message>
        <source>Page numbers</source>
        <translation>Numéros de page</translation>
    </message>
    <message>
        <source>Report pages</source>
        <translation>Pages du rapport</translation>
    </message>
    <message>
        <source>Blocks to add</source>
        <translation>Blocs à ajouter</translation>
    </message>
    <message>
        <source>Are you sure?</source>
        <translation>Confirmation</translation>
    </message>
    <message>
        <source>The template is modified, do you want to save it first?</source>
        <translation>Le modèle a été modifié. Voulez-vous d’abord l’enregistrer&#xa0;?</translation>
    </message>
    <message>
        <source>Choose file to open</source>
        <translation>Choisir le fichier à ouvrir</translation>
    </message>
    <message>
        <source>Choose file to save</source>
        <translation>Choisir le fichier d’enregistrement</translation>
    </message>
    <message>
        <source>Choose file to print to</source>
        <translation>Choisir le fichier d’impression</translation>
    </message>
    <message>
        <source>Pdf file (*.pdf)</source>
        <translation>Fichier PDF (*.pdf)</translation>
    </message>
    <message>
        <source>Save failed</source>
        <translation>Échec de l’enregistrement</translation>
    </message>
    <message>
        <source>Cannot write to file %1</source>
        <translation>Impossible d’écrire dans le fichier %1</translation>
    </message>
    <message>
        <source>[new]</source>
        <translation>[nouveau]</translation>
    </message>
</context>
<context>
    <name>KvTemplatesEditorWindowUi</name>
    <message>
        <source>Open File</source>
        <translation>Ouvrir</translation>
    </message>
    <message>
        <source>Clear</source>
        <translation>Vider</translation>
    </message>
    <message>
        <source>Save as ...</source>
        <translation>Enregistrer sous...</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>Enregistrer</translation>
    </message>
    <message>
        <source>Print</source>
        <translation>Imprimer</translation>
    </message>
    <message>
        <source>Add block</source>
        <translation>Ajouter un bloc</translation>
    </message>
    <message>
        <source>The template is empty. Drag a block from here onto the page.</source>
        <translation>Le modèle est vide. Faites glisser un bloc d’ici sur la page.</translation>
    </message>
</context>
<context>
    <name>KvTextDocumentNodeOptionsWidget</name>
    <message>
        <source>Text</source>
        <translation>Texte</translation>
    </message>
    <message>
        <source>Font size in points</source>
        <translation>Taille de police en points</translation>
    </message>
    <message>
        <source>Font size</source>
        <translation>Taille de police</translation>
    </message>
    <message>
        <source>Text color</source>
        <translation>Couleur du texte</translation>
    </message>
    <message>
        <source>Bold</source>
        <translation>Gras</translation>
    </message>
    <message>
        <source>Italic</source>
        <translation>Italique</translation>
    </message>
    <message>
        <source>Underline</source>
        <translation>Souligné</translation>
    </message>
    <message>
        <source>Align left</source>
        <translation>Aligner à gauche</translation>
    </message>
    <message>
        <source>Align center</source>
        <translation>Centrer</translation>
    </message>
    <message>
        <source>Align right</source>
        <translation>Aligner à droite</translation>
    </message>
    <message>
        <source>Justify</source>
        <translation>Justifier</translation>
    </message>
    <message>
        <source>Superscript</source>
        <translation>Exposant</translation>
    </message>
    <message>
        <source>Subscript</source>
        <translation>Indice</translation>
    </message>
    <message>
        <source>Insert link</source>
        <translation>Insérer un lien</translation>
    </message>
    <message>
        <source>Insert picture</source>
        <translation>Insérer une image</translation>
    </message>
    <message>
        <source>Insert tag</source>
        <translation>Insérer un champ</translation>
    </message>
    <message>
        <source>Insert a tag that the report replaces by its value</source>
        <translation>Insérer un champ que le rapport remplace par sa valeur</translation>
    </message>
</context>
<context>
    <name>KvTextDocumentNodeWidget</name>
    <message>
        <source>Text</source>
        <translation>Texte</translation>
    </message>
</context>
<context>
    <name>KvThemeOptionsRow</name>
    <message>
        <source>Color theme:</source>
        <translation>Thème&#xa0;:</translation>
    </message>
    <message>
        <source>Dark</source>
        <translation>Sombre</translation>
    </message>
    <message>
        <source>Light</source>
        <translation>Clair</translation>
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
        <translation>Largeur en pourcentage</translation>
    </message>
    <message>
        <source>Width in percent of the page&apos;s content</source>
        <translation>Largeur en pourcentage du contenu de la page</translation>
    </message>
</context>
<context>
    <name>KvWindowTitleBar</name>
    <message>
        <source>Close</source>
        <translation>Fermer</translation>
    </message>
</context>
<context>
    <name>StatReportingPlugin</name>
    <message>
        <source>Statistics tools</source>
        <translation>Rapport et statistiques</translation>
    </message>
    <message>
        <source>Select Template File</source>
        <translation>Choisir un fichier de modèle</translation>
    </message>
    <message>
        <source>Report Template File (*.rtp)</source>
        <translation>Modèle de rapport (*.rtp)</translation>
    </message>
    <message>
        <source>No report template selected.</source>
        <translation>Aucun modèle de rapport n’est sélectionné.</translation>
    </message>
</context>
</TS>
