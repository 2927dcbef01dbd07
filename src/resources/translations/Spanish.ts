<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="es_ES" sourcelanguage="en_US">
<context>
    <name>GuiStatReportingPluginUi</name>
    <message>
        <source>Form</source>
        <translation>Formulario</translation>
    </message>
    <message>
        <source>Open Templates Editor</source>
        <translation>Abrir editor de plantillas</translation>
    </message>
    <message>
        <source>Opens Report Template Editor</source>
        <translation>Abrir el editor de plantillas de informe</translation>
    </message>
    <message>
        <source>Generate Report File</source>
        <translation>Generar archivo de informe</translation>
    </message>
    <message>
        <source>Exports current measurments to pdf file.</source>
        <translation>Exportar las mediciones actuales a un archivo PDF.</translation>
    </message>
    <message>
        <source>Open Statistics Window</source>
        <translation>Abrir ventana de estadísticas</translation>
    </message>
    <message>
        <source>Template:</source>
        <translation>Plantilla:</translation>
    </message>
    <message>
        <source>Browse Templates</source>
        <translation>Examinar plantillas</translation>
    </message>
    <message>
        <source>Opens default template for report generation</source>
        <translation>Elegir la plantilla predeterminada para generar informes</translation>
    </message>
</context>
<context>
    <name>KvAddImageDialog</name>
    <message>
        <source>Choose image file</source>
        <translation>Elegir archivo de imagen</translation>
    </message>
    <message>
        <source>Image file(*.png *.jpg *.gif *.tif *.bmp)</source>
        <translation>Archivo de imagen (*.png *.jpg *.gif *.tif *.bmp)</translation>
    </message>
</context>
<context>
    <name>KvAddLinkDialogUi</name>
    <message>
        <source>Insert Link</source>
        <translation>Insertar enlace</translation>
    </message>
    <message>
        <source>Title:</source>
        <translation>Título:</translation>
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
        <translation>Alinear a la izquierda</translation>
    </message>
    <message>
        <source>Align center</source>
        <translation>Centrar</translation>
    </message>
    <message>
        <source>Align right</source>
        <translation>Alinear a la derecha</translation>
    </message>
</context>
<context>
    <name>KvBaseEditorNodeFactory</name>
    <message>
        <source>Measurements Table</source>
        <translation>Tabla de mediciones</translation>
    </message>
    <message>
        <source>Text Document</source>
        <translation>Documento de texto</translation>
    </message>
    <message>
        <source>Camera Image View</source>
        <translation>Imagen de cámara</translation>
    </message>
    <message>
        <source>Image View</source>
        <translation>Imagen</translation>
    </message>
    <message>
        <source>Statistics</source>
        <translation>Estadísticas</translation>
    </message>
    <message>
        <source>Statistics Table</source>
        <translation>Tabla de estadísticas</translation>
    </message>
    <message>
        <source>Counters</source>
        <translation>Contadores</translation>
    </message>
    <message>
        <source>Min / Median / Max Box</source>
        <translation>Caja mín. / mediana / máx.</translation>
    </message>
    <message>
        <source>Trend</source>
        <translation>Tendencia</translation>
    </message>
</context>
<context>
    <name>KvCameraImageNodeOptionsWidget</name>
    <message>
        <source>Camera image view</source>
        <translation>Imagen de cámara</translation>
    </message>
    <message>
        <source>Render measurements</source>
        <translation>Mostrar mediciones</translation>
    </message>
    <message>
        <source>Draw the measurement objects on the picture</source>
        <translation>Dibujar los objetos medidos sobre la imagen</translation>
    </message>
</context>
<context>
    <name>KvCameraImageWidget</name>
    <message>
        <source>Camera Image View</source>
        <translation>Imagen de cámara</translation>
    </message>
</context>
<context>
    <name>KvColumnsOptionsRow</name>
    <message>
        <source>Select columns:</source>
        <translation>Seleccionar columnas:</translation>
    </message>
