<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="zh_TW" sourcelanguage="en_US">
<context>
    <name>KvDeskActions</name>
    <message>
        <source>&amp;New session</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Start an empty session</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Open &amp;image...</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Open image</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>&amp;Open session...</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Open session</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Import &amp;table...</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Import table of measured values</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>&amp;Save session</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Save session</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Save session &amp;as...</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Save session to another file</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>&amp;Quit</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Quit the program</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Zoom &amp;in</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Zoom in</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Zoom &amp;out</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Zoom out</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>&amp;Fit to window</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Show the whole image</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>&amp;Actual size</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Show the image at 100 %</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>&amp;Measured values</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Show or hide the measured values</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Status &amp;log</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Show or hide the status log</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>&amp;Dark or light theme</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Change between the dark and the light theme</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>S&amp;ettings...</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Settings</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>&amp;About Measuring Desk</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>About Measuring Desk</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>%1 (%2)</source>
        <comment>command (shortcut)</comment>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>&amp;Export measured values...</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Export measured values as a table</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>&amp;Undo</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Undo the last step</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>&amp;Redo</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Redo what was undone</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Cu&amp;t</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Cut the selected objects</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>&amp;Copy</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Copy the selected objects</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>&amp;Paste</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Paste copied objects</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>&amp;Delete</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Delete the selected objects</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Select &amp;all</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Select all objects on the image</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Re&amp;name</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Give the selected object a name</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>&amp;Find measured values</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Filter the measured values</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>&amp;Select</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Select and change objects</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>&amp;Line</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Measure a length</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>&amp;Polyline</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Measure the length of a way</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Parallel &amp;distance</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Measure the distance of a point from a line</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>&amp;Arc</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Measure an arc through three points</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>&amp;Circle</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Measure a circle</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>&amp;Rectangle</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Measure a rectangle</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Poly&amp;gon</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Measure the area of a polygon</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Cou&amp;nter</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Count by clicks</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>&amp;Text note</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Write on the image</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Scale &amp;bar</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Draw a scale bar</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Cali&amp;bration...</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Say how large a pixel of the image is</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Use the file&apos;s pixel size</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Measure with the pixel size that the image&apos;s file states</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>&amp;Take snapshot</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Save the image to the gallery</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Snapshots with &amp;measurements</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Draw the measured objects on snapshots</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>&amp;Freeze</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Freeze the live image</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>&amp;Labels on the image</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Show or hide the labels of objects</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Pixel &amp;rulers</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Show or hide the rulers</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>&amp;Scale bar on the image</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Show or hide the scale bar, on reports, too</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>&amp;Gallery</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Show or hide the gallery</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>KvDeskAutosave</name>
    <message>
        <source>the folder &quot;%1&quot; cannot be written</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Unsaved changes are not being copied: %1</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>KvDeskCalibrationCommands</name>
    <message>
        <source>The session measures with it already</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The image&apos;s file does not state one</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>KvDeskCalibrationDialog</name>
    <message>
        <source>Calibration</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Objective</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Choose an objective, or type the name of a new one</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Such as 10x</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>In use</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>New calibration</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Known distance</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Image file</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Typed</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Name</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Who</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Note</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Calibrate</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>History of the objective</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Calibrations of this objective appear here</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Use again</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Close</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>New pixel size: %1</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>No pixel size yet</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Measure with this pixel size and remember it</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Complete the fields above first</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Measure with the selected calibration</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Select a calibration in the table first</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>KvDeskCalibrationHistory</name>
    <message>
        <source>Date</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Who</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Pixel size</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Origin</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Name</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>KvDeskCalibrationText</name>
    <message>
        <source>%1 μm</source>
        <comment>size of a pixel</comment>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>%1 × %2 μm</source>
        <comment>width and height of a pixel</comment>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Known distance</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Image file</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Typed</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Not calibrated</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>KvDeskCalibrator</name>
    <message>
        <source>%1 states pixels of %2; the session measures with %3</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>%1 states pixels of %2; the session measures in pixels</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>KvDeskCommandLine</name>
    <message>
        <source>There is no theme &quot;%1&quot;: use %2</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source> or </source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Usage: measuringdesk [OPTION...] [SESSION|IMAGE|TABLE...]
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
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>KvDeskCounterBar</name>
    <message>
        <source>Clicks count for</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The counter that gets the clicks (1 to 9)</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Count another class</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>A right click takes a place away</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>A new counter</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>KvDeskEditCommands</name>
    <message>
        <source>&amp;Undo %1</source>
        <extracomment>%1 is what is undone or redone, such as &quot;move of Line 3&quot;</extracomment>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>&amp;Undo</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>&amp;Redo %1</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>&amp;Redo</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Nothing was done yet</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Nothing was undone</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Select an object first</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Select one object first</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>No measured objects were copied</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>KvDeskExportCommand</name>
    <message>
        <source>Nothing was measured yet</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Measured values</source>
        <comment>file name</comment>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>JSON files</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>CSV tables</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Export measured values</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Export cancelled: %1</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The table &quot;%1&quot; was not written.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Measured values exported: %1</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Exporting measured values</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>KvDeskExportDialog</name>
    <message>
        <source>Export measured values</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Table</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Numbers</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Only the selected objects (%1)</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Byte order mark, for spreadsheets that do not expect UTF-8</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Apostrophe before names that spreadsheets take for formulas</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Changes names that begin with =, +, - or @: they are others when the table is imported again</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Export...</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>CSV, one row per value</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>CSV, one row per object</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>JSON</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>1.5, commas between the fields</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>1,5, semicolons between the fields (spreadsheets, %1)</source>
        <extracomment>%1 is the name of a language</extracomment>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>1.5, commas between the fields (spreadsheets, %1)</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>For statistics programs. Can be imported here again.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>For spreadsheets. Headings name the units.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>For programs. Numbers always have a decimal point.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>No measured object is selected</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>KvDeskExposureControl</name>
    <message>
        <source>&amp;Exposure</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Exposure time of the camera</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source> ms</source>
        <comment>milliseconds</comment>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>KvDeskFileCommands</name>
    <message>
        <source>Sessions</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>All files</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Unsaved changes</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Save the changes to &quot;%1&quot;?</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The session &quot;%1&quot; was not opened.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Session opened: %1 (objects: %2)</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Image missing</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Open the session without its image?</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The image &quot;%1&quot; was not opened.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Image opened: %1</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The table &quot;%1&quot; was not imported.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>%1: %2</source>
        <comment>file, remark</comment>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Table imported: %1 (objects: %2)</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The session &quot;%1&quot; was not saved.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Session saved: %1</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Open session</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Open image</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Images</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Import table</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Tables</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Save session</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Measuring Desk</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Only one session can be open; not opened: %1</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Neither a session, an image nor a table: %1</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>There is not enough memory</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Opening &quot;%1&quot;</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The measurements were not restored.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Restoring measurements</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Measurements restored: %1 (objects: %2)</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Importing &quot;%1&quot;</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Saving &quot;%1&quot;</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Session changed by another program</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>&quot;%1&quot; was changed by another program. Overwrite its changes?</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Overwrite</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Save as...</source>
        <translation type="unfinished"></translation>
    </message>
    <message numerus="yes">
        <source>%n files were not opened.</source>
        <extracomment>%n is 2 at least</extracomment>
        <translation type="unfinished">
            <numerusform></numerusform>
        </translation>
    </message>
