<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="en_US" sourcelanguage="en_US">
<context>
    <name>KvDeskActions</name>
    <message>
        <source>&amp;New session</source>
        <translation>&amp;New session</translation>
    </message>
    <message>
        <source>Start an empty session</source>
        <translation>Start an empty session</translation>
    </message>
    <message>
        <source>Open &amp;image...</source>
        <translation>Open &amp;image...</translation>
    </message>
    <message>
        <source>Open image</source>
        <translation>Open image</translation>
    </message>
    <message>
        <source>&amp;Open session...</source>
        <translation>&amp;Open session...</translation>
    </message>
    <message>
        <source>Open session</source>
        <translation>Open session</translation>
    </message>
    <message>
        <source>Import &amp;table...</source>
        <translation>Import &amp;table...</translation>
    </message>
    <message>
        <source>Import table of measured values</source>
        <translation>Import table of measured values</translation>
    </message>
    <message>
        <source>&amp;Save session</source>
        <translation>&amp;Save session</translation>
    </message>
    <message>
        <source>Save session</source>
        <translation>Save session</translation>
    </message>
    <message>
        <source>Save session &amp;as...</source>
        <translation>Save session &amp;as...</translation>
    </message>
    <message>
        <source>Save session to another file</source>
        <translation>Save session to another file</translation>
    </message>
    <message>
        <source>&amp;Quit</source>
        <translation>&amp;Quit</translation>
    </message>
    <message>
        <source>Quit the program</source>
        <translation>Quit the program</translation>
    </message>
    <message>
        <source>Zoom &amp;in</source>
        <translation>Zoom &amp;in</translation>
    </message>
    <message>
        <source>Zoom in</source>
        <translation>Zoom in</translation>
    </message>
    <message>
        <source>Zoom &amp;out</source>
        <translation>Zoom &amp;out</translation>
    </message>
    <message>
        <source>Zoom out</source>
        <translation>Zoom out</translation>
    </message>
    <message>
        <source>&amp;Fit to window</source>
        <translation>&amp;Fit to window</translation>
    </message>
    <message>
        <source>Show the whole image</source>
        <translation>Show the whole image</translation>
    </message>
    <message>
        <source>&amp;Actual size</source>
        <translation>&amp;Actual size</translation>
    </message>
    <message>
        <source>Show the image at 100 %</source>
        <translation>Show the image at 100 %</translation>
    </message>
    <message>
        <source>&amp;Measured values</source>
        <translation>&amp;Measured values</translation>
    </message>
    <message>
        <source>Show or hide the measured values</source>
        <translation>Show or hide the measured values</translation>
    </message>
    <message>
        <source>Stat&amp;us log</source>
        <translation>Stat&amp;us log</translation>
    </message>
    <message>
        <source>Show or hide the status log</source>
        <translation>Show or hide the status log</translation>
    </message>
    <message>
        <source>&amp;Dark or light theme</source>
        <translation>&amp;Dark or light theme</translation>
    </message>
    <message>
        <source>Change between the dark and the light theme</source>
        <translation>Change between the dark and the light theme</translation>
    </message>
    <message>
        <source>Settin&amp;gs...</source>
        <translation>Settin&amp;gs...</translation>
    </message>
    <message>
        <source>Settings</source>
        <translation>Settings</translation>
    </message>
    <message>
        <source>&amp;About Measuring Desk</source>
        <translation>&amp;About Measuring Desk</translation>
    </message>
    <message>
        <source>About Measuring Desk</source>
        <translation>About Measuring Desk</translation>
    </message>
    <message>
        <source>%1 (%2)</source>
        <comment>command (shortcut)</comment>
        <translation>%1 (%2)</translation>
    </message>
    <message>
        <source>&amp;Export measured values...</source>
        <translation>&amp;Export measured values...</translation>
    </message>
    <message>
        <source>Export measured values as a table</source>
        <translation>Export measured values as a table</translation>
    </message>
    <message>
        <source>&amp;Undo</source>
        <translation>&amp;Undo</translation>
    </message>
    <message>
        <source>Undo the last step</source>
        <translation>Undo the last step</translation>
    </message>
    <message>
        <source>&amp;Redo</source>
        <translation>&amp;Redo</translation>
    </message>
    <message>
        <source>Redo what was undone</source>
        <translation>Redo what was undone</translation>
    </message>
    <message>
        <source>Cu&amp;t</source>
        <translation>Cu&amp;t</translation>
    </message>
    <message>
        <source>Cut the selected objects</source>
        <translation>Cut the selected objects</translation>
    </message>
    <message>
        <source>&amp;Copy</source>
        <translation>&amp;Copy</translation>
    </message>
    <message>
        <source>Copy the selected objects</source>
        <translation>Copy the selected objects</translation>
    </message>
    <message>
        <source>&amp;Paste</source>
        <translation>&amp;Paste</translation>
    </message>
    <message>
        <source>Paste copied objects</source>
        <translation>Paste copied objects</translation>
    </message>
    <message>
        <source>&amp;Delete</source>
        <translation>&amp;Delete</translation>
    </message>
    <message>
        <source>Delete the selected objects</source>
        <translation>Delete the selected objects</translation>
    </message>
    <message>
        <source>Select &amp;all</source>
        <translation>Select &amp;all</translation>
    </message>
    <message>
        <source>Select all objects on the image</source>
        <translation>Select all objects on the image</translation>
    </message>
    <message>
        <source>Re&amp;name</source>
        <translation>Re&amp;name</translation>
    </message>
    <message>
        <source>Give the selected object a name</source>
        <translation>Give the selected object a name</translation>
    </message>
    <message>
        <source>&amp;Find measured values</source>
        <translation>&amp;Find measured values</translation>
    </message>
    <message>
        <source>Filter the measured values</source>
        <translation>Filter the measured values</translation>
    </message>
    <message>
        <source>&amp;Select</source>
        <translation>&amp;Select</translation>
    </message>
    <message>
        <source>Select and change objects</source>
        <translation>Select and change objects</translation>
    </message>
    <message>
        <source>&amp;Line</source>
        <translation>&amp;Line</translation>
    </message>
    <message>
        <source>Measure a length</source>
        <translation>Measure a length</translation>
    </message>
    <message>
        <source>&amp;Polyline</source>
        <translation>&amp;Polyline</translation>
    </message>
    <message>
        <source>Measure the length of a way</source>
        <translation>Measure the length of a way</translation>
    </message>
    <message>
        <source>Parallel &amp;distance</source>
        <translation>Parallel &amp;distance</translation>
    </message>
    <message>
        <source>Measure the distance of a point from a line</source>
        <translation>Measure the distance of a point from a line</translation>
    </message>
    <message>
        <source>&amp;Arc</source>
        <translation>&amp;Arc</translation>
    </message>
    <message>
        <source>Measure an arc through three points</source>
        <translation>Measure an arc through three points</translation>
    </message>
    <message>
        <source>&amp;Circle</source>
        <translation>&amp;Circle</translation>
    </message>
    <message>
        <source>Measure a circle</source>
        <translation>Measure a circle</translation>
    </message>
    <message>
        <source>&amp;Rectangle</source>
        <translation>&amp;Rectangle</translation>
    </message>
    <message>
        <source>Measure a rectangle</source>
        <translation>Measure a rectangle</translation>
    </message>
    <message>
        <source>Poly&amp;gon</source>
        <translation>Poly&amp;gon</translation>
    </message>
    <message>
        <source>Measure the area of a polygon</source>
        <translation>Measure the area of a polygon</translation>
    </message>
    <message>
        <source>Cou&amp;nter</source>
        <translation>Cou&amp;nter</translation>
    </message>
    <message>
        <source>Count by clicks</source>
        <translation>Count by clicks</translation>
    </message>
    <message>
        <source>&amp;Text note</source>
        <translation>&amp;Text note</translation>
    </message>
    <message>
        <source>Write on the image</source>
        <translation>Write on the image</translation>
    </message>
    <message>
        <source>Scale &amp;bar</source>
        <translation>Scale &amp;bar</translation>
    </message>
    <message>
        <source>Draw a scale bar</source>
        <translation>Draw a scale bar</translation>
    </message>
    <message>
        <source>Cal&amp;ibration...</source>
        <translation>Cal&amp;ibration...</translation>
    </message>
    <message>
        <source>Say how large a pixel of the image is</source>
        <translation>Say how large a pixel of the image is</translation>
    </message>
    <message>
        <source>Use the file&apos;s pixel size</source>
        <translation>Use the file&apos;s pixel size</translation>
    </message>
    <message>
        <source>Measure with the pixel size that the image&apos;s file states</source>
        <translation>Measure with the pixel size that the image&apos;s file states</translation>
    </message>
    <message>
        <source>&amp;Take snapshot</source>
        <translation>&amp;Take snapshot</translation>
    </message>
    <message>
        <source>Save the image to the gallery</source>
        <translation>Save the image to the gallery</translation>
    </message>
    <message>
        <source>Snapshots &amp;with measurements</source>
        <translation>Snapshots &amp;with measurements</translation>
    </message>
    <message>
        <source>Draw the measured objects on snapshots</source>
        <translation>Draw the measured objects on snapshots</translation>
    </message>
    <message>
        <source>&amp;Freeze</source>
        <translation>&amp;Freeze</translation>
    </message>
    <message>
        <source>Freeze the live image</source>
        <translation>Freeze the live image</translation>
    </message>
    <message>
        <source>&amp;Labels on the image</source>
        <translation>&amp;Labels on the image</translation>
    </message>
    <message>
        <source>Show or hide the labels of objects</source>
        <translation>Show or hide the labels of objects</translation>
    </message>
    <message>
        <source>&amp;Rulers</source>
        <translation>&amp;Rulers</translation>
    </message>
    <message>
        <source>Show or hide the rulers</source>
        <translation>Show or hide the rulers</translation>
    </message>
    <message>
        <source>&amp;Scale bar on the image</source>
        <translation>&amp;Scale bar on the image</translation>
    </message>
    <message>
        <source>Show or hide the scale bar, on reports, too</source>
        <translation>Show or hide the scale bar, on reports, too</translation>
    </message>
    <message>
        <source>&amp;Gallery</source>
        <translation>&amp;Gallery</translation>
    </message>
    <message>
        <source>Show or hide the gallery</source>
        <translation>Show or hide the gallery</translation>
    </message>
    <message>
        <source>&amp;Start page</source>
        <translation>&amp;Start page</translation>
    </message>
    <message>
        <source>Show the first steps, the examples and the recent sessions</source>
        <translation>Show the first steps, the examples and the recent sessions</translation>
    </message>
    <message>
        <source>&amp;User guide</source>
        <translation>&amp;User guide</translation>
    </message>
    <message>
        <source>Read the user guide</source>
        <translation>Read the user guide</translation>
    </message>
