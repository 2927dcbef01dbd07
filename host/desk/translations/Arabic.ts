<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="ar_EG" sourcelanguage="en_US">
<context>
    <name>KvDeskActions</name>
    <message>
        <source>&amp;New session</source>
        <translation>جلسة &amp;جديدة</translation>
    </message>
    <message>
        <source>Start an empty session</source>
        <translation>بدء جلسة فارغة</translation>
    </message>
    <message>
        <source>Open &amp;image...</source>
        <translation>فتح &amp;صورة...</translation>
    </message>
    <message>
        <source>Open image</source>
        <translation>فتح صورة</translation>
    </message>
    <message>
        <source>&amp;Open session...</source>
        <translation>&amp;فتح جلسة...</translation>
    </message>
    <message>
        <source>Open session</source>
        <translation>فتح جلسة</translation>
    </message>
    <message>
        <source>Import &amp;table...</source>
        <translation>ا&amp;ستيراد جدول...</translation>
    </message>
    <message>
        <source>Import table of measured values</source>
        <translation>استيراد جدول قيم مقيسة</translation>
    </message>
    <message>
        <source>&amp;Save session</source>
        <translation>&amp;حفظ الجلسة</translation>
    </message>
    <message>
        <source>Save session</source>
        <translation>حفظ الجلسة</translation>
    </message>
    <message>
        <source>Save session &amp;as...</source>
        <translation>حفظ الجلسة &amp;باسم...</translation>
    </message>
    <message>
        <source>Save session to another file</source>
        <translation>حفظ الجلسة في ملف آخر</translation>
    </message>
    <message>
        <source>&amp;Quit</source>
        <translation>خ&amp;روج</translation>
    </message>
    <message>
        <source>Quit the program</source>
        <translation>الخروج من البرنامج</translation>
    </message>
    <message>
        <source>Zoom &amp;in</source>
        <translation>ت&amp;كبير</translation>
    </message>
    <message>
        <source>Zoom in</source>
        <translation>تكبير</translation>
    </message>
    <message>
        <source>Zoom &amp;out</source>
        <translation>ت&amp;صغير</translation>
    </message>
    <message>
        <source>Zoom out</source>
        <translation>تصغير</translation>
    </message>
    <message>
        <source>&amp;Fit to window</source>
        <translation>&amp;ملاءمة النافذة</translation>
    </message>
    <message>
        <source>Show the whole image</source>
        <translation>إظهار الصورة كاملة</translation>
    </message>
    <message>
        <source>&amp;Actual size</source>
        <translation>ال&amp;حجم الفعلي</translation>
    </message>
    <message>
        <source>Show the image at 100 %</source>
        <translation>إظهار الصورة بنسبة 100 %</translation>
    </message>
    <message>
        <source>&amp;Measured values</source>
        <translation>ال&amp;قيم المقيسة</translation>
    </message>
    <message>
        <source>Show or hide the measured values</source>
        <translation>إظهار القيم المقيسة أو إخفاؤها</translation>
    </message>
    <message>
        <source>Stat&amp;us log</source>
        <translation>&amp;سجل الحالة</translation>
    </message>
    <message>
        <source>Show or hide the status log</source>
        <translation>إظهار سجل الحالة أو إخفاؤه</translation>
    </message>
    <message>
        <source>&amp;Dark or light theme</source>
        <translation>سمة &amp;داكنة أو فاتحة</translation>
    </message>
    <message>
        <source>Change between the dark and the light theme</source>
        <translation>التبديل بين السمة الداكنة والفاتحة</translation>
    </message>
    <message>
        <source>Settin&amp;gs...</source>
        <translation>الإ&amp;عدادات...</translation>
    </message>
    <message>
        <source>Settings</source>
        <translation>الإعدادات</translation>
    </message>
    <message>
        <source>&amp;About Measuring Desk</source>
        <translation>&amp;حول Measuring Desk</translation>
    </message>
    <message>
        <source>About Measuring Desk</source>
        <translation>حول Measuring Desk</translation>
    </message>
    <message>
        <source>%1 (%2)</source>
        <comment>command (shortcut)</comment>
        <translation>%1 (%2)</translation>
    </message>
    <message>
        <source>&amp;Export measured values...</source>
        <translation>&amp;تصدير القيم المقيسة...</translation>
    </message>
    <message>
        <source>Export measured values as a table</source>
        <translation>تصدير القيم المقيسة كجدول</translation>
    </message>
    <message>
        <source>&amp;Undo</source>
        <translation>&amp;تراجع</translation>
    </message>
    <message>
        <source>Undo the last step</source>
        <translation>التراجع عن الخطوة الأخيرة</translation>
    </message>
    <message>
        <source>&amp;Redo</source>
        <translation>إ&amp;عادة</translation>
    </message>
    <message>
        <source>Redo what was undone</source>
        <translation>إعادة ما تم التراجع عنه</translation>
    </message>
    <message>
        <source>Cu&amp;t</source>
        <translation>&amp;قص</translation>
    </message>
    <message>
        <source>Cut the selected objects</source>
        <translation>قص الكائنات المحددة</translation>
    </message>
    <message>
        <source>&amp;Copy</source>
        <translation>&amp;نسخ</translation>
    </message>
    <message>
        <source>Copy the selected objects</source>
        <translation>نسخ الكائنات المحددة</translation>
    </message>
    <message>
        <source>&amp;Paste</source>
        <translation>&amp;لصق</translation>
    </message>
    <message>
        <source>Paste copied objects</source>
        <translation>لصق الكائنات المنسوخة</translation>
    </message>
    <message>
        <source>&amp;Delete</source>
        <translation>&amp;حذف</translation>
    </message>
    <message>
        <source>Delete the selected objects</source>
        <translation>حذف الكائنات المحددة</translation>
    </message>
    <message>
        <source>Select &amp;all</source>
        <translation>تحديد ال&amp;كل</translation>
    </message>
    <message>
        <source>Select all objects on the image</source>
        <translation>تحديد كل الكائنات على الصورة</translation>
    </message>
    <message>
        <source>Re&amp;name</source>
        <translation>إعادة ت&amp;سمية</translation>
    </message>
    <message>
        <source>Give the selected object a name</source>
        <translation>إعطاء الكائن المحدد اسمًا</translation>
    </message>
    <message>
        <source>&amp;Find measured values</source>
        <translation>&amp;بحث في القيم المقيسة</translation>
    </message>
    <message>
        <source>Filter the measured values</source>
        <translation>تصفية القيم المقيسة</translation>
    </message>
    <message>
        <source>&amp;Select</source>
        <translation>&amp;تحديد</translation>
    </message>
    <message>
        <source>Select and change objects</source>
        <translation>تحديد الكائنات وتعديلها</translation>
    </message>
    <message>
        <source>&amp;Line</source>
        <translation>&amp;خط</translation>
    </message>
    <message>
        <source>Measure a length</source>
        <translation>قياس طول</translation>
    </message>
    <message>
        <source>&amp;Polyline</source>
        <translation>خط من&amp;كسر</translation>
    </message>
    <message>
        <source>Measure the length of a way</source>
        <translation>قياس طول مسار</translation>
    </message>
    <message>
        <source>Parallel &amp;distance</source>
        <translation>&amp;مسافة نقطة عن خط</translation>
    </message>
    <message>
        <source>Measure the distance of a point from a line</source>
        <translation>قياس مسافة نقطة عن خط</translation>
    </message>
    <message>
        <source>&amp;Arc</source>
        <translation>&amp;قوس</translation>
    </message>
    <message>
        <source>Measure an arc through three points</source>
        <translation>قياس قوس عبر ثلاث نقاط</translation>
    </message>
    <message>
        <source>&amp;Circle</source>
        <translation>&amp;دائرة</translation>
    </message>
    <message>
        <source>Measure a circle</source>
        <translation>قياس دائرة</translation>
    </message>
    <message>
        <source>&amp;Rectangle</source>
        <translation>مست&amp;طيل</translation>
    </message>
    <message>
        <source>Measure a rectangle</source>
        <translation>قياس مستطيل</translation>
    </message>
    <message>
        <source>Poly&amp;gon</source>
        <translation>م&amp;ضلع</translation>
    </message>
    <message>
        <source>Measure the area of a polygon</source>
        <translation>قياس مساحة مضلع</translation>
    </message>
    <message>
        <source>Cou&amp;nter</source>
        <translation>&amp;عداد</translation>
    </message>
    <message>
        <source>Count by clicks</source>
        <translation>العدّ بالنقر</translation>
    </message>
    <message>
        <source>&amp;Text note</source>
        <translation>ملاحظة &amp;نصية</translation>
    </message>
    <message>
        <source>Write on the image</source>
        <translation>الكتابة على الصورة</translation>
    </message>
    <message>
        <source>Scale &amp;bar</source>
        <translation>&amp;شريط مقياس</translation>
    </message>
    <message>
        <source>Draw a scale bar</source>
        <translation>رسم شريط مقياس</translation>
    </message>
    <message>
        <source>Cal&amp;ibration...</source>
        <translation>المعا&amp;يرة...</translation>
    </message>
    <message>
        <source>Say how large a pixel of the image is</source>
        <translation>تحديد الحجم الحقيقي لبكسل الصورة</translation>
    </message>
    <message>
        <source>Use the file&apos;s pixel size</source>
        <translation>استخدام حجم البكسل من الملف</translation>
    </message>
    <message>
        <source>Measure with the pixel size that the image&apos;s file states</source>
        <translation>القياس بحجم البكسل المذكور في ملف الصورة</translation>
    </message>
    <message>
        <source>&amp;Take snapshot</source>
        <translation>التقاط &amp;لقطة</translation>
    </message>
    <message>
        <source>Save the image to the gallery</source>
        <translation>حفظ الصورة في المعرض</translation>
    </message>
    <message>
        <source>Snapshots &amp;with measurements</source>
        <translation>لقطات مع ال&amp;قياسات</translation>
    </message>
    <message>
        <source>Draw the measured objects on snapshots</source>
        <translation>رسم الكائنات المقيسة على اللقطات</translation>
    </message>
    <message>
        <source>&amp;Freeze</source>
        <translation>ت&amp;جميد</translation>
    </message>
    <message>
        <source>Freeze the live image</source>
        <translation>تجميد الصورة المباشرة</translation>
    </message>
    <message>
        <source>&amp;Labels on the image</source>
        <translation>ال&amp;تسميات على الصورة</translation>
    </message>
    <message>
        <source>Show or hide the labels of objects</source>
        <translation>إظهار تسميات الكائنات أو إخفاؤها</translation>
    </message>
    <message>
        <source>&amp;Rulers</source>
        <translation>المسا&amp;طر</translation>
    </message>
    <message>
        <source>Show or hide the rulers</source>
        <translation>إظهار المساطر أو إخفاؤها</translation>
    </message>
    <message>
        <source>&amp;Scale bar on the image</source>
        <translation>&amp;شريط المقياس على الصورة</translation>
    </message>
    <message>
        <source>Show or hide the scale bar, on reports, too</source>
        <translation>إظهار شريط المقياس أو إخفاؤه، في التقارير أيضًا</translation>
    </message>
    <message>
        <source>&amp;Gallery</source>
        <translation>الم&amp;عرض</translation>
    </message>
    <message>
        <source>Show or hide the gallery</source>
        <translation>إظهار المعرض أو إخفاؤه</translation>
    </message>
    <message>
        <source>&amp;Start page</source>
        <translation>&amp;صفحة البدء</translation>
    </message>
    <message>
        <source>Show the first steps, the examples and the recent sessions</source>
        <translation>إظهار الخطوات الأولى والأمثلة والجلسات الأخيرة</translation>
    </message>
    <message>
        <source>&amp;User guide</source>
        <translation>&amp;دليل المستخدم</translation>
    </message>
    <message>
        <source>Read the user guide</source>
        <translation>قراءة دليل المستخدم</translation>
    </message>
