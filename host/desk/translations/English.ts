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
        <source>Status &amp;log</source>
        <translation>Status &amp;log</translation>
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
        <source>S&amp;ettings...</source>
        <translation>S&amp;ettings...</translation>
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
        <translation>Usage: measuringdesk [OPTION...] [SESSION|IMAGE|TABLE...]
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
        <source>Session opened: %1 (objects: %2)</source>
        <translation>Session opened: %1 (objects: %2)</translation>
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
        <source>Table imported: %1 (objects: %2)</source>
        <translation>Table imported: %1 (objects: %2)</translation>
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
        <source>, %1 μm/px</source>
        <comment>size of a pixel</comment>
        <translation>, %1 μm/px</translation>
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
        <source>Measured values appear here once a session is opened or a table is imported</source>
        <translation>Measured values appear here once a session is opened or a table is imported</translation>
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
    <name>ZtCsvReader</name>
    <message>
        <source>A quoted text does not end</source>
        <translation>A quoted text does not end</translation>
    </message>
    <message>
        <source>There is text after a closing quote</source>
        <translation>There is text after a closing quote</translation>
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
        <source>Sessions of version %1 are not known; this program reads version %2</source>
        <translation>Sessions of version %1 are not known; this program reads version %2</translation>
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
        <source>The first line announces %1 rows, but there are %2</source>
        <translation>The first line announces %1 rows, but there are %2</translation>
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
        <source>The row has %1 fields, but the first line announces %2 values and a class</source>
        <translation>The row has %1 fields, but the first line announces %2 values and a class</translation>
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
    <name>acss</name>
    <message>
        <source>The icon %1 is missing.</source>
        <translation>The icon %1 is missing.</translation>
    </message>
</context>
</TS>
