<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="ru_RU" sourcelanguage="en_US">
<context>
    <name>GuiStatReportingPluginUi</name>
    <message>
        <source>Form</source>
        <translation>Форма</translation>
    </message>
    <message>
        <source>Open Templates Editor</source>
        <translation>Открыть редактор шаблонов</translation>
    </message>
    <message>
        <source>Opens Report Template Editor</source>
        <translation>Открывает редактор шаблонов отчётов</translation>
    </message>
    <message>
        <source>Generate Report File</source>
        <translation>Создать файл отчёта</translation>
    </message>
    <message>
        <source>Exports current measurments to pdf file.</source>
        <translation>Экспортирует текущие измерения в файл PDF.</translation>
    </message>
    <message>
        <source>Open Statistics Window</source>
        <translation>Открыть окно статистики</translation>
    </message>
    <message>
        <source>Template:</source>
        <translation>Шаблон:</translation>
    </message>
    <message>
        <source>Browse Templates</source>
        <translation>Обзор шаблонов</translation>
    </message>
    <message>
        <source>Opens default template for report generation</source>
        <translation>Открывает шаблон по умолчанию для создания отчёта</translation>
    </message>
</context>
<context>
    <name>KvAddImageDialog</name>
    <message>
        <source>Choose image file</source>
        <translation>Выберите файл изображения</translation>
    </message>
    <message>
        <source>Image file(*.png *.jpg *.gif *.tif *.bmp)</source>
        <translation>Файл изображения (*.png *.jpg *.gif *.tif *.bmp)</translation>
    </message>
</context>
<context>
    <name>KvAddLinkDialogUi</name>
    <message>
        <source>Insert Link</source>
        <translation>Вставка ссылки</translation>
    </message>
    <message>
        <source>Title:</source>
        <translation>Название:</translation>
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
        <translation>По левому краю</translation>
    </message>
    <message>
        <source>Align center</source>
        <translation>По центру</translation>
    </message>
    <message>
        <source>Align right</source>
        <translation>По правому краю</translation>
    </message>
</context>
<context>
    <name>KvBaseEditorNodeFactory</name>
    <message>
        <source>Measurements Table</source>
        <translation>Таблица измерений</translation>
    </message>
    <message>
        <source>Text Document</source>
        <translation>Текстовый документ</translation>
    </message>
    <message>
        <source>Camera Image View</source>
        <translation>Изображение с камеры</translation>
    </message>
    <message>
        <source>Image View</source>
        <translation>Изображение</translation>
    </message>
    <message>
        <source>Statistics</source>
        <translation>Статистика</translation>
    </message>
    <message>
        <source>Statistics Table</source>
        <translation>Таблица статистики</translation>
    </message>
    <message>
        <source>Counters</source>
        <translation>Счётчики</translation>
    </message>
    <message>
        <source>Min / Median / Max Box</source>
        <translation>Размах: мин. / медиана / макс.</translation>
    </message>
    <message>
        <source>Trend</source>
        <translation>Тренд</translation>
    </message>
</context>
<context>
    <name>KvCameraImageNodeOptionsWidget</name>
    <message>
        <source>Camera image view</source>
        <translation>Изображение с камеры</translation>
    </message>
    <message>
        <source>Render measurements</source>
        <translation>Показывать измерения</translation>
    </message>
    <message>
        <source>Draw the measurement objects on the picture</source>
        <translation>Наносить измеренные объекты на изображение</translation>
    </message>
</context>
<context>
    <name>KvCameraImageWidget</name>
    <message>
        <source>Camera Image View</source>
        <translation>Изображение с камеры</translation>
    </message>
</context>
<context>
    <name>KvColumnsOptionsRow</name>
    <message>
        <source>Select columns:</source>
        <translation>Выбор столбцов:</translation>
    </message>