</context>
<context>
    <name>KvEditorAddImageExtWidgetUi</name>
    <message>
        <source>Width:</source>
        <translation>Ancho:</translation>
    </message>
    <message>
        <source>Width in percent of the text&apos;s width</source>
        <translation>Ancho en porcentaje del ancho del texto</translation>
    </message>
    <message>
        <source>Float:</source>
        <translation>Lado:</translation>
    </message>
    <message>
        <source>Side of the text at which the picture stands</source>
        <translation>Lado del texto en el que se sitúa la imagen</translation>
    </message>
    <message>
        <source>none</source>
        <translation>ninguno</translation>
    </message>
    <message>
        <source>left</source>
        <translation>izquierdo</translation>
    </message>
    <message>
        <source>right</source>
        <translation>derecho</translation>
    </message>
</context>
<context>
    <name>KvEditorToolCombo</name>
    <message>
        <source>Group of blocks, open</source>
        <translation>Grupo de bloques, abierto</translation>
    </message>
    <message>
        <source>Group of blocks, closed</source>
        <translation>Grupo de bloques, cerrado</translation>
    </message>
    <message>
        <source>Close the group (Enter)</source>
        <translation>Cerrar el grupo (Intro)</translation>
    </message>
    <message>
        <source>Open the group (Enter)</source>
        <translation>Abrir el grupo (Intro)</translation>
    </message>
</context>
<context>
    <name>KvEditorToolWidget</name>
    <message>
        <source>Drag onto the page, or press Enter to append</source>
        <translation>Arrastre a la página o pulse Intro para añadir al final</translation>
    </message>
</context>
<context>
    <name>KvFileDialogs</name>
    <message>
        <source>%1 already exists.
Do you want to replace it?</source>
        <translation>%1 ya existe.
¿Desea reemplazarlo?</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>Guardar</translation>
    </message>
</context>
<context>
    <name>KvFooterWidget</name>
    <message>
        <source>Footer</source>
        <translation>Pie de página</translation>
    </message>
</context>
<context>
    <name>KvGroupByOptionsRow</name>
    <message>
        <source>Group by:</source>
        <translation>Agrupar por:</translation>
    </message>
    <message>
        <source>Object</source>
        <translation>Objeto</translation>
    </message>
    <message>
        <source>Measurement</source>
        <translation>Medición</translation>
    </message>
</context>
<context>
    <name>KvHeaderWidget</name>
    <message>
        <source>Header</source>
        <translation>Encabezado</translation>
    </message>
</context>
<context>
    <name>KvImageFile</name>
    <message>
        <source>Cannot read the image file %1</source>
        <translation>No se puede leer el archivo de imagen %1</translation>
    </message>
    <message>
        <source>The image that the template holds of %1 is damaged</source>
        <translation>La imagen de %1 que contiene la plantilla está dañada</translation>
    </message>
</context>
<context>
    <name>KvImageNodeOptionsWidget</name>
    <message>
        <source>Image view</source>
        <translation>Imagen</translation>
    </message>
    <message>
        <source>Browse</source>
        <translation>Examinar</translation>
    </message>
    <message>
        <source>Choose an image file</source>
        <translation>Elegir un archivo de imagen</translation>
    </message>
    <message>
        <source>Choose image file</source>
        <translation>Elegir archivo de imagen</translation>
    </message>
    <message>
        <source>Image file(*.png *.jpg *.gif *.tif *.bmp)</source>
        <translation>Archivo de imagen (*.png *.jpg *.gif *.tif *.bmp)</translation>
    </message>
</context>
<context>
    <name>KvImageWidget</name>
    <message>
        <source>Image View</source>
        <translation>Imagen</translation>
    </message>
</context>
<context>
    <name>KvPageCountWidget</name>
    <message>
        <source>Page count</source>
        <translation>Número de página</translation>
    </message>
</context>
<context>
    <name>KvPrintProgressDialog</name>
    <message>
        <source>Cancel</source>
        <translation>Cancelar</translation>
    </message>
    <message>
        <source>Printing the report</source>
        <translation>Impresión del informe</translation>
    </message>
    <message>
        <source>Progress</source>
        <translation>Progreso</translation>
    </message>
    <message>
        <source>Cancel (Esc)</source>
        <translation>Cancelar (Esc)</translation>
    </message>
    <message>
        <source>Page %1 of %2</source>
        <translation>Página %1 de %2</translation>
    </message>
