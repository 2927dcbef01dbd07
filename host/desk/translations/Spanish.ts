<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="es_ES" sourcelanguage="en_US">
<context>
    <name>KvDeskActions</name>
    <message>
        <source>&amp;New session</source>
        <translation>&amp;Nueva sesión</translation>
    </message>
    <message>
        <source>Start an empty session</source>
        <translation>Empezar una sesión vacía</translation>
    </message>
    <message>
        <source>Open &amp;image...</source>
        <translation>Abrir &amp;imagen...</translation>
    </message>
    <message>
        <source>Open image</source>
        <translation>Abrir imagen</translation>
    </message>
    <message>
        <source>&amp;Open session...</source>
        <translation>&amp;Abrir sesión...</translation>
    </message>
    <message>
        <source>Open session</source>
        <translation>Abrir sesión</translation>
    </message>
    <message>
        <source>Import &amp;table...</source>
        <translation>Importar &amp;tabla...</translation>
    </message>
    <message>
        <source>Import table of measured values</source>
        <translation>Importar tabla de valores medidos</translation>
    </message>
    <message>
        <source>&amp;Save session</source>
        <translation>&amp;Guardar sesión</translation>
    </message>
    <message>
        <source>Save session</source>
        <translation>Guardar sesión</translation>
    </message>
    <message>
        <source>Save session &amp;as...</source>
        <translation>Guardar sesión &amp;como...</translation>
    </message>
    <message>
        <source>Save session to another file</source>
        <translation>Guardar la sesión en otro archivo</translation>
    </message>
    <message>
        <source>&amp;Quit</source>
        <translation>&amp;Salir</translation>
    </message>
    <message>
        <source>Quit the program</source>
        <translation>Salir del programa</translation>
    </message>
    <message>
        <source>Zoom &amp;in</source>
        <translation>&amp;Ampliar</translation>
    </message>
    <message>
        <source>Zoom in</source>
        <translation>Ampliar</translation>
    </message>
    <message>
        <source>Zoom &amp;out</source>
        <translation>&amp;Reducir</translation>
    </message>
    <message>
        <source>Zoom out</source>
        <translation>Reducir</translation>
    </message>
    <message>
        <source>&amp;Fit to window</source>
        <translation>A&amp;justar a la ventana</translation>
    </message>
    <message>
        <source>Show the whole image</source>
        <translation>Mostrar la imagen completa</translation>
    </message>
    <message>
        <source>&amp;Actual size</source>
        <translation>&amp;Tamaño real</translation>
    </message>
    <message>
        <source>Show the image at 100 %</source>
        <translation>Mostrar la imagen al 100 %</translation>
    </message>
    <message>
        <source>&amp;Measured values</source>
        <translation>&amp;Valores medidos</translation>
    </message>
    <message>
        <source>Show or hide the measured values</source>
        <translation>Mostrar u ocultar los valores medidos</translation>
    </message>
    <message>
        <source>Stat&amp;us log</source>
        <translation>Registro de e&amp;stado</translation>
    </message>
    <message>
        <source>Show or hide the status log</source>
        <translation>Mostrar u ocultar el registro de estado</translation>
    </message>
    <message>
        <source>&amp;Dark or light theme</source>
        <translation>Tema &amp;oscuro o claro</translation>
    </message>
    <message>
        <source>Change between the dark and the light theme</source>
        <translation>Cambiar entre el tema oscuro y el claro</translation>
    </message>
    <message>
        <source>Settin&amp;gs...</source>
        <translation>C&amp;onfiguración...</translation>
    </message>
    <message>
        <source>Settings</source>
        <translation>Configuración</translation>
    </message>
    <message>
        <source>&amp;About Measuring Desk</source>
        <translation>Acerca &amp;de Measuring Desk</translation>
    </message>
    <message>
        <source>About Measuring Desk</source>
        <translation>Acerca de Measuring Desk</translation>
    </message>
    <message>
        <source>%1 (%2)</source>
        <comment>command (shortcut)</comment>
        <translation>%1 (%2)</translation>
    </message>
    <message>
        <source>&amp;Export measured values...</source>
        <translation>&amp;Exportar valores medidos...</translation>
    </message>
    <message>
        <source>Export measured values as a table</source>
        <translation>Exportar los valores medidos como tabla</translation>
    </message>
    <message>
        <source>&amp;Undo</source>
        <translation>&amp;Deshacer</translation>
    </message>
    <message>
        <source>Undo the last step</source>
        <translation>Deshacer el último paso</translation>
    </message>
    <message>
        <source>&amp;Redo</source>
        <translation>&amp;Rehacer</translation>
    </message>
    <message>
        <source>Redo what was undone</source>
        <translation>Rehacer lo que se deshizo</translation>
    </message>
    <message>
        <source>Cu&amp;t</source>
        <translation>Cor&amp;tar</translation>
    </message>
    <message>
        <source>Cut the selected objects</source>
        <translation>Cortar los objetos seleccionados</translation>
    </message>
    <message>
        <source>&amp;Copy</source>
        <translation>&amp;Copiar</translation>
    </message>
    <message>
        <source>Copy the selected objects</source>
        <translation>Copiar los objetos seleccionados</translation>
    </message>
    <message>
        <source>&amp;Paste</source>
        <translation>&amp;Pegar</translation>
    </message>
    <message>
        <source>Paste copied objects</source>
        <translation>Pegar los objetos copiados</translation>
    </message>
    <message>
        <source>&amp;Delete</source>
        <translation>&amp;Eliminar</translation>
    </message>
    <message>
        <source>Delete the selected objects</source>
        <translation>Eliminar los objetos seleccionados</translation>
    </message>
    <message>
        <source>Select &amp;all</source>
        <translation>Seleccionar t&amp;odo</translation>
    </message>
    <message>
        <source>Select all objects on the image</source>
        <translation>Seleccionar todos los objetos de la imagen</translation>
    </message>
    <message>
        <source>Re&amp;name</source>
        <translation>Ca&amp;mbiar nombre</translation>
    </message>
    <message>
        <source>Give the selected object a name</source>
        <translation>Dar un nombre al objeto seleccionado</translation>
    </message>
    <message>
        <source>&amp;Find measured values</source>
        <translation>&amp;Buscar valores medidos</translation>
    </message>
    <message>
        <source>Filter the measured values</source>
        <translation>Filtrar los valores medidos</translation>
    </message>
    <message>
        <source>&amp;Select</source>
        <translation>&amp;Seleccionar</translation>
    </message>
    <message>
        <source>Select and change objects</source>
        <translation>Seleccionar y modificar objetos</translation>
    </message>
    <message>
        <source>&amp;Line</source>
        <translation>&amp;Línea</translation>
    </message>
    <message>
        <source>Measure a length</source>
        <translation>Medir una longitud</translation>
    </message>
    <message>
        <source>&amp;Polyline</source>
        <translation>&amp;Polilínea</translation>
    </message>
    <message>
        <source>Measure the length of a way</source>
        <translation>Medir la longitud de un recorrido</translation>
    </message>
    <message>
        <source>Parallel &amp;distance</source>
        <translation>&amp;Distancia punto-línea</translation>
    </message>
    <message>
        <source>Measure the distance of a point from a line</source>
        <translation>Medir la distancia de un punto a una línea</translation>
    </message>
    <message>
        <source>&amp;Arc</source>
        <translation>&amp;Arco</translation>
    </message>
    <message>
        <source>Measure an arc through three points</source>
        <translation>Medir un arco por tres puntos</translation>
    </message>
    <message>
        <source>&amp;Circle</source>
        <translation>&amp;Círculo</translation>
    </message>
    <message>
        <source>Measure a circle</source>
        <translation>Medir un círculo</translation>
    </message>
    <message>
        <source>&amp;Rectangle</source>
        <translation>&amp;Rectángulo</translation>
    </message>
    <message>
        <source>Measure a rectangle</source>
        <translation>Medir un rectángulo</translation>
    </message>
    <message>
        <source>Poly&amp;gon</source>
        <translation>Polí&amp;gono</translation>
    </message>
    <message>
        <source>Measure the area of a polygon</source>
        <translation>Medir el área de un polígono</translation>
    </message>
    <message>
        <source>Cou&amp;nter</source>
        <translation>Co&amp;ntador</translation>
    </message>
    <message>
        <source>Count by clicks</source>
        <translation>Contar con clics</translation>
    </message>
    <message>
        <source>&amp;Text note</source>
        <translation>Nota de &amp;texto</translation>
    </message>
    <message>
        <source>Write on the image</source>
        <translation>Escribir sobre la imagen</translation>
    </message>
    <message>
        <source>Scale &amp;bar</source>
        <translation>&amp;Barra de escala</translation>
    </message>
    <message>
        <source>Draw a scale bar</source>
        <translation>Dibujar una barra de escala</translation>
    </message>
    <message>
        <source>Cal&amp;ibration...</source>
        <translation>Cal&amp;ibración...</translation>
    </message>
    <message>
        <source>Say how large a pixel of the image is</source>
        <translation>Indicar el tamaño de un píxel de la imagen</translation>
    </message>
    <message>
        <source>Use the file&apos;s pixel size</source>
        <translation>Usar el tamaño de píxel del archivo</translation>
    </message>
    <message>
        <source>Measure with the pixel size that the image&apos;s file states</source>
        <translation>Medir con el tamaño de píxel que indica el archivo de imagen</translation>
    </message>
    <message>
        <source>&amp;Take snapshot</source>
        <translation>Tomar &amp;instantánea</translation>
    </message>
    <message>
        <source>Save the image to the gallery</source>
        <translation>Guardar la imagen en la galería</translation>
    </message>
    <message>
        <source>Snapshots &amp;with measurements</source>
        <translation>Instantáneas con &amp;mediciones</translation>
    </message>
    <message>
        <source>Draw the measured objects on snapshots</source>
        <translation>Dibujar los objetos medidos en las instantáneas</translation>
    </message>
    <message>
        <source>&amp;Freeze</source>
        <translation>&amp;Congelar</translation>
    </message>
    <message>
        <source>Freeze the live image</source>
        <translation>Congelar la imagen en vivo</translation>
    </message>
    <message>
        <source>&amp;Labels on the image</source>
        <translation>&amp;Etiquetas en la imagen</translation>
    </message>
    <message>
        <source>Show or hide the labels of objects</source>
        <translation>Mostrar u ocultar las etiquetas de los objetos</translation>
    </message>
    <message>
        <source>&amp;Rulers</source>
        <translation>Reg&amp;las</translation>
    </message>
    <message>
        <source>Show or hide the rulers</source>
        <translation>Mostrar u ocultar las reglas</translation>
    </message>
    <message>
        <source>&amp;Scale bar on the image</source>
        <translation>&amp;Barra de escala en la imagen</translation>
    </message>
    <message>
        <source>Show or hide the scale bar, on reports, too</source>
        <translation>Mostrar u ocultar la barra de escala, también en los informes</translation>
    </message>
    <message>
        <source>&amp;Gallery</source>
        <translation>&amp;Galería</translation>
    </message>
    <message>
        <source>Show or hide the gallery</source>
        <translation>Mostrar u ocultar la galería</translation>
    </message>
    <message>
        <source>&amp;Start page</source>
        <translation>Página de &amp;inicio</translation>
    </message>
    <message>
        <source>Show the first steps, the examples and the recent sessions</source>
        <translation>Mostrar los primeros pasos, los ejemplos y las sesiones recientes</translation>
    </message>
    <message>
        <source>&amp;User guide</source>
        <translation>&amp;Guía del usuario</translation>
    </message>
    <message>
        <source>Read the user guide</source>
        <translation>Leer la guía del usuario</translation>
    </message>