</context>
<context>
    <name>KvDeskAutosave</name>
    <message>
        <source>the folder &quot;%1&quot; cannot be written</source>
        <translation>the folder &quot;%1&quot; cannot be written</translation>
    </message>
    <message>
        <source>Unsaved changes are not being copied: %1</source>
        <translation>Unsaved changes are not being copied: %1</translation>
    </message>
</context>
<context>
    <name>KvDeskCalibrationCommands</name>
    <message>
        <source>The session measures with it already</source>
        <translation>The session measures with it already</translation>
    </message>
    <message>
        <source>The image&apos;s file does not state one</source>
        <translation>The image&apos;s file does not state one</translation>
    </message>
</context>
<context>
    <name>KvDeskCalibrationDialog</name>
    <message>
        <source>Calibration</source>
        <translation>Calibration</translation>
    </message>
    <message>
        <source>Objective</source>
        <translation>Objective</translation>
    </message>
    <message>
        <source>Choose an objective, or type the name of a new one</source>
        <translation>Choose an objective, or type the name of a new one</translation>
    </message>
    <message>
        <source>Such as 10x</source>
        <translation>Such as 10x</translation>
    </message>
    <message>
        <source>In use</source>
        <translation>In use</translation>
    </message>
    <message>
        <source>New calibration</source>
        <translation>New calibration</translation>
    </message>
    <message>
        <source>Known distance</source>
        <translation>Known distance</translation>
    </message>
    <message>
        <source>Image file</source>
        <translation>Image file</translation>
    </message>
    <message>
        <source>Typed</source>
        <translation>Typed</translation>
    </message>
    <message>
        <source>Name</source>
        <translation>Name</translation>
    </message>
    <message>
        <source>Who</source>
        <translation>Who</translation>
    </message>
    <message>
        <source>Note</source>
        <translation>Note</translation>
    </message>
    <message>
        <source>Calibrate</source>
        <translation>Calibrate</translation>
    </message>
    <message>
        <source>History of the objective</source>
        <translation>History of the objective</translation>
    </message>
    <message>
        <source>Calibrations of this objective appear here</source>
        <translation>Calibrations of this objective appear here</translation>
    </message>
    <message>
        <source>Use again</source>
        <translation>Use again</translation>
    </message>
    <message>
        <source>Close</source>
        <translation>Close</translation>
    </message>
    <message>
        <source>New pixel size: %1</source>
        <translation>New pixel size: %1</translation>
    </message>
    <message>
        <source>No pixel size yet</source>
        <translation>No pixel size yet</translation>
    </message>
    <message>
        <source>Measure with this pixel size and remember it</source>
        <translation>Measure with this pixel size and remember it</translation>
    </message>
    <message>
        <source>Complete the fields above first</source>
        <translation>Complete the fields above first</translation>
    </message>
    <message>
        <source>Measure with the selected calibration</source>
        <translation>Measure with the selected calibration</translation>
    </message>
    <message>
        <source>Select a calibration in the table first</source>
        <translation>Select a calibration in the table first</translation>
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
        <translation>Who</translation>
    </message>
    <message>
        <source>Pixel size</source>
        <translation>Pixel size</translation>
    </message>
    <message>
        <source>Origin</source>
        <translation>Origin</translation>
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
        <translation>%1 μm</translation>
    </message>
    <message>
        <source>%1 × %2 μm</source>
        <comment>width and height of a pixel</comment>
        <translation>%1 × %2 μm</translation>
    </message>
    <message>
        <source>Known distance</source>
        <translation>Known distance</translation>
    </message>
    <message>
        <source>Image file</source>
        <translation>Image file</translation>
    </message>
    <message>
        <source>Typed</source>
        <translation>Typed</translation>
    </message>
    <message>
        <source>Not calibrated</source>
        <translation>Not calibrated</translation>
    </message>
</context>
<context>
    <name>KvDeskCalibrationWay</name>
    <message>
        <source>Type a number such as 5.3 or 5,3</source>
        <translation>Type a number such as 5.3 or 5,3</translation>
    </message>
    <message>
        <source>A pixel measures between %1 and %2</source>
        <translation>A pixel measures between %1 and %2</translation>
    </message>
</context>
<context>
    <name>KvDeskCalibrator</name>
    <message>
        <source>%1 states pixels of %2; the session measures with %3</source>
        <translation>%1 states pixels of %2; the session measures with %3</translation>
    </message>
    <message>
        <source>%1 states pixels of %2; the session measures in pixels</source>
        <translation>%1 states pixels of %2; the session measures in pixels</translation>
    </message>
    <message>
        <source>Calibrated: %1, %2 per pixel</source>
        <extracomment>%1 is an objective or a file, %2 the size of a pixel with its unit</extracomment>
        <translation>Calibrated: %1, %2 per pixel</translation>
    </message>
</context>
<context>
    <name>KvDeskCommandLine</name>
    <message>
        <source>There is no theme &quot;%1&quot;: use %2</source>
        <translation>There is no theme &quot;%1&quot;: use %2</translation>
    </message>
    <message>
        <source> or </source>
        <translation> or </translation>
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
        <translation>Usage: measuringdesk [OPTION...] [SESSION|IMAGE|TABLE|FOLDER|VIDEO...]
Measures objects on images and shows their values.

  --session FILE      open a session
  --image FILE        open an image
  --table FILE        import a table of measured values
  --theme Dark|Light  theme of this run
  --plugins DIR       look for plug-ins here, too; can be given several times
  --help              show this text
  --version           show the version

The environment variable STATREPORT_PLUGINS names more folders with plug-ins.
</translation>
    </message>
    <message>
        <source>%1 (measuringdesk --help tells more)</source>
        <translation>%1 (measuringdesk --help tells more)</translation>
    </message>
</context>
<context>
    <name>KvDeskCounterBar</name>
    <message>
        <source>Clicks count for</source>
        <translation>Clicks count for</translation>
    </message>
    <message>
        <source>The counter that gets the clicks (1 to 9)</source>
        <translation>The counter that gets the clicks (1 to 9)</translation>
    </message>
    <message>
        <source>Count another class</source>
        <translation>Count another class</translation>
    </message>
    <message>
        <source>A right click takes a place away</source>
        <translation>A right click takes a place away</translation>
    </message>
    <message>
        <source>A new counter</source>
        <translation>A new counter</translation>
    </message>
</context>
<context>
    <name>KvDeskEditCommands</name>
    <message>
        <source>&amp;Undo %1</source>
        <extracomment>%1 is what is undone or redone, such as &quot;move of Line 3&quot;</extracomment>
        <translation>&amp;Undo %1</translation>
    </message>
    <message>
        <source>&amp;Undo</source>
        <translation>&amp;Undo</translation>
    </message>
    <message>
        <source>&amp;Redo %1</source>
        <translation>&amp;Redo %1</translation>
    </message>
    <message>
        <source>&amp;Redo</source>
        <translation>&amp;Redo</translation>
    </message>
    <message>
        <source>Nothing was done yet</source>
        <translation>Nothing was done yet</translation>
    </message>
    <message>
        <source>Nothing was undone</source>
        <translation>Nothing was undone</translation>
    </message>
    <message>
        <source>Select an object first</source>
        <translation>Select an object first</translation>
    </message>
    <message>
        <source>Select one object first</source>
        <translation>Select one object first</translation>
    </message>
    <message>
        <source>No measured objects were copied</source>
        <translation>No measured objects were copied</translation>
    </message>
    <message>
        <source>Finish or cancel what you have begun first</source>
        <translation>Finish or cancel what you have begun first</translation>
    </message>
