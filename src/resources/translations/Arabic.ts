<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="ar_EG" sourcelanguage="en_US">
<context>
    <name>GuiStatReportingPluginUi</name>
    <message>
        <source>Form</source>
        <translation>نموذج</translation>
    </message>
    <message>
        <source>Open Templates Editor</source>
        <translation>فتح محرر القوالب</translation>
    </message>
    <message>
        <source>Opens Report Template Editor</source>
        <translation>فتح محرر قوالب التقارير</translation>
    </message>
    <message>
        <source>Generate Report File</source>
        <translation>إنشاء ملف التقرير</translation>
    </message>
    <message>
        <source>Exports current measurments to pdf file.</source>
        <translation>تصدير القياسات الحالية إلى ملف PDF.</translation>
    </message>
    <message>
        <source>Open Statistics Window</source>
        <translation>فتح نافذة الإحصاءات</translation>
    </message>
    <message>
        <source>Template:</source>
        <translation>القالب:</translation>
    </message>
    <message>
        <source>Browse Templates</source>
        <translation>استعراض القوالب</translation>
    </message>
    <message>
        <source>Opens default template for report generation</source>
        <translation>اختيار القالب الافتراضي لإنشاء التقارير</translation>
    </message>
</context>
<context>
    <name>KvAddImageDialog</name>
    <message>
        <source>Choose image file</source>
        <translation>اختيار ملف صورة</translation>
    </message>
    <message>
        <source>Image file(*.png *.jpg *.gif *.tif *.bmp)</source>
        <translation>ملف صورة (*.png *.jpg *.gif *.tif *.bmp)</translation>
    </message>
</context>
<context>
    <name>KvAddLinkDialogUi</name>
    <message>
        <source>Insert Link</source>
        <translation>إدراج رابط</translation>
    </message>
    <message>
        <source>Title:</source>
        <translation>العنوان:</translation>
    </message>
    <message>
        <source>URL:</source>
        <translation>الرابط:</translation>
    </message>
</context>
<context>
    <name>KvAlignmentOptionsRow</name>
    <message>
        <source>Align left</source>
        <translation>محاذاة لليسار</translation>
    </message>
    <message>
        <source>Align center</source>
        <translation>توسيط</translation>
    </message>
    <message>
        <source>Align right</source>
        <translation>محاذاة لليمين</translation>
    </message>
</context>
<context>
    <name>KvBaseEditorNodeFactory</name>
    <message>
        <source>Measurements Table</source>
        <translation>جدول القياسات</translation>
    </message>
    <message>
        <source>Text Document</source>
        <translation>مستند نصي</translation>
    </message>
    <message>
        <source>Camera Image View</source>
        <translation>صورة الكاميرا</translation>
    </message>
    <message>
        <source>Image View</source>
        <translation>صورة</translation>
    </message>
    <message>
        <source>Statistics</source>
        <translation>الإحصاءات</translation>
    </message>
    <message>
        <source>Statistics Table</source>
        <translation>جدول الإحصاءات</translation>
    </message>
    <message>
        <source>Counters</source>
        <translation>العدادات</translation>
    </message>
    <message>
        <source>Min / Median / Max Box</source>
        <translation>مخطط الأدنى / الوسيط / الأقصى</translation>
    </message>
    <message>
        <source>Trend</source>
        <translation>الاتجاه</translation>
    </message>
</context>
<context>
    <name>KvCameraImageNodeOptionsWidget</name>
    <message>
        <source>Camera image view</source>
        <translation>صورة الكاميرا</translation>
    </message>
    <message>
        <source>Render measurements</source>
        <translation>رسم القياسات</translation>
    </message>
    <message>
        <source>Draw the measurement objects on the picture</source>
        <translation>رسم كائنات القياس على الصورة</translation>
    </message>
</context>
<context>
    <name>KvCameraImageWidget</name>
    <message>
        <source>Camera Image View</source>
        <translation>صورة الكاميرا</translation>
    </message>
</context>
<context>
    <name>KvColumnsOptionsRow</name>
    <message>
        <source>Select columns:</source>
        <translation>اختيار الأعمدة:</translation>
    </message>