</context>
<context>
    <name>KvDeskFilePixelSize</name>
    <message>
        <source>%1 states pixels of %2.</source>
        <comment>file, size</comment>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The image&apos;s file does not state how large its pixels are.</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>KvDeskGallery</name>
    <message>
        <source>Gallery</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Hide the gallery</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>&amp;Open image</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>&amp;Show in folder</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>&amp;Copy path</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>&amp;Move to trash...</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Choose &amp;folder...</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Show the images of a folder</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Save s&amp;napshots in this folder</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Folder of the gallery</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>More commands of the gallery</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Snapshots</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Choose folder</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Snapshots are saved in %1</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Snapshots (%1) and the images of a folder appear here; drag them onto report pages</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>There are no images in %1</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The folder %1 does not exist</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Select an image first</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Snapshots are saved in this folder already</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Move &quot;%1&quot; to the trash?</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Move the selected images (%1) to the trash?</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Move to trash</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Moved to the trash: %1</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Not moved to the trash: %1</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Measuring Desk</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The files are still there. They are write-protected, or there is no trash for them.</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>KvDeskGalleryModel</name>
    <message>
        <source>%1 × %2 px</source>
        <comment>width, height</comment>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>KvDeskGalleryView</name>
    <message>
        <source>Gallery</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>KvDeskImageView</name>
    <message>
        <source>Image</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Open an image or a session to start</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>KvDeskInlineEditor</name>
    <message>
        <source>Text</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Name</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>KvDeskKnownDistance</name>
    <message>
        <source>inch</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Use selected line</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Length of the line</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Unit of the length</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Its length</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Draw a line over a distance that you know, such as on a stage micrometer, and select it.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>No line yet</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>%1: %2</source>
        <comment>name and length of a line</comment>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Take the selected line as the known distance</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Select one line on the image first</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>KvDeskLiveBar</name>
    <message>
        <source>Live image</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Freeze</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>%1 fps</source>
        <extracomment>frames per second</extracomment>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>%1 delivers no pictures any more; this is the last one</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>%1 delivers no pictures</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>%1 is stopped</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Waiting for the first picture of %1</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Frozen: %1</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Live: %1</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>This image is not live</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>&amp;Reconnect</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>&amp;Start</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Frames per second