</context>
<context>
    <name>KvDeskExamples</name>
    <message>
        <source>Coin: first length</source>
        <translation>Coin: first length</translation>
    </message>
    <message>
        <source>Plate: dimensions</source>
        <translation>Plate: dimensions</translation>
    </message>
    <message>
        <source>Cells: counting</source>
        <translation>Cells: counting</translation>
    </message>
    <message>
        <source>Fibres: statistics</source>
        <translation>Fibres: statistics</translation>
    </message>
</context>
<context>
    <name>KvDeskExportCommand</name>
    <message>
        <source>Nothing was measured yet</source>
        <translation>Nothing was measured yet</translation>
    </message>
    <message>
        <source>Measured values</source>
        <comment>file name</comment>
        <translation>Measured values</translation>
    </message>
    <message>
        <source>JSON files</source>
        <translation>JSON files</translation>
    </message>
    <message>
        <source>CSV tables</source>
        <translation>CSV tables</translation>
    </message>
    <message>
        <source>Export measured values</source>
        <translation>Export measured values</translation>
    </message>
    <message>
        <source>Export cancelled: %1</source>
        <translation>Export cancelled: %1</translation>
    </message>
    <message>
        <source>The table &quot;%1&quot; was not written.</source>
        <translation>The table &quot;%1&quot; was not written.</translation>
    </message>
    <message>
        <source>Measured values exported: %1</source>
        <translation>Measured values exported: %1</translation>
    </message>
    <message>
        <source>Exporting measured values</source>
        <translation>Exporting measured values</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Cancel</translation>
    </message>
</context>
<context>
    <name>KvDeskExportDialog</name>
    <message>
        <source>Export measured values</source>
        <translation>Export measured values</translation>
    </message>
    <message>
        <source>Table</source>
        <translation>Table</translation>
    </message>
    <message>
        <source>Numbers</source>
        <translation>Numbers</translation>
    </message>
    <message>
        <source>Byte order mark, for spreadsheets that do not expect UTF-8</source>
        <translation>Byte order mark, for spreadsheets that do not expect UTF-8</translation>
    </message>
    <message>
        <source>Apostrophe before names that spreadsheets take for formulas</source>
        <translation>Apostrophe before names that spreadsheets take for formulas</translation>
    </message>
    <message>
        <source>Changes names that begin with =, +, - or @: they are others when the table is imported again</source>
        <translation>Changes names that begin with =, +, - or @: they are others when the table is imported again</translation>
    </message>
    <message>
        <source>Export...</source>
        <translation>Export...</translation>
    </message>
    <message>
        <source>CSV, one row per value</source>
        <translation>CSV, one row per value</translation>
    </message>
    <message>
        <source>CSV, one row per object</source>
        <translation>CSV, one row per object</translation>
    </message>
    <message>
        <source>JSON</source>
        <translation>JSON</translation>
    </message>
    <message>
        <source>1.5, commas between the fields</source>
        <translation>1.5, commas between the fields</translation>
    </message>
    <message>
        <source>1,5, semicolons between the fields (spreadsheets, %1)</source>
        <extracomment>%1 is the name of a language</extracomment>
        <translation>1,5, semicolons between the fields (spreadsheets, %1)</translation>
    </message>
    <message>
        <source>1.5, commas between the fields (spreadsheets, %1)</source>
        <translation>1.5, commas between the fields (spreadsheets, %1)</translation>
    </message>
    <message>
        <source>For statistics programs. Can be imported here again.</source>
        <translation>For statistics programs. Can be imported here again.</translation>
    </message>
    <message>
        <source>For spreadsheets. Headings name the units.</source>
        <translation>For spreadsheets. Headings name the units.</translation>
    </message>
    <message>
        <source>For programs. Numbers always have a decimal point.</source>
        <translation>For programs. Numbers always have a decimal point.</translation>
    </message>
    <message>
        <source>No measured object is selected</source>
        <translation>No measured object is selected</translation>
    </message>
    <message>
        <source>Concerns CSV tables only</source>
        <translation>Concerns CSV tables only</translation>
    </message>
    <message numerus="yes">
        <source>Only the selected object(s) (%n)</source>
        <translation>
            <numerusform>Only the selected object (%n)</numerusform>
            <numerusform>Only the selected objects (%n)</numerusform>
        </translation>
    </message>
</context>
<context>
    <name>KvDeskExposureControl</name>
    <message>
        <source>E&amp;xposure</source>
        <translation>E&amp;xposure</translation>
    </message>
    <message>
        <source>Exposure time of the camera</source>
        <translation>Exposure time of the camera</translation>
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
        <translation>All files</translation>
    </message>
    <message>
        <source>Unsaved changes</source>
        <translation>Unsaved changes</translation>
    </message>
    <message>
        <source>Save the changes to &quot;%1&quot;?</source>
        <translation>Save the changes to &quot;%1&quot;?</translation>
    </message>
    <message>
        <source>The session &quot;%1&quot; was not opened.</source>
        <translation>The session &quot;%1&quot; was not opened.</translation>
    </message>
    <message>
        <source>Image missing</source>
        <translation>Image missing</translation>
    </message>
    <message>
        <source>Open the session without its image?</source>
        <translation>Open the session without its image?</translation>
    </message>
    <message>
        <source>The image &quot;%1&quot; was not opened.</source>
        <translation>The image &quot;%1&quot; was not opened.</translation>
    </message>
    <message>
        <source>Image opened: %1</source>
        <translation>Image opened: %1</translation>
    </message>
    <message>
        <source>The table &quot;%1&quot; was not imported.</source>
        <translation>The table &quot;%1&quot; was not imported.</translation>
    </message>
    <message>
        <source>%1: %2</source>
        <comment>file, remark</comment>
        <translation>%1: %2</translation>
    </message>
    <message>
        <source>The session &quot;%1&quot; was not saved.</source>
        <translation>The session &quot;%1&quot; was not saved.</translation>
    </message>
    <message>
        <source>Session saved: %1</source>
        <translation>Session saved: %1</translation>
    </message>
    <message>
        <source>Open session</source>
        <translation>Open session</translation>
    </message>
    <message>
        <source>Open image</source>
        <translation>Open image</translation>
    </message>
    <message>
        <source>Images</source>
        <translation>Images</translation>
    </message>
    <message>
        <source>Import table</source>
        <translation>Import table</translation>
    </message>
    <message>
        <source>Tables</source>
        <translation>Tables</translation>
    </message>
    <message>
        <source>Save session</source>
        <translation>Save session</translation>
    </message>
    <message>
        <source>Measuring Desk</source>
        <translation>Measuring Desk</translation>
    </message>
    <message>
        <source>Only one session can be open; not opened: %1</source>
        <translation>Only one session can be open; not opened: %1</translation>
    </message>
    <message>
        <source>Neither a session, an image nor a table: %1</source>
        <translation>Neither a session, an image nor a table: %1</translation>
    </message>
    <message>
        <source>There is not enough memory</source>
        <translation>There is not enough memory</translation>
    </message>
    <message>
        <source>Opening &quot;%1&quot;</source>
        <translation>Opening &quot;%1&quot;</translation>
    </message>
    <message>
        <source>The measurements were not restored.</source>
        <translation>The measurements were not restored.</translation>
    </message>
    <message>
        <source>Restoring measurements</source>
        <translation>Restoring measurements</translation>
    </message>
    <message>
        <source>Importing &quot;%1&quot;</source>
        <translation>Importing &quot;%1&quot;</translation>
    </message>
    <message>
        <source>Saving &quot;%1&quot;</source>
        <translation>Saving &quot;%1&quot;</translation>
    </message>
    <message>
        <source>Session changed by another program</source>
        <translation>Session changed by another program</translation>
    </message>
    <message>
        <source>&quot;%1&quot; was changed by another program. Overwrite its changes?</source>
        <translation>&quot;%1&quot; was changed by another program. Overwrite its changes?</translation>
    </message>
    <message>
        <source>Overwrite</source>
        <translation>Overwrite</translation>
    </message>
    <message>
        <source>Save as...</source>
        <translation>Save as...</translation>
    </message>
    <message numerus="yes">
        <source>%n files were not opened.</source>
        <extracomment>%n is 2 at least</extracomment>
        <translation>
            <numerusform>%n file was not opened.</numerusform>
            <numerusform>%n files were not opened.</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Session opened: %1 (%n object(s))</source>
        <translation>
            <numerusform>Session opened: %1 (%n object)</numerusform>
            <numerusform>Session opened: %1 (%n objects)</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Measurements restored: %1 (%n object(s))</source>
        <translation>
            <numerusform>Measurements restored: %1 (%n object)</numerusform>
            <numerusform>Measurements restored: %1 (%n objects)</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Table imported: %1 (%n object(s))</source>
        <translation>
            <numerusform>Table imported: %1 (%n object)</numerusform>
            <numerusform>Table imported: %1 (%n objects)</numerusform>
        </translation>
    </message>