</context>
<context>
    <name>KvDeskAutosave</name>
    <message>
        <source>the folder &quot;%1&quot; cannot be written</source>
        <translation>تعذرت الكتابة في المجلد «%1»</translation>
    </message>
    <message>
        <source>Unsaved changes are not being copied: %1</source>
        <translation>لا تُحفظ نسخة احتياطية من التغييرات غير المحفوظة: %1</translation>
    </message>
</context>
<context>
    <name>KvDeskCalibrationCommands</name>
    <message>
        <source>The session measures with it already</source>
        <translation>الجلسة تقيس به بالفعل</translation>
    </message>
    <message>
        <source>The image&apos;s file does not state one</source>
        <translation>لا يذكر ملف الصورة حجم البكسل</translation>
    </message>
</context>
<context>
    <name>KvDeskCalibrationDialog</name>
    <message>
        <source>Calibration</source>
        <translation>المعايرة</translation>
    </message>
    <message>
        <source>Objective</source>
        <translation>الشيئية</translation>
    </message>
    <message>
        <source>Choose an objective, or type the name of a new one</source>
        <translation>اختر شيئية، أو اكتب اسم شيئية جديدة</translation>
    </message>
    <message>
        <source>Such as 10x</source>
        <translation>مثل 10x</translation>
    </message>
    <message>
        <source>In use</source>
        <translation>المستخدمة</translation>
    </message>
    <message>
        <source>New calibration</source>
        <translation>معايرة جديدة</translation>
    </message>
    <message>
        <source>Known distance</source>
        <translation>مسافة معلومة</translation>
    </message>
    <message>
        <source>Image file</source>
        <translation>ملف الصورة</translation>
    </message>
    <message>
        <source>Typed</source>
        <translation>يدوي</translation>
    </message>
    <message>
        <source>Name</source>
        <translation>الاسم</translation>
    </message>
    <message>
        <source>Who</source>
        <translation>بواسطة</translation>
    </message>
    <message>
        <source>Note</source>
        <translation>ملاحظة</translation>
    </message>
    <message>
        <source>Calibrate</source>
        <translation>معايرة</translation>
    </message>
    <message>
        <source>History of the objective</source>
        <translation>سجل معايرات الشيئية</translation>
    </message>
    <message>
        <source>Calibrations of this objective appear here</source>
        <translation>تظهر هنا معايرات هذه الشيئية</translation>
    </message>
    <message>
        <source>Use again</source>
        <translation>استخدام مجددًا</translation>
    </message>
    <message>
        <source>Close</source>
        <translation>إغلاق</translation>
    </message>
    <message>
        <source>New pixel size: %1</source>
        <translation>حجم البكسل الجديد: %1</translation>
    </message>
    <message>
        <source>No pixel size yet</source>
        <translation>لا يوجد حجم بكسل بعد</translation>
    </message>
    <message>
        <source>Measure with this pixel size and remember it</source>
        <translation>القياس بحجم البكسل هذا وتذكّره</translation>
    </message>
    <message>
        <source>Complete the fields above first</source>
        <translation>أكمل الحقول أعلاه أولًا</translation>
    </message>
    <message>
        <source>Measure with the selected calibration</source>
        <translation>القياس بالمعايرة المحددة</translation>
    </message>
    <message>
        <source>Select a calibration in the table first</source>
        <translation>حدد معايرة في الجدول أولًا</translation>
    </message>
</context>
<context>
    <name>KvDeskCalibrationHistory</name>
    <message>
        <source>Date</source>
        <translation>التاريخ</translation>
    </message>
    <message>
        <source>Who</source>
        <translation>بواسطة</translation>
    </message>
    <message>
        <source>Pixel size</source>
        <translation>حجم البكسل</translation>
    </message>
    <message>
        <source>Origin</source>
        <translation>المصدر</translation>
    </message>
    <message>
        <source>Name</source>
        <translation>الاسم</translation>
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
        <translation>مسافة معلومة</translation>
    </message>
    <message>
        <source>Image file</source>
        <translation>ملف الصورة</translation>
    </message>
    <message>
        <source>Typed</source>
        <translation>يدوي</translation>
    </message>
    <message>
        <source>Not calibrated</source>
        <translation>غير معايَر</translation>
    </message>
</context>
<context>
    <name>KvDeskCalibrationWay</name>
    <message>
        <source>Type a number such as 5.3 or 5,3</source>
        <translation>اكتب رقمًا مثل 5.3 أو 5,3</translation>
    </message>
    <message>
        <source>A pixel measures between %1 and %2</source>
        <translation>يتراوح حجم البكسل بين %1 و%2</translation>
    </message>
</context>
<context>
    <name>KvDeskCalibrator</name>
    <message>
        <source>%1 states pixels of %2; the session measures with %3</source>
        <translation>يذكر %1 أن حجم البكسل %2؛ وتقيس الجلسة بالحجم %3</translation>
    </message>
    <message>
        <source>%1 states pixels of %2; the session measures in pixels</source>
        <translation>يذكر %1 أن حجم البكسل %2؛ وتقيس الجلسة بالبكسل</translation>
    </message>
    <message>
        <source>Calibrated: %1, %2 per pixel</source>
        <extracomment>%1 is an objective or a file, %2 the size of a pixel with its unit</extracomment>
        <translation>تمت المعايرة: %1، %2 لكل بكسل</translation>
    </message>
</context>
<context>
    <name>KvDeskCommandLine</name>
    <message>
        <source>There is no theme &quot;%1&quot;: use %2</source>
        <translation>لا توجد سمة باسم «%1»: استخدم %2</translation>
    </message>
    <message>
        <source> or </source>
        <translation> أو </translation>
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
        <translation>الاستخدام: measuringdesk [OPTION...] [SESSION|IMAGE|TABLE|FOLDER|VIDEO...]
يقيس الكائنات على الصور ويعرض قيمها.

  --session FILE      فتح جلسة
  --image FILE        فتح صورة
  --table FILE        استيراد جدول قيم مقيسة
  --theme Dark|Light  سمة هذا التشغيل
  --plugins DIR       البحث عن الإضافات هنا أيضًا؛ يمكن تكراره
  --help              إظهار هذا النص
  --version           إظهار الإصدار

يحدد متغير البيئة STATREPORT_PLUGINS مجلدات أخرى فيها إضافات.
</translation>
    </message>
    <message>
        <source>%1 (measuringdesk --help tells more)</source>
        <translation>%1 (للمزيد: ‎measuringdesk --help‎)</translation>
    </message>
</context>
<context>
    <name>KvDeskCounterBar</name>
    <message>
        <source>Clicks count for</source>
        <translation>تُحتسب النقرات في</translation>
    </message>
    <message>
        <source>The counter that gets the clicks (1 to 9)</source>
        <translation>العداد الذي يتلقى النقرات (1 إلى 9)</translation>
    </message>
    <message>
        <source>Count another class</source>
        <translation>عدّ فئة أخرى</translation>
    </message>
    <message>
        <source>A right click takes a place away</source>
        <translation>النقر بالزر الأيمن يزيل نقطة</translation>
    </message>
    <message>
        <source>A new counter</source>
        <translation>عداد جديد</translation>
    </message>
</context>
<context>
    <name>KvDeskEditCommands</name>
    <message>
        <source>&amp;Undo %1</source>
        <extracomment>%1 is what is undone or redone, such as &quot;move of Line 3&quot;</extracomment>
        <translation>&amp;تراجع عن %1</translation>
    </message>
    <message>
        <source>&amp;Undo</source>
        <translation>&amp;تراجع</translation>
    </message>
    <message>
        <source>&amp;Redo %1</source>
        <translation>إ&amp;عادة تنفيذ %1</translation>
    </message>
    <message>
        <source>&amp;Redo</source>
        <translation>إ&amp;عادة</translation>
    </message>
    <message>
        <source>Nothing was done yet</source>
        <translation>لم يُنفَّذ أي شيء بعد</translation>
    </message>
    <message>
        <source>Nothing was undone</source>
        <translation>لم يُتراجع عن أي شيء</translation>
    </message>
    <message>
        <source>Select an object first</source>
        <translation>حدد كائنًا أولًا</translation>
    </message>
    <message>
        <source>Select one object first</source>
        <translation>حدد كائنًا واحدًا أولًا</translation>
    </message>
    <message>
        <source>No measured objects were copied</source>
        <translation>لم تُنسخ أي كائنات مقيسة</translation>
    </message>
    <message>
        <source>Finish or cancel what you have begun first</source>
        <translation>أكمل ما بدأته أو ألغه أولًا</translation>
    </message>
</context>
<context>
    <name>KvDeskExamples</name>
    <message>
        <source>Coin: first length</source>
        <translation>عملة معدنية: أول طول</translation>
    </message>
    <message>
        <source>Plate: dimensions</source>
        <translation>صفيحة: الأبعاد</translation>
    </message>
    <message>
        <source>Cells: counting</source>
        <translation>خلايا: العدّ</translation>
    </message>
    <message>
        <source>Fibres: statistics</source>
        <translation>ألياف: الإحصاءات</translation>
    </message>
</context>
<context>
    <name>KvDeskExportCommand</name>
    <message>
        <source>Nothing was measured yet</source>
        <translation>لم يُقَس أي شيء بعد</translation>
    </message>
    <message>
        <source>Measured values</source>
        <comment>file name</comment>
        <translation>القيم المقيسة</translation>
    </message>
    <message>
        <source>JSON files</source>
        <translation>ملفات JSON</translation>
    </message>
    <message>
        <source>CSV tables</source>
        <translation>جداول CSV</translation>
    </message>
    <message>
        <source>Export measured values</source>
        <translation>تصدير القيم المقيسة</translation>
    </message>
    <message>
        <source>Export cancelled: %1</source>
        <translation>أُلغي التصدير: %1</translation>
    </message>
    <message>
        <source>The table &quot;%1&quot; was not written.</source>
        <translation>لم يُكتب الجدول «%1».</translation>
    </message>
    <message>
        <source>Measured values exported: %1</source>
        <translation>صُدِّرت القيم المقيسة: %1</translation>
    </message>
    <message>
        <source>Exporting measured values</source>
        <translation>جارٍ تصدير القيم المقيسة</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>إلغاء</translation>
    </message>