</context>
<context>
    <name>KvReportGlyphs</name>
    <message>
        <source>No installed font has these characters, the report leaves them out: %1</source>
        <translation>Ninguna fuente instalada tiene estos caracteres; el informe los omite: %1</translation>
    </message>
    <message>
        <source>No installed font has these characters, the report leaves them out: %1 (fonts to install: %2)</source>
        <translation>Ninguna fuente instalada tiene estos caracteres; el informe los omite: %1 (fuentes que instalar: %2)</translation>
    </message>
</context>
<context>
    <name>KvReportKeywords</name>
    <message>
        <source>Creation date (ISO)</source>
        <translation>Fecha de creación (ISO)</translation>
    </message>
    <message>
        <source>Creation date (Text)</source>
        <translation>Fecha de creación (texto)</translation>
    </message>
    <message>
        <source>Creation time</source>
        <translation>Hora de creación</translation>
    </message>
    <message>
        <source>Program name</source>
        <translation>Nombre del programa</translation>
    </message>
    <message>
        <source>Program version</source>
        <translation>Versión del programa</translation>
    </message>
    <message>
        <source>Program vendor</source>
        <translation>Fabricante del programa</translation>
    </message>
</context>
<context>
    <name>KvReportTemplatesEditor</name>
    <message>
        <source>Report template editor</source>
        <translation>Editor de plantillas de informe</translation>
    </message>
    <message>
        <source>Report template file (*.rtp)</source>
        <translation>Archivo de plantilla de informe (*.rtp)</translation>
    </message>
</context>
<context>
    <name>KvRotationOptionsRow</name>
    <message>
        <source>Rotation</source>
        <translation>Rotación</translation>
    </message>
    <message>
        <source>Rotation of the picture, clockwise</source>
        <translation>Rotación de la imagen en sentido horario</translation>
    </message>
</context>
<context>
    <name>KvSelectionOverlay</name>
    <message>
        <source>Delete block</source>
        <translation>Eliminar bloque</translation>
    </message>
    <message>
        <source>Delete block (Del)</source>
        <translation>Eliminar bloque (Supr)</translation>
    </message>
</context>
<context>
    <name>KvStatisticsMeasurementsTableNodeCfg</name>
    <message>
        <source>Object Name</source>
        <translation>Objeto</translation>
    </message>
    <message>
        <source>Object Type</source>
        <translation>Tipo de objeto</translation>
    </message>
    <message>
        <source>Value Name</source>
        <translation>Magnitud</translation>
    </message>
    <message>
        <source>Value</source>
        <translation>Valor</translation>
    </message>
</context>
<context>
    <name>KvStatisticsMeasurementsTableOptionsWidget</name>
    <message>
        <source>Measurements table</source>
        <translation>Tabla de mediciones</translation>
    </message>
    <message>
        <source>Order by:</source>
        <translation>Ordenar por:</translation>
    </message>
    <message>
        <source>default</source>
        <translation>predeterminado</translation>
    </message>
    <message>
        <source>%1, ascending</source>
        <translation>%1, ascendente</translation>
    </message>
    <message>
        <source>%1, descending</source>
        <translation>%1, descendente</translation>
    </message>
</context>
<context>
    <name>KvStatisticsMeasurementsTableWidget</name>
    <message>
        <source>Measurements Table</source>
        <translation>Tabla de mediciones</translation>
    </message>
</context>
<context>
    <name>KvStatisticsStatsTableNodeCfg</name>
    <message>
        <source>Min</source>
        <translation>Mín.</translation>
    </message>
    <message>
        <source>Max</source>
        <translation>Máx.</translation>
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
        <translation>Tabla de estadísticas</translation>
    </message>