</context>
<context>
    <name>KvDeskFilePixelSize</name>
    <message>
        <source>%1 states pixels of %2.</source>
        <comment>file, size</comment>
        <translation>%1 states pixels of %2.</translation>
    </message>
    <message>
        <source>The image&apos;s file does not state how large its pixels are.</source>
        <translation>The image&apos;s file does not state how large its pixels are.</translation>
    </message>
</context>
<context>
    <name>KvDeskGallery</name>
    <message>
        <source>Gallery</source>
        <translation>Gallery</translation>
    </message>
    <message>
        <source>Hide the gallery</source>
        <translation>Hide the gallery</translation>
    </message>
    <message>
        <source>&amp;Open image</source>
        <translation>&amp;Open image</translation>
    </message>
    <message>
        <source>&amp;Show in folder</source>
        <translation>&amp;Show in folder</translation>
    </message>
    <message>
        <source>&amp;Copy path</source>
        <translation>&amp;Copy path</translation>
    </message>
    <message>
        <source>&amp;Move to trash...</source>
        <translation>&amp;Move to trash...</translation>
    </message>
    <message>
        <source>Choose &amp;folder...</source>
        <translation>Choose &amp;folder...</translation>
    </message>
    <message>
        <source>Show the images of a folder</source>
        <translation>Show the images of a folder</translation>
    </message>
    <message>
        <source>Save s&amp;napshots in this folder</source>
        <translation>Save s&amp;napshots in this folder</translation>
    </message>
    <message>
        <source>Folder of the gallery</source>
        <translation>Folder of the gallery</translation>
    </message>
    <message>
        <source>More commands of the gallery</source>
        <translation>More commands of the gallery</translation>
    </message>
    <message>
        <source>Snapshots</source>
        <translation>Snapshots</translation>
    </message>
    <message>
        <source>Choose folder</source>
        <translation>Choose folder</translation>
    </message>
    <message>
        <source>Snapshots are saved in %1</source>
        <translation>Snapshots are saved in %1</translation>
    </message>
    <message>
        <source>Snapshots (%1) and the images of a folder appear here; drag them onto report pages</source>
        <translation>Snapshots (%1) and the images of a folder appear here; drag them onto report pages</translation>
    </message>
    <message>
        <source>There are no images in %1</source>
        <translation>There are no images in %1</translation>
    </message>
    <message>
        <source>The folder %1 does not exist</source>
        <translation>The folder %1 does not exist</translation>
    </message>
    <message>
        <source>Select an image first</source>
        <translation>Select an image first</translation>
    </message>
    <message>
        <source>Snapshots are saved in this folder already</source>
        <translation>Snapshots are saved in this folder already</translation>
    </message>
    <message>
        <source>Move &quot;%1&quot; to the trash?</source>
        <translation>Move &quot;%1&quot; to the trash?</translation>
    </message>
    <message>
        <source>Move to trash</source>
        <translation>Move to trash</translation>
    </message>
    <message>
        <source>Moved to the trash: %1</source>
        <translation>Moved to the trash: %1</translation>
    </message>
    <message>
        <source>Not moved to the trash: %1</source>
        <translation>Not moved to the trash: %1</translation>
    </message>
    <message>
        <source>Measuring Desk</source>
        <translation>Measuring Desk</translation>
    </message>
    <message>
        <source>The files are still there. They are write-protected, or there is no trash for them.</source>
        <translation>The files are still there. They are write-protected, or there is no trash for them.</translation>
    </message>
    <message numerus="yes">
        <source>Move %n selected image(s) to the trash?</source>
        <translation>
            <numerusform>Move %n selected image to the trash?</numerusform>
            <numerusform>Move %n selected images to the trash?</numerusform>
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
        <translation>Gallery</translation>
    </message>
</context>
<context>
    <name>KvDeskGuideCommand</name>
    <message>
        <source>The user guide is not installed</source>
        <translation>The user guide is not installed</translation>
    </message>
</context>
<context>
    <name>KvDeskGuideWindow</name>
    <message>
        <source>User guide</source>
        <translation>User guide</translation>
    </message>
    <message>
        <source>Contents</source>
        <translation>Contents</translation>
    </message>
    <message>
        <source>Back</source>
        <translation>Back</translation>
    </message>
    <message>
        <source>Forward</source>
        <translation>Forward</translation>
    </message>
    <message>
        <source>Find in the guide</source>
        <translation>Find in the guide</translation>
    </message>
    <message>
        <source>Find previous</source>
        <translation>Find previous</translation>
    </message>
    <message>
        <source>Find next</source>
        <translation>Find next</translation>
    </message>
    <message>
        <source>This is the first place</source>
        <translation>This is the first place</translation>
    </message>
    <message>
        <source>This is the last place</source>
        <translation>This is the last place</translation>
    </message>
    <message>
        <source>Not found</source>
        <translation>Not found</translation>
    </message>
    <message>
        <source>Type what to find first</source>
        <translation>Type what to find first</translation>
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
        <translation>Open an image or a session to start</translation>
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
        <translation>inch</translation>
    </message>
    <message>
        <source>Use selected line</source>
        <translation>Use selected line</translation>
    </message>
    <message>
        <source>Length of the line</source>
        <translation>Length of the line</translation>
    </message>
    <message>
        <source>Unit of the length</source>
        <translation>Unit of the length</translation>
    </message>
    <message>
        <source>Its length</source>
        <translation>Its length</translation>
    </message>
    <message>
        <source>Draw a line over a distance that you know, such as on a stage micrometer, and select it.</source>
        <translation>Draw a line over a distance that you know, such as on a stage micrometer, and select it.</translation>
    </message>
    <message>
        <source>No line yet</source>
        <translation>No line yet</translation>
    </message>
    <message>
        <source>%1: %2</source>
        <comment>name and length of a line</comment>
        <translation>%1: %2</translation>
    </message>
    <message>
        <source>Take the selected line as the known distance</source>
        <translation>Take the selected line as the known distance</translation>
    </message>
    <message>
        <source>Select one line on the image first</source>
        <translation>Select one line on the image first</translation>
    </message>
</context>
<context>
    <name>KvDeskLiveBar</name>
    <message>
        <source>Live image</source>
        <translation>Live image</translation>
    </message>
    <message>
        <source>Freeze</source>
        <translation>Freeze</translation>
    </message>
    <message>
        <source>%1 fps</source>
        <extracomment>frames per second</extracomment>
        <translation>%1 fps</translation>
    </message>
    <message>
        <source>%1 delivers no pictures any more; this is the last one</source>
        <translation>%1 delivers no pictures any more; this is the last one</translation>
    </message>
    <message>
        <source>%1 delivers no pictures</source>
        <translation>%1 delivers no pictures</translation>
    </message>
    <message>
        <source>%1 is stopped</source>
        <translation>%1 is stopped</translation>
    </message>
    <message>
        <source>Waiting for the first picture of %1</source>
        <translation>Waiting for the first picture of %1</translation>
    </message>
    <message>
        <source>Frozen: %1</source>
        <translation>Frozen: %1</translation>
    </message>
    <message>
        <source>Live: %1</source>
        <translation>Live: %1</translation>
    </message>
    <message>
        <source>This image is not live</source>
        <translation>This image is not live</translation>
    </message>
    <message>
        <source>&amp;Reconnect</source>
        <translation>&amp;Reconnect</translation>
    </message>
    <message>
        <source>&amp;Start</source>
        <translation>&amp;Start</translation>
    </message>
    <message>
        <source>Frames per second
Dropped, because newer ones came first: %1</source>
        <translation>Frames per second
Dropped, because newer ones came first: %1</translation>
    </message>
    <message>
        <source>Stop the live image; other programs can use the camera then</source>
        <translation>Stop the live image; other programs can use the camera then</translation>
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
        <translation>&amp;Recent sessions</translation>
    </message>
    <message>
        <source>&amp;View</source>
        <translation>&amp;View</translation>
    </message>
    <message>
        <source>&amp;Help</source>
        <translation>&amp;Help</translation>
    </message>
    <message>
        <source>Main tool bar</source>
        <translation>Main tool bar</translation>
    </message>
    <message>
        <source>%1[*] - Measuring Desk</source>
        <extracomment>%1 is the name of a session; [*] is replaced by a star when it has unsaved changes</extracomment>
        <translation>%1[*] - Measuring Desk</translation>
    </message>
    <message>
        <source>None yet</source>
        <translation>None yet</translation>
    </message>
    <message>
        <source>About Measuring Desk</source>
        <translation>About Measuring Desk</translation>
    </message>
    <message>
        <source>&lt;b&gt;Measuring Desk %1&lt;/b&gt;&lt;p&gt;Measures objects on images, and hosts plug-ins such as the statistics reports.&lt;/p&gt;&lt;p&gt;%2, MIT licence&lt;/p&gt;</source>
        <translation>&lt;b&gt;Measuring Desk %1&lt;/b&gt;&lt;p&gt;Measures objects on images, and hosts plug-ins such as the statistics reports.&lt;/p&gt;&lt;p&gt;%2, MIT licence&lt;/p&gt;</translation>
    </message>
    <message>
        <source>Measuring Desk</source>
        <translation>Measuring Desk</translation>
    </message>
    <message>
        <source>&amp;Edit</source>
        <translation>&amp;Edit</translation>
    </message>
    <message>
        <source>&amp;Image</source>
        <translation>&amp;Image</translation>
    </message>
    <message>
        <source>&amp;Measure</source>
        <translation>&amp;Measure</translation>
    </message>
    <message>
        <source>Choose the image source</source>
        <translation>Choose the image source</translation>
    </message>