</context>
<context>
    <name>KvDeskExportDialog</name>
    <message>
        <source>Export measured values</source>
        <translation>تصدير القيم المقيسة</translation>
    </message>
    <message>
        <source>Table</source>
        <translation>الجدول</translation>
    </message>
    <message>
        <source>Numbers</source>
        <translation>الأرقام</translation>
    </message>
    <message>
        <source>Byte order mark, for spreadsheets that do not expect UTF-8</source>
        <translation>علامة ترتيب البايتات (BOM)، لبرامج الجداول التي لا تتوقع UTF-8</translation>
    </message>
    <message>
        <source>Apostrophe before names that spreadsheets take for formulas</source>
        <translation>فاصلة علوية قبل الأسماء التي تعدها برامج الجداول صيغًا</translation>
    </message>
    <message>
        <source>Changes names that begin with =, +, - or @: they are others when the table is imported again</source>
        <translation>يغير الأسماء التي تبدأ بأحد الرموز = أو + أو - أو @: ستختلف عن الأصل عند استيراد الجدول مجددًا</translation>
    </message>
    <message>
        <source>Export...</source>
        <translation>تصدير...</translation>
    </message>
    <message>
        <source>CSV, one row per value</source>
        <translation>CSV، صف لكل قيمة</translation>
    </message>
    <message>
        <source>CSV, one row per object</source>
        <translation>CSV، صف لكل كائن</translation>
    </message>
    <message>
        <source>JSON</source>
        <translation>JSON</translation>
    </message>
    <message>
        <source>1.5, commas between the fields</source>
        <translation>1.5، والفاصل بين الحقول فاصلة</translation>
    </message>
    <message>
        <source>1,5, semicolons between the fields (spreadsheets, %1)</source>
        <extracomment>%1 is the name of a language</extracomment>
        <translation>1,5، والفاصل بين الحقول فاصلة منقوطة (برامج الجداول، %1)</translation>
    </message>
    <message>
        <source>1.5, commas between the fields (spreadsheets, %1)</source>
        <translation>1.5، والفاصل بين الحقول فاصلة (برامج الجداول، %1)</translation>
    </message>
    <message>
        <source>For statistics programs. Can be imported here again.</source>
        <translation>لبرامج الإحصاء. يمكن استيراده هنا مجددًا.</translation>
    </message>
    <message>
        <source>For spreadsheets. Headings name the units.</source>
        <translation>لبرامج الجداول. تذكر العناوين الوحدات.</translation>
    </message>
    <message>
        <source>For programs. Numbers always have a decimal point.</source>
        <translation>للبرامج. الفاصلة العشرية في الأرقام نقطة دائمًا.</translation>
    </message>
    <message>
        <source>No measured object is selected</source>
        <translation>لم يُحدَّد أي كائن مقيس</translation>
    </message>
    <message>
        <source>Concerns CSV tables only</source>
        <translation>يخص جداول CSV فقط</translation>
    </message>
    <message numerus="yes">
        <source>Only the selected object(s) (%n)</source>
        <translation>
            <numerusform>الكائنات المحددة فقط (%n)</numerusform>
            <numerusform>الكائن المحدد فقط (%n)</numerusform>
            <numerusform>الكائنان المحددان فقط (%n)</numerusform>
            <numerusform>الكائنات المحددة فقط (%n)</numerusform>
            <numerusform>الكائنات المحددة فقط (%n)</numerusform>
            <numerusform>الكائنات المحددة فقط (%n)</numerusform>
        </translation>
    </message>
</context>
<context>
    <name>KvDeskExposureControl</name>
    <message>
        <source>E&amp;xposure</source>
        <translation>التع&amp;ريض</translation>
    </message>
    <message>
        <source>Exposure time of the camera</source>
        <translation>زمن التعريض في الكاميرا</translation>
    </message>
    <message>
        <source> ms</source>
        <comment>milliseconds</comment>
        <translation> ملي ث</translation>
    </message>
</context>
<context>
    <name>KvDeskFileCommands</name>
    <message>
        <source>Sessions</source>
        <translation>الجلسات</translation>
    </message>
    <message>
        <source>All files</source>
        <translation>كل الملفات</translation>
    </message>
    <message>
        <source>Unsaved changes</source>
        <translation>تغييرات غير محفوظة</translation>
    </message>
    <message>
        <source>Save the changes to &quot;%1&quot;?</source>
        <translation>هل تريد حفظ التغييرات في «%1»؟</translation>
    </message>
    <message>
        <source>The session &quot;%1&quot; was not opened.</source>
        <translation>لم تُفتح الجلسة «%1».</translation>
    </message>
    <message>
        <source>Image missing</source>
        <translation>الصورة مفقودة</translation>
    </message>
    <message>
        <source>Open the session without its image?</source>
        <translation>هل تريد فتح الجلسة دون صورتها؟</translation>
    </message>
    <message>
        <source>The image &quot;%1&quot; was not opened.</source>
        <translation>لم تُفتح الصورة «%1».</translation>
    </message>
    <message>
        <source>Image opened: %1</source>
        <translation>فُتحت الصورة: %1</translation>
    </message>
    <message>
        <source>The table &quot;%1&quot; was not imported.</source>
        <translation>لم يُستورد الجدول «%1».</translation>
    </message>
    <message>
        <source>%1: %2</source>
        <comment>file, remark</comment>
        <translation>%1: %2</translation>
    </message>
    <message>
        <source>The session &quot;%1&quot; was not saved.</source>
        <translation>لم تُحفظ الجلسة «%1».</translation>
    </message>
    <message>
        <source>Session saved: %1</source>
        <translation>حُفظت الجلسة: %1</translation>
    </message>
    <message>
        <source>Open session</source>
        <translation>فتح جلسة</translation>
    </message>
    <message>
        <source>Open image</source>
        <translation>فتح صورة</translation>
    </message>
    <message>
        <source>Images</source>
        <translation>الصور</translation>
    </message>
    <message>
        <source>Import table</source>
        <translation>استيراد جدول</translation>
    </message>
    <message>
        <source>Tables</source>
        <translation>الجداول</translation>
    </message>
    <message>
        <source>Save session</source>
        <translation>حفظ الجلسة</translation>
    </message>
    <message>
        <source>Measuring Desk</source>
        <translation>Measuring Desk</translation>
    </message>
    <message>
        <source>Only one session can be open; not opened: %1</source>
        <translation>لا يمكن فتح أكثر من جلسة واحدة؛ لم تُفتح: %1</translation>
    </message>
    <message>
        <source>Neither a session, an image nor a table: %1</source>
        <translation>ليس جلسة ولا صورة ولا جدولًا: %1</translation>
    </message>
    <message>
        <source>There is not enough memory</source>
        <translation>الذاكرة غير كافية</translation>
    </message>
    <message>
        <source>Opening &quot;%1&quot;</source>
        <translation>جارٍ فتح «%1»</translation>
    </message>
    <message>
        <source>The measurements were not restored.</source>
        <translation>لم تُستعد القياسات.</translation>
    </message>
    <message>
        <source>Restoring measurements</source>
        <translation>جارٍ استعادة القياسات</translation>
    </message>
    <message>
        <source>Importing &quot;%1&quot;</source>
        <translation>جارٍ استيراد «%1»</translation>
    </message>
    <message>
        <source>Saving &quot;%1&quot;</source>
        <translation>جارٍ حفظ «%1»</translation>
    </message>
    <message>
        <source>Session changed by another program</source>
        <translation>غيَّر برنامج آخر الجلسة</translation>
    </message>
    <message>
        <source>&quot;%1&quot; was changed by another program. Overwrite its changes?</source>
        <translation>غيَّر برنامج آخر «%1». هل تريد الكتابة فوق تغييراته؟</translation>
    </message>
    <message>
        <source>Overwrite</source>
        <translation>الكتابة فوقها</translation>
    </message>
    <message>
        <source>Save as...</source>
        <translation>حفظ باسم...</translation>
    </message>
    <message numerus="yes">
        <source>%n files were not opened.</source>
        <extracomment>%n is 2 at least</extracomment>
        <translation>
            <numerusform>لم يُفتح %n ملف.</numerusform>
            <numerusform>لم يُفتح ملف واحد.</numerusform>
            <numerusform>لم يُفتح ملفان.</numerusform>
            <numerusform>لم تُفتح %n ملفات.</numerusform>
            <numerusform>لم يُفتح %n ملفًا.</numerusform>
            <numerusform>لم يُفتح %n ملف.</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Session opened: %1 (%n object(s))</source>
        <translation>
            <numerusform>فُتحت الجلسة: %1 (%n كائن)</numerusform>
            <numerusform>فُتحت الجلسة: %1 (كائن واحد)</numerusform>
            <numerusform>فُتحت الجلسة: %1 (كائنان)</numerusform>
            <numerusform>فُتحت الجلسة: %1 (%n كائنات)</numerusform>
            <numerusform>فُتحت الجلسة: %1 (%n كائنًا)</numerusform>
            <numerusform>فُتحت الجلسة: %1 (%n كائن)</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Measurements restored: %1 (%n object(s))</source>
        <translation>
            <numerusform>استُعيدت القياسات: %1 (%n كائن)</numerusform>
            <numerusform>استُعيدت القياسات: %1 (كائن واحد)</numerusform>
            <numerusform>استُعيدت القياسات: %1 (كائنان)</numerusform>
            <numerusform>استُعيدت القياسات: %1 (%n كائنات)</numerusform>
            <numerusform>استُعيدت القياسات: %1 (%n كائنًا)</numerusform>
            <numerusform>استُعيدت القياسات: %1 (%n كائن)</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Table imported: %1 (%n object(s))</source>
        <translation>
            <numerusform>استُورد الجدول: %1 (%n كائن)</numerusform>
            <numerusform>استُورد الجدول: %1 (كائن واحد)</numerusform>
            <numerusform>استُورد الجدول: %1 (كائنان)</numerusform>
            <numerusform>استُورد الجدول: %1 (%n كائنات)</numerusform>
            <numerusform>استُورد الجدول: %1 (%n كائنًا)</numerusform>
            <numerusform>استُورد الجدول: %1 (%n كائن)</numerusform>
        </translation>
    </message>
</context>
<context>
    <name>KvDeskFilePixelSize</name>
    <message>
        <source>%1 states pixels of %2.</source>
        <comment>file, size</comment>
        <translation>يذكر %1 أن حجم البكسل %2.</translation>
    </message>
    <message>
        <source>The image&apos;s file does not state how large its pixels are.</source>
        <translation>لا يذكر ملف الصورة حجم البكسل فيها.</translation>
    </message>