</context>
<context>
    <name>KvDeskAutosave</name>
    <message>
        <source>the folder &quot;%1&quot; cannot be written</source>
        <translation>no se puede escribir en la carpeta «%1»</translation>
    </message>
    <message>
        <source>Unsaved changes are not being copied: %1</source>
        <translation>No se están copiando los cambios sin guardar: %1</translation>
    </message>
</context>
<context>
    <name>KvDeskCalibrationCommands</name>
    <message>
        <source>The session measures with it already</source>
        <translation>La sesión ya mide con ese tamaño</translation>
    </message>
    <message>
        <source>The image&apos;s file does not state one</source>
        <translation>El archivo de imagen no indica ninguno</translation>
    </message>
</context>
<context>
    <name>KvDeskCalibrationDialog</name>
    <message>
        <source>Calibration</source>
        <translation>Calibración</translation>
    </message>
    <message>
        <source>Objective</source>
        <translation>Objetivo</translation>
    </message>
    <message>
        <source>Choose an objective, or type the name of a new one</source>
        <translation>Elija un objetivo o escriba el nombre de uno nuevo</translation>
    </message>
    <message>
        <source>Such as 10x</source>
        <translation>Por ejemplo, 10x</translation>
    </message>
    <message>
        <source>In use</source>
        <translation>En uso</translation>
    </message>
    <message>
        <source>New calibration</source>
        <translation>Nueva calibración</translation>
    </message>
    <message>
        <source>Known distance</source>
        <translation>Distancia conocida</translation>
    </message>
    <message>
        <source>Image file</source>
        <translation>Archivo de imagen</translation>
    </message>
    <message>
        <source>Typed</source>
        <translation>Manual</translation>
    </message>
    <message>
        <source>Name</source>
        <translation>Nombre</translation>
    </message>
    <message>
        <source>Who</source>
        <translation>Operador</translation>
    </message>
    <message>
        <source>Note</source>
        <translation>Nota</translation>
    </message>
    <message>
        <source>Calibrate</source>
        <translation>Calibrar</translation>
    </message>
    <message>
        <source>History of the objective</source>
        <translation>Historial del objetivo</translation>
    </message>
    <message>
        <source>Calibrations of this objective appear here</source>
        <translation>Aquí aparecen las calibraciones de este objetivo</translation>
    </message>
    <message>
        <source>Use again</source>
        <translation>Volver a usar</translation>
    </message>
    <message>
        <source>Close</source>
        <translation>Cerrar</translation>
    </message>
    <message>
        <source>New pixel size: %1</source>
        <translation>Nuevo tamaño de píxel: %1</translation>
    </message>
    <message>
        <source>No pixel size yet</source>
        <translation>Aún sin tamaño de píxel</translation>
    </message>
    <message>
        <source>Measure with this pixel size and remember it</source>
        <translation>Medir con este tamaño de píxel y recordarlo</translation>
    </message>
    <message>
        <source>Complete the fields above first</source>
        <translation>Complete primero los campos de arriba</translation>
    </message>
    <message>
        <source>Measure with the selected calibration</source>
        <translation>Medir con la calibración seleccionada</translation>
    </message>
    <message>
        <source>Select a calibration in the table first</source>
        <translation>Seleccione primero una calibración en la tabla</translation>
    </message>
</context>
<context>
    <name>KvDeskCalibrationHistory</name>
    <message>
        <source>Date</source>
        <translation>Fecha</translation>
    </message>
    <message>
        <source>Who</source>
        <translation>Operador</translation>
    </message>
    <message>
        <source>Pixel size</source>
        <translation>Tamaño de píxel</translation>
    </message>
    <message>
        <source>Origin</source>
        <translation>Origen</translation>
    </message>
    <message>
        <source>Name</source>
        <translation>Nombre</translation>
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
        <translation>Distancia conocida</translation>
    </message>
    <message>
        <source>Image file</source>
        <translation>Archivo de imagen</translation>
    </message>
    <message>
        <source>Typed</source>
        <translation>Manual</translation>
    </message>
    <message>
        <source>Not calibrated</source>
        <translation>Sin calibrar</translation>
    </message>
</context>
<context>
    <name>KvDeskCalibrationWay</name>
    <message>
        <source>Type a number such as 5.3 or 5,3</source>
        <translation>Escriba un número como 5.3 o 5,3</translation>
    </message>
    <message>
        <source>A pixel measures between %1 and %2</source>
        <translation>Un píxel mide entre %1 y %2</translation>
    </message>
</context>
<context>
    <name>KvDeskCalibrator</name>
    <message>
        <source>%1 states pixels of %2; the session measures with %3</source>
        <translation>%1 indica un tamaño de píxel de %2; la sesión mide con %3</translation>
    </message>
    <message>
        <source>%1 states pixels of %2; the session measures in pixels</source>
        <translation>%1 indica un tamaño de píxel de %2; la sesión mide en píxeles</translation>
    </message>
    <message>
        <source>Calibrated: %1, %2 per pixel</source>
        <extracomment>%1 is an objective or a file, %2 the size of a pixel with its unit</extracomment>
        <translation>Calibrado: %1, %2 por píxel</translation>
    </message>
</context>
<context>
    <name>KvDeskCommandLine</name>
    <message>
        <source>There is no theme &quot;%1&quot;: use %2</source>
        <translation>El tema «%1» no existe: use %2</translation>
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
        <translation>Uso: measuringdesk [OPCIÓN...] [SESIÓN|IMAGEN|TABLA|CARPETA|VÍDEO...]
Mide objetos en imágenes y muestra sus valores.

  --session ARCHIVO   abrir una sesión
  --image ARCHIVO     abrir una imagen
  --table ARCHIVO     importar una tabla de valores medidos
  --theme Dark|Light  tema para esta ejecución
  --plugins CARPETA   buscar complementos también aquí; puede indicarse varias veces
  --help              mostrar este texto
  --version           mostrar la versión

La variable de entorno STATREPORT_PLUGINS indica más carpetas con complementos.
</translation>
    </message>
    <message>
        <source>%1 (measuringdesk --help tells more)</source>
        <translation>%1 (más ayuda: measuringdesk --help)</translation>
    </message>
</context>
<context>
    <name>KvDeskCounterBar</name>
    <message>
        <source>Clicks count for</source>
        <translation>Los clics cuentan para</translation>
    </message>
    <message>
        <source>The counter that gets the clicks (1 to 9)</source>
        <translation>Contador que recibe los clics (1 a 9)</translation>
    </message>
    <message>
        <source>Count another class</source>
        <translation>Contar otra clase</translation>
    </message>
    <message>
        <source>A right click takes a place away</source>
        <translation>El clic derecho quita una marca</translation>
    </message>
    <message>
        <source>A new counter</source>
        <translation>Nuevo contador</translation>
    </message>
</context>
<context>
    <name>KvDeskEditCommands</name>
    <message>
        <source>&amp;Undo %1</source>
        <extracomment>%1 is what is undone or redone, such as &quot;move of Line 3&quot;</extracomment>
        <translation>&amp;Deshacer: %1</translation>
    </message>
    <message>
        <source>&amp;Undo</source>
        <translation>&amp;Deshacer</translation>
    </message>
    <message>
        <source>&amp;Redo %1</source>
        <translation>&amp;Rehacer: %1</translation>
    </message>
    <message>
        <source>&amp;Redo</source>
        <translation>&amp;Rehacer</translation>
    </message>
    <message>
        <source>Nothing was done yet</source>
        <translation>Aún no hay nada que deshacer</translation>
    </message>
    <message>
        <source>Nothing was undone</source>
        <translation>No hay nada que rehacer</translation>
    </message>
    <message>
        <source>Select an object first</source>
        <translation>Seleccione primero un objeto</translation>
    </message>
    <message>
        <source>Select one object first</source>
        <translation>Seleccione primero un solo objeto</translation>
    </message>
    <message>
        <source>No measured objects were copied</source>
        <translation>No se han copiado objetos medidos</translation>
    </message>
    <message>
        <source>Finish or cancel what you have begun first</source>
        <translation>Termine o cancele primero lo que ha empezado</translation>
    </message>