</context>
<context>
    <name>KvDeskNotice</name>
    <message>
        <source>Close this message</source>
        <translation>Close this message</translation>
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
        <translation>Object</translation>
    </message>
    <message>
        <source>Value name</source>
        <translation>Value name</translation>
    </message>
    <message>
        <source>Value</source>
        <translation>Value</translation>
    </message>
</context>
<context>
    <name>KvDeskObjectEditor</name>
    <message numerus="yes">
        <source>%n objects</source>
        <comment>several measured objects</comment>
        <extracomment>%n is 2 at least</extracomment>
        <translation>
            <numerusform>%n object</numerusform>
            <numerusform>%n objects</numerusform>
        </translation>
    </message>
    <message>
        <source>drawing of %1</source>
        <translation>drawing of %1</translation>
    </message>
    <message>
        <source>change of %1</source>
        <translation>change of %1</translation>
    </message>
    <message>
        <source>move of %1</source>
        <translation>move of %1</translation>
    </message>
    <message>
        <source>renaming of %1</source>
        <translation>renaming of %1</translation>
    </message>
    <message>
        <source>text of %1</source>
        <translation>text of %1</translation>
    </message>
    <message>
        <source>showing of %1 of %2</source>
        <extracomment>%1 is a value, %2 an object</extracomment>
        <translation>showing of %1 of %2</translation>
    </message>
    <message>
        <source>hiding of %1 of %2</source>
        <translation>hiding of %1 of %2</translation>
    </message>
    <message>
        <source>deletion of %1</source>
        <translation>deletion of %1</translation>
    </message>
    <message>
        <source>change of the calibration</source>
        <translation>change of the calibration</translation>
    </message>
    <message>
        <source>place of %1</source>
        <translation>place of %1</translation>
    </message>
    <message>
        <source>deletion of a place of %1</source>
        <translation>deletion of a place of %1</translation>
    </message>
    <message>
        <source>pasting of %1</source>
        <translation>pasting of %1</translation>
    </message>
    <message>
        <source>import of %1</source>
        <translation>import of %1</translation>
    </message>
</context>
<context>
    <name>KvDeskPlugins</name>
    <message>
        <source>No plug-ins were found</source>
        <translation>No plug-ins were found</translation>
    </message>
    <message>
        <source>It is no plug-in for this program</source>
        <translation>It is no plug-in for this program</translation>
    </message>
    <message>
        <source>Its tools &quot;%1&quot; could not be started</source>
        <translation>Its tools &quot;%1&quot; could not be started</translation>
    </message>
    <message>
        <source>Plug-in loaded: %1</source>
        <translation>Plug-in loaded: %1</translation>
    </message>
    <message>
        <source>Plug-in not loaded: %1: %2</source>
        <translation>Plug-in not loaded: %1: %2</translation>
    </message>
    <message>
        <source>It failed: %1</source>
        <translation>It failed: %1</translation>
    </message>
    <message>
        <source>It failed for a reason of its own</source>
        <translation>It failed for a reason of its own</translation>
    </message>
</context>
<context>
    <name>KvDeskProgress</name>
    <message>
        <source>Cancel</source>
        <translation>Cancel</translation>
    </message>
    <message>
        <source>Leave everything as it was (Esc)</source>
        <translation>Leave everything as it was (Esc)</translation>
    </message>
    <message>
        <source>This can no longer be cancelled</source>
        <translation>This can no longer be cancelled</translation>
    </message>
</context>
<context>
    <name>KvDeskRecovery</name>
    <message>
        <source>Untitled session</source>
        <translation>Untitled session</translation>
    </message>
    <message numerus="yes">
        <source>%1 (%n object(s))</source>
        <extracomment>%1 is the name of a session</extracomment>
        <translation>
            <numerusform>%1 (%n object)</numerusform>
            <numerusform>%1 (%n objects)</numerusform>
        </translation>
    </message>
</context>
<context>
    <name>KvDeskRecoveryBar</name>
    <message>
        <source>Show other measurements that were not saved</source>
        <translation>Show other measurements that were not saved</translation>
    </message>
    <message>
        <source>Restore</source>
        <translation>Restore</translation>
    </message>
    <message>
        <source>Open these measurements as a session with unsaved changes</source>
        <translation>Open these measurements as a session with unsaved changes</translation>
    </message>
    <message>
        <source>Discard</source>
        <translation>Discard</translation>
    </message>
    <message>
        <source>Delete these measurements for good</source>
        <translation>Delete these measurements for good</translation>
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
            <numerusform>%n more</numerusform>
            <numerusform>%n more</numerusform>
        </translation>
    </message>
    <message>
        <source>Measurements from %1 were not saved.</source>
        <translation>Measurements from %1 were not saved.</translation>
    </message>
</context>
<context>
    <name>KvDeskRuler</name>
    <message>
        <source>Horizontal ruler</source>
        <translation>Horizontal ruler</translation>
    </message>
    <message>
        <source>Vertical ruler</source>
        <translation>Vertical ruler</translation>
    </message>
    <message>
        <source>Ruler in %1</source>
        <translation>Ruler in %1</translation>
    </message>
</context>
<context>
    <name>KvDeskSelectionStatistics</name>
    <message>
        <source>n = %1, mean %2, SD %3, min %4, max %5</source>
        <extracomment>number of values, their mean, standard deviation, smallest and largest one</extracomment>
        <translation>n = %1, mean %2, SD %3, min %4, max %5</translation>
    </message>
    <message>
        <source>Selected values: %1</source>
        <translation>Selected values: %1</translation>
    </message>
    <message>
        <source>Mean: %1</source>
        <translation>Mean: %1</translation>
    </message>
    <message>
        <source>Standard deviation: %1</source>
        <translation>Standard deviation: %1</translation>
    </message>
    <message>
        <source>Smallest: %1</source>
        <translation>Smallest: %1</translation>
    </message>
    <message>
        <source>Largest: %1</source>
        <translation>Largest: %1</translation>
    </message>
</context>
<context>
    <name>KvDeskSession</name>
    <message>
        <source>Untitled session</source>
        <translation>Untitled session</translation>
    </message>
</context>
<context>
    <name>KvDeskSettingsDialog</name>
    <message>
        <source>Settings</source>
        <translation>Settings</translation>
    </message>
    <message>
        <source>Appearance</source>
        <translation>Appearance</translation>
    </message>
    <message>
        <source>Theme</source>
        <translation>Theme</translation>
    </message>
    <message>
        <source>Dark</source>
        <translation>Dark</translation>
    </message>
    <message>
        <source>Light</source>
        <translation>Light</translation>
    </message>
    <message>
        <source>Language</source>
        <translation>Language</translation>
    </message>
    <message>
        <source>Another language takes effect when the program is started again.</source>
        <translation>Another language takes effect when the program is started again.</translation>
    </message>
    <message>
        <source>Measured values</source>
        <translation>Measured values</translation>
    </message>
    <message>
        <source>Automatic</source>
        <translation>Automatic</translation>
    </message>
    <message>
        <source>Significant digits</source>
        <translation>Significant digits</translation>
    </message>
    <message>
        <source>Length unit</source>
        <translation>Length unit</translation>
    </message>
    <message>
        <source>Angle unit</source>
        <translation>Angle unit</translation>
    </message>
    <message>
        <source>Degrees (°)</source>
        <translation>Degrees (°)</translation>
    </message>
    <message>
        <source>Radians (rad)</source>
        <translation>Radians (rad)</translation>
    </message>
    <message>
        <source>System default</source>
        <translation>System default</translation>
    </message>
    <message>
        <source>Nothing was changed yet</source>
        <translation>Nothing was changed yet</translation>
    </message>
</context>
<context>
    <name>KvDeskSnapshotFile</name>
    <message>
        <source>The folder cannot be created</source>
        <translation>The folder cannot be created</translation>
    </message>
    <message>
        <source>The picture cannot be encoded</source>
        <translation>The picture cannot be encoded</translation>
    </message>