</context>
<context>
    <name>KvDeskGallery</name>
    <message>
        <source>Gallery</source>
        <translation>المعرض</translation>
    </message>
    <message>
        <source>Hide the gallery</source>
        <translation>إخفاء المعرض</translation>
    </message>
    <message>
        <source>&amp;Open image</source>
        <translation>&amp;فتح الصورة</translation>
    </message>
    <message>
        <source>&amp;Show in folder</source>
        <translation>إظهار في ال&amp;مجلد</translation>
    </message>
    <message>
        <source>&amp;Copy path</source>
        <translation>&amp;نسخ المسار</translation>
    </message>
    <message>
        <source>&amp;Move to trash...</source>
        <translation>نقل إلى &amp;سلة المهملات...</translation>
    </message>
    <message>
        <source>Choose &amp;folder...</source>
        <translation>ا&amp;ختيار مجلد...</translation>
    </message>
    <message>
        <source>Show the images of a folder</source>
        <translation>إظهار صور مجلد</translation>
    </message>
    <message>
        <source>Save s&amp;napshots in this folder</source>
        <translation>&amp;حفظ اللقطات في هذا المجلد</translation>
    </message>
    <message>
        <source>Folder of the gallery</source>
        <translation>مجلد المعرض</translation>
    </message>
    <message>
        <source>More commands of the gallery</source>
        <translation>أوامر أخرى للمعرض</translation>
    </message>
    <message>
        <source>Snapshots</source>
        <translation>اللقطات</translation>
    </message>
    <message>
        <source>Choose folder</source>
        <translation>اختيار مجلد</translation>
    </message>
    <message>
        <source>Snapshots are saved in %1</source>
        <translation>تُحفظ اللقطات في %1</translation>
    </message>
    <message>
        <source>Snapshots (%1) and the images of a folder appear here; drag them onto report pages</source>
        <translation>تظهر هنا اللقطات (%1) وصور المجلد؛ اسحبها إلى صفحات التقرير</translation>
    </message>
    <message>
        <source>There are no images in %1</source>
        <translation>لا توجد صور في %1</translation>
    </message>
    <message>
        <source>The folder %1 does not exist</source>
        <translation>المجلد %1 غير موجود</translation>
    </message>
    <message>
        <source>Select an image first</source>
        <translation>حدد صورة أولًا</translation>
    </message>
    <message>
        <source>Snapshots are saved in this folder already</source>
        <translation>اللقطات تُحفظ في هذا المجلد بالفعل</translation>
    </message>
    <message>
        <source>Move &quot;%1&quot; to the trash?</source>
        <translation>هل تريد نقل «%1» إلى سلة المهملات؟</translation>
    </message>
    <message>
        <source>Move to trash</source>
        <translation>نقل إلى سلة المهملات</translation>
    </message>
    <message>
        <source>Moved to the trash: %1</source>
        <translation>نُقل إلى سلة المهملات: %1</translation>
    </message>
    <message>
        <source>Not moved to the trash: %1</source>
        <translation>لم يُنقل إلى سلة المهملات: %1</translation>
    </message>
    <message>
        <source>Measuring Desk</source>
        <translation>Measuring Desk</translation>
    </message>
    <message>
        <source>The files are still there. They are write-protected, or there is no trash for them.</source>
        <translation>ما زالت الملفات موجودة. إما أنها محمية من الكتابة أو لا توجد سلة مهملات لها.</translation>
    </message>
    <message numerus="yes">
        <source>Move %n selected image(s) to the trash?</source>
        <translation>
            <numerusform>هل تريد نقل %n صورة محددة إلى سلة المهملات؟</numerusform>
            <numerusform>هل تريد نقل الصورة المحددة إلى سلة المهملات؟</numerusform>
            <numerusform>هل تريد نقل الصورتين المحددتين إلى سلة المهملات؟</numerusform>
            <numerusform>هل تريد نقل %n صور محددة إلى سلة المهملات؟</numerusform>
            <numerusform>هل تريد نقل %n صورة محددة إلى سلة المهملات؟</numerusform>
            <numerusform>هل تريد نقل %n صورة محددة إلى سلة المهملات؟</numerusform>
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
        <translation>المعرض</translation>
    </message>
</context>
<context>
    <name>KvDeskGuideCommand</name>
    <message>
        <source>The user guide is not installed</source>
        <translation>دليل المستخدم غير مثبت</translation>
    </message>
</context>
<context>
    <name>KvDeskGuideWindow</name>
    <message>
        <source>User guide</source>
        <translation>دليل المستخدم</translation>
    </message>
    <message>
        <source>Contents</source>
        <translation>المحتويات</translation>
    </message>
    <message>
        <source>Back</source>
        <translation>رجوع</translation>
    </message>
    <message>
        <source>Forward</source>
        <translation>تقدم</translation>
    </message>
    <message>
        <source>Find in the guide</source>
        <translation>بحث في الدليل</translation>
    </message>
    <message>
        <source>Find previous</source>
        <translation>البحث عن السابق</translation>
    </message>
    <message>
        <source>Find next</source>
        <translation>البحث عن التالي</translation>
    </message>
    <message>
        <source>This is the first place</source>
        <translation>هذا أول موضع</translation>
    </message>
    <message>
        <source>This is the last place</source>
        <translation>هذا آخر موضع</translation>
    </message>
    <message>
        <source>Not found</source>
        <translation>لا توجد نتائج</translation>
    </message>
    <message>
        <source>Type what to find first</source>
        <translation>اكتب ما تبحث عنه أولًا</translation>
    </message>
</context>
<context>
    <name>KvDeskImageView</name>
    <message>
        <source>Image</source>
        <translation>الصورة</translation>
    </message>
    <message>
        <source>Open an image or a session to start</source>
        <translation>افتح صورة أو جلسة للبدء</translation>
    </message>
</context>
<context>
    <name>KvDeskInlineEditor</name>
    <message>
        <source>Text</source>
        <translation>النص</translation>
    </message>
    <message>
        <source>Name</source>
        <translation>الاسم</translation>
    </message>
</context>
<context>
    <name>KvDeskKnownDistance</name>
    <message>
        <source>inch</source>
        <translation>بوصة</translation>
    </message>
    <message>
        <source>Use selected line</source>
        <translation>استخدام الخط المحدد</translation>
    </message>
    <message>
        <source>Length of the line</source>
        <translation>طول الخط</translation>
    </message>
    <message>
        <source>Unit of the length</source>
        <translation>وحدة الطول</translation>
    </message>
    <message>
        <source>Its length</source>
        <translation>طوله</translation>
    </message>
    <message>
        <source>Draw a line over a distance that you know, such as on a stage micrometer, and select it.</source>
        <translation>ارسم خطًا فوق مسافة تعرفها، مثل تدريج ميكرومتر المنصة، ثم حدده.</translation>
    </message>
    <message>
        <source>No line yet</source>
        <translation>لا يوجد خط بعد</translation>
    </message>
    <message>
        <source>%1: %2</source>
        <comment>name and length of a line</comment>
        <translation>%1: %2</translation>
    </message>
    <message>
        <source>Take the selected line as the known distance</source>
        <translation>اعتماد الخط المحدد مسافةً معلومة</translation>
    </message>
    <message>
        <source>Select one line on the image first</source>
        <translation>حدد خطًا واحدًا على الصورة أولًا</translation>
    </message>
</context>
<context>
    <name>KvDeskLiveBar</name>
    <message>
        <source>Live image</source>
        <translation>الصورة المباشرة</translation>
    </message>
    <message>
        <source>Freeze</source>
        <translation>تجميد</translation>
    </message>
    <message>
        <source>%1 fps</source>
        <extracomment>frames per second</extracomment>
        <translation>%1 إطار/ث</translation>
    </message>
    <message>
        <source>%1 delivers no pictures any more; this is the last one</source>
        <translation>لم يعد %1 يرسل صورًا؛ هذه هي الأخيرة</translation>
    </message>
    <message>
        <source>%1 delivers no pictures</source>
        <translation>%1 لا يرسل صورًا</translation>
    </message>
    <message>
        <source>%1 is stopped</source>
        <translation>%1 متوقف</translation>
    </message>
    <message>
        <source>Waiting for the first picture of %1</source>
        <translation>في انتظار أول صورة من %1</translation>
    </message>
    <message>
        <source>Frozen: %1</source>
        <translation>مجمَّد: %1</translation>
    </message>
    <message>
        <source>Live: %1</source>
        <translation>مباشر: %1</translation>
    </message>
    <message>
        <source>This image is not live</source>
        <translation>هذه الصورة ليست مباشرة</translation>
    </message>
    <message>
        <source>&amp;Reconnect</source>
        <translation>إعادة ا&amp;لاتصال</translation>
    </message>
    <message>
        <source>&amp;Start</source>
        <translation>&amp;بدء</translation>
    </message>
    <message>
        <source>Frames per second
Dropped, because newer ones came first: %1</source>
        <translation>الإطارات في الثانية
أُسقطت لأن إطارات أحدث سبقتها: %1</translation>
    </message>
    <message>
        <source>Stop the live image; other programs can use the camera then</source>
        <translation>إيقاف الصورة المباشرة؛ يمكن للبرامج الأخرى استخدام الكاميرا بعد ذلك</translation>
    </message>
</context>
<context>
    <name>KvDeskMainWindow</name>
    <message>
        <source>&amp;File</source>
        <translation>&amp;ملف</translation>
    </message>
    <message>
        <source>&amp;Recent sessions</source>
        <translation>الجلسات الأ&amp;خيرة</translation>
    </message>
    <message>
        <source>&amp;View</source>
        <translation>&amp;عرض</translation>
    </message>
    <message>
        <source>&amp;Help</source>
        <translation>م&amp;ساعدة</translation>
    </message>
    <message>
        <source>Main tool bar</source>
        <translation>شريط الأدوات الرئيسي</translation>
    </message>
    <message>
        <source>%1[*] - Measuring Desk</source>
        <extracomment>%1 is the name of a session; [*] is replaced by a star when it has unsaved changes</extracomment>
        <translation>%1[*] - Measuring Desk</translation>
    </message>
    <message>
        <source>None yet</source>
        <translation>لا توجد بعد</translation>
    </message>
    <message>
        <source>About Measuring Desk</source>
        <translation>حول Measuring Desk</translation>
    </message>
    <message>
        <source>&lt;b&gt;Measuring Desk %1&lt;/b&gt;&lt;p&gt;Measures objects on images, and hosts plug-ins such as the statistics reports.&lt;/p&gt;&lt;p&gt;%2, MIT licence&lt;/p&gt;</source>
        <translation>&lt;b&gt;Measuring Desk %1&lt;/b&gt;&lt;p&gt;يقيس الكائنات على الصور، ويستضيف إضافات مثل التقارير الإحصائية.&lt;/p&gt;&lt;p&gt;%2، رخصة MIT&lt;/p&gt;</translation>
    </message>
    <message>
        <source>Measuring Desk</source>
        <translation>Measuring Desk</translation>
    </message>
    <message>
        <source>&amp;Edit</source>
        <translation>&amp;تحرير</translation>
    </message>
    <message>
        <source>&amp;Image</source>
        <translation>&amp;صورة</translation>
    </message>
    <message>
        <source>&amp;Measure</source>
        <translation>&amp;قياس</translation>
    </message>
    <message>
        <source>Choose the image source</source>
        <translation>اختيار مصدر الصورة</translation>
    </message>