</context>
<context>
    <name>KvEditorAddImageExtWidgetUi</name>
    <message>
        <source>Width:</source>
        <translation>العرض:</translation>
    </message>
    <message>
        <source>Width in percent of the text&apos;s width</source>
        <translation>العرض كنسبة مئوية من عرض النص</translation>
    </message>
    <message>
        <source>Float:</source>
        <translation>الالتفاف:</translation>
    </message>
    <message>
        <source>Side of the text at which the picture stands</source>
        <translation>جانب النص الذي توضع عنده الصورة</translation>
    </message>
    <message>
        <source>none</source>
        <translation>بلا</translation>
    </message>
    <message>
        <source>left</source>
        <translation>يسار</translation>
    </message>
    <message>
        <source>right</source>
        <translation>يمين</translation>
    </message>
</context>
<context>
    <name>KvEditorToolCombo</name>
    <message>
        <source>Group of blocks, open</source>
        <translation>مجموعة كتل، مفتوحة</translation>
    </message>
    <message>
        <source>Group of blocks, closed</source>
        <translation>مجموعة كتل، مغلقة</translation>
    </message>
    <message>
        <source>Close the group (Enter)</source>
        <translation>إغلاق المجموعة (Enter)</translation>
    </message>
    <message>
        <source>Open the group (Enter)</source>
        <translation>فتح المجموعة (Enter)</translation>
    </message>
</context>
<context>
    <name>KvEditorToolWidget</name>
    <message>
        <source>Drag onto the page, or press Enter to append</source>
        <translation>اسحب إلى الصفحة، أو اضغط Enter للإضافة في النهاية</translation>
    </message>
</context>
<context>
    <name>KvFileDialogs</name>
    <message>
        <source>%1 already exists.
Do you want to replace it?</source>
        <translation>%1 موجود بالفعل.
هل تريد استبداله؟</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>حفظ</translation>
    </message>
</context>
<context>
    <name>KvFooterWidget</name>
    <message>
        <source>Footer</source>
        <translation>التذييل</translation>
    </message>
</context>
<context>
    <name>KvGroupByOptionsRow</name>
    <message>
        <source>Group by:</source>
        <translation>تجميع حسب:</translation>
    </message>
    <message>
        <source>Object</source>
        <translation>الكائن</translation>
    </message>
    <message>
        <source>Measurement</source>
        <translation>القياس</translation>
    </message>
</context>
<context>
    <name>KvHeaderWidget</name>
    <message>
        <source>Header</source>
        <translation>الرأس</translation>
    </message>
</context>
<context>
    <name>KvImageFile</name>
    <message>
        <source>Cannot read the image file %1</source>
        <translation>تعذرت قراءة ملف الصورة %1</translation>
    </message>
    <message>
        <source>The image that the template holds of %1 is damaged</source>
        <translation>نسخة الصورة %1 المحفوظة في القالب تالفة</translation>
    </message>
</context>
<context>
    <name>KvImageNodeOptionsWidget</name>
    <message>
        <source>Image view</source>
        <translation>صورة</translation>
    </message>
    <message>
        <source>Browse</source>
        <translation>استعراض</translation>
    </message>
    <message>
        <source>Choose an image file</source>
        <translation>اختيار ملف صورة</translation>
    </message>
    <message>
        <source>Choose image file</source>
        <translation>اختيار ملف صورة</translation>
    </message>
    <message>
        <source>Image file(*.png *.jpg *.gif *.tif *.bmp)</source>
        <translation>ملف صورة (*.png *.jpg *.gif *.tif *.bmp)</translation>
    </message>
</context>
<context>
    <name>KvImageWidget</name>
    <message>
        <source>Image View</source>
        <translation>صورة</translation>
    </message>
</context>
<context>
    <name>KvPageCountWidget</name>
    <message>
        <source>Page count</source>
        <translation>رقم الصفحة</translation>
    </message>
</context>
<context>
    <name>KvPrintProgressDialog</name>
    <message>
        <source>Cancel</source>
        <translation>إلغاء</translation>
    </message>
    <message>
        <source>Printing the report</source>
        <translation>طباعة التقرير</translation>
    </message>
    <message>
        <source>Progress</source>
        <translation>التقدم</translation>
    </message>
    <message>
        <source>Cancel (Esc)</source>
        <translation>إلغاء (Esc)</translation>
    </message>
    <message>
        <source>Page %1 of %2</source>
        <translation>الصفحة %1 من %2</translation>
    </message>
