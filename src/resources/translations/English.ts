<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="en_US" sourcelanguage="en_US">
<context>
    <name>GuiStatReportingPluginUi</name>
    <message>
        <source>Form</source>
        <translation>Form</translation>
    </message>
    <message>
        <source>Open Templates Editor</source>
        <translation>Open Templates Editor</translation>
    </message>
    <message>
        <source>Opens Report Template Editor</source>
        <translation>Opens Report Template Editor</translation>
    </message>
    <message>
        <source>Generate Report File</source>
        <translation>Generate Report File</translation>
    </message>
    <message>
        <source>Exports current measurments to pdf file.</source>
        <translation>Exports current measurments to pdf file.</translation>
    </message>
    <message>
        <source>Open Statistics Window</source>
        <translation>Open Statistics Window</translation>
    </message>
    <message>
        <source>Template:</source>
        <translation>Template:</translation>
    </message>
    <message>
        <source>Browse Templates</source>
        <translation>Browse Templates</translation>
    </message>
    <message>
        <source>Opens default template for report generation</source>
        <translation>Opens default template for report generation</translation>
    </message>
</context>
<context>
    <name>KvAddImageDialog</name>
    <message>
        <source>Choose image file</source>
        <translation>Choose image file</translation>
    </message>
    <message>
        <source>Image file(*.png *.jpg *.gif *.tif *.bmp)</source>
        <translation>Image file(*.png *.jpg *.gif *.tif *.bmp)</translation>
    </message>
</context>
<context>
    <name>KvAddLinkDialogUi</name>
    <message>
        <source>Insert Link</source>
        <translation>Insert Link</translation>
    </message>
    <message>
        <source>Title:</source>
        <translation>Title:</translation>
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
        <translation>Align left</translation>
    </message>
    <message>
        <source>Align center</source>
        <translation>Align center</translation>
    </message>
    <message>
        <source>Align right</source>
        <translation>Align right</translation>
    </message>
</context>
<context>
    <name>KvBaseEditorNodeFactory</name>
    <message>
        <source>Measurements Table</source>
        <translation>Measurements Table</translation>
    </message>
    <message>
        <source>Text Document</source>
        <translation>Text Document</translation>
    </message>
    <message>
        <source>Camera Image View</source>
        <translation>Camera Image View</translation>
    </message>
    <message>
        <source>Image View</source>
        <translation>Image View</translation>
    </message>
    <message>
        <source>Statistics</source>
        <translation>Statistics</translation>
    </message>
    <message>
        <source>Statistics Table</source>
        <translation>Statistics Table</translation>
    </message>
    <message>
        <source>Counters</source>
        <translation>Counters</translation>
    </message>
    <message>
        <source>Min / Median / Max Box</source>
        <translation>Min / Median / Max Box</translation>
    </message>
    <message>
        <source>Trend</source>
        <translation>Trend</translation>
    </message>
</context>
<context>
    <name>KvCameraImageNodeOptionsWidget</name>
    <message>
        <source>Camera image view</source>
        <translation>Camera image view</translation>
    </message>
    <message>
        <source>Render measurements</source>
        <translation>Render measurements</translation>
    </message>
    <message>
        <source>Draw the measurement objects on the picture</source>
        <translation>Draw the measurement objects on the picture</translation>
    </message>
</context>
<context>
    <name>KvCameraImageWidget</name>
    <message>
        <source>Camera Image View</source>
        <translation>Camera Image View</translation>
    </message>
</context>
<context>
    <name>KvColumnsOptionsRow</name>
    <message>
        <source>Select columns:</source>
        <translation>Select columns:</translation>
    </message>
</context>
<context>
    <name>KvEditorAddImageExtWidgetUi</name>
    <message>
        <source>Width:</source>
        <translation>Width:</translation>
    </message>
    <message>
        <source>Width in percent of the text&apos;s width</source>
        <translation>Width in percent of the text&apos;s width</translation>
    </message>
    <message>
        <source>Float:</source>
        <translation>Float:</translation>
    </message>
    <message>
        <source>Side of the text at which the picture stands</source>
        <translation>Side of the text at which the picture stands</translation>
    </message>
    <message>
        <source>none</source>
        <translation>none</translation>
    </message>
    <message>
        <source>left</source>
        <translation>left</translation>
    </message>
    <message>
        <source>right</source>
        <translation>right</translation>
    </message>