</context>
<context>
    <name>KvDeskExamples</name>
    <message>
        <source>Coin: first length</source>
        <translation>Moneda: longitud</translation>
    </message>
    <message>
        <source>Plate: dimensions</source>
        <translation>Placa: dimensiones</translation>
    </message>
    <message>
        <source>Cells: counting</source>
        <translation>Células: recuento</translation>
    </message>
    <message>
        <source>Fibres: statistics</source>
        <translation>Fibras: estadísticas</translation>
    </message>
</context>
<context>
    <name>KvDeskExportCommand</name>
    <message>
        <source>Nothing was measured yet</source>
        <translation>Aún no se ha medido nada</translation>
    </message>
    <message>
        <source>Measured values</source>
        <comment>file name</comment>
        <translation>Valores medidos</translation>
    </message>
    <message>
        <source>JSON files</source>
        <translation>Archivos JSON</translation>
    </message>
    <message>
        <source>CSV tables</source>
        <translation>Tablas CSV</translation>
    </message>
    <message>
        <source>Export measured values</source>
        <translation>Exportar valores medidos</translation>
    </message>
    <message>
        <source>Export cancelled: %1</source>
        <translation>Exportación cancelada: %1</translation>
    </message>
    <message>
        <source>The table &quot;%1&quot; was not written.</source>
        <translation>No se ha escrito la tabla «%1».</translation>
    </message>
    <message>
        <source>Measured values exported: %1</source>
        <translation>Valores medidos exportados: %1</translation>
    </message>
    <message>
        <source>Exporting measured values</source>
        <translation>Exportando valores medidos</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Cancelar</translation>
    </message>
</context>
<context>
    <name>KvDeskExportDialog</name>
    <message>
        <source>Export measured values</source>
        <translation>Exportar valores medidos</translation>
    </message>
    <message>
        <source>Table</source>
        <translation>Tabla</translation>
    </message>
    <message>
        <source>Numbers</source>
        <translation>Números</translation>
    </message>
    <message>
        <source>Byte order mark, for spreadsheets that do not expect UTF-8</source>
        <translation>Marca de orden de bytes (BOM), para hojas de cálculo que no esperan UTF-8</translation>
    </message>
    <message>
        <source>Apostrophe before names that spreadsheets take for formulas</source>
        <translation>Apóstrofo ante nombres que las hojas de cálculo toman por fórmulas</translation>
    </message>
    <message>
        <source>Changes names that begin with =, +, - or @: they are others when the table is imported again</source>
        <translation>Cambia los nombres que empiezan por =, +, - o @: serán distintos al volver a importar la tabla</translation>
    </message>
    <message>
        <source>Export...</source>
        <translation>Exportar...</translation>
    </message>
    <message>
        <source>CSV, one row per value</source>
        <translation>CSV, una fila por valor</translation>
    </message>
    <message>
        <source>CSV, one row per object</source>
        <translation>CSV, una fila por objeto</translation>
    </message>
    <message>
        <source>JSON</source>
        <translation>JSON</translation>
    </message>
    <message>
        <source>1.5, commas between the fields</source>
        <translation>1.5, comas entre los campos</translation>
    </message>
    <message>
        <source>1,5, semicolons between the fields (spreadsheets, %1)</source>
        <extracomment>%1 is the name of a language</extracomment>
        <translation>1,5, punto y coma entre los campos (hojas de cálculo, %1)</translation>
    </message>
    <message>
        <source>1.5, commas between the fields (spreadsheets, %1)</source>
        <translation>1.5, comas entre los campos (hojas de cálculo, %1)</translation>
    </message>
    <message>
        <source>For statistics programs. Can be imported here again.</source>
        <translation>Para programas de estadística. Se puede volver a importar aquí.</translation>
    </message>
    <message>
        <source>For spreadsheets. Headings name the units.</source>
        <translation>Para hojas de cálculo. Los encabezados indican las unidades.</translation>
    </message>
    <message>
        <source>For programs. Numbers always have a decimal point.</source>
        <translation>Para programas. Los números llevan siempre punto decimal.</translation>
    </message>
    <message>
        <source>No measured object is selected</source>
        <translation>No hay ningún objeto medido seleccionado</translation>
    </message>
    <message>
        <source>Concerns CSV tables only</source>
        <translation>Solo afecta a las tablas CSV</translation>
    </message>
    <message numerus="yes">
        <source>Only the selected object(s) (%n)</source>
        <translation>
            <numerusform>Solo el objeto seleccionado (%n)</numerusform>
            <numerusform>Solo los objetos seleccionados (%n)</numerusform>
        </translation>
    </message>
</context>
<context>
    <name>KvDeskExposureControl</name>
    <message>
        <source>E&amp;xposure</source>
        <translation>E&amp;xposición</translation>
    </message>
    <message>
        <source>Exposure time of the camera</source>
        <translation>Tiempo de exposición de la cámara</translation>
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
        <translation>Sesiones</translation>
    </message>
    <message>
        <source>All files</source>
        <translation>Todos los archivos</translation>
    </message>
    <message>
        <source>Unsaved changes</source>
        <translation>Cambios sin guardar</translation>
    </message>
    <message>
        <source>Save the changes to &quot;%1&quot;?</source>
        <translation>¿Desea guardar los cambios en «%1»?</translation>
    </message>
    <message>
        <source>The session &quot;%1&quot; was not opened.</source>
        <translation>No se ha abierto la sesión «%1».</translation>
    </message>
    <message>
        <source>Image missing</source>
        <translation>Falta la imagen</translation>
    </message>
    <message>
        <source>Open the session without its image?</source>
        <translation>¿Desea abrir la sesión sin su imagen?</translation>
    </message>
    <message>
        <source>The image &quot;%1&quot; was not opened.</source>
        <translation>No se ha abierto la imagen «%1».</translation>
    </message>
    <message>
        <source>Image opened: %1</source>
        <translation>Imagen abierta: %1</translation>
    </message>
    <message>
        <source>The table &quot;%1&quot; was not imported.</source>
        <translation>No se ha importado la tabla «%1».</translation>
    </message>
    <message>
        <source>%1: %2</source>
        <comment>file, remark</comment>
        <translation>%1: %2</translation>
    </message>
    <message>
        <source>The session &quot;%1&quot; was not saved.</source>
        <translation>No se ha guardado la sesión «%1».</translation>
    </message>
    <message>
        <source>Session saved: %1</source>
        <translation>Sesión guardada: %1</translation>
    </message>
    <message>
        <source>Open session</source>
        <translation>Abrir sesión</translation>
    </message>
    <message>
        <source>Open image</source>
        <translation>Abrir imagen</translation>
    </message>
    <message>
        <source>Images</source>
        <translation>Imágenes</translation>
    </message>
    <message>
        <source>Import table</source>
        <translation>Importar tabla</translation>
    </message>
    <message>
        <source>Tables</source>
        <translation>Tablas</translation>
    </message>
    <message>
        <source>Save session</source>
        <translation>Guardar sesión</translation>
    </message>
    <message>
        <source>Measuring Desk</source>
        <translation>Measuring Desk</translation>
    </message>
    <message>
        <source>Only one session can be open; not opened: %1</source>
        <translation>Solo puede haber una sesión abierta; no se ha abierto: %1</translation>
    </message>
    <message>
        <source>Neither a session, an image nor a table: %1</source>
        <translation>No es una sesión, ni una imagen, ni una tabla: %1</translation>
    </message>
    <message>
        <source>There is not enough memory</source>
        <translation>No hay memoria suficiente</translation>
    </message>
    <message>
        <source>Opening &quot;%1&quot;</source>
        <translation>Abriendo «%1»</translation>
    </message>
    <message>
        <source>The measurements were not restored.</source>
        <translation>No se han recuperado las mediciones.</translation>
    </message>
    <message>
        <source>Restoring measurements</source>
        <translation>Recuperando mediciones</translation>
    </message>
    <message>
        <source>Importing &quot;%1&quot;</source>
        <translation>Importando «%1»</translation>
    </message>
    <message>
        <source>Saving &quot;%1&quot;</source>
        <translation>Guardando «%1»</translation>
    </message>
    <message>
        <source>Session changed by another program</source>
        <translation>Sesión modificada por otro programa</translation>
    </message>
    <message>
        <source>&quot;%1&quot; was changed by another program. Overwrite its changes?</source>
        <translation>Otro programa ha modificado «%1». ¿Desea sobrescribir sus cambios?</translation>
    </message>
    <message>
        <source>Overwrite</source>
        <translation>Sobrescribir</translation>
    </message>
    <message>
        <source>Save as...</source>
        <translation>Guardar como...</translation>
    </message>
    <message numerus="yes">
        <source>%n files were not opened.</source>
        <extracomment>%n is 2 at least</extracomment>
        <translation>
            <numerusform>No se ha abierto %n archivo.</numerusform>
            <numerusform>No se han abierto %n archivos.</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Session opened: %1 (%n object(s))</source>
        <translation>
            <numerusform>Sesión abierta: %1 (%n objeto)</numerusform>
            <numerusform>Sesión abierta: %1 (%n objetos)</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Measurements restored: %1 (%n object(s))</source>
        <translation>
            <numerusform>Mediciones recuperadas: %1 (%n objeto)</numerusform>
            <numerusform>Mediciones recuperadas: %1 (%n objetos)</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Table imported: %1 (%n object(s))</source>
        <translation>
            <numerusform>Tabla importada: %1 (%n objeto)</numerusform>
            <numerusform>Tabla importada: %1 (%n objetos)</numerusform>
        </translation>
    </message>
</context>
<context>
    <name>KvDeskFilePixelSize</name>
    <message>
        <source>%1 states pixels of %2.</source>
        <comment>file, size</comment>
        <translation>%1 indica un tamaño de píxel de %2.</translation>
    </message>
    <message>
        <source>The image&apos;s file does not state how large its pixels are.</source>
        <translation>El archivo de imagen no indica el tamaño de sus píxeles.</translation>
    </message>