</context>
<context>
    <name>KvDeskSnapshots</name>
    <message>
        <source>Open an image first</source>
        <translation>Open an image first</translation>
    </message>
    <message>
        <source>No snapshot was taken: earlier ones are still being saved</source>
        <translation>No snapshot was taken: earlier ones are still being saved</translation>
    </message>
    <message>
        <source>Snapshot saved: %1</source>
        <translation>Snapshot saved: %1</translation>
    </message>
    <message>
        <source>The snapshot was not saved. %1</source>
        <translation>The snapshot was not saved. %1</translation>
    </message>
</context>
<context>
    <name>KvDeskSourceCommands</name>
    <message>
        <source>The image source &quot;%1&quot; was not opened.</source>
        <translation>The image source &quot;%1&quot; was not opened.</translation>
    </message>
    <message>
        <source>Image source: %1</source>
        <translation>Image source: %1</translation>
    </message>
    <message>
        <source>Open image folder</source>
        <translation>Open image folder</translation>
    </message>
    <message>
        <source>Open video</source>
        <translation>Open video</translation>
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
        <translation>Image &amp;source</translation>
    </message>
    <message>
        <source>Still &amp;image...</source>
        <translation>Still &amp;image...</translation>
    </message>
    <message>
        <source>Image &amp;folder...</source>
        <translation>Image &amp;folder...</translation>
    </message>
    <message>
        <source>Play the images of a folder like a camera</source>
        <translation>Play the images of a folder like a camera</translation>
    </message>
    <message>
        <source>&amp;Video...</source>
        <translation>&amp;Video...</translation>
    </message>
    <message>
        <source>Play a video like a camera</source>
        <translation>Play a video like a camera</translation>
    </message>
    <message>
        <source>Looking for cameras...</source>
        <translation>Looking for cameras...</translation>
    </message>
    <message>
        <source>No camera is connected</source>
        <translation>No camera is connected</translation>
    </message>
</context>
<context>
    <name>KvDeskStartPage</name>
    <message>
        <source>From an image to a report</source>
        <translation>From an image to a report</translation>
    </message>
    <message>
        <source>Back to the image</source>
        <translation>Back to the image</translation>
    </message>
    <message>
        <source>%1 (%2)</source>
        <comment>command (shortcut)</comment>
        <translation>%1 (%2)</translation>
    </message>
    <message>
        <source>Open an image</source>
        <translation>Open an image</translation>
    </message>
    <message>
        <source>A picture file, or the live image of a camera.</source>
        <translation>A picture file, or the live image of a camera.</translation>
    </message>
    <message>
        <source>Choose a camera or another source</source>
        <translation>Choose a camera or another source</translation>
    </message>
    <message>
        <source>Calibrate</source>
        <translation>Calibrate</translation>
    </message>
    <message>
        <source>Say how large a pixel is. The examples are calibrated already.</source>
        <translation>Say how large a pixel is. The examples are calibrated already.</translation>
    </message>
    <message>
        <source>Measure and report</source>
        <translation>Measure and report</translation>
    </message>
    <message>
        <source>Drag a line over the image: its length is listed at once. The report panel makes a PDF of all values.</source>
        <translation>Drag a line over the image: its length is listed at once. The report panel makes a PDF of all values.</translation>
    </message>
    <message>
        <source>Examples to try</source>
        <translation>Examples to try</translation>
    </message>
    <message>
        <source>Recent sessions</source>
        <translation>Recent sessions</translation>
    </message>
    <message>
        <source>Open an image first</source>
        <translation>Open an image first</translation>
    </message>
    <message>
        <source>Open a copy of this example</source>
        <translation>Open a copy of this example</translation>
    </message>
</context>
<context>
    <name>KvDeskStatus</name>
    <message>
        <source>Warning</source>
        <translation>Warning</translation>
    </message>
    <message>
        <source>Error</source>
        <translation>Error</translation>
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
        <translation>Statistics of the selected values</translation>
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
        <translation>Status log</translation>
    </message>
    <message>
        <source>Hide the status log</source>
        <translation>Hide the status log</translation>
    </message>
    <message>
        <source>Clear the status log</source>
        <translation>Clear the status log</translation>
    </message>
    <message>
        <source>Messages of the program and its plug-ins appear here</source>
        <translation>Messages of the program and its plug-ins appear here</translation>
    </message>
    <message>
        <source>There are no messages</source>
        <translation>There are no messages</translation>
    </message>
</context>
<context>
    <name>KvDeskStatusLogModel</name>
    <message>
        <source>%1
Reported by %2</source>
        <comment>message, source</comment>
        <translation>%1
Reported by %2</translation>
    </message>
    <message>
        <source>Category</source>
        <translation>Category</translation>
    </message>
    <message>
        <source>Time</source>
        <translation>Time</translation>
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
        <translation>Copy</translation>
    </message>
</context>
<context>
    <name>KvDeskToolStrip</name>
    <message>
        <source>Measuring tools</source>
        <translation>Measuring tools</translation>
    </message>
</context>
<context>
    <name>KvDeskTypedPixelSize</name>
    <message>
        <source>Width of a pixel in micrometres</source>
        <translation>Width of a pixel in micrometres</translation>
    </message>
    <message>
        <source>Height of a pixel in micrometres</source>
        <translation>Height of a pixel in micrometres</translation>
    </message>
    <message>
        <source>Same size in both directions</source>
        <translation>Same size in both directions</translation>
    </message>
    <message>
        <source>Width</source>
        <translation>Width</translation>
    </message>
    <message>
        <source>Height</source>
        <translation>Height</translation>
    </message>
    <message>
        <source>Type how large a pixel of the image is in reality.</source>
        <translation>Type how large a pixel of the image is in reality.</translation>
    </message>
</context>
<context>
    <name>KvDeskValueCommands</name>
    <message>
        <source>Rename</source>
        <translation>Rename</translation>
    </message>
    <message>
        <source>Delete object</source>
        <translation>Delete object</translation>
    </message>
    <message>
        <source>Hide value</source>
        <translation>Hide value</translation>
    </message>
    <message>
        <source>Show all values of the object</source>
        <translation>Show all values of the object</translation>
    </message>
    <message>
        <source>Select one object first</source>
        <translation>Select one object first</translation>
    </message>
    <message>
        <source>Select an object first</source>
        <translation>Select an object first</translation>
    </message>
    <message>
        <source>Select a value first</source>
        <translation>Select a value first</translation>
    </message>
    <message>
        <source>No value of the selected object is hidden</source>
        <translation>No value of the selected object is hidden</translation>
    </message>
    <message>
        <source>showing of values</source>
        <translation>showing of values</translation>
    </message>
    <message>
        <source>hiding of values</source>
        <translation>hiding of values</translation>
    </message>
</context>
<context>
    <name>KvDeskValueTable</name>
    <message>
        <source>Measured values</source>
        <translation>Measured values</translation>
    </message>
    <message>
        <source>Hide the measured values</source>
        <translation>Hide the measured values</translation>
    </message>
    <message>
        <source>Filter by type, object or value name</source>
        <translation>Filter by type, object or value name</translation>
    </message>
    <message>
        <source>Filter of the measured values</source>
        <translation>Filter of the measured values</translation>
    </message>
    <message>
        <source>Shows only rows that have all of these words</source>
        <translation>Shows only rows that have all of these words</translation>
    </message>
    <message>
        <source>No measured value matches the filter</source>
        <translation>No measured value matches the filter</translation>
    </message>
    <message>
        <source>Clear the filter</source>
        <translation>Clear the filter</translation>
    </message>
    <message>
        <source>%1 of %2</source>
        <extracomment>rows that match the filter, all rows</extracomment>
        <translation>%1 of %2</translation>
    </message>
    <message>
        <source>Measured values appear here once something is measured or imported</source>
        <translation>Measured values appear here once something is measured or imported</translation>
    </message>
    <message>
        <source>There are no measured values yet</source>
        <translation>There are no measured values yet</translation>
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
        <translation>Object</translation>
    </message>
    <message>
        <source>Value name</source>
        <translation>Value name</translation>
    </message>
    <message>
        <source>Value</source>
        <translation>Value</translation>
    </message>
</context>
<context>
    <name>KvToolBase</name>
    <message>
        <source>Reset</source>
        <translation>Reset</translation>
    </message>
    <message>
        <source>Reset to the default values</source>
        <translation>Reset to the default values</translation>
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
        <translation>Cancel</translation>
    </message>
    <message>
        <source>Apply</source>
        <translation>Apply</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>Save</translation>
    </message>
    <message>
        <source>Open</source>
        <translation>Open</translation>
    </message>
    <message>
        <source>Close</source>
        <translation>Close</translation>
    </message>
    <message>
        <source>Discard</source>
        <translation>Discard</translation>
    </message>
    <message>
        <source>&amp;Yes</source>
        <translation>&amp;Yes</translation>
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
        <translation>The settings could not be saved to %1. Check that the folder is writable.</translation>
    </message>
    <message>
        <source>The settings file %1 cannot be read. Changes to the settings will not be kept.</source>
        <translation>The settings file %1 cannot be read. Changes to the settings will not be kept.</translation>
    </message>
    <message>
        <source>The settings file %1 is damaged. It was renamed to %2; all settings are back at their defaults.</source>
        <translation>The settings file %1 is damaged. It was renamed to %2; all settings are back at their defaults.</translation>
    </message>
    <message>
        <source>The settings file %1 is damaged and could not be renamed to %2. Changes to the settings will not be kept.</source>
        <translation>The settings file %1 is damaged and could not be renamed to %2. Changes to the settings will not be kept.</translation>
    </message>