</context>
<context>
    <name>KvStatisticsStatsTableWidget</name>
    <message>
        <source>Statistics Table</source>
        <translation>Tabla de estadísticas</translation>
    </message>
    <message>
        <source>Object Type</source>
        <translation>Tipo de objeto</translation>
    </message>
    <message>
        <source>Measurement Type</source>
        <translation>Tipo de medición</translation>
    </message>
</context>
<context>
    <name>KvStatisticsUnitConverter</name>
    <message>
        <source>deg</source>
        <translation>grados</translation>
    </message>
    <message>
        <source>pcs</source>
        <translation>uds.</translation>
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
        <translation>Estadísticas de las mediciones</translation>
    </message>
    <message>
        <source>Choose a statistics view on the right.</source>
        <translation>Elija a la derecha una vista de estadísticas.</translation>
    </message>
    <message>
        <source>No statistics blocks are installed.</source>
        <translation>No hay bloques de estadísticas instalados.</translation>
    </message>
</context>
<context>
    <name>KvTemplateModel</name>
    <message>
        <source>Cannot read</source>
        <translation>Error de lectura</translation>
    </message>
    <message>
        <source>Cannot open file %1</source>
        <translation>No se puede abrir el archivo %1</translation>
    </message>
    <message>
        <source>Error reading file</source>
        <translation>Error al leer el archivo</translation>
    </message>
    <message>
        <source>Cannot read file %1</source>
        <translation>No se puede leer el archivo %1</translation>
    </message>
    <message>
        <source>Cannot save</source>
        <translation>Error al guardar</translation>
    </message>
    <message>
        <source>Cannot create file %1</source>
        <translation>No se puede crear el archivo %1</translation>
    </message>
</context>
<context>
    <name>KvTemplatesEditorWindow</name>
    <message>
        <source>Open a template file</source>
        <translation>Abrir un archivo de plantilla</translation>
    </message>
    <message>
        <source>Start a new, empty template</source>
        <translation>Empezar una plantilla nueva y vacía</translation>
    </message>
    <message>
        <source>Save the template to another file</source>
        <translation>Guardar la plantilla en otro archivo</translation>
    </message>
    <message>
        <source>Save the template</source>
        <translation>Guardar la plantilla</translation>
    </message>
    <message>
        <source>Print the report to a PDF file</source>
        <translation>Imprimir el informe en un archivo PDF</translation>
    </message>
    <message>
        <source>Header on every page</source>
        <translation>Encabezado en todas las páginas</translation>
    </message>
    <message>
        <source>Footer on every page</source>
        <translation>Pie de página en todas las páginas</translation>
    </message>
    <message>
        <source>Page numbers</source>
        <translation>Números de página</translation>
    </message>
    <message>
        <source>Report pages</source>
        <translation>Páginas del informe</translation>
    </message>
    <message>
        <source>Blocks to add</source>
        <translation>Bloques disponibles</translation>
    </message>
    <message>
        <source>Are you sure?</source>
        <translation>Confirmación</translation>
    </message>
    <message>
        <source>The template is modified, do you want to save it first?</source>
        <translation>La plantilla se ha modificado. ¿Desea guardarla antes?</translation>
    </message>
    <message>
        <source>Choose file to open</source>
        <translation>Elegir archivo para abrir</translation>
    </message>
    <message>
        <source>Choose file to save</source>
        <translation>Elegir archivo para guardar</translation>
    </message>
    <message>
        <source>Choose file to print to</source>
        <translation>Elegir archivo de impresión</translation>
    </message>
    <message>
        <source>Pdf file (*.pdf)</source>
        <translation>Archivo PDF (*.pdf)</translation>
    </message>
    <message>
        <source>Save failed</source>
        <translation>Error al guardar</translation>
    </message>
    <message>
        <source>Cannot write to file %1</source>
        <translation>No se puede escribir en el archivo %1</translation>
    </message>
    <message>
        <source>[new]</source>
        <translation>[nueva]</translation>
    </message>