</context>
<context>
    <name>KvDeskGallery</name>
    <message>
        <source>Gallery</source>
        <translation>Galería</translation>
    </message>
    <message>
        <source>Hide the gallery</source>
        <translation>Ocultar la galería</translation>
    </message>
    <message>
        <source>&amp;Open image</source>
        <translation>&amp;Abrir imagen</translation>
    </message>
    <message>
        <source>&amp;Show in folder</source>
        <translation>Mostrar en la &amp;carpeta</translation>
    </message>
    <message>
        <source>&amp;Copy path</source>
        <translation>Copiar &amp;ruta</translation>
    </message>
    <message>
        <source>&amp;Move to trash...</source>
        <translation>Mover a la &amp;papelera...</translation>
    </message>
    <message>
        <source>Choose &amp;folder...</source>
        <translation>Elegir carpe&amp;ta...</translation>
    </message>
    <message>
        <source>Show the images of a folder</source>
        <translation>Mostrar las imágenes de una carpeta</translation>
    </message>
    <message>
        <source>Save s&amp;napshots in this folder</source>
        <translation>&amp;Guardar instantáneas en esta carpeta</translation>
    </message>
    <message>
        <source>Folder of the gallery</source>
        <translation>Carpeta de la galería</translation>
    </message>
    <message>
        <source>More commands of the gallery</source>
        <translation>Más comandos de la galería</translation>
    </message>
    <message>
        <source>Snapshots</source>
        <translation>Instantáneas</translation>
    </message>
    <message>
        <source>Choose folder</source>
        <translation>Elegir carpeta</translation>
    </message>
    <message>
        <source>Snapshots are saved in %1</source>
        <translation>Las instantáneas se guardan en %1</translation>
    </message>
    <message>
        <source>Snapshots (%1) and the images of a folder appear here; drag them onto report pages</source>
        <translation>Aquí aparecen las instantáneas (%1) y las imágenes de una carpeta; arrástrelas a las páginas del informe</translation>
    </message>
    <message>
        <source>There are no images in %1</source>
        <translation>No hay imágenes en %1</translation>
    </message>
    <message>
        <source>The folder %1 does not exist</source>
        <translation>La carpeta %1 no existe</translation>
    </message>
    <message>
        <source>Select an image first</source>
        <translation>Seleccione primero una imagen</translation>
    </message>
    <message>
        <source>Snapshots are saved in this folder already</source>
        <translation>Las instantáneas ya se guardan en esta carpeta</translation>
    </message>
    <message>
        <source>Move &quot;%1&quot; to the trash?</source>
        <translation>¿Desea mover «%1» a la papelera?</translation>
    </message>
    <message>
        <source>Move to trash</source>
        <translation>Mover a la papelera</translation>
    </message>
    <message>
        <source>Moved to the trash: %1</source>
        <translation>Movido a la papelera: %1</translation>
    </message>
    <message>
        <source>Not moved to the trash: %1</source>
        <translation>No se ha podido mover a la papelera: %1</translation>
    </message>
    <message>
        <source>Measuring Desk</source>
        <translation>Measuring Desk</translation>
    </message>
    <message>
        <source>The files are still there. They are write-protected, or there is no trash for them.</source>
        <translation>Los archivos siguen ahí. Están protegidos contra escritura o no hay papelera para ellos.</translation>
    </message>
    <message numerus="yes">
        <source>Move %n selected image(s) to the trash?</source>
        <translation>
            <numerusform>¿Desea mover %n imagen seleccionada a la papelera?</numerusform>
            <numerusform>¿Desea mover %n imágenes seleccionadas a la papelera?</numerusform>
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
        <translation>Galería</translation>
    </message>
</context>
<context>
    <name>KvDeskGuideCommand</name>
    <message>
        <source>The user guide is not installed</source>
        <translation>La guía del usuario no está instalada</translation>
    </message>
</context>
<context>
    <name>KvDeskGuideWindow</name>
    <message>
        <source>User guide</source>
        <translation>Guía del usuario</translation>
    </message>
    <message>
        <source>Contents</source>
        <translation>Contenido</translation>
    </message>
    <message>
        <source>Back</source>
        <translation>Atrás</translation>
    </message>
    <message>
        <source>Forward</source>
        <translation>Adelante</translation>
    </message>
    <message>
        <source>Find in the guide</source>
        <translation>Buscar en la guía</translation>
    </message>
    <message>
        <source>Find previous</source>
        <translation>Buscar anterior</translation>
    </message>
    <message>
        <source>Find next</source>
        <translation>Buscar siguiente</translation>
    </message>
    <message>
        <source>This is the first place</source>
        <translation>Este es el primer lugar visitado</translation>
    </message>
    <message>
        <source>This is the last place</source>
        <translation>Este es el último lugar visitado</translation>
    </message>
    <message>
        <source>Not found</source>
        <translation>No encontrado</translation>
    </message>
    <message>
        <source>Type what to find first</source>
        <translation>Escriba primero lo que desea buscar</translation>
    </message>
</context>
<context>
    <name>KvDeskImageView</name>
    <message>
        <source>Image</source>
        <translation>Imagen</translation>
    </message>
    <message>
        <source>Open an image or a session to start</source>
        <translation>Abra una imagen o una sesión para empezar</translation>
    </message>
</context>
<context>
    <name>KvDeskInlineEditor</name>
    <message>
        <source>Text</source>
        <translation>Texto</translation>
    </message>
    <message>
        <source>Name</source>
        <translation>Nombre</translation>
    </message>
</context>
<context>
    <name>KvDeskKnownDistance</name>
    <message>
        <source>inch</source>
        <translation>pulgadas</translation>
    </message>
    <message>
        <source>Use selected line</source>
        <translation>Usar línea seleccionada</translation>
    </message>
    <message>
        <source>Length of the line</source>
        <translation>Longitud de la línea</translation>
    </message>
    <message>
        <source>Unit of the length</source>
        <translation>Unidad de la longitud</translation>
    </message>
    <message>
        <source>Its length</source>
        <translation>Su longitud</translation>
    </message>
    <message>
        <source>Draw a line over a distance that you know, such as on a stage micrometer, and select it.</source>
        <translation>Dibuje una línea sobre una distancia conocida, por ejemplo en un micrómetro de platina, y selecciónela.</translation>
    </message>
    <message>
        <source>No line yet</source>
        <translation>Aún no hay línea</translation>
    </message>
    <message>
        <source>%1: %2</source>
        <comment>name and length of a line</comment>
        <translation>%1: %2</translation>
    </message>
    <message>
        <source>Take the selected line as the known distance</source>
        <translation>Tomar la línea seleccionada como distancia conocida</translation>
    </message>
    <message>
        <source>Select one line on the image first</source>
        <translation>Seleccione primero una sola línea en la imagen</translation>
    </message>
</context>
<context>
    <name>KvDeskLiveBar</name>
    <message>
        <source>Live image</source>
        <translation>Imagen en vivo</translation>
    </message>
    <message>
        <source>Freeze</source>
        <translation>Congelar</translation>
    </message>
    <message>
        <source>%1 fps</source>
        <extracomment>frames per second</extracomment>
        <translation>%1 fps</translation>
    </message>
    <message>
        <source>%1 delivers no pictures any more; this is the last one</source>
        <translation>%1 ya no envía imágenes; esta es la última</translation>
    </message>
    <message>
        <source>%1 delivers no pictures</source>
        <translation>%1 no envía imágenes</translation>
    </message>
    <message>
        <source>%1 is stopped</source>
        <translation>Fuente detenida: %1</translation>
    </message>
    <message>
        <source>Waiting for the first picture of %1</source>
        <translation>Esperando la primera imagen de %1</translation>
    </message>
    <message>
        <source>Frozen: %1</source>
        <translation>Congelada: %1</translation>
    </message>
    <message>
        <source>Live: %1</source>
        <translation>En vivo: %1</translation>
    </message>
    <message>
        <source>This image is not live</source>
        <translation>No es una imagen en vivo</translation>
    </message>
    <message>
        <source>&amp;Reconnect</source>
        <translation>&amp;Reconectar</translation>
    </message>
    <message>
        <source>&amp;Start</source>
        <translation>I&amp;niciar</translation>
    </message>
    <message>
        <source>Frames per second
Dropped, because newer ones came first: %1</source>
        <translation>Fotogramas por segundo
Descartados porque llegaron antes otros más nuevos: %1</translation>
    </message>
    <message>
        <source>Stop the live image; other programs can use the camera then</source>
        <translation>Detener la imagen en vivo; entonces otros programas podrán usar la cámara</translation>
    </message>
</context>
<context>
    <name>KvDeskMainWindow</name>
    <message>
        <source>&amp;File</source>
        <translation>&amp;Archivo</translation>
    </message>
    <message>
        <source>&amp;Recent sessions</source>
        <translation>Sesiones &amp;recientes</translation>
    </message>
    <message>
        <source>&amp;View</source>
        <translation>&amp;Ver</translation>
    </message>
    <message>
        <source>&amp;Help</source>
        <translation>A&amp;yuda</translation>
    </message>
    <message>
        <source>Main tool bar</source>
        <translation>Barra de herramientas principal</translation>
    </message>
    <message>
        <source>%1[*] - Measuring Desk</source>
        <extracomment>%1 is the name of a session; [*] is replaced by a star when it has unsaved changes</extracomment>
        <translation>%1[*] - Measuring Desk</translation>
    </message>
    <message>
        <source>None yet</source>
        <translation>Ninguna todavía</translation>
    </message>
    <message>
        <source>About Measuring Desk</source>
        <translation>Acerca de Measuring Desk</translation>
    </message>
    <message>
        <source>&lt;b&gt;Measuring Desk %1&lt;/b&gt;&lt;p&gt;Measures objects on images, and hosts plug-ins such as the statistics reports.&lt;/p&gt;&lt;p&gt;%2, MIT licence&lt;/p&gt;</source>
        <translation>&lt;b&gt;Measuring Desk %1&lt;/b&gt;&lt;p&gt;Mide objetos en imágenes y admite complementos, como los informes estadísticos.&lt;/p&gt;&lt;p&gt;%2, licencia MIT&lt;/p&gt;</translation>
    </message>
    <message>
        <source>Measuring Desk</source>
        <translation>Measuring Desk</translation>
    </message>
    <message>
        <source>&amp;Edit</source>
        <translation>&amp;Edición</translation>
    </message>
    <message>
        <source>&amp;Image</source>
        <translation>&amp;Imagen</translation>
    </message>
    <message>
        <source>&amp;Measure</source>
        <translation>&amp;Medir</translation>
    </message>
    <message>
        <source>Choose the image source</source>
        <translation>Elegir la fuente de imagen</translation>
    </message>