</context>
<context>
    <name>ZtAravisSource</name>
    <message>
        <source>%1 is disconnected; its last picture stays</source>
        <translation>%1 is disconnected; its last picture stays</translation>
    </message>
    <message>
        <source>%1 delivers pictures of a kind that cannot be shown</source>
        <translation>%1 delivers pictures of a kind that cannot be shown</translation>
    </message>
    <message>
        <source>The camera does not take the setting (%1)</source>
        <translation>The camera does not take the setting (%1)</translation>
    </message>
    <message>
        <source>%1 cannot be opened (%2)</source>
        <translation>%1 cannot be opened (%2)</translation>
    </message>
</context>
<context>
    <name>ZtCalibrationStore</name>
    <message>
        <source>This is not a calibration</source>
        <translation>This is not a calibration</translation>
    </message>
    <message>
        <source>A calibration in the settings is damaged and was left out (%1: %2)</source>
        <translation>A calibration in the settings is damaged and was left out (%1: %2)</translation>
    </message>
</context>
<context>
    <name>ZtCsvReader</name>
    <message>
        <source>A quoted text does not end</source>
        <translation>A quoted text does not end</translation>
    </message>
    <message>
        <source>There is text after a closing quote</source>
        <translation>There is text after a closing quote</translation>
    </message>
    <message>
        <source>Reading was cancelled</source>
        <translation>Reading was cancelled</translation>
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
        <translation>Width</translation>
    </message>
    <message>
        <source>Height</source>
        <translation>Height</translation>
    </message>
    <message>
        <source>Area</source>
        <translation>Area</translation>
    </message>
    <message>
        <source>Line</source>
        <translation>Line</translation>
    </message>
    <message>
        <source>Length</source>
        <translation>Length</translation>
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
        <translation>Arc length</translation>
    </message>
    <message>
        <source>Polygon</source>
        <translation>Polygon</translation>
    </message>
    <message>
        <source>Perimeter</source>
        <translation>Perimeter</translation>
    </message>
    <message>
        <source>Polyline</source>
        <translation>Polyline</translation>
    </message>
    <message>
        <source>Parallel distance</source>
        <translation>Parallel distance</translation>
    </message>
    <message>
        <source>Distance</source>
        <translation>Distance</translation>
    </message>
    <message>
        <source>Text note</source>
        <translation>Text note</translation>
    </message>
    <message>
        <source>Scale bar</source>
        <translation>Scale bar</translation>
    </message>
    <message>
        <source>Counter</source>
        <translation>Counter</translation>
    </message>
    <message>
        <source>Count</source>
        <translation>Count</translation>
    </message>
    <message>
        <source>Share</source>
        <translation>Share</translation>
    </message>
    <message>
        <source>Circle</source>
        <translation>Circle</translation>
    </message>
    <message>
        <source>Diameter</source>
        <translation>Diameter</translation>
    </message>
</context>
<context>
    <name>ZtFileFault</name>
    <message>
        <source>No such file or directory</source>
        <translation>No such file or directory</translation>
    </message>
    <message>
        <source>Permission denied</source>
        <translation>Permission denied</translation>
    </message>
    <message>
        <source>Is a directory</source>
        <translation>Is a directory</translation>
    </message>
    <message>
        <source>Not a directory</source>
        <translation>Not a directory</translation>
    </message>
    <message>
        <source>File name too long</source>
        <translation>File name too long</translation>
    </message>
    <message>
        <source>No space left on device</source>
        <translation>No space left on device</translation>
    </message>
    <message>
        <source>Read-only file system</source>
        <translation>Read-only file system</translation>
    </message>
    <message>
        <source>Input/output error</source>
        <translation>Input/output error</translation>
    </message>
</context>
<context>
    <name>ZtFrameSourceCatalogue</name>
    <message>
        <source>This program cannot play videos</source>
        <translation>This program cannot play videos</translation>
    </message>
    <message>
        <source>This program knows no cameras of this kind</source>
        <translation>This program knows no cameras of this kind</translation>
    </message>
</context>
<context>
    <name>ZtImageFolderSource</name>
    <message>
        <source>%1: no picture of the folder can be shown</source>
        <translation>%1: no picture of the folder can be shown</translation>
    </message>
    <message>
        <source>The folder does not exist</source>
        <translation>The folder does not exist</translation>
    </message>
    <message>
        <source>The folder cannot be read</source>
        <translation>The folder cannot be read</translation>
    </message>
    <message>
        <source>The folder holds no pictures</source>
        <translation>The folder holds no pictures</translation>
    </message>
</context>
<context>
    <name>ZtKernelImage</name>
    <message>
        <source>%1 delivers pictures again</source>
        <translation>%1 delivers pictures again</translation>
    </message>
</context>
<context>
    <name>ZtLiveFrameSource</name>
    <message>
        <source>%1 has stopped delivering pictures; the last one stays</source>
        <translation>%1 has stopped delivering pictures; the last one stays</translation>
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
        <translation>The file is empty</translation>
    </message>
    <message>
        <source>The file is not a session</source>
        <translation>The file is not a session</translation>
    </message>
    <message>
        <source>The file cannot be written (%1)</source>
        <translation>The file cannot be written (%1)</translation>
    </message>
    <message>
        <source>This must be a list</source>
        <translation>This must be a list</translation>
    </message>
    <message>
        <source>This must be a text</source>
        <translation>This must be a text</translation>
    </message>
    <message>
        <source>This must be a whole number from 1</source>
        <translation>This must be a whole number from 1</translation>
    </message>
    <message>
        <source>This must be a number</source>
        <translation>This must be a number</translation>
    </message>
    <message>
        <source>This must be a number greater than 0</source>
        <translation>This must be a number greater than 0</translation>
    </message>
    <message>
        <source>Another object of this type has the same number</source>
        <translation>Another object of this type has the same number</translation>
    </message>
    <message>
        <source>This must be an object</source>
        <translation>This must be an object</translation>
    </message>
    <message>
        <source>&quot;%1&quot; is not a type of objects</source>
        <translation>&quot;%1&quot; is not a type of objects</translation>
    </message>
    <message>
        <source>An object of type &quot;%1&quot; cannot have this number of points (%2)</source>
        <translation>An object of type &quot;%1&quot; cannot have this number of points (%2)</translation>
    </message>
    <message>
        <source>A point must be a list of two numbers between -1e9 and 1e9</source>
        <translation>A point must be a list of two numbers between -1e9 and 1e9</translation>
    </message>
    <message>
        <source>This must be the name of a value</source>
        <translation>This must be the name of a value</translation>
    </message>
    <message>
        <source>The type has no name</source>
        <translation>The type has no name</translation>
    </message>
    <message>
        <source>A value must have a name of its own</source>
        <translation>A value must have a name of its own</translation>
    </message>
    <message>
        <source>The numbers of the rows must rise</source>
        <translation>The numbers of the rows must rise</translation>
    </message>
    <message>
        <source>A row must be a list of number, name and values</source>
        <translation>A row must be a list of number, name and values</translation>
    </message>
    <message>
        <source>This must be a text or null</source>
        <translation>This must be a text or null</translation>
    </message>
    <message>
        <source>This must be a list or an object</source>
        <translation>This must be a list or an object</translation>
    </message>
    <message>
        <source>The table has no such value</source>
        <translation>The table has no such value</translation>
    </message>
    <message>
        <source>This must be the text of a number</source>
        <translation>This must be the text of a number</translation>
    </message>
    <message>
        <source>The unit does not fit that of the value</source>
        <translation>The unit does not fit that of the value</translation>
    </message>
    <message>
        <source>The file is nested too deeply</source>
        <translation>The file is nested too deeply</translation>
    </message>
    <message>
        <source>The file is not valid JSON (%1)</source>
        <translation>The file is not valid JSON (%1)</translation>
    </message>
    <message>
        <source>The file does not exist</source>
        <translation>The file does not exist</translation>
    </message>
    <message>
        <source>This is a folder, not a file</source>
        <translation>This is a folder, not a file</translation>
    </message>
    <message>
        <source>The file cannot be read (%1)</source>
        <translation>The file cannot be read (%1)</translation>
    </message>
    <message>
        <source>The file is too large for a session</source>
        <translation>The file is too large for a session</translation>
    </message>
    <message>
        <source>This must be a date such as 2026-01-31T12:00:00Z</source>
        <translation>This must be a date such as 2026-01-31T12:00:00Z</translation>
    </message>
    <message>
        <source>This must be &quot;knownDistance&quot;, &quot;metadata&quot; or &quot;typed&quot;</source>
        <translation>This must be &quot;knownDistance&quot;, &quot;metadata&quot; or &quot;typed&quot;</translation>
    </message>
    <message>
        <source>The file is write-protected</source>
        <translation>The file is write-protected</translation>
    </message>
    <message>
        <source>Writing was cancelled</source>
        <translation>Writing was cancelled</translation>
    </message>
    <message>
        <source>Reading was cancelled</source>
        <translation>Reading was cancelled</translation>
    </message>
    <message>
        <source>The session is of the newer version %1; this program reads versions up to %2</source>
        <translation>The session is of the newer version %1; this program reads versions up to %2</translation>
    </message>
    <message>
        <source>Sessions of version %1 are not known; this program reads versions %2 to %3</source>
        <translation>Sessions of version %1 are not known; this program reads versions %2 to %3</translation>
    </message>
    <message>
        <source>This file is a table of values; import it</source>
        <translation>This file is a table of values; import it</translation>
    </message>
