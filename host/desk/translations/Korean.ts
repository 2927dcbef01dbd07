<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="ko_KR" sourcelanguage="en_US">
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
        <source>, %1 μm/px</source>
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
    <name>ZtCsvReader</name>
    <message>
        <source>A quoted text does not end</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>There is text after a closing quote</source>
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
        <source>Sessions of version %1 are not known; this program reads version %2</source>
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
    <name>acss</name>
    <message>
        <source>The icon %1 is missing.</source>
        <translation type="unfinished"></translation>
    </message>
</context>
</TS>