</context>
<context>
    <name>KvEditorToolCombo</name>
    <message>
        <source>Group of blocks, open</source>
        <translation>Group of blocks, open</translation>
    </message>
    <message>
        <source>Group of blocks, closed</source>
        <translation>Group of blocks, closed</translation>
    </message>
    <message>
        <source>Close the group (Enter)</source>
        <translation>Close the group (Enter)</translation>
    </message>
    <message>
        <source>Open the group (Enter)</source>
        <translation>Open the group (Enter)</translation>
    </message>
</context>
<context>
    <name>KvEditorToolWidget</name>
    <message>
        <source>Drag onto the page, or press Enter to append</source>
        <translation>Drag onto the page, or press Enter to append</translation>
    </message>
</context>
<context>
    <name>KvFileDialogs</name>
    <message>
        <source>%1 already exists.
Do you want to replace it?</source>
        <translation>%1 already exists.
Do you want to replace it?</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>Save</translation>
    </message>
</context>
<context>
    <name>KvFooterWidget</name>
    <message>
        <source>Footer</source>
        <translation>Footer</translation>
    </message>
</context>
<context>
    <name>KvGroupByOptionsRow</name>
    <message>
        <source>Group by:</source>
        <translation>Group by:</translation>
    </message>
    <message>
        <source>Object</source>
        <translation>Object</translation>
    </message>
    <message>
        <source>Measurement</source>
        <translation>Measurement</translation>
    </message>
</context>
<context>
    <name>KvHeaderWidget</name>
    <message>
        <source>Header</source>
        <translation>Header</translation>
    </message>
</context>
<context>
    <name>KvImageFile</name>
    <message>
        <source>Cannot read the image file %1</source>
        <translation>Cannot read the image file %1</translation>
    </message>
    <message>
        <source>The image that the template holds of %1 is damaged</source>
        <translation>The image that the template holds of %1 is damaged</translation>
    </message>
</context>
<context>
    <name>KvImageNodeOptionsWidget</name>
    <message>
        <source>Image view</source>
        <translation>Image view</translation>
    </message>
    <message>
        <source>Browse</source>
        <translation>Browse</translation>
    </message>
    <message>
        <source>Choose an image file</source>
        <translation>Choose an image file</translation>
    </message>
    <message>
        <source>Choose image file</source>
        <translation>Choose image file</translation>
    </message>
    <message>
        <source>Image file(*.png *.jpg *.gif *.tif *.bmp)</source>
        <translation>Image file(*.png *.jpg *.gif *.tif *.bmp)</translation>
    </message>
</context>
<context>
    <name>KvImageWidget</name>
    <message>
        <source>Image View</source>
        <translation>Image View</translation>
    </message>
</context>
<context>
    <name>KvPageCountWidget</name>
    <message>
        <source>Page count</source>
        <translation>Page count</translation>
    </message>
</context>
<context>
    <name>KvPrintProgressDialog</name>
    <message>
        <source>Cancel</source>
        <translation>Cancel</translation>
    </message>
    <message>
        <source>Printing the report</source>
        <translation>Printing the report</translation>
    </message>
    <message>
        <source>Progress</source>
        <translation>Progress</translation>
    </message>
    <message>
        <source>Cancel (Esc)</source>
        <translation>Cancel (Esc)</translation>
    </message>
    <message>
        <source>Page %1 of %2</source>
        <translation>Page %1 of %2</translation>
    </message>
</context>
<context>
    <name>KvReportGlyphs</name>
    <message>
        <source>No installed font has these characters, the report leaves them out: %1</source>
        <translation>No installed font has these characters, the report leaves them out: %1</translation>
    </message>
    <message>
        <source>No installed font has these characters, the report leaves them out: %1 (fonts to install: %2)</source>
        <translation>No installed font has these characters, the report leaves them out: %1 (fonts to install: %2)</translation>
    </message>
</context>
<context>
    <name>KvReportKeywords</name>
    <message>
        <source>Creation date (ISO)</source>
        <translation>Creation date (ISO)</translation>
    </message>
    <message>
        <source>Creation date (Text)</source>
        <translation>Creation date (Text)</translation>
    </message>
    <message>
        <source>Creation time</source>
        <translation>Creation time</translation>
    </message>
    <message>
        <source>Program name</source>
        <translation>Program name</translation>
    </message>
    <message>
        <source>Program version</source>
        <translation>Program version</translation>
    </message>
    <message>
        <source>Program vendor</source>
        <translation>Program vendor</translation>
    </message>
</context>
<context>
    <name>KvReportTemplatesEditor</name>
    <message>
        <source>Report template editor</source>
        <translation>Report template editor</translation>
    </message>
    <message>
        <source>Report template file (*.rtp)</source>
        <translation>Report template file (*.rtp)</translation>
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
        <translation>Rotation of the picture, clockwise</translation>
    </message>