</context>
<context>
    <name>KvDeskNotice</name>
    <message>
        <source>Close this message</source>
        <translation>Cerrar este mensaje</translation>
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
        <translation>Objeto</translation>
    </message>
    <message>
        <source>Value name</source>
        <translation>Magnitud</translation>
    </message>
    <message>
        <source>Value</source>
        <translation>Valor</translation>
    </message>
</context>
<context>
    <name>KvDeskObjectEditor</name>
    <message numerus="yes">
        <source>%n objects</source>
        <comment>several measured objects</comment>
        <extracomment>%n is 2 at least</extracomment>
        <translation>
            <numerusform>%n objeto</numerusform>
            <numerusform>%n objetos</numerusform>
        </translation>
    </message>
    <message>
        <source>drawing of %1</source>
        <translation>dibujo de %1</translation>
    </message>
    <message>
        <source>change of %1</source>
        <translation>modificación de %1</translation>
    </message>
    <message>
        <source>move of %1</source>
        <translation>desplazamiento de %1</translation>
    </message>
    <message>
        <source>renaming of %1</source>
        <translation>cambio de nombre de %1</translation>
    </message>
    <message>
        <source>text of %1</source>
        <translation>texto de %1</translation>
    </message>
    <message>
        <source>showing of %1 of %2</source>
        <extracomment>%1 is a value, %2 an object</extracomment>
        <translation>visualización de %1 de %2</translation>
    </message>
    <message>
        <source>hiding of %1 of %2</source>
        <translation>ocultación de %1 de %2</translation>
    </message>
    <message>
        <source>deletion of %1</source>
        <translation>eliminación de %1</translation>
    </message>
    <message>
        <source>change of the calibration</source>
        <translation>cambio de calibración</translation>
    </message>
    <message>
        <source>place of %1</source>
        <translation>nueva marca de %1</translation>
    </message>
    <message>
        <source>deletion of a place of %1</source>
        <translation>eliminación de una marca de %1</translation>
    </message>
    <message>
        <source>pasting of %1</source>
        <translation>pegado de %1</translation>
    </message>
    <message>
        <source>import of %1</source>
        <translation>importar %1</translation>
    </message>
</context>
<context>
    <name>KvDeskPlugins</name>
    <message>
        <source>No plug-ins were found</source>
        <translation>No se han encontrado complementos</translation>
    </message>
    <message>
        <source>It is no plug-in for this program</source>
        <translation>No es un complemento para este programa</translation>
    </message>
    <message>
        <source>Its tools &quot;%1&quot; could not be started</source>
        <translation>No se han podido iniciar sus herramientas «%1»</translation>
    </message>
    <message>
        <source>Plug-in loaded: %1</source>
        <translation>Complemento cargado: %1</translation>
    </message>
    <message>
        <source>Plug-in not loaded: %1: %2</source>
        <translation>Complemento no cargado: %1: %2</translation>
    </message>
    <message>
        <source>It failed: %1</source>
        <translation>Ha fallado: %1</translation>
    </message>
    <message>
        <source>It failed for a reason of its own</source>
        <translation>Ha fallado por un motivo desconocido</translation>
    </message>
</context>
<context>
    <name>KvDeskProgress</name>
    <message>
        <source>Cancel</source>
        <translation>Cancelar</translation>
    </message>
    <message>
        <source>Leave everything as it was (Esc)</source>
        <translation>Dejar todo como estaba (Esc)</translation>
    </message>
    <message>
        <source>This can no longer be cancelled</source>
        <translation>Ya no se puede cancelar</translation>
    </message>
</context>
<context>
    <name>KvDeskRecovery</name>
    <message>
        <source>Untitled session</source>
        <translation>Sesión sin título</translation>
    </message>
    <message numerus="yes">
        <source>%1 (%n object(s))</source>
        <extracomment>%1 is the name of a session</extracomment>
        <translation>
            <numerusform>%1 (%n objeto)</numerusform>
            <numerusform>%1 (%n objetos)</numerusform>
        </translation>
    </message>
</context>
<context>
    <name>KvDeskRecoveryBar</name>
    <message>
        <source>Show other measurements that were not saved</source>
        <translation>Mostrar otras mediciones que no se guardaron</translation>
    </message>
    <message>
        <source>Restore</source>
        <translation>Recuperar</translation>
    </message>
    <message>
        <source>Open these measurements as a session with unsaved changes</source>
        <translation>Abrir estas mediciones como una sesión con cambios sin guardar</translation>
    </message>
    <message>
        <source>Discard</source>
        <translation>Descartar</translation>
    </message>
    <message>
        <source>Delete these measurements for good</source>
        <translation>Eliminar estas mediciones definitivamente</translation>
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
            <numerusform>%n más</numerusform>
            <numerusform>%n más</numerusform>
        </translation>
    </message>
    <message>
        <source>Measurements from %1 were not saved.</source>
        <translation>Hay mediciones sin guardar (%1).</translation>
    </message>
</context>
<context>
    <name>KvDeskRuler</name>
    <message>
        <source>Horizontal ruler</source>
        <translation>Regla horizontal</translation>
    </message>
    <message>
        <source>Vertical ruler</source>
        <translation>Regla vertical</translation>
    </message>
    <message>
        <source>Ruler in %1</source>
        <translation>Regla en %1</translation>
    </message>
</context>
<context>
    <name>KvDeskSelectionStatistics</name>
    <message>
        <source>n = %1, mean %2, SD %3, min %4, max %5</source>
        <extracomment>number of values, their mean, standard deviation, smallest and largest one</extracomment>
        <translation>n = %1, media %2, DE %3, mín. %4, máx. %5</translation>
    </message>
    <message>
        <source>Selected values: %1</source>
        <translation>Valores seleccionados: %1</translation>
    </message>
    <message>
        <source>Mean: %1</source>
        <translation>Media: %1</translation>
    </message>
    <message>
        <source>Standard deviation: %1</source>
        <translation>Desviación estándar: %1</translation>
    </message>
    <message>
        <source>Smallest: %1</source>
        <translation>Mínimo: %1</translation>
    </message>
    <message>
        <source>Largest: %1</source>
        <translation>Máximo: %1</translation>
    </message>
</context>
<context>
    <name>KvDeskSession</name>
    <message>
        <source>Untitled session</source>
        <translation>Sesión sin título</translation>
    </message>
</context>
<context>
    <name>KvDeskSettingsDialog</name>
    <message>
        <source>Settings</source>
        <translation>Configuración</translation>
    </message>
    <message>
        <source>Appearance</source>
        <translation>Apariencia</translation>
    </message>
    <message>
        <source>Theme</source>
        <translation>Tema</translation>
    </message>
    <message>
        <source>Dark</source>
        <translation>Oscuro</translation>
    </message>
    <message>
        <source>Light</source>
        <translation>Claro</translation>
    </message>
    <message>
        <source>Language</source>
        <translation>Idioma</translation>
    </message>
    <message>
        <source>Another language takes effect when the program is started again.</source>
        <translation>El cambio de idioma se aplica al reiniciar el programa.</translation>
    </message>
    <message>
        <source>Measured values</source>
        <translation>Valores medidos</translation>
    </message>
    <message>
        <source>Automatic</source>
        <translation>Automático</translation>
    </message>
    <message>
        <source>Significant digits</source>
        <translation>Cifras significativas</translation>
    </message>
    <message>
        <source>Length unit</source>
        <translation>Unidad de longitud</translation>
    </message>
    <message>
        <source>Angle unit</source>
        <translation>Unidad de ángulo</translation>
    </message>
    <message>
        <source>Degrees (°)</source>
        <translation>Grados (°)</translation>
    </message>
    <message>
        <source>Radians (rad)</source>
        <translation>Radianes (rad)</translation>
    </message>
    <message>
        <source>System default</source>
        <translation>Idioma del sistema</translation>
    </message>
    <message>
        <source>Nothing was changed yet</source>
        <translation>Aún no se ha cambiado nada</translation>
    </message>
</context>
<context>
    <name>KvDeskSnapshotFile</name>
    <message>
        <source>The folder cannot be created</source>
        <translation>No se puede crear la carpeta</translation>
    </message>
    <message>
        <source>The picture cannot be encoded</source>
        <translation>No se puede codificar la imagen</translation>
    </message>
</context>
<context>
    <name>KvDeskSnapshots</name>
    <message>
        <source>Open an image first</source>
        <translation>Abra primero una imagen</translation>
    </message>
    <message>
        <source>No snapshot was taken: earlier ones are still being saved</source>
        <translation>No se ha tomado la instantánea: aún se están guardando otras anteriores</translation>
    </message>
    <message>
        <source>Snapshot saved: %1</source>
        <translation>Instantánea guardada: %1</translation>
    </message>
    <message>
        <source>The snapshot was not saved. %1</source>
        <translation>No se ha guardado la instantánea. %1</translation>
    </message>