</context>
<context>
    <name>KvEditorAddImageExtWidgetUi</name>
    <message>
        <source>Width:</source>
        <translation>Ширина:</translation>
    </message>
    <message>
        <source>Width in percent of the text&apos;s width</source>
        <translation>Ширина в процентах от ширины текста</translation>
    </message>
    <message>
        <source>Float:</source>
        <translation>Обтекание:</translation>
    </message>
    <message>
        <source>Side of the text at which the picture stands</source>
        <translation>Сторона текста, с которой располагается изображение</translation>
    </message>
    <message>
        <source>none</source>
        <translation>нет</translation>
    </message>
    <message>
        <source>left</source>
        <translation>слева</translation>
    </message>
    <message>
        <source>right</source>
        <translation>справа</translation>
    </message>
</context>
<context>
    <name>KvEditorToolCombo</name>
    <message>
        <source>Group of blocks, open</source>
        <translation>Группа блоков, развёрнута</translation>
    </message>
    <message>
        <source>Group of blocks, closed</source>
        <translation>Группа блоков, свёрнута</translation>
    </message>
    <message>
        <source>Close the group (Enter)</source>
        <translation>Свернуть группу (Enter)</translation>
    </message>
    <message>
        <source>Open the group (Enter)</source>
        <translation>Развернуть группу (Enter)</translation>
    </message>
</context>
<context>
    <name>KvEditorToolWidget</name>
    <message>
        <source>Drag onto the page, or press Enter to append</source>
        <translation>Перетащите на страницу или нажмите Enter, чтобы добавить в конец</translation>
    </message>
</context>
<context>
    <name>KvFileDialogs</name>
    <message>
        <source>%1 already exists.
Do you want to replace it?</source>
        <translation>%1 уже существует.
Заменить?</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>Сохранить</translation>
    </message>
</context>
<context>
    <name>KvFooterWidget</name>
    <message>
        <source>Footer</source>
        <translation>Нижний колонтитул</translation>
    </message>
</context>
<context>
    <name>KvGroupByOptionsRow</name>
    <message>
        <source>Group by:</source>
        <translation>Группировка:</translation>
    </message>
    <message>
        <source>Object</source>
        <translation>Объект</translation>
    </message>
    <message>
        <source>Measurement</source>
        <translation>Измерение</translation>
    </message>
</context>
<context>
    <name>KvHeaderWidget</name>
    <message>
        <source>Header</source>
        <translation>Верхний колонтитул</translation>
    </message>
</context>
<context>
    <name>KvImageFile</name>
    <message>
        <source>Cannot read the image file %1</source>
        <translation>Не удаётся прочитать файл изображения %1</translation>
    </message>
    <message>
        <source>The image that the template holds of %1 is damaged</source>
        <translation>Сохранённое в шаблоне изображение %1 повреждено</translation>
    </message>
</context>
<context>
    <name>KvImageNodeOptionsWidget</name>
    <message>
        <source>Image view</source>
        <translation>Изображение</translation>
    </message>
    <message>
        <source>Browse</source>
        <translation>Обзор</translation>
    </message>
    <message>
        <source>Choose an image file</source>
        <translation>Выбрать файл изображения</translation>
    </message>
    <message>
        <source>Choose image file</source>
        <translation>Выберите файл изображения</translation>
    </message>
    <message>
        <source>Image file(*.png *.jpg *.gif *.tif *.bmp)</source>
        <translation>Файл изображения (*.png *.jpg *.gif *.tif *.bmp)</translation>
    </message>
</context>
<context>
    <name>KvImageWidget</name>
    <message>
        <source>Image View</source>
        <translation>Изображение</translation>
    </message>
</context>
<context>
    <name>KvPageCountWidget</name>
    <message>
        <source>Page count</source>
        <translation>Нумерация страниц</translation>
    </message>
</context>
<context>
    <name>KvPrintProgressDialog</name>
    <message>
        <source>Cancel</source>
        <translation>Отмена</translation>
    </message>
    <message>
        <source>Printing the report</source>
        <translation>Печать отчёта</translation>
    </message>
    <message>
        <source>Progress</source>
        <translation>Ход выполнения</translation>
    </message>
    <message>
        <source>Cancel (Esc)</source>
        <translation>Отмена (Esc)</translation>
    </message>
    <message>
        <source>Page %1 of %2</source>
        <translation>Страница %1 из %2</translation>
    </message>