</context>
<context>
    <name>KvDeskNotice</name>
    <message>
        <source>Close this message</source>
        <translation>إغلاق هذه الرسالة</translation>
    </message>
</context>
<context>
    <name>KvDeskObjectClipboard</name>
    <message>
        <source>Type</source>
        <translation>النوع</translation>
    </message>
    <message>
        <source>Object</source>
        <translation>الكائن</translation>
    </message>
    <message>
        <source>Value name</source>
        <translation>اسم القيمة</translation>
    </message>
    <message>
        <source>Value</source>
        <translation>القيمة</translation>
    </message>
</context>
<context>
    <name>KvDeskObjectEditor</name>
    <message numerus="yes">
        <source>%n objects</source>
        <comment>several measured objects</comment>
        <extracomment>%n is 2 at least</extracomment>
        <translation>
            <numerusform>%n كائن</numerusform>
            <numerusform>كائن واحد</numerusform>
            <numerusform>كائنين</numerusform>
            <numerusform>%n كائنات</numerusform>
            <numerusform>%n كائنًا</numerusform>
            <numerusform>%n كائن</numerusform>
        </translation>
    </message>
    <message>
        <source>drawing of %1</source>
        <translation>رسم %1</translation>
    </message>
    <message>
        <source>change of %1</source>
        <translation>تعديل %1</translation>
    </message>
    <message>
        <source>move of %1</source>
        <translation>نقل %1</translation>
    </message>
    <message>
        <source>renaming of %1</source>
        <translation>إعادة تسمية %1</translation>
    </message>
    <message>
        <source>text of %1</source>
        <translation>تغيير نص %1</translation>
    </message>
    <message>
        <source>showing of %1 of %2</source>
        <extracomment>%1 is a value, %2 an object</extracomment>
        <translation>إظهار %1 في %2</translation>
    </message>
    <message>
        <source>hiding of %1 of %2</source>
        <translation>إخفاء %1 في %2</translation>
    </message>
    <message>
        <source>deletion of %1</source>
        <translation>حذف %1</translation>
    </message>
    <message>
        <source>change of the calibration</source>
        <translation>تغيير المعايرة</translation>
    </message>
    <message>
        <source>place of %1</source>
        <translation>إضافة نقطة إلى %1</translation>
    </message>
    <message>
        <source>deletion of a place of %1</source>
        <translation>حذف نقطة من %1</translation>
    </message>
    <message>
        <source>pasting of %1</source>
        <translation>لصق %1</translation>
    </message>
    <message>
        <source>import of %1</source>
        <translation>استيراد %1</translation>
    </message>
</context>
<context>
    <name>KvDeskPlugins</name>
    <message>
        <source>No plug-ins were found</source>
        <translation>لم يُعثر على إضافات</translation>
    </message>
    <message>
        <source>It is no plug-in for this program</source>
        <translation>الملف ليس إضافة لهذا البرنامج</translation>
    </message>
    <message>
        <source>Its tools &quot;%1&quot; could not be started</source>
        <translation>تعذر بدء أدواتها «%1»</translation>
    </message>
    <message>
        <source>Plug-in loaded: %1</source>
        <translation>حُمِّلت الإضافة: %1</translation>
    </message>
    <message>
        <source>Plug-in not loaded: %1: %2</source>
        <translation>لم تُحمَّل الإضافة: %1: %2</translation>
    </message>
    <message>
        <source>It failed: %1</source>
        <translation>فشلت: %1</translation>
    </message>
    <message>
        <source>It failed for a reason of its own</source>
        <translation>فشلت لسبب غير معروف</translation>
    </message>
</context>
<context>
    <name>KvDeskProgress</name>
    <message>
        <source>Cancel</source>
        <translation>إلغاء</translation>
    </message>
    <message>
        <source>Leave everything as it was (Esc)</source>
        <translation>ترك كل شيء كما كان (Esc)</translation>
    </message>
    <message>
        <source>This can no longer be cancelled</source>
        <translation>لم يعد الإلغاء ممكنًا</translation>
    </message>
</context>
<context>
    <name>KvDeskRecovery</name>
    <message>
        <source>Untitled session</source>
        <translation>جلسة بلا عنوان</translation>
    </message>
    <message numerus="yes">
        <source>%1 (%n object(s))</source>
        <extracomment>%1 is the name of a session</extracomment>
        <translation>
            <numerusform>%1 (%n كائن)</numerusform>
            <numerusform>%1 (كائن واحد)</numerusform>
            <numerusform>%1 (كائنان)</numerusform>
            <numerusform>%1 (%n كائنات)</numerusform>
            <numerusform>%1 (%n كائنًا)</numerusform>
            <numerusform>%1 (%n كائن)</numerusform>
        </translation>
    </message>
</context>
<context>
    <name>KvDeskRecoveryBar</name>
    <message>
        <source>Show other measurements that were not saved</source>
        <translation>إظهار قياسات أخرى لم تُحفظ</translation>
    </message>
    <message>
        <source>Restore</source>
        <translation>استعادة</translation>
    </message>
    <message>
        <source>Open these measurements as a session with unsaved changes</source>
        <translation>فتح هذه القياسات كجلسة بتغييرات غير محفوظة</translation>
    </message>
    <message>
        <source>Discard</source>
        <translation>تجاهل</translation>
    </message>
    <message>
        <source>Delete these measurements for good</source>
        <translation>حذف هذه القياسات نهائيًا</translation>
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
            <numerusform>%n أخرى</numerusform>
            <numerusform>واحدة أخرى</numerusform>
            <numerusform>اثنتان أخريان</numerusform>
            <numerusform>%n أخرى</numerusform>
            <numerusform>%n أخرى</numerusform>
            <numerusform>%n أخرى</numerusform>
        </translation>
    </message>
    <message>
        <source>Measurements from %1 were not saved.</source>
        <translation>القياسات من %1 لم تُحفظ.</translation>
    </message>
</context>
<context>
    <name>KvDeskRuler</name>
    <message>
        <source>Horizontal ruler</source>
        <translation>المسطرة الأفقية</translation>
    </message>
    <message>
        <source>Vertical ruler</source>
        <translation>المسطرة الرأسية</translation>
    </message>
    <message>
        <source>Ruler in %1</source>
        <translation>المسطرة بوحدة %1</translation>
    </message>
</context>
<context>
    <name>KvDeskSelectionStatistics</name>
    <message>
        <source>n = %1, mean %2, SD %3, min %4, max %5</source>
        <extracomment>number of values, their mean, standard deviation, smallest and largest one</extracomment>
        <translation>العدد %1، المتوسط %2، الانحراف المعياري %3، الأدنى %4، الأقصى %5</translation>
    </message>
    <message>
        <source>Selected values: %1</source>
        <translation>القيم المحددة: %1</translation>
    </message>
    <message>
        <source>Mean: %1</source>
        <translation>المتوسط: %1</translation>
    </message>
    <message>
        <source>Standard deviation: %1</source>
        <translation>الانحراف المعياري: %1</translation>
    </message>
    <message>
        <source>Smallest: %1</source>
        <translation>الأصغر: %1</translation>
    </message>
    <message>
        <source>Largest: %1</source>
        <translation>الأكبر: %1</translation>
    </message>
</context>
<context>
    <name>KvDeskSession</name>
    <message>
        <source>Untitled session</source>
        <translation>جلسة بلا عنوان</translation>
    </message>
</context>
<context>
    <name>KvDeskSettingsDialog</name>
    <message>
        <source>Settings</source>
        <translation>الإعدادات</translation>
    </message>
    <message>
        <source>Appearance</source>
        <translation>المظهر</translation>
    </message>
    <message>
        <source>Theme</source>
        <translation>السمة</translation>
    </message>
    <message>
        <source>Dark</source>
        <translation>داكنة</translation>
    </message>
    <message>
        <source>Light</source>
        <translation>فاتحة</translation>
    </message>
    <message>
        <source>Language</source>
        <translation>اللغة</translation>
    </message>
    <message>
        <source>Another language takes effect when the program is started again.</source>
        <translation>تُطبَّق اللغة الجديدة عند بدء البرنامج مجددًا.</translation>
    </message>
    <message>
        <source>Measured values</source>
        <translation>القيم المقيسة</translation>
    </message>
    <message>
        <source>Automatic</source>
        <translation>تلقائي</translation>
    </message>
    <message>
        <source>Significant digits</source>
        <translation>الأرقام المعنوية</translation>
    </message>
    <message>
        <source>Length unit</source>
        <translation>وحدة الطول</translation>
    </message>
    <message>
        <source>Angle unit</source>
        <translation>وحدة الزاوية</translation>
    </message>
    <message>
        <source>Degrees (°)</source>
        <translation>درجات (°)</translation>
    </message>
    <message>
        <source>Radians (rad)</source>
        <translation>راديان (rad)</translation>
    </message>
    <message>
        <source>System default</source>
        <translation>لغة النظام</translation>
    </message>
    <message>
        <source>Nothing was changed yet</source>
        <translation>لم يُغيَّر أي شيء بعد</translation>
    </message>
</context>
<context>
    <name>KvDeskSnapshotFile</name>
    <message>
        <source>The folder cannot be created</source>
        <translation>تعذر إنشاء المجلد</translation>
    </message>
    <message>
        <source>The picture cannot be encoded</source>
        <translation>تعذر ترميز الصورة</translation>
    </message>
</context>
<context>
    <name>KvDeskSnapshots</name>
    <message>
        <source>Open an image first</source>
        <translation>افتح صورة أولًا</translation>
    </message>
    <message>
        <source>No snapshot was taken: earlier ones are still being saved</source>
        <translation>لم تُلتقط لقطة: ما زال حفظ لقطات سابقة جاريًا</translation>
    </message>
    <message>
        <source>Snapshot saved: %1</source>
        <translation>حُفظت اللقطة: %1</translation>
    </message>
    <message>
        <source>The snapshot was not saved. %1</source>
        <translation>لم تُحفظ اللقطة. %1</translation>
    </message>
</context>
<context>
    <name>KvDeskSourceCommands</name>
    <message>
        <source>The image source &quot;%1&quot; was not opened.</source>
        <translation>لم يُفتح مصدر الصورة «%1».</translation>
    </message>
    <message>
        <source>Image source: %1</source>
        <translation>مصدر الصورة: %1</translation>
    </message>
    <message>
        <source>Open image folder</source>
        <translation>فتح مجلد صور</translation>
    </message>
    <message>
        <source>Open video</source>
        <translation>فتح فيديو</translation>
    </message>
    <message>
        <source>Videos</source>
        <translation>مقاطع الفيديو</translation>
    </message>