</context>
<context>
    <name>KvSelectionOverlay</name>
    <message>
        <source>Delete block</source>
        <translation>Delete block</translation>
    </message>
    <message>
        <source>Delete block (Del)</source>
        <translation>Delete block (Del)</translation>
    </message>
</context>
<context>
    <name>KvStatisticsMeasurementsTableNodeCfg</name>
    <message>
        <source>Object Name</source>
        <translation>Object Name</translation>
    </message>
    <message>
        <source>Object Type</source>
        <translation>Object Type</translation>
    </message>
    <message>
        <source>Value Name</source>
        <translation>Value Name</translation>
    </message>
    <message>
        <source>Value</source>
        <translation>Value</translation>
    </message>
</context>
<context>
    <name>KvStatisticsMeasurementsTableOptionsWidget</name>
    <message>
        <source>Measurements table</source>
        <translation>Measurements table</translation>
    </message>
    <message>
        <source>Order by:</source>
        <translation>Order by:</translation>
    </message>
    <message>
        <source>default</source>
        <translation>default</translation>
    </message>
    <message>
        <source>%1, ascending</source>
        <translation>%1, ascending</translation>
    </message>
    <message>
        <source>%1, descending</source>
        <translation>%1, descending</translation>
    </message>
</context>
<context>
    <name>KvStatisticsMeasurementsTableWidget</name>
    <message>
        <source>Measurements Table</source>
        <translation>Measurements Table</translation>
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
        <translation>Average</translation>
    </message>
    <message>
        <source>Sigma</source>
        <translation>Sigma</translation>
    </message>
    <message>
        <source>3 Sigma</source>
        <translation>3 Sigma</translation>
    </message>
    <message>
        <source>6 Sigma</source>
        <translation>6 Sigma</translation>
    </message>
</context>
<context>
    <name>KvStatisticsStatsTableOptionsWidget</name>
    <message>
        <source>Statistics table</source>
        <translation>Statistics table</translation>
    </message>
</context>
<context>
    <name>KvStatisticsStatsTableWidget</name>
    <message>
        <source>Statistics Table</source>
        <translation>Statistics Table</translation>
    </message>
    <message>
        <source>Object Type</source>
        <translation>Object Type</translation>
    </message>
    <message>
        <source>Measurement Type</source>
        <translation>Measurement Type</translation>
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
        <translation>Measurement statistics</translation>
    </message>
    <message>
        <source>Choose a statistics view on the right.</source>
        <translation>Choose a statistics view on the right.</translation>
    </message>
    <message>
        <source>No statistics blocks are installed.</source>
        <translation>No statistics blocks are installed.</translation>
    </message>
</context>
<context>
    <name>KvTemplateModel</name>
    <message>
        <source>Cannot read</source>
        <translation>Cannot read</translation>
    </message>
    <message>
        <source>Cannot open file %1</source>
        <translation>Cannot open file %1</translation>
    </message>
    <message>
        <source>Error reading file</source>
        <translation>Error reading file</translation>
    </message>
    <message>
        <source>Cannot read file %1</source>
        <translation>Cannot read file %1</translation>
    </message>
    <message>
        <source>Cannot save</source>
        <translation>Cannot save</translation>
    </message>
    <message>
        <source>Cannot create file %1</source>
        <translation>Cannot create file %1</translation>
    </message>
</context>
<context>
    <name>KvTemplatesEditorWindow</name>
    <message>
        <source>Open a template file</source>
        <translation>Open a template file</translation>
    </message>
    <message>
        <source>Start a new, empty template</source>
        <translation>Start a new, empty template</translation>
    </message>
    <message>
        <source>Save the template to another file</source>
        <translation>Save the template to another file</translation>
    </message>
    <message>
        <source>Save the template</source>
        <translation>Save the template</translation>
    </message>
    <message>
        <source>Print the report to a PDF file</source>
        <translation>Print the report to a PDF file</translation>
    </message>
    <message>
        <source>Header on every page</source>
        <translation>Header on every page</translation>
    </message>
    <message>
        <source>Footer on every page</source>
        <translation>Footer on every page</translation>
    </message>
    <message>
        <source>Page numbers</source>
        <translation>Page numbers</translation>
    </message>
    <message>
        <source>Report pages</source>
        <translation>Report pages</translation>
    </message>
    <message>
        <source>Blocks to add</source>
        <translation>Blocks to add</translation>
    </message>
    <message>
        <source>Are you sure?</source>
        <translation>Are you sure?</translation>
    </message>
    <message>
        <source>The template is modified, do you want to save it first?</source>
        <translation>The template is modified, do you want to save it first?</translation>
    </message>
    <message>
        <source>Choose file to open</source>
        <translation>Choose file to open</translation>
    </message>
    <message>
        <source>Choose file to save</source>
        <translation>Choose file to save</translation>
    </message>
    <message>
        <source>Choose file to print to</source>
        <translation>Choose file to print to</translation>
    </message>
    <message>
        <source>Pdf file (*.pdf)</source>
        <translation>Pdf file (*.pdf)</translation>
    </message>
    <message>
        <source>Save failed</source>
        <translation>Save failed</translation>
    </message>
    <message>
        <source>Cannot write to file %1</source>
        <translation>Cannot write to file %1</translation>
    </message>
    <message>
        <source>[new]</source>
        <translation>[new]</translation>
    </message>