</context>
<context>
    <name>KvReportGlyphs</name>
    <message>
        <source>No installed font has these characters, the report leaves them out: %1</source>
        <translation>Ни в одном установленном шрифте нет этих символов, в отчёте они пропущены: %1</translation>
    </message>
    <message>
        <source>No installed font has these characters, the report leaves them out: %1 (fonts to install: %2)</source>
        <translation>Ни в одном установленном шрифте нет этих символов, в отчёте они пропущены: %1 (установите шрифты: %2)</translation>
    </message>
</context>
<context>
    <name>KvReportKeywords</name>
    <message>
        <source>Creation date (ISO)</source>
        <translation>Дата создания (ISO)</translation>
    </message>
    <message>
        <source>Creation date (Text)</source>
        <translation>Дата создания (текст)</translation>
    </message>
    <message>
        <source>Creation time</source>
        <translation>Время создания</translation>
    </message>
    <message>
        <source>Program name</source>
        <translation>Название программы</translation>
    </message>
    <message>
        <source>Program version</source>
        <translation>Версия программы</translation>
    </message>
    <message>
        <source>Program vendor</source>
        <translation>Разработчик программы</translation>
    </message>
</context>
<context>
    <name>KvReportTemplatesEditor</name>
    <message>
        <source>Report template editor</source>
        <translation>Редактор шаблонов отчётов</translation>
    </message>
    <message>
        <source>Report template file (*.rtp)</source>
        <translation>Файл шаблона отчёта (*.rtp)</translation>
    </message>
</context>
<context>
    <name>KvRotationOptionsRow</name>
    <message>
        <source>Rotation</source>
        <translation>Поворот</translation>
    </message>
    <message>
        <source>Rotation of the picture, clockwise</source>
        <translation>Поворот изображения по часовой стрелке</translation>
    </message>
</context>
<context>
    <name>KvSelectionOverlay</name>
    <message>
        <source>Delete block</source>
        <translation>Удалить блок</translation>
    </message>
    <message>
        <source>Delete block (Del)</source>
        <translation>Удалить блок (Del)</translation>
    </message>
</context>
<context>
    <name>KvStatisticsMeasurementsTableNodeCfg</name>
    <message>
        <source>Object Name</source>
        <translation>Имя объекта</translation>
    </message>
    <message>
        <source>Object Type</source>
        <translation>Тип объекта</translation>
    </message>
    <message>
        <source>Value Name</source>
        <translation>Величина</translation>
    </message>
    <message>
        <source>Value</source>
        <translation>Значение</translation>
    </message>
</context>
<context>
    <name>KvStatisticsMeasurementsTableOptionsWidget</name>
    <message>
        <source>Measurements table</source>
        <translation>Таблица измерений</translation>
    </message>
    <message>
        <source>Order by:</source>
        <translation>Сортировка:</translation>
    </message>
    <message>
        <source>default</source>
        <translation>по умолчанию</translation>
    </message>
    <message>
        <source>%1, ascending</source>
        <translation>%1, по возрастанию</translation>
    </message>
    <message>
        <source>%1, descending</source>
        <translation>%1, по убыванию</translation>
    </message>
</context>
<context>
    <name>KvStatisticsMeasurementsTableWidget</name>
    <message>
        <source>Measurements Table</source>
        <translation>Таблица измерений</translation>
    </message>
</context>
<context>
    <name>KvStatisticsStatsTableNodeCfg</name>
    <message>
        <source>Min</source>
        <translation>Мин.</translation>
    </message>
    <message>
        <source>Max</source>
        <translation>Макс.</translation>
    </message>
    <message>
        <source>Average</source>
        <translation>Среднее</translation>
    </message>
    <message>
        <source>Sigma</source>
        <translation>σ</translation>
    </message>
    <message>
        <source>3 Sigma</source>
        <translation>3σ</translation>
    </message>
    <message>
        <source>6 Sigma</source>
        <translation>6σ</translation>
    </message>
</context>
<context>
    <name>KvStatisticsStatsTableOptionsWidget</name>
    <message>
        <source>Statistics table</source>
        <translation>Таблица статистики</translation>
    </message>