</context>
<context>
    <name>KvTemplatesEditorWindowUi</name>
    <message>
        <source>Open File</source>
        <translation>Abrir archivo</translation>
    </message>
    <message>
        <source>Clear</source>
        <translation>Vaciar</translation>
    </message>
    <message>
        <source>Save as ...</source>
        <translation>Guardar como...</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>Guardar</translation>
    </message>
    <message>
        <source>Print</source>
        <translation>Imprimir</translation>
    </message>
    <message>
        <source>Add block</source>
        <translation>Añadir bloque</translation>
    </message>
    <message>
        <source>The template is empty. Drag a block from here onto the page.</source>
        <translation>La plantilla está vacía. Arrastre un bloque desde aquí a la página.</translation>
    </message>
</context>
<context>
    <name>KvTextDocumentNodeOptionsWidget</name>
    <message>
        <source>Text</source>
        <translation>Texto</translation>
    </message>
    <message>
        <source>Font size in points</source>
        <translation>Tamaño de fuente en puntos</translation>
    </message>
    <message>
        <source>Font size</source>
        <translation>Tamaño de fuente</translation>
    </message>
    <message>
        <source>Text color</source>
        <translation>Color del texto</translation>
    </message>
    <message>
        <source>Bold</source>
        <translation>Negrita</translation>
    </message>
    <message>
        <source>Italic</source>
        <translation>Cursiva</translation>
    </message>
    <message>
        <source>Underline</source>
        <translation>Subrayado</translation>
    </message>
    <message>
        <source>Align left</source>
        <translation>Alinear a la izquierda</translation>
    </message>
    <message>
        <source>Align center</source>
        <translation>Centrar</translation>
    </message>
    <message>
        <source>Align right</source>
        <translation>Alinear a la derecha</translation>
    </message>
    <message>
        <source>Justify</source>
        <translation>Justificar</translation>
    </message>
    <message>
        <source>Superscript</source>
        <translation>Superíndice</translation>
    </message>
    <message>
        <source>Subscript</source>
        <translation>Subíndice</translation>
    </message>
    <message>
        <source>Insert link</source>
        <translation>Insertar enlace</translation>
    </message>
    <message>
        <source>Insert picture</source>
        <translation>Insertar imagen</translation>
    </message>
    <message>
        <source>Insert tag</source>
        <translation>Insertar campo</translation>
    </message>
    <message>
        <source>Insert a tag that the report replaces by its value</source>
        <translation>Insertar un campo que el informe sustituye por su valor</translation>
    </message>
</context>
<context>
    <name>KvTextDocumentNodeWidget</name>
    <message>
        <source>Text</source>
        <translation>Texto</translation>
    </message>
</context>
<context>
    <name>KvThemeOptionsRow</name>
    <message>
        <source>Color theme:</source>
        <translation>Tema de color:</translation>
    </message>
    <message>
        <source>Dark</source>
        <translation>Oscuro</translation>
    </message>
    <message>
        <source>Light</source>
        <translation>Claro</translation>
    </message>
</context>
<context>
    <name>KvWidthOptionsRow</name>
    <message>
        <source>W</source>
        <comment>short for width</comment>
        <translation>An.</translation>
    </message>
    <message>
        <source>Width in percent</source>
        <translation>Ancho en porcentaje</translation>
    </message>
    <message>
        <source>Width in percent of the page&apos;s content</source>
        <translation>Ancho en porcentaje del contenido de la página</translation>
    </message>
</context>
<context>
    <name>KvWindowTitleBar</name>
    <message>
        <source>Close</source>
        <translation>Cerrar</translation>
    </message>
</context>
<context>
    <name>StatReportingPlugin</name>
    <message>
        <source>Statistics tools</source>
        <translation>Informes y estadística</translation>
    </message>
    <message>
        <source>Select Template File</source>
        <translation>Seleccionar archivo de plantilla</translation>
    </message>
    <message>
        <source>Report Template File (*.rtp)</source>
        <translation>Archivo de plantilla de informe (*.rtp)</translation>
    </message>
    <message>
        <source>No report template selected.</source>
        <translation>No hay ninguna plantilla de informe seleccionada.</translation>
    </message>
</context>
</TS>