</context>
<context>
    <name>KvDeskSourceCommands</name>
    <message>
        <source>The image source &quot;%1&quot; was not opened.</source>
        <translation>No se ha abierto la fuente de imagen «%1».</translation>
    </message>
    <message>
        <source>Image source: %1</source>
        <translation>Fuente de imagen: %1</translation>
    </message>
    <message>
        <source>Open image folder</source>
        <translation>Abrir carpeta de imágenes</translation>
    </message>
    <message>
        <source>Open video</source>
        <translation>Abrir vídeo</translation>
    </message>
    <message>
        <source>Videos</source>
        <translation>Vídeos</translation>
    </message>
</context>
<context>
    <name>KvDeskSourceMenu</name>
    <message>
        <source>Image &amp;source</source>
        <translation>&amp;Fuente de imagen</translation>
    </message>
    <message>
        <source>Still &amp;image...</source>
        <translation>Imagen &amp;fija...</translation>
    </message>
    <message>
        <source>Image &amp;folder...</source>
        <translation>&amp;Carpeta de imágenes...</translation>
    </message>
    <message>
        <source>Play the images of a folder like a camera</source>
        <translation>Reproducir las imágenes de una carpeta como una cámara</translation>
    </message>
    <message>
        <source>&amp;Video...</source>
        <translation>&amp;Vídeo...</translation>
    </message>
    <message>
        <source>Play a video like a camera</source>
        <translation>Reproducir un vídeo como una cámara</translation>
    </message>
    <message>
        <source>Looking for cameras...</source>
        <translation>Buscando cámaras...</translation>
    </message>
    <message>
        <source>No camera is connected</source>
        <translation>No hay ninguna cámara conectada</translation>
    </message>
</context>
<context>
    <name>KvDeskStartPage</name>
    <message>
        <source>From an image to a report</source>
        <translation>De la imagen al informe</translation>
    </message>
    <message>
        <source>Back to the image</source>
        <translation>Volver a la imagen</translation>
    </message>
    <message>
        <source>%1 (%2)</source>
        <comment>command (shortcut)</comment>
        <translation>%1 (%2)</translation>
    </message>
    <message>
        <source>Open an image</source>
        <translation>Abrir una imagen</translation>
    </message>
    <message>
        <source>A picture file, or the live image of a camera.</source>
        <translation>Un archivo de imagen o la imagen en vivo de una cámara.</translation>
    </message>
    <message>
        <source>Choose a camera or another source</source>
        <translation>Elegir una cámara u otra fuente</translation>
    </message>
    <message>
        <source>Calibrate</source>
        <translation>Calibrar</translation>
    </message>
    <message>
        <source>Say how large a pixel is. The examples are calibrated already.</source>
        <translation>Indique el tamaño de un píxel. Los ejemplos ya están calibrados.</translation>
    </message>
    <message>
        <source>Measure and report</source>
        <translation>Medir y crear el informe</translation>
    </message>
    <message>
        <source>Drag a line over the image: its length is listed at once. The report panel makes a PDF of all values.</source>
        <translation>Trace una línea sobre la imagen: su longitud aparece al momento en la lista. El panel de informes crea un PDF con todos los valores.</translation>
    </message>
    <message>
        <source>Examples to try</source>
        <translation>Ejemplos para probar</translation>
    </message>
    <message>
        <source>Recent sessions</source>
        <translation>Sesiones recientes</translation>
    </message>
    <message>
        <source>Open an image first</source>
        <translation>Abra primero una imagen</translation>
    </message>
    <message>
        <source>Open a copy of this example</source>
        <translation>Abrir una copia de este ejemplo</translation>
    </message>
</context>
<context>
    <name>KvDeskStatus</name>
    <message>
        <source>Warning</source>
        <translation>Advertencia</translation>
    </message>
    <message>
        <source>Error</source>
        <translation>Error</translation>
    </message>
    <message>
        <source>Information</source>
        <translation>Información</translation>
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
        <translation>Estadísticas de los valores seleccionados</translation>
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
        <translation>Registro de estado</translation>
    </message>
    <message>
        <source>Hide the status log</source>
        <translation>Ocultar el registro de estado</translation>
    </message>
    <message>
        <source>Clear the status log</source>
        <translation>Vaciar el registro de estado</translation>
    </message>
    <message>
        <source>Messages of the program and its plug-ins appear here</source>
        <translation>Aquí aparecen los mensajes del programa y sus complementos</translation>
    </message>
    <message>
        <source>There are no messages</source>
        <translation>No hay mensajes</translation>
    </message>
</context>
<context>
    <name>KvDeskStatusLogModel</name>
    <message>
        <source>%1
Reported by %2</source>
        <comment>message, source</comment>
        <translation>%1
Notificado por %2</translation>
    </message>
    <message>
        <source>Category</source>
        <translation>Categoría</translation>
    </message>
    <message>
        <source>Time</source>
        <translation>Hora</translation>
    </message>
    <message>
        <source>Message</source>
        <translation>Mensaje</translation>
    </message>
</context>
<context>
    <name>KvDeskTableView</name>
    <message>
        <source>Copy</source>
        <translation>Copiar</translation>
    </message>
</context>
<context>
    <name>KvDeskToolStrip</name>
    <message>
        <source>Measuring tools</source>
        <translation>Herramientas de medición</translation>
    </message>
</context>
<context>
    <name>KvDeskTypedPixelSize</name>
    <message>
        <source>Width of a pixel in micrometres</source>
        <translation>Ancho de un píxel en micrómetros</translation>
    </message>
    <message>
        <source>Height of a pixel in micrometres</source>
        <translation>Alto de un píxel en micrómetros</translation>
    </message>
    <message>
        <source>Same size in both directions</source>
        <translation>Mismo tamaño en ambas direcciones</translation>
    </message>
    <message>
        <source>Width</source>
        <translation>Ancho</translation>
    </message>
    <message>
        <source>Height</source>
        <translation>Alto</translation>
    </message>
    <message>
        <source>Type how large a pixel of the image is in reality.</source>
        <translation>Indique el tamaño real de un píxel de la imagen.</translation>
    </message>
</context>
<context>
    <name>KvDeskValueCommands</name>
    <message>
        <source>Rename</source>
        <translation>Cambiar nombre</translation>
    </message>
    <message>
        <source>Delete object</source>
        <translation>Eliminar objeto</translation>
    </message>
    <message>
        <source>Hide value</source>
        <translation>Ocultar valor</translation>
    </message>
    <message>
        <source>Show all values of the object</source>
        <translation>Mostrar todos los valores del objeto</translation>
    </message>
    <message>
        <source>Select one object first</source>
        <translation>Seleccione primero un solo objeto</translation>
    </message>
    <message>
        <source>Select an object first</source>
        <translation>Seleccione primero un objeto</translation>
    </message>
    <message>
        <source>Select a value first</source>
        <translation>Seleccione primero un valor</translation>
    </message>
    <message>
        <source>No value of the selected object is hidden</source>
        <translation>No hay ningún valor oculto en el objeto seleccionado</translation>
    </message>
    <message>
        <source>showing of values</source>
        <translation>visualización de valores</translation>
    </message>
    <message>
        <source>hiding of values</source>
        <translation>ocultación de valores</translation>
    </message>
</context>
<context>
    <name>KvDeskValueTable</name>
    <message>
        <source>Measured values</source>
        <translation>Valores medidos</translation>
    </message>
    <message>
        <source>Hide the measured values</source>
        <translation>Ocultar los valores medidos</translation>
    </message>
    <message>
        <source>Filter by type, object or value name</source>
        <translation>Filtrar por tipo, objeto o magnitud</translation>
    </message>
    <message>
        <source>Filter of the measured values</source>
        <translation>Filtro de los valores medidos</translation>
    </message>
    <message>
        <source>Shows only rows that have all of these words</source>
        <translation>Muestra solo las filas que contienen todas estas palabras</translation>
    </message>
    <message>
        <source>No measured value matches the filter</source>
        <translation>Ningún valor medido coincide con el filtro</translation>
    </message>
    <message>
        <source>Clear the filter</source>
        <translation>Borrar el filtro</translation>
    </message>
    <message>
        <source>%1 of %2</source>
        <extracomment>rows that match the filter, all rows</extracomment>
        <translation>%1 de %2</translation>
    </message>
    <message>
        <source>Measured values appear here once something is measured or imported</source>
        <translation>Los valores medidos aparecen aquí en cuanto se mide o se importa algo</translation>
    </message>
    <message>
        <source>There are no measured values yet</source>
        <translation>Aún no hay valores medidos</translation>
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
        <translation>Objeto</translation>
    </message>
    <message>
        <source>Value name</source>
        <translation>Magnitud</translation>
    </message>
    <message>
        <source>Value</source>
        <translation>Valor</translation>
    </message>
</context>
<context>
    <name>KvToolBase</name>
    <message>
        <source>Reset</source>
        <translation>Restablecer</translation>
    </message>
    <message>
        <source>Reset to the default values</source>
        <translation>Restablecer los valores predeterminados</translation>
    </message>
</context>
<context>
    <name>QPlatformTheme</name>
    <message>
        <source>OK</source>
        <translation>Aceptar</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Cancelar</translation>
    </message>
    <message>
        <source>Apply</source>
        <translation>Aplicar</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>Guardar</translation>
    </message>
    <message>
        <source>Open</source>
        <translation>Abrir</translation>
    </message>
    <message>
        <source>Close</source>
        <translation>Cerrar</translation>
    </message>
    <message>
        <source>Discard</source>
        <translation>Descartar</translation>
    </message>
    <message>
        <source>&amp;Yes</source>
        <translation>&amp;Sí</translation>
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
        <translation>No se ha podido guardar la configuración en %1. Compruebe que se puede escribir en la carpeta.</translation>
    </message>
    <message>
        <source>The settings file %1 cannot be read. Changes to the settings will not be kept.</source>
        <translation>No se puede leer el archivo de configuración %1. Los cambios en la configuración no se conservarán.</translation>
    </message>
    <message>
        <source>The settings file %1 is damaged. It was renamed to %2; all settings are back at their defaults.</source>
        <translation>El archivo de configuración %1 está dañado. Se le ha cambiado el nombre a %2; toda la configuración vuelve a sus valores predeterminados.</translation>
    </message>
    <message>
        <source>The settings file %1 is damaged and could not be renamed to %2. Changes to the settings will not be kept.</source>
        <translation>El archivo de configuración %1 está dañado y no se le ha podido cambiar el nombre a %2. Los cambios en la configuración no se conservarán.</translation>
    </message>