</context>
<context>
    <name>KvStatisticsStatsTableWidget</name>
    <message>
        <source>Statistics Table</source>
        <translation>Таблица статистики</translation>
    </message>
    <message>
        <source>Object Type</source>
        <translation>Тип объекта</translation>
    </message>
    <message>
        <source>Measurement Type</source>
        <translation>Вид измерения</translation>
    </message>
</context>
<context>
    <name>KvStatisticsUnitConverter</name>
    <message>
        <source>deg</source>
        <translation>град</translation>
    </message>
    <message>
        <source>pcs</source>
        <translation>шт.</translation>
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
        <translation>Статистика измерений</translation>
    </message>
    <message>
        <source>Choose a statistics view on the right.</source>
        <translation>Выберите справа вид статистики.</translation>
    </message>
    <message>
        <source>No statistics blocks are installed.</source>
        <translation>Блоки статистики не установлены.</translation>
    </message>
</context>
<context>
    <name>KvTemplateModel</name>
    <message>
        <source>Cannot read</source>
        <translation>Ошибка чтения</translation>
    </message>
    <message>
        <source>Cannot open file %1</source>
        <translation>Не удаётся открыть файл %1</translation>
    </message>
    <message>
        <source>Error reading file</source>
        <translation>Ошибка чтения файла</translation>
    </message>
    <message>
        <source>Cannot read file %1</source>
        <translation>Не удаётся прочитать файл %1</translation>
    </message>
    <message>
        <source>Cannot save</source>
        <translation>Ошибка сохранения</translation>
    </message>
    <message>
        <source>Cannot create file %1</source>
        <translation>Не удаётся создать файл %1</translation>
    </message>
</context>
<context>
    <name>KvTemplatesEditorWindow</name>
    <message>
        <source>Open a template file</source>
        <translation>Открыть файл шаблона</translation>
    </message>
    <message>
        <source>Start a new, empty template</source>
        <translation>Создать новый пустой шаблон</translation>
    </message>
    <message>
        <source>Save the template to another file</source>
        <translation>Сохранить шаблон в другой файл</translation>
    </message>
    <message>
        <source>Save the template</source>
        <translation>Сохранить шаблон</translation>
    </message>
    <message>
        <source>Print the report to a PDF file</source>
        <translation>Напечатать отчёт в файл PDF</translation>
    </message>
    <message>
        <source>Header on every page</source>
        <translation>Верхний колонтитул на каждой странице</translation>
    </message>
    <message>
        <source>Footer on every page</source>
        <translation>Нижний колонтитул на каждой странице</translation>
    </message>
    <message>
        <source>Page numbers</source>
        <translation>Номера страниц</translation>
    </message>
    <message>
        <source>Report pages</source>
        <translation>Страницы отчёта</translation>
    </message>
    <message>
        <source>Blocks to add</source>
        <translation>Доступные блоки</translation>
    </message>
    <message>
        <source>Are you sure?</source>
        <translation>Подтверждение</translation>
    </message>
    <message>
        <source>The template is modified, do you want to save it first?</source>
        <translation>Шаблон изменён. Сохранить его перед продолжением?</translation>
    </message>
    <message>
        <source>Choose file to open</source>
        <translation>Выберите файл для открытия</translation>
    </message>
    <message>
        <source>Choose file to save</source>
        <translation>Выберите файл для сохранения</translation>
    </message>
    <message>
        <source>Choose file to print to</source>
        <translation>Выберите файл для печати</translation>
    </message>
    <message>
        <source>Pdf file (*.pdf)</source>
        <translation>Файл PDF (*.pdf)</translation>
    </message>
    <message>
        <source>Save failed</source>
        <translation>Не удалось сохранить</translation>
    </message>
    <message>
        <source>Cannot write to file %1</source>
        <translation>Не удаётся записать файл %1</translation>
    </message>
    <message>
        <source>[new]</source>
        <translation>[новый]</translation>
    </message>