</context>
<context>
    <name>KvReportGlyphs</name>
    <message>
        <source>No installed font has these characters, the report leaves them out: %1</source>
        <translation>لا يوجد خط مثبت فيه هذه الأحرف، فلا تظهر في التقرير: %1</translation>
    </message>
    <message>
        <source>No installed font has these characters, the report leaves them out: %1 (fonts to install: %2)</source>
        <translation>لا يوجد خط مثبت فيه هذه الأحرف، فلا تظهر في التقرير: %1 (خطوط للتثبيت: %2)</translation>
    </message>
</context>
<context>
    <name>KvReportKeywords</name>
    <message>
        <source>Creation date (ISO)</source>
        <translation>تاريخ الإنشاء (ISO)</translation>
    </message>
    <message>
        <source>Creation date (Text)</source>
        <translation>تاريخ الإنشاء (نص)</translation>
    </message>
    <message>
        <source>Creation time</source>
        <translation>وقت الإنشاء</translation>
    </message>
    <message>
        <source>Program name</source>
        <translation>اسم البرنامج</translation>
    </message>
    <message>
        <source>Program version</source>
        <translation>إصدار البرنامج</translation>
    </message>
    <message>
        <source>Program vendor</source>
        <translation>مورّد البرنامج</translation>
    </message>
</context>
<context>
    <name>KvReportTemplatesEditor</name>
    <message>
        <source>Report template editor</source>
        <translation>محرر قوالب التقارير</translation>
    </message>
    <message>
        <source>Report template file (*.rtp)</source>
        <translation>ملف قالب تقرير (*.rtp)</translation>
    </message>
</context>
<context>
    <name>KvRotationOptionsRow</name>
    <message>
        <source>Rotation</source>
        <translation>التدوير</translation>
    </message>
    <message>
        <source>Rotation of the picture, clockwise</source>
        <translation>تدوير الصورة باتجاه عقارب الساعة</translation>
    </message>
</context>
<context>
    <name>KvSelectionOverlay</name>
    <message>
        <source>Delete block</source>
        <translation>حذف الكتلة</translation>
    </message>
    <message>
        <source>Delete block (Del)</source>
        <translation>حذف الكتلة (Del)</translation>
    </message>
</context>
<context>
    <name>KvStatisticsMeasurementsTableNodeCfg</name>
    <message>
        <source>Object Name</source>
        <translation>اسم الكائن</translation>
    </message>
    <message>
        <source>Object Type</source>
        <translation>نوع الكائن</translation>
    </message>
    <message>
        <source>Value Name</source>
        <translation>اسم القيمة</translation>
    </message>
    <message>
        <source>Value</source>
        <translation>القيمة</translation>
    </message>
</context>
<context>
    <name>KvStatisticsMeasurementsTableOptionsWidget</name>
    <message>
        <source>Measurements table</source>
        <translation>جدول القياسات</translation>
    </message>
    <message>
        <source>Order by:</source>
        <translation>ترتيب حسب:</translation>
    </message>
    <message>
        <source>default</source>
        <translation>افتراضي</translation>
    </message>
    <message>
        <source>%1, ascending</source>
        <translation>%1، تصاعدي</translation>
    </message>
    <message>
        <source>%1, descending</source>
        <translation>%1، تنازلي</translation>
    </message>
</context>
<context>
    <name>KvStatisticsMeasurementsTableWidget</name>
    <message>
        <source>Measurements Table</source>
        <translation>جدول القياسات</translation>
    </message>
</context>
<context>
    <name>KvStatisticsStatsTableNodeCfg</name>
    <message>
        <source>Min</source>
        <translation>الأدنى</translation>
    </message>
    <message>
        <source>Max</source>
        <translation>الأقصى</translation>
    </message>
    <message>
        <source>Average</source>
        <translation>المتوسط</translation>
    </message>
    <message>
        <source>Sigma</source>
        <translation>سيجما</translation>
    </message>
    <message>
        <source>3 Sigma</source>
        <translation>3 سيجما</translation>
    </message>
    <message>
        <source>6 Sigma</source>
        <translation>6 سيجما</translation>
    </message>