Dropped, because newer ones came first: %1</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>KvDeskMainWindow</name>
    <message>
        <source>&amp;File</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>&amp;Recent sessions</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>&amp;View</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>&amp;Help</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Main tool bar</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>%1[*] - Measuring Desk</source>
        <extracomment>%1 is the name of a session; [*] is replaced by a star when it has unsaved changes</extracomment>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>None yet</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>About Measuring Desk</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>&lt;b&gt;Measuring Desk %1&lt;/b&gt;&lt;p&gt;Measures objects on images, and hosts plug-ins such as the statistics reports.&lt;/p&gt;&lt;p&gt;%2, MIT licence&lt;/p&gt;</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Measuring Desk</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>&amp;Edit</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>&amp;Image</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>&amp;Measure</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Choose the image source</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>KvDeskNotice</name>
    <message>
        <source>Close this message</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>KvDeskObjectClipboard</name>
    <message>
        <source>Type</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Object</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Value name</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Value</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>KvDeskObjectEditor</name>
    <message numerus="yes">
        <source>%n objects</source>
        <comment>several measured objects</comment>
        <extracomment>%n is 2 at least</extracomment>
        <translation type="unfinished">
            <numerusform></numerusform>
        </translation>
    </message>
    <message>
        <source>drawing of %1</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>change of %1</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>move of %1</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>renaming of %1</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>text of %1</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>showing of %1 of %2</source>
        <extracomment>%1 is a value, %2 an object</extracomment>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>hiding of %1 of %2</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>deletion of %1</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>change of the calibration</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>place of %1</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>deletion of a place of %1</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>pasting of %1</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>KvDeskPlugins</name>
    <message>
        <source>No plug-ins were found</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>It is no plug-in for this program</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Its tools &quot;%1&quot; could not be started</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Plug-in loaded: %1</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Plug-in not loaded: %1: %2</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>It failed: %1</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>It failed for a reason of its own</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>KvDeskProgress</name>
    <message>
        <source>Cancel</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Leave everything as it was (Esc)</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>KvDeskRecovery</name>
    <message>
        <source>Untitled session</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>%1 (objects: %2)</source>
        <extracomment>%1 is the name of a session</extracomment>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>KvDeskRecoveryBar</name>
    <message>
        <source>Show other measurements that were not saved</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Restore</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Open these measurements as a session with unsaved changes</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Discard</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Delete these measurements for good</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>%1: %2</source>
        <extracomment>%1 is a time, %2 a session</extracomment>
        <translation type="unfinished"></translation>
    </message>
    <message numerus="yes">
        <source>%n more</source>
        <comment>measurements that were not saved</comment>
        <translation type="unfinished">
            <numerusform></numerusform>
        </translation>
    </message>
    <message>
        <source>Measurements from %1 were not saved.</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>KvDeskRuler</name>
    <message>
        <source>Horizontal ruler</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Vertical ruler</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Ruler in %1</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>KvDeskSelectionStatistics</name>
    <message>
        <source>n = %1, mean %2, SD %3, min %4, max %5</source>
        <extracomment>number of values, their mean, standard deviation, smallest and largest one</extracomment>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Selected values: %1</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>&quot;%1&quot; among them: %2</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Mean: %1</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Standard deviation: %1</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Smallest: %1</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Largest: %1</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>KvDeskSession</name>
    <message>
        <source>Untitled session</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>KvDeskSettingsDialog</name>
    <message>
        <source>Settings</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Appearance</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Theme</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Dark</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Light</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Language</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Another language takes effect when the program is started again.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Measured values</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Automatic</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Significant digits</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Length unit</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Angle unit</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Degrees (°)</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Radians (rad)</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>System default</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>KvDeskSnapshotFile</name>
    <message>
        <source>The folder cannot be created</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The picture cannot be encoded</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>KvDeskSnapshots</name>
    <message>
        <source>Open an image first</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>No snapshot was taken: earlier ones are still being saved</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Snapshot saved: %1</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The snapshot was not saved. %1</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>KvDeskSourceCommands</name>
    <message>
        <source>The image source &quot;%1&quot; was not opened.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Image source: %1</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Open image folder</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Open video</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Videos</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>KvDeskSourceMenu</name>
    <message>
        <source>Image &amp;source</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Still &amp;image...</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Image &amp;folder...</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Play the images of a folder like a camera</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>&amp;Video...</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Play a video like a camera</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Looking for cameras...</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>No camera is connected</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>KvDeskStatus</name>
    <message>
        <source>Warning</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Error</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Information</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>KvDeskStatusBar</name>
    <message>
        <source>%1 × %2 px</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>%1 %</source>
        <comment>zoom</comment>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>x %1, y %2</source>
        <comment>pixel below the pointer</comment>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Statistics of the selected values</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>, %1</source>
        <comment>objective</comment>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>, %1/px</source>
        <comment>size of a pixel</comment>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>KvDeskStatusLog</name>
    <message>
        <source>Status log</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Hide the status log</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Clear the status log</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Messages of the program and its plug-ins appear here</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>KvDeskStatusLogModel</name>
    <message>
        <source>%1