</context>
<context>
    <name>ZtAravisSource</name>
    <message>
        <source>%1 is disconnected; its last picture stays</source>
        <translation>%1 se ha desconectado; se mantiene su última imagen</translation>
    </message>
    <message>
        <source>%1 delivers pictures of a kind that cannot be shown</source>
        <translation>%1 envía imágenes en un formato que no se puede mostrar</translation>
    </message>
    <message>
        <source>The camera does not take the setting (%1)</source>
        <translation>La cámara no acepta la configuración (%1)</translation>
    </message>
    <message>
        <source>%1 cannot be opened (%2)</source>
        <translation>No se puede abrir %1 (%2)</translation>
    </message>
</context>
<context>
    <name>ZtCalibrationStore</name>
    <message>
        <source>This is not a calibration</source>
        <translation>Esto no es una calibración</translation>
    </message>
    <message>
        <source>A calibration in the settings is damaged and was left out (%1: %2)</source>
        <translation>Una calibración de la configuración está dañada y se ha omitido (%1: %2)</translation>
    </message>
</context>
<context>
    <name>ZtCsvReader</name>
    <message>
        <source>A quoted text does not end</source>
        <translation>Un texto entre comillas no termina</translation>
    </message>
    <message>
        <source>There is text after a closing quote</source>
        <translation>Hay texto después de las comillas de cierre</translation>
    </message>
    <message>
        <source>Reading was cancelled</source>
        <translation>Lectura cancelada</translation>
    </message>
</context>
<context>
    <name>ZtDrawnType</name>
    <message>
        <source>Rectangle</source>
        <translation>Rectángulo</translation>
    </message>
    <message>
        <source>Width</source>
        <translation>Ancho</translation>
    </message>
    <message>
        <source>Height</source>
        <translation>Alto</translation>
    </message>
    <message>
        <source>Area</source>
        <translation>Área</translation>
    </message>
    <message>
        <source>Line</source>
        <translation>Línea</translation>
    </message>
    <message>
        <source>Length</source>
        <translation>Longitud</translation>
    </message>
    <message>
        <source>Arc</source>
        <translation>Arco</translation>
    </message>
    <message>
        <source>Angle</source>
        <translation>Ángulo</translation>
    </message>
    <message>
        <source>Arc length</source>
        <translation>Longitud de arco</translation>
    </message>
    <message>
        <source>Polygon</source>
        <translation>Polígono</translation>
    </message>
    <message>
        <source>Perimeter</source>
        <translation>Perímetro</translation>
    </message>
    <message>
        <source>Polyline</source>
        <translation>Polilínea</translation>
    </message>
    <message>
        <source>Parallel distance</source>
        <translation>Distancia punto-línea</translation>
    </message>
    <message>
        <source>Distance</source>
        <translation>Distancia</translation>
    </message>
    <message>
        <source>Text note</source>
        <translation>Nota de texto</translation>
    </message>
    <message>
        <source>Scale bar</source>
        <translation>Barra de escala</translation>
    </message>
    <message>
        <source>Counter</source>
        <translation>Contador</translation>
    </message>
    <message>
        <source>Count</source>
        <translation>Recuento</translation>
    </message>
    <message>
        <source>Share</source>
        <translation>Porcentaje</translation>
    </message>
    <message>
        <source>Circle</source>
        <translation>Círculo</translation>
    </message>
    <message>
        <source>Diameter</source>
        <translation>Diámetro</translation>
    </message>
</context>
<context>
    <name>ZtFileFault</name>
    <message>
        <source>No such file or directory</source>
        <translation>no existe el fichero o el directorio</translation>
    </message>
    <message>
        <source>Permission denied</source>
        <translation>permiso denegado</translation>
    </message>
    <message>
        <source>Is a directory</source>
        <translation>es un directorio</translation>
    </message>
    <message>
        <source>Not a directory</source>
        <translation>no es un directorio</translation>
    </message>
    <message>
        <source>File name too long</source>
        <translation>nombre de fichero demasiado largo</translation>
    </message>
    <message>
        <source>No space left on device</source>
        <translation>no queda espacio en el dispositivo</translation>
    </message>
    <message>
        <source>Read-only file system</source>
        <translation>sistema de ficheros de solo lectura</translation>
    </message>
    <message>
        <source>Input/output error</source>
        <translation>error de entrada/salida</translation>
    </message>
</context>
<context>
    <name>ZtFrameSourceCatalogue</name>
    <message>
        <source>This program cannot play videos</source>
        <translation>Este programa no puede reproducir vídeos</translation>
    </message>
    <message>
        <source>This program knows no cameras of this kind</source>
        <translation>Este programa no reconoce cámaras de este tipo</translation>
    </message>
</context>
<context>
    <name>ZtImageFolderSource</name>
    <message>
        <source>%1: no picture of the folder can be shown</source>
        <translation>%1: no se puede mostrar ninguna imagen de la carpeta</translation>
    </message>
    <message>
        <source>The folder does not exist</source>
        <translation>La carpeta no existe</translation>
    </message>
    <message>
        <source>The folder cannot be read</source>
        <translation>No se puede leer la carpeta</translation>
    </message>
    <message>
        <source>The folder holds no pictures</source>
        <translation>La carpeta no contiene imágenes</translation>
    </message>
</context>
<context>
    <name>ZtKernelImage</name>
    <message>
        <source>%1 delivers pictures again</source>
        <translation>%1 vuelve a enviar imágenes</translation>
    </message>
</context>
<context>
    <name>ZtLiveFrameSource</name>
    <message>
        <source>%1 has stopped delivering pictures; the last one stays</source>
        <translation>%1 ha dejado de enviar imágenes; se mantiene la última</translation>
    </message>
</context>
<context>
    <name>ZtMeasureFormat</name>
    <message>
        <source>pcs</source>
        <translation>uds.</translation>
    </message>
</context>
<context>
    <name>ZtSession</name>
    <message>
        <source>The file is empty</source>
        <translation>El archivo está vacío</translation>
    </message>
    <message>
        <source>The file is not a session</source>
        <translation>El archivo no es una sesión</translation>
    </message>
    <message>
        <source>The file cannot be written (%1)</source>
        <translation>No se puede escribir en el archivo (%1)</translation>
    </message>
    <message>
        <source>This must be a list</source>
        <translation>Debe ser una lista</translation>
    </message>
    <message>
        <source>This must be a text</source>
        <translation>Debe ser un texto</translation>
    </message>
    <message>
        <source>This must be a whole number from 1</source>
        <translation>Debe ser un número entero a partir de 1</translation>
    </message>
    <message>
        <source>This must be a number</source>
        <translation>Debe ser un número</translation>
    </message>
    <message>
        <source>This must be a number greater than 0</source>
        <translation>Debe ser un número mayor que 0</translation>
    </message>
    <message>
        <source>Another object of this type has the same number</source>
        <translation>Otro objeto de este tipo tiene el mismo número</translation>
    </message>
    <message>
        <source>This must be an object</source>
        <translation>Debe ser un objeto JSON</translation>
    </message>
    <message>
        <source>&quot;%1&quot; is not a type of objects</source>
        <translation>«%1» no es un tipo de objeto</translation>
    </message>
    <message>
        <source>An object of type &quot;%1&quot; cannot have this number of points (%2)</source>
        <translation>Un objeto del tipo «%1» no puede tener este número de puntos (%2)</translation>
    </message>
    <message>
        <source>A point must be a list of two numbers between -1e9 and 1e9</source>
        <translation>Un punto debe ser una lista de dos números entre -1e9 y 1e9</translation>
    </message>
    <message>
        <source>This must be the name of a value</source>
        <translation>Debe ser el nombre de un valor</translation>
    </message>
    <message>
        <source>The type has no name</source>
        <translation>El tipo no tiene nombre</translation>
    </message>
    <message>
        <source>A value must have a name of its own</source>
        <translation>Cada valor debe tener un nombre único</translation>
    </message>
    <message>
        <source>The numbers of the rows must rise</source>
        <translation>Los números de las filas deben ser crecientes</translation>
    </message>
    <message>
        <source>A row must be a list of number, name and values</source>
        <translation>Una fila debe ser una lista de número, nombre y valores</translation>
    </message>
    <message>
        <source>This must be a text or null</source>
        <translation>Debe ser un texto o null</translation>
    </message>
    <message>
        <source>This must be a list or an object</source>
        <translation>Debe ser una lista o un objeto JSON</translation>
    </message>
    <message>
        <source>The table has no such value</source>
        <translation>La tabla no tiene ese valor</translation>
    </message>
    <message>
        <source>This must be the text of a number</source>
        <translation>Debe ser el texto de un número</translation>
    </message>
    <message>
        <source>The unit does not fit that of the value</source>
        <translation>La unidad no concuerda con la del valor</translation>
    </message>
    <message>
        <source>The file is nested too deeply</source>
        <translation>El archivo tiene demasiados niveles de anidamiento</translation>
    </message>
    <message>
        <source>The file is not valid JSON (%1)</source>
        <translation>El archivo no es JSON válido (%1)</translation>
    </message>
    <message>
        <source>The file does not exist</source>
        <translation>El archivo no existe</translation>
    </message>
    <message>
        <source>This is a folder, not a file</source>
        <translation>Es una carpeta, no un archivo</translation>
    </message>
    <message>
        <source>The file cannot be read (%1)</source>
        <translation>No se puede leer el archivo (%1)</translation>
    </message>
    <message>
        <source>The file is too large for a session</source>
        <translation>El archivo es demasiado grande para una sesión</translation>
    </message>
    <message>
        <source>This must be a date such as 2026-01-31T12:00:00Z</source>
        <translation>Debe ser una fecha como 2026-01-31T12:00:00Z</translation>
    </message>
    <message>
        <source>This must be &quot;knownDistance&quot;, &quot;metadata&quot; or &quot;typed&quot;</source>
        <translation>Debe ser &quot;knownDistance&quot;, &quot;metadata&quot; o &quot;typed&quot;</translation>
    </message>
    <message>
        <source>The file is write-protected</source>
        <translation>El archivo está protegido contra escritura</translation>
    </message>
    <message>
        <source>Writing was cancelled</source>
        <translation>Escritura cancelada</translation>
    </message>
    <message>
        <source>Reading was cancelled</source>
        <translation>Lectura cancelada</translation>
    </message>
    <message>
        <source>The session is of the newer version %1; this program reads versions up to %2</source>
        <translation>La sesión es de la versión %1, más reciente; este programa lee versiones hasta la %2</translation>
    </message>
    <message>
        <source>Sessions of version %1 are not known; this program reads versions %2 to %3</source>
        <translation>Las sesiones de la versión %1 no se reconocen; este programa lee las versiones de la %2 a la %3</translation>
    </message>
    <message>
        <source>This file is a table of values; import it</source>
        <translation>Este archivo es una tabla de valores; impórtela</translation>
    </message>