</context>
<context>
    <name>KvStatisticsStatsTableOptionsWidget</name>
    <message>
        <source>Statistics table</source>
        <translation>جدول الإحصاءات</translation>
    </message>
</context>
<context>
    <name>KvStatisticsStatsTableWidget</name>
    <message>
        <source>Statistics Table</source>
        <translation>جدول الإحصاءات</translation>
    </message>
    <message>
        <source>Object Type</source>
        <translation>نوع الكائن</translation>
    </message>
    <message>
        <source>Measurement Type</source>
        <translation>نوع القياس</translation>
    </message>
</context>
<context>
    <name>KvStatisticsUnitConverter</name>
    <message>
        <source>deg</source>
        <translation>درجة</translation>
    </message>
    <message>
        <source>pcs</source>
        <translation>قطعة</translation>
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
        <translation>إحصاءات القياسات</translation>
    </message>
    <message>
        <source>Choose a statistics view on the right.</source>
        <translation>اختر عرضًا إحصائيًا من الشريط الجانبي.</translation>
    </message>
    <message>
        <source>No statistics blocks are installed.</source>
        <translation>لم تُثبَّت أي كتل إحصائية.</translation>
    </message>
</context>
<context>
    <name>KvTemplateModel</name>
    <message>
        <source>Cannot read</source>
        <translation>تعذرت القراءة</translation>
    </message>
    <message>
        <source>Cannot open file %1</source>
        <translation>تعذر فتح الملف %1</translation>
    </message>
    <message>
        <source>Error reading file</source>
        <translation>خطأ في قراءة الملف</translation>
    </message>
    <message>
        <source>Cannot read file %1</source>
        <translation>تعذرت قراءة الملف %1</translation>
    </message>
    <message>
        <source>Cannot save</source>
        <translation>تعذر الحفظ</translation>
    </message>
    <message>
        <source>Cannot create file %1</source>
        <translation>تعذر إنشاء الملف %1</translation>
    </message>
</context>
<context>
    <name>KvTemplatesEditorWindow</name>
    <message>
        <source>Open a template file</source>
        <translation>فتح ملف قالب</translation>
    </message>
    <message>
        <source>Start a new, empty template</source>
        <translation>بدء قالب جديد فارغ</translation>
    </message>
    <message>
        <source>Save the template to another file</source>
        <translation>حفظ القالب في ملف آخر</translation>
    </message>
    <message>
        <source>Save the template</source>
        <translation>حفظ القالب</translation>
    </message>
    <message>
        <source>Print the report to a PDF file</source>
        <translation>طباعة التقرير إلى ملف PDF</translation>
    </message>
    <message>
        <source>Header on every page</source>
        <translation>رأس في كل صفحة</translation>
    </message>
    <message>
        <source>Footer on every page</source>
        <translation>تذييل في كل صفحة</translation>
    </message>
    <message>
        <source>Page numbers</source>
        <translation>أرقام الصفحات</translation>
    </message>
    <message>
        <source>Report pages</source>
        <translation>صفحات التقرير</translation>
    </message>
    <message>
        <source>Blocks to add</source>
        <translation>الكتل المتاحة</translation>
    </message>
    <message>
        <source>Are you sure?</source>
        <translation>هل أنت متأكد؟</translation>
    </message>
    <message>
        <source>The template is modified, do you want to save it first?</source>
        <translation>القالب معدَّل، هل تريد حفظه أولًا؟</translation>
    </message>
    <message>
        <source>Choose file to open</source>
        <translation>اختيار ملف لفتحه</translation>
    </message>
    <message>
        <source>Choose file to save</source>
        <translation>اختيار ملف للحفظ</translation>
    </message>
    <message>
        <source>Choose file to print to</source>
        <translation>اختيار ملف للطباعة إليه</translation>
    </message>
    <message>
        <source>Pdf file (*.pdf)</source>
        <translation>ملف PDF (*.pdf)</translation>
    </message>
    <message>
        <source>Save failed</source>
        <translation>فشل الحفظ</translation>
    </message>
    <message>
        <source>Cannot write to file %1</source>
        <translation>تعذرت الكتابة إلى الملف %1</translation>
    </message>
    <message>
        <source>[new]</source>
        <translation>[جديد]</translation>
    </message>