Reported by %2</source>
        <comment>message, source</comment>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Category</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Time</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Message</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>KvDeskTableView</name>
    <message>
        <source>Copy</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>KvDeskToolStrip</name>
    <message>
        <source>Measuring tools</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>KvDeskTypedPixelSize</name>
    <message>
        <source>Width of a pixel in micrometres</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Height of a pixel in micrometres</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Same size in both directions</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Width</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Height</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Type how large a pixel of the image is in reality.</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>KvDeskValueCommands</name>
    <message>
        <source>Rename</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Delete object</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Hide value</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Show all values of the object</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Select one object first</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Select an object first</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Select a value first</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>No value of the selected object is hidden</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>showing of values</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>hiding of values</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>KvDeskValueTable</name>
    <message>
        <source>Measured values</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Hide the measured values</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Measured values appear here once a session is opened or a table is imported</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Filter by type, object or value name</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Filter of the measured values</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Shows only rows that have all of these words (Ctrl+F)</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>No measured value matches the filter</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Clear the filter</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>%1 of %2</source>
        <extracomment>rows that match the filter, all rows</extracomment>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>KvDeskValueTableModel</name>
    <message>
        <source>Type</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Object</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Value name</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Value</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>KvToolBase</name>
    <message>
        <source>Reset</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Reset to the default values</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>ZtAppSettings</name>
    <message>
        <source>The settings could not be saved to %1. Check that the folder is writable.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The settings file %1 cannot be read. Changes to the settings will not be kept.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The settings file %1 is damaged. It was renamed to %2; all settings are back at their defaults.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The settings file %1 is damaged and could not be renamed to %2. Changes to the settings will not be kept.</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>ZtAravisSource</name>
    <message>
        <source>%1 is disconnected; its last picture stays</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>%1 delivers pictures of a kind that cannot be shown</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The camera does not take the setting (%1)</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>%1 cannot be opened (%2)</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>ZtCalibrationStore</name>
    <message>
        <source>This is not a calibration</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>A calibration in the settings is damaged and was left out (%1: %2)</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>ZtCsvReader</name>
    <message>
        <source>A quoted text does not end</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>There is text after a closing quote</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Reading was cancelled</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>ZtDrawnType</name>
    <message>
        <source>Rectangle</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Width</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Height</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Area</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Line</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Length</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Arc</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Angle</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Arc length</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Polygon</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Perimeter</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Polyline</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Parallel distance</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Distance</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Text note</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Scale bar</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Counter</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Count</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Share</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Circle</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Diameter</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>ZtFrameSourceCatalogue</name>
    <message>
        <source>This program cannot play videos</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>This program knows no cameras of this kind</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>ZtImageFolderSource</name>
    <message>
        <source>%1: no picture of the folder can be shown</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The folder does not exist</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The folder cannot be read</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The folder holds no pictures</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>ZtKernelImage</name>
    <message>
        <source>%1 delivers pictures again</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>ZtLiveFrameSource</name>
    <message>
        <source>%1 has stopped delivering pictures; the last one stays</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>ZtMeasureFormat</name>
    <message>
        <source>pcs</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>ZtSession</name>
    <message>
        <source>The file is empty</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The file is not a session</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The file cannot be written (%1)</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>This must be a list</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>This must be a text</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>This must be a whole number from 1</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>This must be a number</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>This must be a number greater than 0</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Another object of this type has the same number</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>This must be an object</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>&quot;%1&quot; is not a type of objects</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>An object of type &quot;%1&quot; cannot have this number of points (%2)</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>A point must be a list of two numbers between -1e9 and 1e9</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>This must be the name of a value</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The type has no name</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>A value must have a name of its own</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The numbers of the rows must rise</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>A row must be a list of number, name and values</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>This must be a text or null</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>This must be a list or an object</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The table has no such value</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>This must be the text of a number</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The unit does not fit that of the value</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The file is nested too deeply</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The file is not valid JSON (%1)</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The file does not exist</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>This is a folder, not a file</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The file cannot be read (%1)</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The file is too large for a session</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>This must be a date such as 2026-01-31T12:00:00Z</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>This must be &quot;knownDistance&quot;, &quot;metadata&quot; or &quot;typed&quot;</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The file is write-protected</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Writing was cancelled</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Reading was cancelled</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The session is of the newer version %1; this program reads versions up to %2</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Sessions of version %1 are not known; this program reads versions %2 to %3</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>ZtStillImageSource</name>
    <message>
        <source>The picture does not exist</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>This is a folder, not a picture</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The picture cannot be read</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The picture has %1 x %2 pixels, which is too many</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The picture cannot be decoded (%1)</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>the file is empty</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>it has no size</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>the file is damaged</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>the file is too short for its picture</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>there is not enough memory</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>ZtTableImport</name>
    <message>
        <source>&quot;%1&quot; already has a value &quot;%2&quot; in line %3</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The file does not exist</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>This is a folder, not a file</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The file cannot be read (%1)</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The table is not open for reading</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The table has no rows</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The row and the header differ in their number of fields (%1 and %2)</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>%1 is not a finite number</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>%1 is not a number</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>&quot;%1&quot; of &quot;%2&quot; is given in &quot;%3&quot; here, but in &quot;%4&quot; before</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>There is no column %1; the columns are %2</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Object</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>There is no value %1 to give a unit; the values are %2</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The first line announces %1 rows, but there are %2</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The first line announces rows without values</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>There is no column %1; the columns of this table have no names</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>%1 is not the index of a class; they go from 0 to %2</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Value %1</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The row has %1 fields, but the first line announces %2 values and a class</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The file is larger than %1 MB</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The file is empty</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The first line does not name the columns</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Column %1 is not part of a list of values and was left out</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Columns %1 are not part of a list of values and were left out</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The value has no name</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The row does not say which object it belongs to</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>%1 is not a unit</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>There is no column of numbers</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Column %1</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Column %1 holds text and was left out</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Columns %1 hold text and were left out</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Reading was cancelled</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>ZtTextDecoder</name>
    <message>
        <source>The file is not a text file: it holds a NUL character</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The file is not valid UTF-16 text</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The text is not valid UTF-8</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>ZtUvcCameraSource</name>
    <message>
        <source>%1 is not connected</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>%1 is disconnected or in use (%2)</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>ZtVideoFileSource</name>
    <message>
        <source>The video does not exist</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The video cannot be read</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The video is empty</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>there is only sound in it</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The video %1 cannot be played (%2)</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>the file is damaged</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>acss</name>
    <message>
        <source>The icon %1 is missing.</source>
        <translation type="unfinished"></translation>
    </message>
</context>
</TS>