</context>
<context>
    <name>ZtStillImageSource</name>
    <message>
        <source>The picture does not exist</source>
        <translation>La imagen no existe</translation>
    </message>
    <message>
        <source>This is a folder, not a picture</source>
        <translation>Es una carpeta, no una imagen</translation>
    </message>
    <message>
        <source>The picture cannot be read</source>
        <translation>No se puede leer la imagen</translation>
    </message>
    <message>
        <source>The picture has %1 x %2 pixels, which is too many</source>
        <translation>La imagen tiene %1 x %2 píxeles, que son demasiados</translation>
    </message>
    <message>
        <source>The picture cannot be decoded (%1)</source>
        <translation>No se puede decodificar la imagen (%1)</translation>
    </message>
    <message>
        <source>the file is empty</source>
        <translation>el archivo está vacío</translation>
    </message>
    <message>
        <source>it has no size</source>
        <translation>no tiene tamaño</translation>
    </message>
    <message>
        <source>the file is damaged</source>
        <translation>el archivo está dañado</translation>
    </message>
    <message>
        <source>the file is too short for its picture</source>
        <translation>el archivo es demasiado corto para su imagen</translation>
    </message>
    <message>
        <source>there is not enough memory</source>
        <translation>no hay memoria suficiente</translation>
    </message>
</context>
<context>
    <name>ZtTableImport</name>
    <message>
        <source>&quot;%1&quot; already has a value &quot;%2&quot; in line %3</source>
        <translation>«%1» ya tiene un valor «%2» en la línea %3</translation>
    </message>
    <message>
        <source>The file does not exist</source>
        <translation>El archivo no existe</translation>
    </message>
    <message>
        <source>This is a folder, not a file</source>
        <translation>Es una carpeta, no un archivo</translation>
    </message>
    <message>
        <source>The file cannot be read (%1)</source>
        <translation>No se puede leer el archivo (%1)</translation>
    </message>
    <message>
        <source>The table is not open for reading</source>
        <translation>La tabla no está abierta para lectura</translation>
    </message>
    <message>
        <source>The table has no rows</source>
        <translation>La tabla no tiene filas</translation>
    </message>
    <message>
        <source>The row and the header differ in their number of fields (%1 and %2)</source>
        <translation>La fila y el encabezado difieren en el número de campos (%1 y %2)</translation>
    </message>
    <message>
        <source>%1 is not a finite number</source>
        <translation>%1 no es un número finito</translation>
    </message>
    <message>
        <source>%1 is not a number</source>
        <translation>%1 no es un número</translation>
    </message>
    <message>
        <source>&quot;%1&quot; of &quot;%2&quot; is given in &quot;%3&quot; here, but in &quot;%4&quot; before</source>
        <translation>«%1» de «%2» tiene aquí la unidad «%3», pero antes «%4»</translation>
    </message>
    <message>
        <source>There is no column %1; the columns are %2</source>
        <translation>No existe la columna %1; las columnas son %2</translation>
    </message>
    <message>
        <source>Object</source>
        <translation>Objeto</translation>
    </message>
    <message>
        <source>There is no value %1 to give a unit; the values are %2</source>
        <translation>No existe el valor %1 al que dar una unidad; los valores son %2</translation>
    </message>
    <message>
        <source>The first line announces rows without values</source>
        <translation>La primera línea anuncia filas sin valores</translation>
    </message>
    <message>
        <source>There is no column %1; the columns of this table have no names</source>
        <translation>No existe la columna %1; las columnas de esta tabla no tienen nombre</translation>
    </message>
    <message>
        <source>%1 is not the index of a class; they go from 0 to %2</source>
        <translation>%1 no es el índice de una clase; van de 0 a %2</translation>
    </message>
    <message>
        <source>Value %1</source>
        <translation>Valor %1</translation>
    </message>
    <message>
        <source>The file is larger than %1 MB</source>
        <translation>El archivo ocupa más de %1 MB</translation>
    </message>
    <message>
        <source>The file is empty</source>
        <translation>El archivo está vacío</translation>
    </message>
    <message>
        <source>The first line does not name the columns</source>
        <translation>La primera línea no da nombre a las columnas</translation>
    </message>
    <message>
        <source>Column %1 is not part of a list of values and was left out</source>
        <translation>La columna %1 no forma parte de una lista de valores y se ha omitido</translation>
    </message>
    <message>
        <source>Columns %1 are not part of a list of values and were left out</source>
        <translation>Las columnas %1 no forman parte de una lista de valores y se han omitido</translation>
    </message>
    <message>
        <source>The value has no name</source>
        <translation>El valor no tiene nombre</translation>
    </message>
    <message>
        <source>The row does not say which object it belongs to</source>
        <translation>La fila no indica a qué objeto pertenece</translation>
    </message>
    <message>
        <source>%1 is not a unit</source>
        <translation>%1 no es una unidad</translation>
    </message>
    <message>
        <source>There is no column of numbers</source>
        <translation>No hay ninguna columna de números</translation>
    </message>
    <message>
        <source>Column %1</source>
        <translation>Columna %1</translation>
    </message>
    <message>
        <source>Column %1 holds text and was left out</source>
        <translation>La columna %1 contiene texto y se ha omitido</translation>
    </message>
    <message>
        <source>Columns %1 hold text and were left out</source>
        <translation>Las columnas %1 contienen texto y se han omitido</translation>
    </message>
    <message>
        <source>Reading was cancelled</source>
        <translation>Lectura cancelada</translation>
    </message>
    <message numerus="yes">
        <source>The table has %n row(s), its first line announces %1</source>
        <translation>
            <numerusform>La tabla tiene %n fila, pero su primera línea anuncia %1</numerusform>
            <numerusform>La tabla tiene %n filas, pero su primera línea anuncia %1</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>The row has %n field(s) instead of %1</source>
        <translation>
            <numerusform>La fila tiene %n campo en lugar de %1</numerusform>
            <numerusform>La fila tiene %n campos en lugar de %1</numerusform>
        </translation>
    </message>
    <message>
        <source>The records have too many different names</source>
        <translation>Los registros tienen demasiados nombres distintos</translation>
    </message>
    <message>
        <source>This file is a session, not a table; open it</source>
        <translation>Este archivo es una sesión, no una tabla; ábrala</translation>
    </message>
    <message>
        <source>The file is neither a list of records nor an export of values</source>
        <translation>El archivo no es una lista de registros ni una exportación de valores</translation>
    </message>
    <message>
        <source>This name comes twice</source>
        <translation>Este nombre aparece dos veces</translation>
    </message>
    <message>
        <source>This must be a text, a number or null</source>
        <translation>Aquí debe haber un texto, un número o null</translation>
    </message>
    <message>
        <source>The table is of version %1; this program reads version %2</source>
        <translation>La tabla es de la versión %1; este programa lee la versión %2</translation>
    </message>
</context>
<context>
    <name>ZtTextDecoder</name>
    <message>
        <source>The file is not a text file: it holds a NUL character</source>
        <translation>El archivo no es de texto: contiene un carácter NUL</translation>
    </message>
    <message>
        <source>The file is not valid UTF-16 text</source>
        <translation>El archivo no es texto UTF-16 válido</translation>
    </message>
    <message>
        <source>The text is not valid UTF-8</source>
        <translation>El texto no es UTF-8 válido</translation>
    </message>
</context>
<context>
    <name>ZtUvcCameraSource</name>
    <message>
        <source>%1 is not connected</source>
        <translation>%1 no está conectada</translation>
    </message>
    <message>
        <source>%1 is disconnected or in use (%2)</source>
        <translation>%1 está desconectada o en uso (%2)</translation>
    </message>
</context>
<context>
    <name>ZtVideoFileSource</name>
    <message>
        <source>The video does not exist</source>
        <translation>El vídeo no existe</translation>
    </message>
    <message>
        <source>The video cannot be read</source>
        <translation>No se puede leer el vídeo</translation>
    </message>
    <message>
        <source>The video is empty</source>
        <translation>El vídeo está vacío</translation>
    </message>
    <message>
        <source>there is only sound in it</source>
        <translation>solo contiene sonido</translation>
    </message>
    <message>
        <source>The video %1 cannot be played (%2)</source>
        <translation>No se puede reproducir el vídeo %1 (%2)</translation>
    </message>
    <message>
        <source>the file is damaged</source>
        <translation>el archivo está dañado</translation>
    </message>
</context>
<context>
    <name>acss</name>
    <message>
        <source>The icon %1 is missing.</source>
        <translation>Falta el icono %1.</translation>
    </message>
</context>
</TS>