</context>
<context>
    <name>KvDeskSourceMenu</name>
    <message>
        <source>Image &amp;source</source>
        <translation>مصدر ال&amp;صورة</translation>
    </message>
    <message>
        <source>Still &amp;image...</source>
        <translation>&amp;صورة ثابتة...</translation>
    </message>
    <message>
        <source>Image &amp;folder...</source>
        <translation>&amp;مجلد صور...</translation>
    </message>
    <message>
        <source>Play the images of a folder like a camera</source>
        <translation>تشغيل صور مجلد كأنها من كاميرا</translation>
    </message>
    <message>
        <source>&amp;Video...</source>
        <translation>&amp;فيديو...</translation>
    </message>
    <message>
        <source>Play a video like a camera</source>
        <translation>تشغيل فيديو كأنه من كاميرا</translation>
    </message>
    <message>
        <source>Looking for cameras...</source>
        <translation>جارٍ البحث عن كاميرات...</translation>
    </message>
    <message>
        <source>No camera is connected</source>
        <translation>لا توجد كاميرا متصلة</translation>
    </message>
</context>
<context>
    <name>KvDeskStartPage</name>
    <message>
        <source>From an image to a report</source>
        <translation>من الصورة إلى التقرير</translation>
    </message>
    <message>
        <source>Back to the image</source>
        <translation>العودة إلى الصورة</translation>
    </message>
    <message>
        <source>%1 (%2)</source>
        <comment>command (shortcut)</comment>
        <translation>%1 (%2)</translation>
    </message>
    <message>
        <source>Open an image</source>
        <translation>فتح صورة</translation>
    </message>
    <message>
        <source>A picture file, or the live image of a camera.</source>
        <translation>ملف صورة، أو الصورة المباشرة من كاميرا.</translation>
    </message>
    <message>
        <source>Choose a camera or another source</source>
        <translation>اختيار كاميرا أو مصدر آخر</translation>
    </message>
    <message>
        <source>Calibrate</source>
        <translation>معايرة</translation>
    </message>
    <message>
        <source>Say how large a pixel is. The examples are calibrated already.</source>
        <translation>حدد حجم البكسل. الأمثلة معايَرة مسبقًا.</translation>
    </message>
    <message>
        <source>Measure and report</source>
        <translation>القياس وإعداد التقرير</translation>
    </message>
    <message>
        <source>Drag a line over the image: its length is listed at once. The report panel makes a PDF of all values.</source>
        <translation>ارسم خطًا على الصورة بالسحب: يظهر طوله في القائمة فورًا. تُنشئ لوحة التقرير ملف PDF بجميع القيم.</translation>
    </message>
    <message>
        <source>Examples to try</source>
        <translation>أمثلة للتجربة</translation>
    </message>
    <message>
        <source>Recent sessions</source>
        <translation>الجلسات الأخيرة</translation>
    </message>
    <message>
        <source>Open an image first</source>
        <translation>افتح صورة أولًا</translation>
    </message>
    <message>
        <source>Open a copy of this example</source>
        <translation>فتح نسخة من هذا المثال</translation>
    </message>
</context>
<context>
    <name>KvDeskStatus</name>
    <message>
        <source>Warning</source>
        <translation>تحذير</translation>
    </message>
    <message>
        <source>Error</source>
        <translation>خطأ</translation>
    </message>
    <message>
        <source>Information</source>
        <translation>معلومات</translation>
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
        <translation>x %1، y %2</translation>
    </message>
    <message>
        <source>Statistics of the selected values</source>
        <translation>إحصاءات القيم المحددة</translation>
    </message>
    <message>
        <source>, %1</source>
        <comment>objective</comment>
        <translation>، %1</translation>
    </message>
    <message>
        <source>, %1/px</source>
        <comment>size of a pixel</comment>
        <translation>، %1/px</translation>
    </message>
</context>
<context>
    <name>KvDeskStatusLog</name>
    <message>
        <source>Status log</source>
        <translation>سجل الحالة</translation>
    </message>
    <message>
        <source>Hide the status log</source>
        <translation>إخفاء سجل الحالة</translation>
    </message>
    <message>
        <source>Clear the status log</source>
        <translation>مسح سجل الحالة</translation>
    </message>
    <message>
        <source>Messages of the program and its plug-ins appear here</source>
        <translation>تظهر هنا رسائل البرنامج وإضافاته</translation>
    </message>
    <message>
        <source>There are no messages</source>
        <translation>لا توجد رسائل</translation>
    </message>
</context>
<context>
    <name>KvDeskStatusLogModel</name>
    <message>
        <source>%1
Reported by %2</source>
        <comment>message, source</comment>
        <translation>%1
أبلغ عنها: %2</translation>
    </message>
    <message>
        <source>Category</source>
        <translation>النوع</translation>
    </message>
    <message>
        <source>Time</source>
        <translation>الوقت</translation>
    </message>
    <message>
        <source>Message</source>
        <translation>الرسالة</translation>
    </message>
</context>
<context>
    <name>KvDeskTableView</name>
    <message>
        <source>Copy</source>
        <translation>نسخ</translation>
    </message>
</context>
<context>
    <name>KvDeskToolStrip</name>
    <message>
        <source>Measuring tools</source>
        <translation>أدوات القياس</translation>
    </message>
</context>
<context>
    <name>KvDeskTypedPixelSize</name>
    <message>
        <source>Width of a pixel in micrometres</source>
        <translation>عرض البكسل بالميكرومتر</translation>
    </message>
    <message>
        <source>Height of a pixel in micrometres</source>
        <translation>ارتفاع البكسل بالميكرومتر</translation>
    </message>
    <message>
        <source>Same size in both directions</source>
        <translation>الحجم نفسه في الاتجاهين</translation>
    </message>
    <message>
        <source>Width</source>
        <translation>العرض</translation>
    </message>
    <message>
        <source>Height</source>
        <translation>الارتفاع</translation>
    </message>
    <message>
        <source>Type how large a pixel of the image is in reality.</source>
        <translation>أدخل الحجم الحقيقي لبكسل الصورة.</translation>
    </message>
</context>
<context>
    <name>KvDeskValueCommands</name>
    <message>
        <source>Rename</source>
        <translation>إعادة تسمية</translation>
    </message>
    <message>
        <source>Delete object</source>
        <translation>حذف الكائن</translation>
    </message>
    <message>
        <source>Hide value</source>
        <translation>إخفاء القيمة</translation>
    </message>
    <message>
        <source>Show all values of the object</source>
        <translation>إظهار كل قيم الكائن</translation>
    </message>
    <message>
        <source>Select one object first</source>
        <translation>حدد كائنًا واحدًا أولًا</translation>
    </message>
    <message>
        <source>Select an object first</source>
        <translation>حدد كائنًا أولًا</translation>
    </message>
    <message>
        <source>Select a value first</source>
        <translation>حدد قيمة أولًا</translation>
    </message>
    <message>
        <source>No value of the selected object is hidden</source>
        <translation>لا توجد قيمة مخفية للكائن المحدد</translation>
    </message>
    <message>
        <source>showing of values</source>
        <translation>إظهار القيم</translation>
    </message>
    <message>
        <source>hiding of values</source>
        <translation>إخفاء القيم</translation>
    </message>
</context>
<context>
    <name>KvDeskValueTable</name>
    <message>
        <source>Measured values</source>
        <translation>القيم المقيسة</translation>
    </message>
    <message>
        <source>Hide the measured values</source>
        <translation>إخفاء القيم المقيسة</translation>
    </message>
    <message>
        <source>Filter by type, object or value name</source>
        <translation>تصفية حسب النوع أو الكائن أو اسم القيمة</translation>
    </message>
    <message>
        <source>Filter of the measured values</source>
        <translation>تصفية القيم المقيسة</translation>
    </message>
    <message>
        <source>Shows only rows that have all of these words</source>
        <translation>لا يُظهر إلا الصفوف التي تحوي كل هذه الكلمات</translation>
    </message>
    <message>
        <source>No measured value matches the filter</source>
        <translation>لا توجد قيمة مقيسة تطابق عامل التصفية</translation>
    </message>
    <message>
        <source>Clear the filter</source>
        <translation>مسح عامل التصفية</translation>
    </message>
    <message>
        <source>%1 of %2</source>
        <extracomment>rows that match the filter, all rows</extracomment>
        <translation>%1 من %2</translation>
    </message>
    <message>
        <source>Measured values appear here once something is measured or imported</source>
        <translation>تظهر القيم المقيسة هنا بعد إجراء قياس أو استيراد</translation>
    </message>
    <message>
        <source>There are no measured values yet</source>
        <translation>لا توجد قيم مقيسة بعد</translation>
    </message>
</context>
<context>
    <name>KvDeskValueTableModel</name>
    <message>
        <source>Type</source>
        <translation>النوع</translation>
    </message>
    <message>
        <source>Object</source>
        <translation>الكائن</translation>
    </message>
    <message>
        <source>Value name</source>
        <translation>اسم القيمة</translation>
    </message>
    <message>
        <source>Value</source>
        <translation>القيمة</translation>
    </message>
</context>
<context>
    <name>KvToolBase</name>
    <message>
        <source>Reset</source>
        <translation>إعادة تعيين</translation>
    </message>
    <message>
        <source>Reset to the default values</source>
        <translation>إعادة التعيين إلى القيم الافتراضية</translation>
    </message>
</context>
<context>
    <name>QPlatformTheme</name>
    <message>
        <source>OK</source>
        <translation>موافق</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>إلغاء</translation>
    </message>
    <message>
        <source>Apply</source>
        <translation>تطبيق</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>حفظ</translation>
    </message>
    <message>
        <source>Open</source>
        <translation>فتح</translation>
    </message>
    <message>
        <source>Close</source>
        <translation>إغلاق</translation>
    </message>
    <message>
        <source>Discard</source>
        <translation>تجاهل</translation>
    </message>
    <message>
        <source>&amp;Yes</source>
        <translation>&amp;نعم</translation>
    </message>
    <message>
        <source>&amp;No</source>
        <translation>&amp;لا</translation>
    </message>
</context>
<context>
    <name>ZtAppSettings</name>
    <message>
        <source>The settings could not be saved to %1. Check that the folder is writable.</source>
        <translation>تعذر حفظ الإعدادات في %1. تحقق من أن الكتابة في المجلد ممكنة.</translation>
    </message>
    <message>
        <source>The settings file %1 cannot be read. Changes to the settings will not be kept.</source>
        <translation>تعذرت قراءة ملف الإعدادات %1. لن يُحتفظ بالتغييرات في الإعدادات.</translation>
    </message>
    <message>
        <source>The settings file %1 is damaged. It was renamed to %2; all settings are back at their defaults.</source>
        <translation>ملف الإعدادات %1 تالف. أُعيدت تسميته إلى %2؛ وعادت كل الإعدادات إلى قيمها الافتراضية.</translation>
    </message>
    <message>
        <source>The settings file %1 is damaged and could not be renamed to %2. Changes to the settings will not be kept.</source>
        <translation>ملف الإعدادات %1 تالف وتعذرت إعادة تسميته إلى %2. لن يُحتفظ بالتغييرات في الإعدادات.</translation>
    </message>