</context>
<context>
    <name>KvTemplatesEditorWindowUi</name>
    <message>
        <source>Open File</source>
        <translation>فتح ملف</translation>
    </message>
    <message>
        <source>Clear</source>
        <translation>مسح</translation>
    </message>
    <message>
        <source>Save as ...</source>
        <translation>حفظ باسم...</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>حفظ</translation>
    </message>
    <message>
        <source>Print</source>
        <translation>طباعة</translation>
    </message>
    <message>
        <source>Add block</source>
        <translation>إضافة كتلة</translation>
    </message>
    <message>
        <source>The template is empty. Drag a block from here onto the page.</source>
        <translation>القالب فارغ. اسحب كتلة من هنا إلى الصفحة.</translation>
    </message>
</context>
<context>
    <name>KvTextDocumentNodeOptionsWidget</name>
    <message>
        <source>Text</source>
        <translation>نص</translation>
    </message>
    <message>
        <source>Font size in points</source>
        <translation>حجم الخط بالنقاط</translation>
    </message>
    <message>
        <source>Font size</source>
        <translation>حجم الخط</translation>
    </message>
    <message>
        <source>Text color</source>
        <translation>لون النص</translation>
    </message>
    <message>
        <source>Bold</source>
        <translation>غامق</translation>
    </message>
    <message>
        <source>Italic</source>
        <translation>مائل</translation>
    </message>
    <message>
        <source>Underline</source>
        <translation>تسطير</translation>
    </message>
    <message>
        <source>Align left</source>
        <translation>محاذاة لليسار</translation>
    </message>
    <message>
        <source>Align center</source>
        <translation>توسيط</translation>
    </message>
    <message>
        <source>Align right</source>
        <translation>محاذاة لليمين</translation>
    </message>
    <message>
        <source>Justify</source>
        <translation>ضبط</translation>
    </message>
    <message>
        <source>Superscript</source>
        <translation>نص مرتفع</translation>
    </message>
    <message>
        <source>Subscript</source>
        <translation>نص منخفض</translation>
    </message>
    <message>
        <source>Insert link</source>
        <translation>إدراج رابط</translation>
    </message>
    <message>
        <source>Insert picture</source>
        <translation>إدراج صورة</translation>
    </message>
    <message>
        <source>Insert tag</source>
        <translation>إدراج وسم</translation>
    </message>
    <message>
        <source>Insert a tag that the report replaces by its value</source>
        <translation>إدراج وسم يستبدله التقرير بقيمته</translation>
    </message>
</context>
<context>
    <name>KvTextDocumentNodeWidget</name>
    <message>
        <source>Text</source>
        <translation>نص</translation>
    </message>
</context>
<context>
    <name>KvThemeOptionsRow</name>
    <message>
        <source>Color theme:</source>
        <translation>سمة الألوان:</translation>
    </message>
    <message>
        <source>Dark</source>
        <translation>داكنة</translation>
    </message>
    <message>
        <source>Light</source>
        <translation>فاتحة</translation>
    </message>
</context>
<context>
    <name>KvWidthOptionsRow</name>
    <message>
        <source>W</source>
        <comment>short for width</comment>
        <translation>ع</translation>
    </message>
    <message>
        <source>Width in percent</source>
        <translation>العرض بالنسبة المئوية</translation>
    </message>
    <message>
        <source>Width in percent of the page&apos;s content</source>
        <translation>العرض كنسبة مئوية من عرض محتوى الصفحة</translation>
    </message>
</context>
<context>
    <name>KvWindowTitleBar</name>
    <message>
        <source>Close</source>
        <translation>إغلاق</translation>
    </message>
</context>
<context>
    <name>StatReportingPlugin</name>
    <message>
        <source>Statistics tools</source>
        <translation>التقارير والإحصاء</translation>
    </message>
    <message>
        <source>Select Template File</source>
        <translation>اختيار ملف القالب</translation>
    </message>
    <message>
        <source>Report Template File (*.rtp)</source>
        <translation>ملف قالب تقرير (*.rtp)</translation>
    </message>
    <message>
        <source>No report template selected.</source>
        <translation>لم يُحدَّد أي قالب تقرير.</translation>
    </message>
</context>
</TS>