</context>
<context>
    <name>KvTemplatesEditorWindowUi</name>
    <message>
        <source>Open File</source>
        <translation>Открыть файл</translation>
    </message>
    <message>
        <source>Clear</source>
        <translation>Очистить</translation>
    </message>
    <message>
        <source>Save as ...</source>
        <translation>Сохранить как...</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>Сохранить</translation>
    </message>
    <message>
        <source>Print</source>
        <translation>Печать</translation>
    </message>
    <message>
        <source>Add block</source>
        <translation>Добавить блок</translation>
    </message>
    <message>
        <source>The template is empty. Drag a block from here onto the page.</source>
        <translation>Шаблон пуст. Перетащите блок отсюда на страницу.</translation>
    </message>
</context>
<context>
    <name>KvTextDocumentNodeOptionsWidget</name>
    <message>
        <source>Text</source>
        <translation>Текст</translation>
    </message>
    <message>
        <source>Font size in points</source>
        <translation>Размер шрифта в пунктах</translation>
    </message>
    <message>
        <source>Font size</source>
        <translation>Размер шрифта</translation>
    </message>
    <message>
        <source>Text color</source>
        <translation>Цвет текста</translation>
    </message>
    <message>
        <source>Bold</source>
        <translation>Полужирный</translation>
    </message>
    <message>
        <source>Italic</source>
        <translation>Курсив</translation>
    </message>
    <message>
        <source>Underline</source>
        <translation>Подчёркнутый</translation>
    </message>
    <message>
        <source>Align left</source>
        <translation>По левому краю</translation>
    </message>
    <message>
        <source>Align center</source>
        <translation>По центру</translation>
    </message>
    <message>
        <source>Align right</source>
        <translation>По правому краю</translation>
    </message>
    <message>
        <source>Justify</source>
        <translation>По ширине</translation>
    </message>
    <message>
        <source>Superscript</source>
        <translation>Надстрочный</translation>
    </message>
    <message>
        <source>Subscript</source>
        <translation>Подстрочный</translation>
    </message>
    <message>
        <source>Insert link</source>
        <translation>Вставить ссылку</translation>
    </message>
    <message>
        <source>Insert picture</source>
        <translation>Вставить изображение</translation>
    </message>
    <message>
        <source>Insert tag</source>
        <translation>Вставить поле</translation>
    </message>
    <message>
        <source>Insert a tag that the report replaces by its value</source>
        <translation>Вставить поле, вместо которого в отчёте появится его значение</translation>
    </message>
</context>
<context>
    <name>KvTextDocumentNodeWidget</name>
    <message>
        <source>Text</source>
        <translation>Текст</translation>
    </message>
</context>
<context>
    <name>KvThemeOptionsRow</name>
    <message>
        <source>Color theme:</source>
        <translation>Цветовая тема:</translation>
    </message>
    <message>
        <source>Dark</source>
        <translation>Тёмная</translation>
    </message>
    <message>
        <source>Light</source>
        <translation>Светлая</translation>
    </message>
</context>
<context>
    <name>KvWidthOptionsRow</name>
    <message>
        <source>W</source>
        <comment>short for width</comment>
        <translation>Ш</translation>
    </message>
    <message>
        <source>Width in percent</source>
        <translation>Ширина в процентах</translation>
    </message>
    <message>
        <source>Width in percent of the page&apos;s content</source>
        <translation>Ширина в процентах от содержимого страницы</translation>
    </message>
</context>
<context>
    <name>KvWindowTitleBar</name>
    <message>
        <source>Close</source>
        <translation>Закрыть</translation>
    </message>
</context>
<context>
    <name>StatReportingPlugin</name>
    <message>
        <source>Statistics tools</source>
        <translation>Отчёты и статистика</translation>
    </message>
    <message>
        <source>Select Template File</source>
        <translation>Выберите файл шаблона</translation>
    </message>
    <message>
        <source>Report Template File (*.rtp)</source>
        <translation>Файл шаблона отчёта (*.rtp)</translation>
    </message>
    <message>
        <source>No report template selected.</source>
        <translation>Шаблон отчёта не выбран.</translation>
    </message>
</context>
</TS>