</context>
<context>
    <name>KvTemplatesEditorWindowUi</name>
    <message>
        <source>Open File</source>
        <translation>Open File</translation>
    </message>
    <message>
        <source>Clear</source>
        <translation>Clear</translation>
    </message>
    <message>
        <source>Save as ...</source>
        <translation>Save as ...</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>Save</translation>
    </message>
    <message>
        <source>Print</source>
        <translation>Print</translation>
    </message>
    <message>
        <source>Add block</source>
        <translation>Add block</translation>
    </message>
    <message>
        <source>The template is empty. Drag a block from here onto the page.</source>
        <translation>The template is empty. Drag a block from here onto the page.</translation>
    </message>
</context>
<context>
    <name>KvTextDocumentNodeOptionsWidget</name>
    <message>
        <source>Text</source>
        <translation>Text</translation>
    </message>
    <message>
        <source>Font size in points</source>
        <translation>Font size in points</translation>
    </message>
    <message>
        <source>Font size</source>
        <translation>Font size</translation>
    </message>
    <message>
        <source>Text color</source>
        <translation>Text color</translation>
    </message>
    <message>
        <source>Bold</source>
        <translation>Bold</translation>
    </message>
    <message>
        <source>Italic</source>
        <translation>Italic</translation>
    </message>
    <message>
        <source>Underline</source>
        <translation>Underline</translation>
    </message>
    <message>
        <source>Align left</source>
        <translation>Align left</translation>
    </message>
    <message>
        <source>Align center</source>
        <translation>Align center</translation>
    </message>
    <message>
        <source>Align right</source>
        <translation>Align right</translation>
    </message>
    <message>
        <source>Justify</source>
        <translation>Justify</translation>
    </message>
    <message>
        <source>Superscript</source>
        <translation>Superscript</translation>
    </message>
    <message>
        <source>Subscript</source>
        <translation>Subscript</translation>
    </message>
    <message>
        <source>Insert link</source>
        <translation>Insert link</translation>
    </message>
    <message>
        <source>Insert picture</source>
        <translation>Insert picture</translation>
    </message>
    <message>
        <source>Insert tag</source>
        <translation>Insert tag</translation>
    </message>
    <message>
        <source>Insert a tag that the report replaces by its value</source>
        <translation>Insert a tag that the report replaces by its value</translation>
    </message>
</context>
<context>
    <name>KvTextDocumentNodeWidget</name>
    <message>
        <source>Text</source>
        <translation>Text</translation>
    </message>
</context>
<context>
    <name>KvThemeOptionsRow</name>
    <message>
        <source>Color theme:</source>
        <translation>Color theme:</translation>
    </message>
    <message>
        <source>Dark</source>
        <translation>Dark</translation>
    </message>
    <message>
        <source>Light</source>
        <translation>Light</translation>
    </message>
</context>
<context>
    <name>KvWidthOptionsRow</name>
    <message>
        <source>W</source>
        <comment>short for width</comment>
        <translation>W</translation>
    </message>
    <message>
        <source>Width in percent</source>
        <translation>Width in percent</translation>
    </message>
    <message>
        <source>Width in percent of the page&apos;s content</source>
        <translation>Width in percent of the page&apos;s content</translation>
    </message>
</context>
<context>
    <name>KvWindowTitleBar</name>
    <message>
        <source>Close</source>
        <translation>Close</translation>
    </message>
</context>
<context>
    <name>StatReportingPlugin</name>
    <message>
        <source>Statistics tools</source>
        <translation>Report &amp; Statistic</translation>
    </message>
    <message>
        <source>Select Template File</source>
        <translation>Select Report Template File</translation>
    </message>
    <message>
        <source>Report Template File (*.rtp)</source>
        <translation>Report Template File (*.rtp)</translation>
    </message>
    <message>
        <source>No report template selected.</source>
        <translation>No report template selected.</translation>
    </message>
</context>
</TS>