</context>
<context>
    <name>ZtAravisSource</name>
    <message>
        <source>%1 is disconnected; its last picture stays</source>
        <translation>انقطع اتصال الكاميرا %1؛ وتبقى صورتها الأخيرة</translation>
    </message>
    <message>
        <source>%1 delivers pictures of a kind that cannot be shown</source>
        <translation>ترسل الكاميرا %1 صورًا من نوع لا يمكن عرضه</translation>
    </message>
    <message>
        <source>The camera does not take the setting (%1)</source>
        <translation>لا تقبل الكاميرا هذا الإعداد (%1)</translation>
    </message>
    <message>
        <source>%1 cannot be opened (%2)</source>
        <translation>تعذر فتح الكاميرا %1 (%2)</translation>
    </message>
</context>
<context>
    <name>ZtCalibrationStore</name>
    <message>
        <source>This is not a calibration</source>
        <translation>هذه ليست معايرة</translation>
    </message>
    <message>
        <source>A calibration in the settings is damaged and was left out (%1: %2)</source>
        <translation>توجد في الإعدادات معايرة تالفة وقد جرى تجاهلها (%1: %2)</translation>
    </message>
</context>
<context>
    <name>ZtCsvReader</name>
    <message>
        <source>A quoted text does not end</source>
        <translation>نص بين علامتي اقتباس لا نهاية له</translation>
    </message>
    <message>
        <source>There is text after a closing quote</source>
        <translation>يوجد نص بعد علامة اقتباس الإغلاق</translation>
    </message>
    <message>
        <source>Reading was cancelled</source>
        <translation>أُلغيت القراءة</translation>
    </message>
</context>
<context>
    <name>ZtDrawnType</name>
    <message>
        <source>Rectangle</source>
        <translation>مستطيل</translation>
    </message>
    <message>
        <source>Width</source>
        <translation>العرض</translation>
    </message>
    <message>
        <source>Height</source>
        <translation>الارتفاع</translation>
    </message>
    <message>
        <source>Area</source>
        <translation>المساحة</translation>
    </message>
    <message>
        <source>Line</source>
        <translation>خط</translation>
    </message>
    <message>
        <source>Length</source>
        <translation>الطول</translation>
    </message>
    <message>
        <source>Arc</source>
        <translation>قوس</translation>
    </message>
    <message>
        <source>Angle</source>
        <translation>الزاوية</translation>
    </message>
    <message>
        <source>Arc length</source>
        <translation>طول القوس</translation>
    </message>
    <message>
        <source>Polygon</source>
        <translation>مضلع</translation>
    </message>
    <message>
        <source>Perimeter</source>
        <translation>المحيط</translation>
    </message>
    <message>
        <source>Polyline</source>
        <translation>خط منكسر</translation>
    </message>
    <message>
        <source>Parallel distance</source>
        <translation>مسافة نقطة عن خط</translation>
    </message>
    <message>
        <source>Distance</source>
        <translation>المسافة</translation>
    </message>
    <message>
        <source>Text note</source>
        <translation>ملاحظة نصية</translation>
    </message>
    <message>
        <source>Scale bar</source>
        <translation>شريط مقياس</translation>
    </message>
    <message>
        <source>Counter</source>
        <translation>عداد</translation>
    </message>
    <message>
        <source>Count</source>
        <translation>العدد</translation>
    </message>
    <message>
        <source>Share</source>
        <translation>النسبة</translation>
    </message>
    <message>
        <source>Circle</source>
        <translation>دائرة</translation>
    </message>
    <message>
        <source>Diameter</source>
        <translation>القطر</translation>
    </message>
</context>
<context>
    <name>ZtFileFault</name>
    <message>
        <source>No such file or directory</source>
        <translation>لا يوجد ملف أو مجلد بهذا الاسم</translation>
    </message>
    <message>
        <source>Permission denied</source>
        <translation>الإذن مرفوض</translation>
    </message>
    <message>
        <source>Is a directory</source>
        <translation>هذا مجلد</translation>
    </message>
    <message>
        <source>Not a directory</source>
        <translation>ليس مجلدًا</translation>
    </message>
    <message>
        <source>File name too long</source>
        <translation>اسم الملف طويل جدًا</translation>
    </message>
    <message>
        <source>No space left on device</source>
        <translation>لا توجد مساحة متبقية على الجهاز</translation>
    </message>
    <message>
        <source>Read-only file system</source>
        <translation>نظام ملفات للقراءة فقط</translation>
    </message>
    <message>
        <source>Input/output error</source>
        <translation>خطأ في الإدخال/الإخراج</translation>
    </message>
</context>
<context>
    <name>ZtFrameSourceCatalogue</name>
    <message>
        <source>This program cannot play videos</source>
        <translation>لا يستطيع هذا البرنامج تشغيل الفيديو</translation>
    </message>
    <message>
        <source>This program knows no cameras of this kind</source>
        <translation>لا يعرف هذا البرنامج كاميرات من هذا النوع</translation>
    </message>
</context>
<context>
    <name>ZtImageFolderSource</name>
    <message>
        <source>%1: no picture of the folder can be shown</source>
        <translation>%1: لا توجد في المجلد صورة يمكن عرضها</translation>
    </message>
    <message>
        <source>The folder does not exist</source>
        <translation>المجلد غير موجود</translation>
    </message>
    <message>
        <source>The folder cannot be read</source>
        <translation>تعذرت قراءة المجلد</translation>
    </message>
    <message>
        <source>The folder holds no pictures</source>
        <translation>لا يحوي المجلد أي صور</translation>
    </message>
</context>
<context>
    <name>ZtKernelImage</name>
    <message>
        <source>%1 delivers pictures again</source>
        <translation>عاد %1 إلى إرسال الصور</translation>
    </message>
</context>
<context>
    <name>ZtLiveFrameSource</name>
    <message>
        <source>%1 has stopped delivering pictures; the last one stays</source>
        <translation>توقف %1 عن إرسال الصور؛ وتبقى الأخيرة</translation>
    </message>
</context>
<context>
    <name>ZtMeasureFormat</name>
    <message>
        <source>pcs</source>
        <translation>قطعة</translation>
    </message>
</context>
<context>
    <name>ZtSession</name>
    <message>
        <source>The file is empty</source>
        <translation>الملف فارغ</translation>
    </message>
    <message>
        <source>The file is not a session</source>
        <translation>الملف ليس جلسة</translation>
    </message>
    <message>
        <source>The file cannot be written (%1)</source>
        <translation>تعذرت كتابة الملف (%1)</translation>
    </message>
    <message>
        <source>This must be a list</source>
        <translation>يجب أن يكون هذا قائمة</translation>
    </message>
    <message>
        <source>This must be a text</source>
        <translation>يجب أن يكون هذا نصًا</translation>
    </message>
    <message>
        <source>This must be a whole number from 1</source>
        <translation>يجب أن يكون هذا عددًا صحيحًا لا يقل عن 1</translation>
    </message>
    <message>
        <source>This must be a number</source>
        <translation>يجب أن يكون هذا عددًا</translation>
    </message>
    <message>
        <source>This must be a number greater than 0</source>
        <translation>يجب أن يكون هذا عددًا أكبر من 0</translation>
    </message>
    <message>
        <source>Another object of this type has the same number</source>
        <translation>يوجد كائن آخر من هذا النوع بالرقم نفسه</translation>
    </message>
    <message>
        <source>This must be an object</source>
        <translation>يجب أن يكون هذا كائن JSON</translation>
    </message>
    <message>
        <source>&quot;%1&quot; is not a type of objects</source>
        <translation>«%1» ليس نوعًا من الكائنات</translation>
    </message>
    <message>
        <source>An object of type &quot;%1&quot; cannot have this number of points (%2)</source>
        <translation>لا يمكن أن يكون لكائن من النوع «%1» هذا العدد من النقاط (%2)</translation>
    </message>
    <message>
        <source>A point must be a list of two numbers between -1e9 and 1e9</source>
        <translation>يجب أن تكون النقطة قائمة من عددين بين ‎-1e9 و1e9</translation>
    </message>
    <message>
        <source>This must be the name of a value</source>
        <translation>يجب أن يكون هذا اسم قيمة</translation>
    </message>
    <message>
        <source>The type has no name</source>
        <translation>النوع بلا اسم</translation>
    </message>
    <message>
        <source>A value must have a name of its own</source>
        <translation>يجب أن يكون لكل قيمة اسم خاص بها</translation>
    </message>
    <message>
        <source>The numbers of the rows must rise</source>
        <translation>يجب أن تكون أرقام الصفوف تصاعدية</translation>
    </message>
    <message>
        <source>A row must be a list of number, name and values</source>
        <translation>يجب أن يكون الصف قائمة من رقم واسم وقيم</translation>
    </message>
    <message>
        <source>This must be a text or null</source>
        <translation>يجب أن يكون هذا نصًا أو null</translation>
    </message>
    <message>
        <source>This must be a list or an object</source>
        <translation>يجب أن يكون هذا قائمة أو كائن JSON</translation>
    </message>
    <message>
        <source>The table has no such value</source>
        <translation>لا توجد في الجدول قيمة كهذه</translation>
    </message>
    <message>
        <source>This must be the text of a number</source>
        <translation>يجب أن يكون هذا نصًا يمثل عددًا</translation>
    </message>
    <message>
        <source>The unit does not fit that of the value</source>
        <translation>الوحدة لا تناسب وحدة القيمة</translation>
    </message>
    <message>
        <source>The file is nested too deeply</source>
        <translation>تداخل العناصر في الملف أعمق مما يجب</translation>
    </message>
    <message>
        <source>The file is not valid JSON (%1)</source>
        <translation>الملف ليس JSON صالحًا (%1)</translation>
    </message>
    <message>
        <source>The file does not exist</source>
        <translation>الملف غير موجود</translation>
    </message>
    <message>
        <source>This is a folder, not a file</source>
        <translation>هذا مجلد وليس ملفًا</translation>
    </message>
    <message>
        <source>The file cannot be read (%1)</source>
        <translation>تعذرت قراءة الملف (%1)</translation>
    </message>
    <message>
        <source>The file is too large for a session</source>
        <translation>الملف أكبر من أن يكون جلسة</translation>
    </message>
    <message>
        <source>This must be a date such as 2026-01-31T12:00:00Z</source>
        <translation>يجب أن يكون هذا تاريخًا مثل ‎2026-01-31T12:00:00Z</translation>
    </message>
    <message>
        <source>This must be &quot;knownDistance&quot;, &quot;metadata&quot; or &quot;typed&quot;</source>
        <translation>يجب أن يكون هذا &quot;knownDistance&quot; أو &quot;metadata&quot; أو &quot;typed&quot;</translation>
    </message>
    <message>
        <source>The file is write-protected</source>
        <translation>الملف محمي من الكتابة</translation>
    </message>
    <message>
        <source>Writing was cancelled</source>
        <translation>أُلغيت الكتابة</translation>
    </message>
    <message>
        <source>Reading was cancelled</source>
        <translation>أُلغيت القراءة</translation>
    </message>
    <message>
        <source>The session is of the newer version %1; this program reads versions up to %2</source>
        <translation>الجلسة من الإصدار الأحدث %1؛ ويقرأ هذا البرنامج الإصدارات حتى %2</translation>
    </message>
    <message>
        <source>Sessions of version %1 are not known; this program reads versions %2 to %3</source>
        <translation>جلسات الإصدار %1 غير معروفة؛ ويقرأ هذا البرنامج الإصدارات من %2 إلى %3</translation>
    </message>
    <message>
        <source>This file is a table of values; import it</source>
        <translation>هذا الملف جدول قيم؛ استورده</translation>
    </message>