</context>
<context>
    <name>ZtStillImageSource</name>
    <message>
        <source>The picture does not exist</source>
        <translation>The picture does not exist</translation>
    </message>
    <message>
        <source>This is a folder, not a picture</source>
        <translation>This is a folder, not a picture</translation>
    </message>
    <message>
        <source>The picture cannot be read</source>
        <translation>The picture cannot be read</translation>
    </message>
    <message>
        <source>The picture has %1 x %2 pixels, which is too many</source>
        <translation>The picture has %1 x %2 pixels, which is too many</translation>
    </message>
    <message>
        <source>The picture cannot be decoded (%1)</source>
        <translation>The picture cannot be decoded (%1)</translation>
    </message>
    <message>
        <source>the file is empty</source>
        <translation>the file is empty</translation>
    </message>
    <message>
        <source>it has no size</source>
        <translation>it has no size</translation>
    </message>
    <message>
        <source>the file is damaged</source>
        <translation>the file is damaged</translation>
    </message>
    <message>
        <source>the file is too short for its picture</source>
        <translation>the file is too short for its picture</translation>
    </message>
    <message>
        <source>there is not enough memory</source>
        <translation>there is not enough memory</translation>
    </message>
</context>
<context>
    <name>ZtTableImport</name>
    <message>
        <source>&quot;%1&quot; already has a value &quot;%2&quot; in line %3</source>
        <translation>&quot;%1&quot; already has a value &quot;%2&quot; in line %3</translation>
    </message>
    <message>
        <source>The file does not exist</source>
        <translation>The file does not exist</translation>
    </message>
    <message>
        <source>This is a folder, not a file</source>
        <translation>This is a folder, not a file</translation>
    </message>
    <message>
        <source>The file cannot be read (%1)</source>
        <translation>The file cannot be read (%1)</translation>
    </message>
    <message>
        <source>The table is not open for reading</source>
        <translation>The table is not open for reading</translation>
    </message>
    <message>
        <source>The table has no rows</source>
        <translation>The table has no rows</translation>
    </message>
    <message>
        <source>The row and the header differ in their number of fields (%1 and %2)</source>
        <translation>The row and the header differ in their number of fields (%1 and %2)</translation>
    </message>
    <message>
        <source>%1 is not a finite number</source>
        <translation>%1 is not a finite number</translation>
    </message>
    <message>
        <source>%1 is not a number</source>
        <translation>%1 is not a number</translation>
    </message>
    <message>
        <source>&quot;%1&quot; of &quot;%2&quot; is given in &quot;%3&quot; here, but in &quot;%4&quot; before</source>
        <translation>&quot;%1&quot; of &quot;%2&quot; is given in &quot;%3&quot; here, but in &quot;%4&quot; before</translation>
    </message>
    <message>
        <source>There is no column %1; the columns are %2</source>
        <translation>There is no column %1; the columns are %2</translation>
    </message>
    <message>
        <source>Object</source>
        <translation>Object</translation>
    </message>
    <message>
        <source>There is no value %1 to give a unit; the values are %2</source>
        <translation>There is no value %1 to give a unit; the values are %2</translation>
    </message>
    <message>
        <source>The first line announces rows without values</source>
        <translation>The first line announces rows without values</translation>
    </message>
    <message>
        <source>There is no column %1; the columns of this table have no names</source>
        <translation>There is no column %1; the columns of this table have no names</translation>
    </message>
    <message>
        <source>%1 is not the index of a class; they go from 0 to %2</source>
        <translation>%1 is not the index of a class; they go from 0 to %2</translation>
    </message>
    <message>
        <source>Value %1</source>
        <translation>Value %1</translation>
    </message>
    <message>
        <source>The file is larger than %1 MB</source>
        <translation>The file is larger than %1 MB</translation>
    </message>
    <message>
        <source>The file is empty</source>
        <translation>The file is empty</translation>
    </message>
    <message>
        <source>The first line does not name the columns</source>
        <translation>The first line does not name the columns</translation>
    </message>
    <message>
        <source>Column %1 is not part of a list of values and was left out</source>
        <translation>Column %1 is not part of a list of values and was left out</translation>
    </message>
    <message>
        <source>Columns %1 are not part of a list of values and were left out</source>
        <translation>Columns %1 are not part of a list of values and were left out</translation>
    </message>
    <message>
        <source>The value has no name</source>
        <translation>The value has no name</translation>
    </message>
    <message>
        <source>The row does not say which object it belongs to</source>
        <translation>The row does not say which object it belongs to</translation>
    </message>
    <message>
        <source>%1 is not a unit</source>
        <translation>%1 is not a unit</translation>
    </message>
    <message>
        <source>There is no column of numbers</source>
        <translation>There is no column of numbers</translation>
    </message>
    <message>
        <source>Column %1</source>
        <translation>Column %1</translation>
    </message>
    <message>
        <source>Column %1 holds text and was left out</source>
        <translation>Column %1 holds text and was left out</translation>
    </message>
    <message>
        <source>Columns %1 hold text and were left out</source>
        <translation>Columns %1 hold text and were left out</translation>
    </message>
    <message>
        <source>Reading was cancelled</source>
        <translation>Reading was cancelled</translation>
    </message>
    <message numerus="yes">
        <source>The table has %n row(s), its first line announces %1</source>
        <translation>
            <numerusform>The table has %n row, its first line announces %1</numerusform>
            <numerusform>The table has %n rows, its first line announces %1</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>The row has %n field(s) instead of %1</source>
        <translation>
            <numerusform>The row has %n field instead of %1</numerusform>
            <numerusform>The row has %n fields instead of %1</numerusform>
        </translation>
    </message>
    <message>
        <source>The records have too many different names</source>
        <translation>The records have too many different names</translation>
    </message>
    <message>
        <source>This file is a session, not a table; open it</source>
        <translation>This file is a session, not a table; open it</translation>
    </message>
    <message>
        <source>The file is neither a list of records nor an export of values</source>
        <translation>The file is neither a list of records nor an export of values</translation>
    </message>
    <message>
        <source>This name comes twice</source>
        <translation>This name comes twice</translation>
    </message>
    <message>
        <source>This must be a text, a number or null</source>
        <translation>This must be a text, a number or null</translation>
    </message>
    <message>
        <source>The table is of version %1; this program reads version %2</source>
        <translation>The table is of version %1; this program reads version %2</translation>
    </message>
</context>
<context>
    <name>ZtTextDecoder</name>
    <message>
        <source>The file is not a text file: it holds a NUL character</source>
        <translation>The file is not a text file: it holds a NUL character</translation>
    </message>
    <message>
        <source>The file is not valid UTF-16 text</source>
        <translation>The file is not valid UTF-16 text</translation>
    </message>
    <message>
        <source>The text is not valid UTF-8</source>
        <translation>The text is not valid UTF-8</translation>
    </message>
</context>
<context>
    <name>ZtUvcCameraSource</name>
    <message>
        <source>%1 is not connected</source>
        <translation>%1 is not connected</translation>
    </message>
    <message>
        <source>%1 is disconnected or in use (%2)</source>
        <translation>%1 is disconnected or in use (%2)</translation>
    </message>
</context>
<context>
    <name>ZtVideoFileSource</name>
    <message>
        <source>The video does not exist</source>
        <translation>The video does not exist</translation>
    </message>
    <message>
        <source>The video cannot be read</source>
        <translation>The video cannot be read</translation>
    </message>
    <message>
        <source>The video is empty</source>
        <translation>The video is empty</translation>
    </message>
    <message>
        <source>there is only sound in it</source>
        <translation>there is only sound in it</translation>
    </message>
    <message>
        <source>The video %1 cannot be played (%2)</source>
        <translation>The video %1 cannot be played (%2)</translation>
    </message>
    <message>
        <source>the file is damaged</source>
        <translation>the file is damaged</translation>
    </message>
</context>
<context>
    <name>acss</name>
    <message>
        <source>The icon %1 is missing.</source>
        <translation>The icon %1 is missing.</translation>
    </message>
</context>
</TS>
