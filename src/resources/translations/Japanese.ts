<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="ja_JP" sourcelanguage="en_US">
<context>
    <name>GuiStatReportingPluginUi</name>
    <message>
        <source>Form</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Open Templates Editor</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Opens Report Template Editor</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Generate Report File</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Exports current measurments to pdf file.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Open Statistics Window</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Template:</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Browse Templates</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Opens default template for report generation</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>KvAddImageDialog</name>
    <message>
        <source>Choose image file</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Image file(*.png *.jpg *.gif *.tif *.bmp)</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>KvAddLinkDialogUi</name>
    <message>
        <source>Insert Link</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Title:</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>URL:</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>KvAlignmentOptionsRow</name>
    <message>
        <source>Align left</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Align center</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Align right</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>KvBaseEditorNodeFactory</name>
    <message>
        <source>Measurements Table</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Text Document</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Camera Image View</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Image View</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Statistics</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Statistics Table</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Counters</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Min / Median / Max Box</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Trend</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>KvCameraImageNodeOptionsWidget</name>
    <message>
        <source>Camera image view</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Render measurements</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Draw the measurement objects on the picture</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>KvCameraImageWidget</name>
    <message>
        <source>Camera Image View</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>KvColumnsOptionsRow</name>
    <message>
        <source>Select columns:</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>KvEditorAddImageExtWidgetUi</name>
    <message>
        <source>Width:</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Width in percent of the text&apos;s width</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Float:</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Side of the text at which the picture stands</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>none</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>left</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>right</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>KvEditorToolCombo</name>
    <message>
        <source>Group of blocks, open</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Group of blocks, closed</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Close the group (Enter)</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Open the group (Enter)</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>KvEditorToolWidget</name>
    <message>
        <source>Drag onto the page, or press Enter to append</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>KvFileDialogs</name>
    <message>
        <source>%1 already exists.
Do you want to replace it?</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Save</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>KvFooterWidget</name>
    <message>
        <source>Footer</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>KvGroupByOptionsRow</name>
    <message>
        <source>Group by:</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Object</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Measurement</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>KvHeaderWidget</name>
    <message>
        <source>Header</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>KvImageFile</name>
    <message>
        <source>Cannot read the image file %1</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The image that the template holds of %1 is damaged</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>KvImageNodeOptionsWidget</name>
    <message>
        <source>Image view</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Browse</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Choose an image file</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Choose image file</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Image file(*.png *.jpg *.gif *.tif *.bmp)</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>KvImageWidget</name>
    <message>
        <source>Image View</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>KvPageCountWidget</name>
    <message>
        <source>Page count</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>KvPrintProgressDialog</name>
    <message>
        <source>Cancel</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Printing the report</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Progress</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Cancel (Esc)</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Page %1 of %2</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>KvReportKeywords</name>
    <message>
        <source>Creation date (ISO)</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Creation date (Text)</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Creation time</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Program name</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Program version</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Program vendor</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>KvReportTemplatesEditor</name>
    <message>
        <source>Report template editor</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Report template file (*.rtp)</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>KvRotationOptionsRow</name>
    <message>
        <source>Rotation</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Rotation of the picture, clockwise</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>KvSelectionOverlay</name>
    <message>
        <source>Delete block</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Delete block (Del)</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>KvStatisticsMeasurementsTableNodeCfg</name>
    <message>
        <source>Object Name</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Object Type</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Value Name</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Value</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>KvStatisticsMeasurementsTableOptionsWidget</name>
    <message>
        <source>Measurements table</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Order by:</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>default</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>%1, ascending</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>%1, descending</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>KvStatisticsMeasurementsTableWidget</name>
    <message>
        <source>Measurements Table</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>KvStatisticsStatsTableNodeCfg</name>
    <message>
        <source>Min</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Max</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Average</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Sigma</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>3 Sigma</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>6 Sigma</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>KvStatisticsStatsTableOptionsWidget</name>
    <message>
        <source>Statistics table</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>KvStatisticsStatsTableWidget</name>
    <message>
        <source>Statistics Table</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Object Type</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Measurement Type</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>KvStatisticsUnitConverter</name>
    <message>
        <source>deg</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>pcs</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>%</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>KvStatisticsWindow</name>
    <message>
        <source>Measurement statistics</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Choose a statistics view on the right.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>No statistics blocks are installed.</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>KvTemplateModel</name>
    <message>
        <source>Cannot read</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Cannot open file %1</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Error reading file</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Cannot read file %1</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Cannot save</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Cannot create file %1</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>KvTemplatesEditorWindow</name>
    <message>
        <source>Open a template file</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Start a new, empty template</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Save the template to another file</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Save the template</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Print the report to a PDF file</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Header on every page</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Footer on every page</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Page numbers</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Report pages</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Blocks to add</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Are you sure?</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The template is modified, do you want to save it first?</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Choose file to open</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Choose file to save</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Choose file to print to</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Pdf file (*.pdf)</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Save failed</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Cannot write to file %1</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>[new]</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>KvTemplatesEditorWindowUi</name>
    <message>
        <source>Open File</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Clear</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Save as ...</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Save</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Print</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Add block</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The template is empty. Drag a block from here onto the page.</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>KvTextDocumentNodeOptionsWidget</name>
    <message>
        <source>Text</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Font size in points</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Font size</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Text color</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Bold</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Italic</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Underline</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Align left</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Align center</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Align right</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Justify</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Superscript</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Subscript</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Insert link</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Insert picture</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Insert tag</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Insert a tag that the report replaces by its value</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>KvTextDocumentNodeWidget</name>
    <message>
        <source>Text</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>KvThemeOptionsRow</name>
    <message>
        <source>Color theme:</source>
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
</context>
<context>
    <name>KvWidthOptionsRow</name>
    <message>
        <source>W</source>
        <comment>short for width</comment>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Width in percent</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Width in percent of the page&apos;s content</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>KvWindowTitleBar</name>
    <message>
        <source>Close</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>StatReportingPlugin</name>
    <message>
        <source>Statistics tools</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Select Template File</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Report Template File (*.rtp)</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>No report template selected.</source>
        <translation type="unfinished"></translation>
    </message>
</context>
</TS>