</context>
<context>
    <name>ZtStillImageSource</name>
    <message>
        <source>The picture does not exist</source>
        <translation>الصورة غير موجودة</translation>
    </message>
    <message>
        <source>This is a folder, not a picture</source>
        <translation>هذا مجلد وليس صورة</translation>
    </message>
    <message>
        <source>The picture cannot be read</source>
        <translation>تعذرت قراءة الصورة</translation>
    </message>
    <message>
        <source>The picture has %1 x %2 pixels, which is too many</source>
        <translation>أبعاد الصورة %1 x %2 بكسل، وهي أكبر مما يمكن فتحه</translation>
    </message>
    <message>
        <source>The picture cannot be decoded (%1)</source>
        <translation>تعذر فك ترميز الصورة (%1)</translation>
    </message>
    <message>
        <source>the file is empty</source>
        <translation>الملف فارغ</translation>
    </message>
    <message>
        <source>it has no size</source>
        <translation>لا أبعاد لها</translation>
    </message>
    <message>
        <source>the file is damaged</source>
        <translation>الملف تالف</translation>
    </message>
    <message>
        <source>the file is too short for its picture</source>
        <translation>الملف أقصر من صورته</translation>
    </message>
    <message>
        <source>there is not enough memory</source>
        <translation>الذاكرة غير كافية</translation>
    </message>
</context>
<context>
    <name>ZtTableImport</name>
    <message>
        <source>&quot;%1&quot; already has a value &quot;%2&quot; in line %3</source>
        <translation>للكائن «%1» قيمة «%2» بالفعل في السطر %3</translation>
    </message>
    <message>
        <source>The file does not exist</source>
        <translation>الملف غير موجود</translation>
    </message>
    <message>
        <source>This is a folder, not a file</source>
        <translation>هذا مجلد وليس ملفًا</translation>
    </message>
    <message>
        <source>The file cannot be read (%1)</source>
        <translation>تعذرت قراءة الملف (%1)</translation>
    </message>
    <message>
        <source>The table is not open for reading</source>
        <translation>الجدول غير مفتوح للقراءة</translation>
    </message>
    <message>
        <source>The table has no rows</source>
        <translation>لا توجد صفوف في الجدول</translation>
    </message>
    <message>
        <source>The row and the header differ in their number of fields (%1 and %2)</source>
        <translation>يختلف عدد الحقول بين الصف وسطر العناوين (%1 و%2)</translation>
    </message>
    <message>
        <source>%1 is not a finite number</source>
        <translation>%1 ليس عددًا منتهيًا</translation>
    </message>
    <message>
        <source>%1 is not a number</source>
        <translation>%1 ليس عددًا</translation>
    </message>
    <message>
        <source>&quot;%1&quot; of &quot;%2&quot; is given in &quot;%3&quot; here, but in &quot;%4&quot; before</source>
        <translation>القيمة «%1» للنوع «%2» معطاة هنا بوحدة «%3»، لكنها كانت قبل ذلك بوحدة «%4»</translation>
    </message>
    <message>
        <source>There is no column %1; the columns are %2</source>
        <translation>لا يوجد عمود %1؛ الأعمدة هي %2</translation>
    </message>
    <message>
        <source>Object</source>
        <translation>كائن</translation>
    </message>
    <message>
        <source>There is no value %1 to give a unit; the values are %2</source>
        <translation>لا توجد قيمة %1 لإعطائها وحدة؛ القيم هي %2</translation>
    </message>
    <message>
        <source>The first line announces rows without values</source>
        <translation>يعلن السطر الأول عن صفوف بلا قيم</translation>
    </message>
    <message>
        <source>There is no column %1; the columns of this table have no names</source>
        <translation>لا يوجد عمود %1؛ أعمدة هذا الجدول بلا أسماء</translation>
    </message>
    <message>
        <source>%1 is not the index of a class; they go from 0 to %2</source>
        <translation>%1 ليس رقم فئة؛ فالأرقام من 0 إلى %2</translation>
    </message>
    <message>
        <source>Value %1</source>
        <translation>القيمة %1</translation>
    </message>
    <message>
        <source>The file is larger than %1 MB</source>
        <translation>حجم الملف أكبر من %1 ميغابايت</translation>
    </message>
    <message>
        <source>The file is empty</source>
        <translation>الملف فارغ</translation>
    </message>
    <message>
        <source>The first line does not name the columns</source>
        <translation>لا يسمي السطر الأول الأعمدة</translation>
    </message>
    <message>
        <source>Column %1 is not part of a list of values and was left out</source>
        <translation>العمود %1 ليس جزءًا من قائمة قيم وقد جرى تجاهله</translation>
    </message>
    <message>
        <source>Columns %1 are not part of a list of values and were left out</source>
        <translation>الأعمدة %1 ليست جزءًا من قائمة قيم وقد جرى تجاهلها</translation>
    </message>
    <message>
        <source>The value has no name</source>
        <translation>القيمة بلا اسم</translation>
    </message>
    <message>
        <source>The row does not say which object it belongs to</source>
        <translation>لا يذكر الصف الكائن الذي ينتمي إليه</translation>
    </message>
    <message>
        <source>%1 is not a unit</source>
        <translation>%1 ليس وحدة</translation>
    </message>
    <message>
        <source>There is no column of numbers</source>
        <translation>لا يوجد عمود أعداد</translation>
    </message>
    <message>
        <source>Column %1</source>
        <translation>العمود %1</translation>
    </message>
    <message>
        <source>Column %1 holds text and was left out</source>
        <translation>العمود %1 يحوي نصًا وقد جرى تجاهله</translation>
    </message>
    <message>
        <source>Columns %1 hold text and were left out</source>
        <translation>الأعمدة %1 تحوي نصوصًا وقد جرى تجاهلها</translation>
    </message>
    <message>
        <source>Reading was cancelled</source>
        <translation>أُلغيت القراءة</translation>
    </message>
    <message numerus="yes">
        <source>The table has %n row(s), its first line announces %1</source>
        <translation>
            <numerusform>في الجدول %n صف، بينما يعلن سطره الأول عن %1</numerusform>
            <numerusform>في الجدول صف واحد، بينما يعلن سطره الأول عن %1</numerusform>
            <numerusform>في الجدول صفان، بينما يعلن سطره الأول عن %1</numerusform>
            <numerusform>في الجدول %n صفوف، بينما يعلن سطره الأول عن %1</numerusform>
            <numerusform>في الجدول %n صفًا، بينما يعلن سطره الأول عن %1</numerusform>
            <numerusform>في الجدول %n صف، بينما يعلن سطره الأول عن %1</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>The row has %n field(s) instead of %1</source>
        <translation>
            <numerusform>في الصف %n حقل بدلًا من %1</numerusform>
            <numerusform>في الصف حقل واحد بدلًا من %1</numerusform>
            <numerusform>في الصف حقلان بدلًا من %1</numerusform>
            <numerusform>في الصف %n حقول بدلًا من %1</numerusform>
            <numerusform>في الصف %n حقلًا بدلًا من %1</numerusform>
            <numerusform>في الصف %n حقل بدلًا من %1</numerusform>
        </translation>
    </message>
    <message>
        <source>The records have too many different names</source>
        <translation>في السجلات أسماء مختلفة أكثر من اللازم</translation>
    </message>
    <message>
        <source>This file is a session, not a table; open it</source>
        <translation>هذا الملف جلسة وليس جدولًا؛ افتحه</translation>
    </message>
    <message>
        <source>The file is neither a list of records nor an export of values</source>
        <translation>الملف ليس قائمة سجلات ولا تصديرًا للقيم</translation>
    </message>
    <message>
        <source>This name comes twice</source>
        <translation>هذا الاسم مكرر</translation>
    </message>
    <message>
        <source>This must be a text, a number or null</source>
        <translation>يجب أن يكون هنا نص أو رقم أو null</translation>
    </message>
    <message>
        <source>The table is of version %1; this program reads version %2</source>
        <translation>الجدول من الإصدار %1؛ يقرأ هذا البرنامج الإصدار %2</translation>
    </message>
</context>
<context>
    <name>ZtTextDecoder</name>
    <message>
        <source>The file is not a text file: it holds a NUL character</source>
        <translation>الملف ليس ملفًا نصيًا: فيه محرف NUL</translation>
    </message>
    <message>
        <source>The file is not valid UTF-16 text</source>
        <translation>الملف ليس نص UTF-16 صالحًا</translation>
    </message>
    <message>
        <source>The text is not valid UTF-8</source>
        <translation>النص ليس UTF-8 صالحًا</translation>
    </message>
</context>
<context>
    <name>ZtUvcCameraSource</name>
    <message>
        <source>%1 is not connected</source>
        <translation>الكاميرا %1 غير متصلة</translation>
    </message>
    <message>
        <source>%1 is disconnected or in use (%2)</source>
        <translation>الكاميرا %1 غير متصلة أو قيد الاستخدام (%2)</translation>
    </message>
</context>
<context>
    <name>ZtVideoFileSource</name>
    <message>
        <source>The video does not exist</source>
        <translation>الفيديو غير موجود</translation>
    </message>
    <message>
        <source>The video cannot be read</source>
        <translation>تعذرت قراءة الفيديو</translation>
    </message>
    <message>
        <source>The video is empty</source>
        <translation>الفيديو فارغ</translation>
    </message>
    <message>
        <source>there is only sound in it</source>
        <translation>لا يحوي إلا صوتًا</translation>
    </message>
    <message>
        <source>The video %1 cannot be played (%2)</source>
        <translation>تعذر تشغيل الفيديو %1 (%2)</translation>
    </message>
    <message>
        <source>the file is damaged</source>
        <translation>الملف تالف</translation>
    </message>
</context>
<context>
    <name>acss</name>
    <message>
        <source>The icon %1 is missing.</source>
        <translation>الرمز %1 مفقود.</translation>
    </message>
</context>
</TS>
