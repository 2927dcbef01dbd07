<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="ru_RU" sourcelanguage="en_US">
<context>
    <name>KvDeskActions</name>
    <message>
        <source>&amp;New session</source>
        <translation>&amp;Новый сеанс</translation>
    </message>
    <message>
        <source>Start an empty session</source>
        <translation>Начать пустой сеанс</translation>
    </message>
    <message>
        <source>Open &amp;image...</source>
        <translation>Открыть &amp;изображение...</translation>
    </message>
    <message>
        <source>Open image</source>
        <translation>Открыть изображение</translation>
    </message>
    <message>
        <source>&amp;Open session...</source>
        <translation>&amp;Открыть сеанс...</translation>
    </message>
    <message>
        <source>Open session</source>
        <translation>Открыть сеанс</translation>
    </message>
    <message>
        <source>Import &amp;table...</source>
        <translation>Импорт &amp;таблицы...</translation>
    </message>
    <message>
        <source>Import table of measured values</source>
        <translation>Импортировать таблицу измеренных значений</translation>
    </message>
    <message>
        <source>&amp;Save session</source>
        <translation>&amp;Сохранить сеанс</translation>
    </message>
    <message>
        <source>Save session</source>
        <translation>Сохранить сеанс</translation>
    </message>
    <message>
        <source>Save session &amp;as...</source>
        <translation>Сохранить сеанс &amp;как...</translation>
    </message>
    <message>
        <source>Save session to another file</source>
        <translation>Сохранить сеанс в другой файл</translation>
    </message>
    <message>
        <source>&amp;Quit</source>
        <translation>В&amp;ыход</translation>
    </message>
    <message>
        <source>Quit the program</source>
        <translation>Выйти из программы</translation>
    </message>
    <message>
        <source>Zoom &amp;in</source>
        <translation>У&amp;величить</translation>
    </message>
    <message>
        <source>Zoom in</source>
        <translation>Увеличить</translation>
    </message>
    <message>
        <source>Zoom &amp;out</source>
        <translation>У&amp;меньшить</translation>
    </message>
    <message>
        <source>Zoom out</source>
        <translation>Уменьшить</translation>
    </message>
    <message>
        <source>&amp;Fit to window</source>
        <translation>По размеру &amp;окна</translation>
    </message>
    <message>
        <source>Show the whole image</source>
        <translation>Показать изображение целиком</translation>
    </message>
    <message>
        <source>&amp;Actual size</source>
        <translation>&amp;Фактический размер</translation>
    </message>
    <message>
        <source>Show the image at 100 %</source>
        <translation>Показать изображение в масштабе 100 %</translation>
    </message>
    <message>
        <source>&amp;Measured values</source>
        <translation>&amp;Измеренные значения</translation>
    </message>
    <message>
        <source>Show or hide the measured values</source>
        <translation>Показать или скрыть измеренные значения</translation>
    </message>
    <message>
        <source>Stat&amp;us log</source>
        <translation>&amp;Журнал сообщений</translation>
    </message>
    <message>
        <source>Show or hide the status log</source>
        <translation>Показать или скрыть журнал сообщений</translation>
    </message>
    <message>
        <source>&amp;Dark or light theme</source>
        <translation>&amp;Тёмная или светлая тема</translation>
    </message>
    <message>
        <source>Change between the dark and the light theme</source>
        <translation>Переключить тёмную и светлую тему</translation>
    </message>
    <message>
        <source>Settin&amp;gs...</source>
        <translation>Н&amp;астройки...</translation>
    </message>
    <message>
        <source>Settings</source>
        <translation>Настройки</translation>
    </message>
    <message>
        <source>&amp;About Measuring Desk</source>
        <translation>&amp;О программе Measuring Desk</translation>
    </message>
    <message>
        <source>About Measuring Desk</source>
        <translation>О программе Measuring Desk</translation>
    </message>
    <message>
        <source>%1 (%2)</source>
        <comment>command (shortcut)</comment>
        <translation>%1 (%2)</translation>
    </message>
    <message>
        <source>&amp;Export measured values...</source>
        <translation>&amp;Экспорт измеренных значений...</translation>
    </message>
    <message>
        <source>Export measured values as a table</source>
        <translation>Экспортировать измеренные значения в виде таблицы</translation>
    </message>
    <message>
        <source>&amp;Undo</source>
        <translation>&amp;Отменить</translation>
    </message>
    <message>
        <source>Undo the last step</source>
        <translation>Отменить последнее действие</translation>
    </message>
    <message>
        <source>&amp;Redo</source>
        <translation>&amp;Повторить</translation>
    </message>
    <message>
        <source>Redo what was undone</source>
        <translation>Повторить отменённое действие</translation>
    </message>
    <message>
        <source>Cu&amp;t</source>
        <translation>Вы&amp;резать</translation>
    </message>
    <message>
        <source>Cut the selected objects</source>
        <translation>Вырезать выделенные объекты</translation>
    </message>
    <message>
        <source>&amp;Copy</source>
        <translation>&amp;Копировать</translation>
    </message>
    <message>
        <source>Copy the selected objects</source>
        <translation>Копировать выделенные объекты</translation>
    </message>
    <message>
        <source>&amp;Paste</source>
        <translation>&amp;Вставить</translation>
    </message>
    <message>
        <source>Paste copied objects</source>
        <translation>Вставить скопированные объекты</translation>
    </message>
    <message>
        <source>&amp;Delete</source>
        <translation>&amp;Удалить</translation>
    </message>
    <message>
        <source>Delete the selected objects</source>
        <translation>Удалить выделенные объекты</translation>
    </message>
    <message>
        <source>Select &amp;all</source>
        <translation>Выделить в&amp;сё</translation>
    </message>
    <message>
        <source>Select all objects on the image</source>
        <translation>Выделить все объекты на изображении</translation>
    </message>
    <message>
        <source>Re&amp;name</source>
        <translation>Переи&amp;меновать</translation>
    </message>
    <message>
        <source>Give the selected object a name</source>
        <translation>Задать имя выделенному объекту</translation>
    </message>
    <message>
        <source>&amp;Find measured values</source>
        <translation>&amp;Найти измеренные значения</translation>
    </message>
    <message>
        <source>Filter the measured values</source>
        <translation>Отфильтровать измеренные значения</translation>
    </message>
    <message>
        <source>&amp;Select</source>
        <translation>&amp;Выделение</translation>
    </message>
    <message>
        <source>Select and change objects</source>
        <translation>Выделять и изменять объекты</translation>
    </message>
    <message>
        <source>&amp;Line</source>
        <translation>&amp;Линия</translation>
    </message>
    <message>
        <source>Measure a length</source>
        <translation>Измерить длину</translation>
    </message>
    <message>
        <source>&amp;Polyline</source>
        <translation>Ло&amp;маная</translation>
    </message>
    <message>
        <source>Measure the length of a way</source>
        <translation>Измерить длину пути</translation>
    </message>
    <message>
        <source>Parallel &amp;distance</source>
        <translation>&amp;Расстояние до линии</translation>
    </message>
    <message>
        <source>Measure the distance of a point from a line</source>
        <translation>Измерить расстояние от точки до линии</translation>
    </message>
    <message>
        <source>&amp;Arc</source>
        <translation>&amp;Дуга</translation>
    </message>
    <message>
        <source>Measure an arc through three points</source>
        <translation>Измерить дугу по трём точкам</translation>
    </message>
    <message>
        <source>&amp;Circle</source>
        <translation>&amp;Окружность</translation>
    </message>
    <message>
        <source>Measure a circle</source>
        <translation>Измерить окружность</translation>
    </message>
    <message>
        <source>&amp;Rectangle</source>
        <translation>&amp;Прямоугольник</translation>
    </message>
    <message>
        <source>Measure a rectangle</source>
        <translation>Измерить прямоугольник</translation>
    </message>
    <message>
        <source>Poly&amp;gon</source>
        <translation>Мно&amp;гоугольник</translation>
    </message>
    <message>
        <source>Measure the area of a polygon</source>
        <translation>Измерить площадь многоугольника</translation>
    </message>
    <message>
        <source>Cou&amp;nter</source>
        <translation>&amp;Счётчик</translation>
    </message>
    <message>
        <source>Count by clicks</source>
        <translation>Подсчитывать щелчками мыши</translation>
    </message>
    <message>
        <source>&amp;Text note</source>
        <translation>&amp;Надпись</translation>
    </message>
    <message>
        <source>Write on the image</source>
        <translation>Сделать надпись на изображении</translation>
    </message>
    <message>
        <source>Scale &amp;bar</source>
        <translation>Мас&amp;штабный отрезок</translation>
    </message>
    <message>
        <source>Draw a scale bar</source>
        <translation>Нанести масштабный отрезок</translation>
    </message>
    <message>
        <source>Cal&amp;ibration...</source>
        <translation>&amp;Калибровка...</translation>
    </message>
    <message>
        <source>Say how large a pixel of the image is</source>
        <translation>Указать размер пикселя изображения</translation>
    </message>
    <message>
        <source>Use the file&apos;s pixel size</source>
        <translation>Взять размер пикселя из файла</translation>
    </message>
    <message>
        <source>Measure with the pixel size that the image&apos;s file states</source>
        <translation>Измерять с размером пикселя, указанным в файле изображения</translation>
    </message>
    <message>
        <source>&amp;Take snapshot</source>
        <translation>Сделать с&amp;нимок</translation>
    </message>
    <message>
        <source>Save the image to the gallery</source>
        <translation>Сохранить изображение в галерею</translation>
    </message>
    <message>
        <source>Snapshots &amp;with measurements</source>
        <translation>Снимки с из&amp;мерениями</translation>
    </message>
    <message>
        <source>Draw the measured objects on snapshots</source>
        <translation>Наносить измеренные объекты на снимки</translation>
    </message>
    <message>
        <source>&amp;Freeze</source>
        <translation>&amp;Стоп-кадр</translation>
    </message>
    <message>
        <source>Freeze the live image</source>
        <translation>Зафиксировать текущий кадр живого изображения</translation>
    </message>
    <message>
        <source>&amp;Labels on the image</source>
        <translation>&amp;Подписи на изображении</translation>
    </message>
    <message>
        <source>Show or hide the labels of objects</source>
        <translation>Показать или скрыть подписи объектов</translation>
    </message>
    <message>
        <source>&amp;Rulers</source>
        <translation>&amp;Линейки</translation>
    </message>
    <message>
        <source>Show or hide the rulers</source>
        <translation>Показать или скрыть линейки</translation>
    </message>
    <message>
        <source>&amp;Scale bar on the image</source>
        <translation>Мас&amp;штабный отрезок на изображении</translation>
    </message>
    <message>
        <source>Show or hide the scale bar, on reports, too</source>
        <translation>Показать или скрыть масштабный отрезок, в том числе в отчётах</translation>
    </message>
    <message>
        <source>&amp;Gallery</source>
        <translation>&amp;Галерея</translation>
    </message>
    <message>
        <source>Show or hide the gallery</source>
        <translation>Показать или скрыть галерею</translation>
    </message>
    <message>
        <source>&amp;Start page</source>
        <translation>&amp;Начальная страница</translation>
    </message>
    <message>
        <source>Show the first steps, the examples and the recent sessions</source>
        <translation>Показать первые шаги, примеры и недавние сеансы</translation>
    </message>
    <message>
        <source>&amp;User guide</source>
        <translation>&amp;Руководство пользователя</translation>
    </message>
    <message>
        <source>Read the user guide</source>
        <translation>Открыть руководство пользователя</translation>
    </message>
</context>
<context>
    <name>KvDeskAutosave</name>
    <message>
        <source>the folder &quot;%1&quot; cannot be written</source>
        <translation>запись в папку «%1» невозможна</translation>
    </message>
    <message>
        <source>Unsaved changes are not being copied: %1</source>
        <translation>Резервная копия несохранённых изменений не создаётся: %1</translation>
    </message>
</context>
<context>
    <name>KvDeskCalibrationCommands</name>
    <message>
        <source>The session measures with it already</source>
        <translation>Сеанс уже использует этот размер</translation>
    </message>
    <message>
        <source>The image&apos;s file does not state one</source>
        <translation>В файле изображения он не указан</translation>
    </message>
</context>
<context>
    <name>KvDeskCalibrationDialog</name>
    <message>
        <source>Calibration</source>
        <translation>Калибровка</translation>
    </message>
    <message>
        <source>Objective</source>
        <translation>Объектив</translation>
    </message>
    <message>
        <source>Choose an objective, or type the name of a new one</source>
        <translation>Выберите объектив или введите название нового</translation>
    </message>
    <message>
        <source>Such as 10x</source>
        <translation>Например, 10x</translation>
    </message>
    <message>
        <source>In use</source>
        <translation>Действует</translation>
    </message>
    <message>
        <source>New calibration</source>
        <translation>Новая калибровка</translation>
    </message>
    <message>
        <source>Known distance</source>
        <translation>Известная длина</translation>
    </message>
    <message>
        <source>Image file</source>
        <translation>Файл изображения</translation>
    </message>
    <message>
        <source>Typed</source>
        <translation>Вручную</translation>
    </message>
    <message>
        <source>Name</source>
        <translation>Название</translation>
    </message>
    <message>
        <source>Who</source>
        <translation>Выполнил</translation>
    </message>
    <message>
        <source>Note</source>
        <translation>Примечание</translation>
    </message>
    <message>
        <source>Calibrate</source>
        <translation>Калибровать</translation>
    </message>
    <message>
        <source>History of the objective</source>
        <translation>История калибровок объектива</translation>
    </message>
    <message>
        <source>Calibrations of this objective appear here</source>
        <translation>Здесь появятся калибровки этого объектива</translation>
    </message>
    <message>
        <source>Use again</source>
        <translation>Применить снова</translation>
    </message>
    <message>
        <source>Close</source>
        <translation>Закрыть</translation>
    </message>
    <message>
        <source>New pixel size: %1</source>
        <translation>Новый размер пикселя: %1</translation>
    </message>
    <message>
        <source>No pixel size yet</source>
        <translation>Размер пикселя не задан</translation>
    </message>
    <message>
        <source>Measure with this pixel size and remember it</source>
        <translation>Измерять с этим размером пикселя и запомнить его</translation>
    </message>
    <message>
        <source>Complete the fields above first</source>
        <translation>Сначала заполните поля выше</translation>
    </message>
    <message>
        <source>Measure with the selected calibration</source>
        <translation>Измерять с выделенной калибровкой</translation>
    </message>
    <message>
        <source>Select a calibration in the table first</source>
        <translation>Сначала выделите калибровку в таблице</translation>
    </message>
</context>
<context>
    <name>KvDeskCalibrationHistory</name>
    <message>
        <source>Date</source>
        <translation>Дата</translation>
    </message>
    <message>
        <source>Who</source>
        <translation>Выполнил</translation>
    </message>
    <message>
        <source>Pixel size</source>
        <translation>Размер пикселя</translation>
    </message>
    <message>
        <source>Origin</source>
        <translation>Способ</translation>
    </message>
    <message>
        <source>Name</source>
        <translation>Название</translation>
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
        <translation>Известная длина</translation>
    </message>
    <message>
        <source>Image file</source>
        <translation>Файл изображения</translation>
    </message>
    <message>
        <source>Typed</source>
        <translation>Вручную</translation>
    </message>
    <message>
        <source>Not calibrated</source>
        <translation>Не откалибровано</translation>
    </message>
</context>
<context>
    <name>KvDeskCalibrationWay</name>
    <message>
        <source>Type a number such as 5.3 or 5,3</source>
        <translation>Введите число, например 5.3 или 5,3</translation>
    </message>
    <message>
        <source>A pixel measures between %1 and %2</source>
        <translation>Размер пикселя — от %1 до %2</translation>
    </message>
</context>
<context>
    <name>KvDeskCalibrator</name>
    <message>
        <source>%1 states pixels of %2; the session measures with %3</source>
        <translation>%1: указан размер пикселя %2; сеанс использует %3</translation>
    </message>
    <message>
        <source>%1 states pixels of %2; the session measures in pixels</source>
        <translation>%1: указан размер пикселя %2; в сеансе измерения ведутся в пикселях</translation>
    </message>
    <message>
        <source>Calibrated: %1, %2 per pixel</source>
        <extracomment>%1 is an objective or a file, %2 the size of a pixel with its unit</extracomment>
        <translation>Откалибровано: %1, %2 на пиксель</translation>
    </message>
</context>
<context>
    <name>KvDeskCommandLine</name>
    <message>
        <source>There is no theme &quot;%1&quot;: use %2</source>
        <translation>Темы «%1» нет; допустимые значения: %2</translation>
    </message>
    <message>
        <source> or </source>
        <translation> или </translation>
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
        <translation>Использование: measuringdesk [ПАРАМЕТР...] [СЕАНС|ИЗОБРАЖЕНИЕ|ТАБЛИЦА|ПАПКА|ВИДЕО...]
Измеряет объекты на изображениях и показывает их значения.

  --session ФАЙЛ      открыть сеанс
  --image ФАЙЛ        открыть изображение
  --table ФАЙЛ        импортировать таблицу измеренных значений
  --theme Dark|Light  тема на время этого запуска
  --plugins ПАПКА     искать подключаемые модули и здесь; можно указать несколько раз
  --help              показать этот текст
  --version           показать версию

Переменная среды STATREPORT_PLUGINS задаёт дополнительные папки с подключаемыми модулями.
</translation>
    </message>
    <message>
        <source>%1 (measuringdesk --help tells more)</source>
        <translation>%1 (подробнее: measuringdesk --help)</translation>
    </message>
</context>
<context>
    <name>KvDeskCounterBar</name>
    <message>
        <source>Clicks count for</source>
        <translation>Щелчки считает</translation>
    </message>
    <message>
        <source>The counter that gets the clicks (1 to 9)</source>
        <translation>Счётчик, которому засчитываются щелчки (клавиши 1–9)</translation>
    </message>
    <message>
        <source>Count another class</source>
        <translation>Считать ещё один класс</translation>
    </message>
    <message>
        <source>A right click takes a place away</source>
        <translation>Щелчок правой кнопкой удаляет метку</translation>
    </message>
    <message>
        <source>A new counter</source>
        <translation>Новый счётчик</translation>
    </message>
</context>
<context>
    <name>KvDeskEditCommands</name>
    <message>
        <source>&amp;Undo %1</source>
        <extracomment>%1 is what is undone or redone, such as &quot;move of Line 3&quot;</extracomment>
        <translation>&amp;Отменить %1</translation>
    </message>
    <message>
        <source>&amp;Undo</source>
        <translation>&amp;Отменить</translation>
    </message>
    <message>
        <source>&amp;Redo %1</source>
        <translation>&amp;Повторить %1</translation>
    </message>
    <message>
        <source>&amp;Redo</source>
        <translation>&amp;Повторить</translation>
    </message>
    <message>
        <source>Nothing was done yet</source>
        <translation>Ещё ничего не сделано</translation>
    </message>
    <message>
        <source>Nothing was undone</source>
        <translation>Ничего не отменено</translation>
    </message>
    <message>
        <source>Select an object first</source>
        <translation>Сначала выделите объект</translation>
    </message>
    <message>
        <source>Select one object first</source>
        <translation>Сначала выделите один объект</translation>
    </message>
    <message>
        <source>No measured objects were copied</source>
        <translation>Нет скопированных измеренных объектов</translation>
    </message>
    <message>
        <source>Finish or cancel what you have begun first</source>
        <translation>Сначала завершите или отмените начатое</translation>
    </message>
</context>
<context>
    <name>KvDeskExamples</name>
    <message>
        <source>Coin: first length</source>
        <translation>Монета: первая длина</translation>
    </message>
    <message>
        <source>Plate: dimensions</source>
        <translation>Пластина: размеры</translation>
    </message>
    <message>
        <source>Cells: counting</source>
        <translation>Клетки: подсчёт</translation>
    </message>
    <message>
        <source>Fibres: statistics</source>
        <translation>Волокна: статистика</translation>
    </message>
</context>
<context>
    <name>KvDeskExportCommand</name>
    <message>
        <source>Nothing was measured yet</source>
        <translation>Ещё ничего не измерено</translation>
    </message>
    <message>
        <source>Measured values</source>
        <comment>file name</comment>
        <translation>Измеренные значения</translation>
    </message>
    <message>
        <source>JSON files</source>
        <translation>Файлы JSON</translation>
    </message>
    <message>
        <source>CSV tables</source>
        <translation>Таблицы CSV</translation>
    </message>
    <message>
        <source>Export measured values</source>
        <translation>Экспорт измеренных значений</translation>
    </message>
    <message>
        <source>Export cancelled: %1</source>
        <translation>Экспорт отменён: %1</translation>
    </message>
    <message>
        <source>The table &quot;%1&quot; was not written.</source>
        <translation>Таблица «%1» не записана.</translation>
    </message>
    <message>
        <source>Measured values exported: %1</source>
        <translation>Измеренные значения экспортированы: %1</translation>
    </message>
    <message>
        <source>Exporting measured values</source>
        <translation>Экспорт измеренных значений</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Отмена</translation>
    </message>
</context>
<context>
    <name>KvDeskExportDialog</name>
    <message>
        <source>Export measured values</source>
        <translation>Экспорт измеренных значений</translation>
    </message>
    <message>
        <source>Table</source>
        <translation>Таблица</translation>
    </message>
    <message>
        <source>Numbers</source>
        <translation>Числа</translation>
    </message>
    <message>
        <source>Byte order mark, for spreadsheets that do not expect UTF-8</source>
        <translation>Метка порядка байтов (BOM) для табличных редакторов, не ожидающих UTF-8</translation>
    </message>
    <message>
        <source>Apostrophe before names that spreadsheets take for formulas</source>
        <translation>Апостроф перед именами, которые табличные редакторы принимают за формулы</translation>
    </message>
    <message>
        <source>Changes names that begin with =, +, - or @: they are others when the table is imported again</source>
        <translation>Изменяет имена, начинающиеся с =, +, - или @: при обратном импорте таблицы они будут отличаться от исходных</translation>
    </message>
    <message>
        <source>Export...</source>
        <translation>Экспорт...</translation>
    </message>
    <message>
        <source>CSV, one row per value</source>
        <translation>CSV, по строке на значение</translation>
    </message>
    <message>
        <source>CSV, one row per object</source>
        <translation>CSV, по строке на объект</translation>
    </message>
    <message>
        <source>JSON</source>
        <translation>JSON</translation>
    </message>
    <message>
        <source>1.5, commas between the fields</source>
        <translation>1.5, поля через запятую</translation>
    </message>
    <message>
        <source>1,5, semicolons between the fields (spreadsheets, %1)</source>
        <extracomment>%1 is the name of a language</extracomment>
        <translation>1,5, поля через точку с запятой (табличные редакторы, %1)</translation>
    </message>
    <message>
        <source>1.5, commas between the fields (spreadsheets, %1)</source>
        <translation>1.5, поля через запятую (табличные редакторы, %1)</translation>
    </message>
    <message>
        <source>For statistics programs. Can be imported here again.</source>
        <translation>Для программ статистики. Такую таблицу можно снова импортировать.</translation>
    </message>
    <message>
        <source>For spreadsheets. Headings name the units.</source>
        <translation>Для табличных редакторов. Единицы указаны в заголовках.</translation>
    </message>
    <message>
        <source>For programs. Numbers always have a decimal point.</source>
        <translation>Для программ. В числах всегда десятичная точка.</translation>
    </message>
    <message>
        <source>No measured object is selected</source>
        <translation>Не выделен ни один измеренный объект</translation>
    </message>
    <message>
        <source>Concerns CSV tables only</source>
        <translation>Относится только к таблицам CSV</translation>
    </message>
    <message numerus="yes">
        <source>Only the selected object(s) (%n)</source>
        <translation>
            <numerusform>Только выделенные объекты (%n)</numerusform>
            <numerusform>Только выделенные объекты (%n)</numerusform>
            <numerusform>Только выделенные объекты (%n)</numerusform>
        </translation>
    </message>
</context>
<context>
    <name>KvDeskExposureControl</name>
    <message>
        <source>E&amp;xposure</source>
        <translation>&amp;Экспозиция</translation>
    </message>
    <message>
        <source>Exposure time of the camera</source>
        <translation>Время экспозиции камеры</translation>
    </message>
    <message>
        <source> ms</source>
        <comment>milliseconds</comment>
        <translation> мс</translation>
    </message>
</context>
<context>
    <name>KvDeskFileCommands</name>
    <message>
        <source>Sessions</source>
        <translation>Сеансы</translation>
    </message>
    <message>
        <source>All files</source>
        <translation>Все файлы</translation>
    </message>
    <message>
        <source>Unsaved changes</source>
        <translation>Несохранённые изменения</translation>
    </message>
    <message>
        <source>Save the changes to &quot;%1&quot;?</source>
        <translation>Сохранить изменения в «%1»?</translation>
    </message>
    <message>
        <source>The session &quot;%1&quot; was not opened.</source>
        <translation>Сеанс «%1» не открыт.</translation>
    </message>
    <message>
        <source>Image missing</source>
        <translation>Нет изображения</translation>
    </message>
    <message>
        <source>Open the session without its image?</source>
        <translation>Открыть сеанс без изображения?</translation>
    </message>
    <message>
        <source>The image &quot;%1&quot; was not opened.</source>
        <translation>Изображение «%1» не открыто.</translation>
    </message>
    <message>
        <source>Image opened: %1</source>
        <translation>Изображение открыто: %1</translation>
    </message>
    <message>
        <source>The table &quot;%1&quot; was not imported.</source>
        <translation>Таблица «%1» не импортирована.</translation>
    </message>
    <message>
        <source>%1: %2</source>
        <comment>file, remark</comment>
        <translation>%1: %2</translation>
    </message>
    <message>
        <source>The session &quot;%1&quot; was not saved.</source>
        <translation>Сеанс «%1» не сохранён.</translation>
    </message>
    <message>
        <source>Session saved: %1</source>
        <translation>Сеанс сохранён: %1</translation>
    </message>
    <message>
        <source>Open session</source>
        <translation>Открыть сеанс</translation>
    </message>
    <message>
        <source>Open image</source>
        <translation>Открыть изображение</translation>
    </message>
    <message>
        <source>Images</source>
        <translation>Изображения</translation>
    </message>
    <message>
        <source>Import table</source>
        <translation>Импорт таблицы</translation>
    </message>
    <message>
        <source>Tables</source>
        <translation>Таблицы</translation>
    </message>
    <message>
        <source>Save session</source>
        <translation>Сохранить сеанс</translation>
    </message>
    <message>
        <source>Measuring Desk</source>
        <translation>Measuring Desk</translation>
    </message>
    <message>
        <source>Only one session can be open; not opened: %1</source>
        <translation>Открытым может быть только один сеанс; не открыто: %1</translation>
    </message>
    <message>
        <source>Neither a session, an image nor a table: %1</source>
        <translation>Это не сеанс, не изображение и не таблица: %1</translation>
    </message>
    <message>
        <source>There is not enough memory</source>
        <translation>Недостаточно памяти</translation>
    </message>
    <message>
        <source>Opening &quot;%1&quot;</source>
        <translation>Открытие «%1»</translation>
    </message>
    <message>
        <source>The measurements were not restored.</source>
        <translation>Измерения не восстановлены.</translation>
    </message>
    <message>
        <source>Restoring measurements</source>
        <translation>Восстановление измерений</translation>
    </message>
    <message>
        <source>Importing &quot;%1&quot;</source>
        <translation>Импорт «%1»</translation>
    </message>
    <message>
        <source>Saving &quot;%1&quot;</source>
        <translation>Сохранение «%1»</translation>
    </message>
    <message>
        <source>Session changed by another program</source>
        <translation>Сеанс изменён другой программой</translation>
    </message>
    <message>
        <source>&quot;%1&quot; was changed by another program. Overwrite its changes?</source>
        <translation>«%1» изменён другой программой. Перезаписать её изменения?</translation>
    </message>
    <message>
        <source>Overwrite</source>
        <translation>Перезаписать</translation>
    </message>
    <message>
        <source>Save as...</source>
        <translation>Сохранить как...</translation>
    </message>
    <message numerus="yes">
        <source>%n files were not opened.</source>
        <extracomment>%n is 2 at least</extracomment>
        <translation>
            <numerusform>Не открыт %n файл.</numerusform>
            <numerusform>Не открыто %n файла.</numerusform>
            <numerusform>Не открыто %n файлов.</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Session opened: %1 (%n object(s))</source>
        <translation>
            <numerusform>Сеанс открыт: %1 (%n объект)</numerusform>
            <numerusform>Сеанс открыт: %1 (%n объекта)</numerusform>
            <numerusform>Сеанс открыт: %1 (%n объектов)</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Measurements restored: %1 (%n object(s))</source>
        <translation>
            <numerusform>Измерения восстановлены: %1 (%n объект)</numerusform>
            <numerusform>Измерения восстановлены: %1 (%n объекта)</numerusform>
            <numerusform>Измерения восстановлены: %1 (%n объектов)</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Table imported: %1 (%n object(s))</source>
        <translation>
            <numerusform>Таблица импортирована: %1 (%n объект)</numerusform>
            <numerusform>Таблица импортирована: %1 (%n объекта)</numerusform>
            <numerusform>Таблица импортирована: %1 (%n объектов)</numerusform>
        </translation>
    </message>
</context>
<context>
    <name>KvDeskFilePixelSize</name>
    <message>
        <source>%1 states pixels of %2.</source>
        <comment>file, size</comment>
        <translation>%1: указан размер пикселя %2.</translation>
    </message>
    <message>
        <source>The image&apos;s file does not state how large its pixels are.</source>
        <translation>В файле изображения не указан размер пикселя.</translation>
    </message>
</context>
<context>
    <name>KvDeskGallery</name>
    <message>
        <source>Gallery</source>
        <translation>Галерея</translation>
    </message>
    <message>
        <source>Hide the gallery</source>
        <translation>Скрыть галерею</translation>
    </message>
    <message>
        <source>&amp;Open image</source>
        <translation>&amp;Открыть изображение</translation>
    </message>
    <message>
        <source>&amp;Show in folder</source>
        <translation>&amp;Показать в папке</translation>
    </message>
    <message>
        <source>&amp;Copy path</source>
        <translation>&amp;Копировать путь</translation>
    </message>
    <message>
        <source>&amp;Move to trash...</source>
        <translation>Переместить в кор&amp;зину...</translation>
    </message>
    <message>
        <source>Choose &amp;folder...</source>
        <translation>&amp;Выбрать папку...</translation>
    </message>
    <message>
        <source>Show the images of a folder</source>
        <translation>Показать изображения из папки</translation>
    </message>
    <message>
        <source>Save s&amp;napshots in this folder</source>
        <translation>Сохранять с&amp;нимки в этой папке</translation>
    </message>
    <message>
        <source>Folder of the gallery</source>
        <translation>Папка галереи</translation>
    </message>
    <message>
        <source>More commands of the gallery</source>
        <translation>Другие команды галереи</translation>
    </message>
    <message>
        <source>Snapshots</source>
        <translation>Снимки</translation>
    </message>
    <message>
        <source>Choose folder</source>
        <translation>Выберите папку</translation>
    </message>
    <message>
        <source>Snapshots are saved in %1</source>
        <translation>Снимки сохраняются в %1</translation>
    </message>
    <message>
        <source>Snapshots (%1) and the images of a folder appear here; drag them onto report pages</source>
        <translation>Здесь появятся снимки (%1) и изображения из папки; перетаскивайте их на страницы отчёта</translation>
    </message>
    <message>
        <source>There are no images in %1</source>
        <translation>В %1 нет изображений</translation>
    </message>
    <message>
        <source>The folder %1 does not exist</source>
        <translation>Папка %1 не существует</translation>
    </message>
    <message>
        <source>Select an image first</source>
        <translation>Сначала выделите изображение</translation>
    </message>
    <message>
        <source>Snapshots are saved in this folder already</source>
        <translation>Снимки уже сохраняются в этой папке</translation>
    </message>
    <message>
        <source>Move &quot;%1&quot; to the trash?</source>
        <translation>Переместить «%1» в корзину?</translation>
    </message>
    <message>
        <source>Move to trash</source>
        <translation>Переместить в корзину</translation>
    </message>
    <message>
        <source>Moved to the trash: %1</source>
        <translation>Перемещено в корзину: %1</translation>
    </message>
    <message>
        <source>Not moved to the trash: %1</source>
        <translation>Не перемещено в корзину: %1</translation>
    </message>
    <message>
        <source>Measuring Desk</source>
        <translation>Measuring Desk</translation>
    </message>
    <message>
        <source>The files are still there. They are write-protected, or there is no trash for them.</source>
        <translation>Файлы остались на месте. Они защищены от записи, или для них нет корзины.</translation>
    </message>
    <message numerus="yes">
        <source>Move %n selected image(s) to the trash?</source>
        <translation>
            <numerusform>Переместить %n выделенное изображение в корзину?</numerusform>
            <numerusform>Переместить %n выделенных изображения в корзину?</numerusform>
            <numerusform>Переместить %n выделенных изображений в корзину?</numerusform>
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
        <translation>Галерея</translation>
    </message>
</context>
<context>
    <name>KvDeskGuideCommand</name>
    <message>
        <source>The user guide is not installed</source>
        <translation>Руководство пользователя не установлено</translation>
    </message>
</context>
<context>
    <name>KvDeskGuideWindow</name>
    <message>
        <source>User guide</source>
        <translation>Руководство пользователя</translation>
    </message>
    <message>
        <source>Contents</source>
        <translation>Содержание</translation>
    </message>
    <message>
        <source>Back</source>
        <translation>Назад</translation>
    </message>
    <message>
        <source>Forward</source>
        <translation>Вперёд</translation>
    </message>
    <message>
        <source>Find in the guide</source>
        <translation>Найти в руководстве</translation>
    </message>
    <message>
        <source>Find previous</source>
        <translation>Найти предыдущее</translation>
    </message>
    <message>
        <source>Find next</source>
        <translation>Найти следующее</translation>
    </message>
    <message>
        <source>This is the first place</source>
        <translation>Это первое из просмотренных мест</translation>
    </message>
    <message>
        <source>This is the last place</source>
        <translation>Это последнее из просмотренных мест</translation>
    </message>
    <message>
        <source>Not found</source>
        <translation>Не найдено</translation>
    </message>
    <message>
        <source>Type what to find first</source>
        <translation>Сначала введите текст для поиска</translation>
    </message>
</context>
<context>
    <name>KvDeskImageView</name>
    <message>
        <source>Image</source>
        <translation>Изображение</translation>
    </message>
    <message>
        <source>Open an image or a session to start</source>
        <translation>Для начала откройте изображение или сеанс</translation>
    </message>
</context>
<context>
    <name>KvDeskInlineEditor</name>
    <message>
        <source>Text</source>
        <translation>Текст</translation>
    </message>
    <message>
        <source>Name</source>
        <translation>Имя</translation>
    </message>
</context>
<context>
    <name>KvDeskKnownDistance</name>
    <message>
        <source>inch</source>
        <translation>дюйм</translation>
    </message>
    <message>
        <source>Use selected line</source>
        <translation>Взять выделенную линию</translation>
    </message>
    <message>
        <source>Length of the line</source>
        <translation>Длина линии</translation>
    </message>
    <message>
        <source>Unit of the length</source>
        <translation>Единица длины</translation>
    </message>
    <message>
        <source>Its length</source>
        <translation>Её длина</translation>
    </message>
    <message>
        <source>Draw a line over a distance that you know, such as on a stage micrometer, and select it.</source>
        <translation>Проведите линию вдоль отрезка известной длины, например по шкале объект-микрометра, и выделите её.</translation>
    </message>
    <message>
        <source>No line yet</source>
        <translation>Линии пока нет</translation>
    </message>
    <message>
        <source>%1: %2</source>
        <comment>name and length of a line</comment>
        <translation>%1: %2</translation>
    </message>
    <message>
        <source>Take the selected line as the known distance</source>
        <translation>Взять выделенную линию как известную длину</translation>
    </message>
    <message>
        <source>Select one line on the image first</source>
        <translation>Сначала выделите одну линию на изображении</translation>
    </message>
</context>
<context>
    <name>KvDeskLiveBar</name>
    <message>
        <source>Live image</source>
        <translation>Живое изображение</translation>
    </message>
    <message>
        <source>Freeze</source>
        <translation>Стоп-кадр</translation>
    </message>
    <message>
        <source>%1 fps</source>
        <extracomment>frames per second</extracomment>
        <translation>%1 кадр/с</translation>
    </message>
    <message>
        <source>%1 delivers no pictures any more; this is the last one</source>
        <translation>%1 больше не передаёт кадры; показан последний</translation>
    </message>
    <message>
        <source>%1 delivers no pictures</source>
        <translation>%1 не передаёт кадры</translation>
    </message>
    <message>
        <source>%1 is stopped</source>
        <translation>%1: остановлено</translation>
    </message>
    <message>
        <source>Waiting for the first picture of %1</source>
        <translation>Ожидание первого кадра: %1</translation>
    </message>
    <message>
        <source>Frozen: %1</source>
        <translation>Стоп-кадр: %1</translation>
    </message>
    <message>
        <source>Live: %1</source>
        <translation>Живое изображение: %1</translation>
    </message>
    <message>
        <source>This image is not live</source>
        <translation>Это не живое изображение</translation>
    </message>
    <message>
        <source>&amp;Reconnect</source>
        <translation>Переп&amp;одключить</translation>
    </message>
    <message>
        <source>&amp;Start</source>
        <translation>Зап&amp;устить</translation>
    </message>
    <message>
        <source>Frames per second
Dropped, because newer ones came first: %1</source>
        <translation>Кадров в секунду
Пропущено из-за поступления более новых: %1</translation>
    </message>
    <message>
        <source>Stop the live image; other programs can use the camera then</source>
        <translation>Остановить живое изображение; после этого камеру смогут использовать другие программы</translation>
    </message>
</context>
<context>
    <name>KvDeskMainWindow</name>
    <message>
        <source>&amp;File</source>
        <translation>&amp;Файл</translation>
    </message>
    <message>
        <source>&amp;Recent sessions</source>
        <translation>Не&amp;давние сеансы</translation>
    </message>
    <message>
        <source>&amp;View</source>
        <translation>&amp;Вид</translation>
    </message>
    <message>
        <source>&amp;Help</source>
        <translation>&amp;Справка</translation>
    </message>
    <message>
        <source>Main tool bar</source>
        <translation>Главная панель инструментов</translation>
    </message>
    <message>
        <source>%1[*] - Measuring Desk</source>
        <extracomment>%1 is the name of a session; [*] is replaced by a star when it has unsaved changes</extracomment>
        <translation>%1[*] - Measuring Desk</translation>
    </message>
    <message>
        <source>None yet</source>
        <translation>Пока нет</translation>
    </message>
    <message>
        <source>About Measuring Desk</source>
        <translation>О программе Measuring Desk</translation>
    </message>
    <message>
        <source>&lt;b&gt;Measuring Desk %1&lt;/b&gt;&lt;p&gt;Measures objects on images, and hosts plug-ins such as the statistics reports.&lt;/p&gt;&lt;p&gt;%2, MIT licence&lt;/p&gt;</source>
        <translation>&lt;b&gt;Measuring Desk %1&lt;/b&gt;&lt;p&gt;Измеряет объекты на изображениях и служит основой для подключаемых модулей, например отчётов со статистикой.&lt;/p&gt;&lt;p&gt;%2, лицензия MIT&lt;/p&gt;</translation>
    </message>
    <message>
        <source>Measuring Desk</source>
        <translation>Measuring Desk</translation>
    </message>
    <message>
        <source>&amp;Edit</source>
        <translation>&amp;Правка</translation>
    </message>
    <message>
        <source>&amp;Image</source>
        <translation>&amp;Изображение</translation>
    </message>
    <message>
        <source>&amp;Measure</source>
        <translation>И&amp;змерение</translation>
    </message>
    <message>
        <source>Choose the image source</source>
        <translation>Выбрать источник изображения</translation>
    </message>
</context>
<context>
    <name>KvDeskNotice</name>
    <message>
        <source>Close this message</source>
        <translation>Закрыть это сообщение</translation>
    </message>
</context>
<context>
    <name>KvDeskObjectClipboard</name>
    <message>
        <source>Type</source>
        <translation>Тип</translation>
    </message>
    <message>
        <source>Object</source>
        <translation>Объект</translation>
    </message>
    <message>
        <source>Value name</source>
        <translation>Величина</translation>
    </message>
    <message>
        <source>Value</source>
        <translation>Значение</translation>
    </message>
</context>
<context>
    <name>KvDeskObjectEditor</name>
    <message numerus="yes">
        <source>%n objects</source>
        <comment>several measured objects</comment>
        <extracomment>%n is 2 at least</extracomment>
        <translation>
            <numerusform>%n объект</numerusform>
            <numerusform>%n объекта</numerusform>
            <numerusform>%n объектов</numerusform>
        </translation>
    </message>
    <message>
        <source>drawing of %1</source>
        <translation>рисование: %1</translation>
    </message>
    <message>
        <source>change of %1</source>
        <translation>изменение: %1</translation>
    </message>
    <message>
        <source>move of %1</source>
        <translation>перемещение: %1</translation>
    </message>
    <message>
        <source>renaming of %1</source>
        <translation>переименование: %1</translation>
    </message>
    <message>
        <source>text of %1</source>
        <translation>изменение текста: %1</translation>
    </message>
    <message>
        <source>showing of %1 of %2</source>
        <extracomment>%1 is a value, %2 an object</extracomment>
        <translation>показ значения «%1»: %2</translation>
    </message>
    <message>
        <source>hiding of %1 of %2</source>
        <translation>скрытие значения «%1»: %2</translation>
    </message>
    <message>
        <source>deletion of %1</source>
        <translation>удаление: %1</translation>
    </message>
    <message>
        <source>change of the calibration</source>
        <translation>изменение калибровки</translation>
    </message>
    <message>
        <source>place of %1</source>
        <translation>добавление метки: %1</translation>
    </message>
    <message>
        <source>deletion of a place of %1</source>
        <translation>удаление метки: %1</translation>
    </message>
    <message>
        <source>pasting of %1</source>
        <translation>вставку: %1</translation>
    </message>
    <message>
        <source>import of %1</source>
        <translation>импорт %1</translation>
    </message>
</context>
<context>
    <name>KvDeskPlugins</name>
    <message>
        <source>No plug-ins were found</source>
        <translation>Подключаемые модули не найдены</translation>
    </message>
    <message>
        <source>It is no plug-in for this program</source>
        <translation>Это не подключаемый модуль для этой программы</translation>
    </message>
    <message>
        <source>Its tools &quot;%1&quot; could not be started</source>
        <translation>Не удалось запустить его инструменты «%1»</translation>
    </message>
    <message>
        <source>Plug-in loaded: %1</source>
        <translation>Модуль загружен: %1</translation>
    </message>
    <message>
        <source>Plug-in not loaded: %1: %2</source>
        <translation>Модуль не загружен: %1: %2</translation>
    </message>
    <message>
        <source>It failed: %1</source>
        <translation>Сбой: %1</translation>
    </message>
    <message>
        <source>It failed for a reason of its own</source>
        <translation>Сбой по неизвестной причине</translation>
    </message>
</context>
<context>
    <name>KvDeskProgress</name>
    <message>
        <source>Cancel</source>
        <translation>Отмена</translation>
    </message>
    <message>
        <source>Leave everything as it was (Esc)</source>
        <translation>Оставить всё как было (Esc)</translation>
    </message>
    <message>
        <source>This can no longer be cancelled</source>
        <translation>Отменить уже нельзя</translation>
    </message>
</context>
<context>
    <name>KvDeskRecovery</name>
    <message>
        <source>Untitled session</source>
        <translation>Безымянный сеанс</translation>
    </message>
    <message numerus="yes">
        <source>%1 (%n object(s))</source>
        <extracomment>%1 is the name of a session</extracomment>
        <translation>
            <numerusform>%1 (%n объект)</numerusform>
            <numerusform>%1 (%n объекта)</numerusform>
            <numerusform>%1 (%n объектов)</numerusform>
        </translation>
    </message>
</context>
<context>
    <name>KvDeskRecoveryBar</name>
    <message>
        <source>Show other measurements that were not saved</source>
        <translation>Показать другие несохранённые измерения</translation>
    </message>
    <message>
        <source>Restore</source>
        <translation>Восстановить</translation>
    </message>
    <message>
        <source>Open these measurements as a session with unsaved changes</source>
        <translation>Открыть эти измерения как сеанс с несохранёнными изменениями</translation>
    </message>
    <message>
        <source>Discard</source>
        <translation>Удалить</translation>
    </message>
    <message>
        <source>Delete these measurements for good</source>
        <translation>Удалить эти измерения безвозвратно</translation>
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
            <numerusform>Ещё %n</numerusform>
            <numerusform>Ещё %n</numerusform>
            <numerusform>Ещё %n</numerusform>
        </translation>
    </message>
    <message>
        <source>Measurements from %1 were not saved.</source>
        <translation>Измерения (%1) не были сохранены.</translation>
    </message>
</context>
<context>
    <name>KvDeskRuler</name>
    <message>
        <source>Horizontal ruler</source>
        <translation>Горизонтальная линейка</translation>
    </message>
    <message>
        <source>Vertical ruler</source>
        <translation>Вертикальная линейка</translation>
    </message>
    <message>
        <source>Ruler in %1</source>
        <translation>Линейка (%1)</translation>
    </message>
</context>
<context>
    <name>KvDeskSelectionStatistics</name>
    <message>
        <source>n = %1, mean %2, SD %3, min %4, max %5</source>
        <extracomment>number of values, their mean, standard deviation, smallest and largest one</extracomment>
        <translation>n = %1, среднее %2, СКО %3, мин. %4, макс. %5</translation>
    </message>
    <message>
        <source>Selected values: %1</source>
        <translation>Выделено значений: %1</translation>
    </message>
    <message>
        <source>Mean: %1</source>
        <translation>Среднее: %1</translation>
    </message>
    <message>
        <source>Standard deviation: %1</source>
        <translation>Среднее квадратическое отклонение (СКО): %1</translation>
    </message>
    <message>
        <source>Smallest: %1</source>
        <translation>Наименьшее: %1</translation>
    </message>
    <message>
        <source>Largest: %1</source>
        <translation>Наибольшее: %1</translation>
    </message>
</context>
<context>
    <name>KvDeskSession</name>
    <message>
        <source>Untitled session</source>
        <translation>Безымянный сеанс</translation>
    </message>
</context>
<context>
    <name>KvDeskSettingsDialog</name>
    <message>
        <source>Settings</source>
        <translation>Настройки</translation>
    </message>
    <message>
        <source>Appearance</source>
        <translation>Внешний вид</translation>
    </message>
    <message>
        <source>Theme</source>
        <translation>Тема</translation>
    </message>
    <message>
        <source>Dark</source>
        <translation>Тёмная</translation>
    </message>
    <message>
        <source>Light</source>
        <translation>Светлая</translation>
    </message>
    <message>
        <source>Language</source>
        <translation>Язык</translation>
    </message>
    <message>
        <source>Another language takes effect when the program is started again.</source>
        <translation>Смена языка вступит в силу после перезапуска программы.</translation>
    </message>
    <message>
        <source>Measured values</source>
        <translation>Измеренные значения</translation>
    </message>
    <message>
        <source>Automatic</source>
        <translation>Автоматически</translation>
    </message>
    <message>
        <source>Significant digits</source>
        <translation>Значащие цифры</translation>
    </message>
    <message>
        <source>Length unit</source>
        <translation>Единица длины</translation>
    </message>
    <message>
        <source>Angle unit</source>
        <translation>Единица угла</translation>
    </message>
    <message>
        <source>Degrees (°)</source>
        <translation>Градусы (°)</translation>
    </message>
    <message>
        <source>Radians (rad)</source>
        <translation>Радианы (rad)</translation>
    </message>
    <message>
        <source>System default</source>
        <translation>Как в системе</translation>
    </message>
    <message>
        <source>Nothing was changed yet</source>
        <translation>Ещё ничего не изменено</translation>
    </message>
</context>
<context>
    <name>KvDeskSnapshotFile</name>
    <message>
        <source>The folder cannot be created</source>
        <translation>Не удаётся создать папку</translation>
    </message>
    <message>
        <source>The picture cannot be encoded</source>
        <translation>Не удаётся закодировать изображение</translation>
    </message>
</context>
<context>
    <name>KvDeskSnapshots</name>
    <message>
        <source>Open an image first</source>
        <translation>Сначала откройте изображение</translation>
    </message>
    <message>
        <source>No snapshot was taken: earlier ones are still being saved</source>
        <translation>Снимок не сделан: предыдущие ещё сохраняются</translation>
    </message>
    <message>
        <source>Snapshot saved: %1</source>
        <translation>Снимок сохранён: %1</translation>
    </message>
    <message>
        <source>The snapshot was not saved. %1</source>
        <translation>Снимок не сохранён. %1</translation>
    </message>
</context>
<context>
    <name>KvDeskSourceCommands</name>
    <message>
        <source>The image source &quot;%1&quot; was not opened.</source>
        <translation>Источник изображения «%1» не открыт.</translation>
    </message>
    <message>
        <source>Image source: %1</source>
        <translation>Источник изображения: %1</translation>
    </message>
    <message>
        <source>Open image folder</source>
        <translation>Открыть папку с изображениями</translation>
    </message>
    <message>
        <source>Open video</source>
        <translation>Открыть видео</translation>
    </message>
    <message>
        <source>Videos</source>
        <translation>Видео</translation>
    </message>
</context>
<context>
    <name>KvDeskSourceMenu</name>
    <message>
        <source>Image &amp;source</source>
        <translation>&amp;Источник изображения</translation>
    </message>
    <message>
        <source>Still &amp;image...</source>
        <translation>&amp;Неподвижное изображение...</translation>
    </message>
    <message>
        <source>Image &amp;folder...</source>
        <translation>&amp;Папка с изображениями...</translation>
    </message>
    <message>
        <source>Play the images of a folder like a camera</source>
        <translation>Воспроизводить изображения из папки, как с камеры</translation>
    </message>
    <message>
        <source>&amp;Video...</source>
        <translation>&amp;Видео...</translation>
    </message>
    <message>
        <source>Play a video like a camera</source>
        <translation>Воспроизводить видео, как с камеры</translation>
    </message>
    <message>
        <source>Looking for cameras...</source>
        <translation>Поиск камер...</translation>
    </message>
    <message>
        <source>No camera is connected</source>
        <translation>Камера не подключена</translation>
    </message>
</context>
<context>
    <name>KvDeskStartPage</name>
    <message>
        <source>From an image to a report</source>
        <translation>От изображения к отчёту</translation>
    </message>
    <message>
        <source>Back to the image</source>
        <translation>Назад к изображению</translation>
    </message>
    <message>
        <source>%1 (%2)</source>
        <comment>command (shortcut)</comment>
        <translation>%1 (%2)</translation>
    </message>
    <message>
        <source>Open an image</source>
        <translation>Открыть изображение</translation>
    </message>
    <message>
        <source>A picture file, or the live image of a camera.</source>
        <translation>Файл изображения или живое изображение с камеры.</translation>
    </message>
    <message>
        <source>Choose a camera or another source</source>
        <translation>Выбрать камеру или другой источник</translation>
    </message>
    <message>
        <source>Calibrate</source>
        <translation>Калибровать</translation>
    </message>
    <message>
        <source>Say how large a pixel is. The examples are calibrated already.</source>
        <translation>Укажите размер пикселя. Примеры уже откалиброваны.</translation>
    </message>
    <message>
        <source>Measure and report</source>
        <translation>Измерить и создать отчёт</translation>
    </message>
    <message>
        <source>Drag a line over the image: its length is listed at once. The report panel makes a PDF of all values.</source>
        <translation>Проведите мышью линию по изображению: её длина сразу появится в списке. Панель отчёта создаёт PDF со всеми значениями.</translation>
    </message>
    <message>
        <source>Examples to try</source>
        <translation>Попробуйте на примерах</translation>
    </message>
    <message>
        <source>Recent sessions</source>
        <translation>Недавние сеансы</translation>
    </message>
    <message>
        <source>Open an image first</source>
        <translation>Сначала откройте изображение</translation>
    </message>
    <message>
        <source>Open a copy of this example</source>
        <translation>Открыть копию этого примера</translation>
    </message>
</context>
<context>
    <name>KvDeskStatus</name>
    <message>
        <source>Warning</source>
        <translation>Предупреждение</translation>
    </message>
    <message>
        <source>Error</source>
        <translation>Ошибка</translation>
    </message>
    <message>
        <source>Information</source>
        <translation>Информация</translation>
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
        <translation>Статистика выделенных значений</translation>
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
        <translation>Журнал сообщений</translation>
    </message>
    <message>
        <source>Hide the status log</source>
        <translation>Скрыть журнал сообщений</translation>
    </message>
    <message>
        <source>Clear the status log</source>
        <translation>Очистить журнал сообщений</translation>
    </message>
    <message>
        <source>Messages of the program and its plug-ins appear here</source>
        <translation>Здесь появляются сообщения программы и её модулей</translation>
    </message>
    <message>
        <source>There are no messages</source>
        <translation>Сообщений нет</translation>
    </message>
</context>
<context>
    <name>KvDeskStatusLogModel</name>
    <message>
        <source>%1
Reported by %2</source>
        <comment>message, source</comment>
        <translation>%1
Источник: %2</translation>
    </message>
    <message>
        <source>Category</source>
        <translation>Категория</translation>
    </message>
    <message>
        <source>Time</source>
        <translation>Время</translation>
    </message>
    <message>
        <source>Message</source>
        <translation>Сообщение</translation>
    </message>
</context>
<context>
    <name>KvDeskTableView</name>
    <message>
        <source>Copy</source>
        <translation>Копировать</translation>
    </message>
</context>
<context>
    <name>KvDeskToolStrip</name>
    <message>
        <source>Measuring tools</source>
        <translation>Инструменты измерения</translation>
    </message>
</context>
<context>
    <name>KvDeskTypedPixelSize</name>
    <message>
        <source>Width of a pixel in micrometres</source>
        <translation>Ширина пикселя в микрометрах</translation>
    </message>
    <message>
        <source>Height of a pixel in micrometres</source>
        <translation>Высота пикселя в микрометрах</translation>
    </message>
    <message>
        <source>Same size in both directions</source>
        <translation>Одинаковый размер в обоих направлениях</translation>
    </message>
    <message>
        <source>Width</source>
        <translation>Ширина</translation>
    </message>
    <message>
        <source>Height</source>
        <translation>Высота</translation>
    </message>
    <message>
        <source>Type how large a pixel of the image is in reality.</source>
        <translation>Введите реальный размер пикселя изображения.</translation>
    </message>
</context>
<context>
    <name>KvDeskValueCommands</name>
    <message>
        <source>Rename</source>
        <translation>Переименовать</translation>
    </message>
    <message>
        <source>Delete object</source>
        <translation>Удалить объект</translation>
    </message>
    <message>
        <source>Hide value</source>
        <translation>Скрыть значение</translation>
    </message>
    <message>
        <source>Show all values of the object</source>
        <translation>Показать все значения объекта</translation>
    </message>
    <message>
        <source>Select one object first</source>
        <translation>Сначала выделите один объект</translation>
    </message>
    <message>
        <source>Select an object first</source>
        <translation>Сначала выделите объект</translation>
    </message>
    <message>
        <source>Select a value first</source>
        <translation>Сначала выделите значение</translation>
    </message>
    <message>
        <source>No value of the selected object is hidden</source>
        <translation>У выделенного объекта нет скрытых значений</translation>
    </message>
    <message>
        <source>showing of values</source>
        <translation>показ значений</translation>
    </message>
    <message>
        <source>hiding of values</source>
        <translation>скрытие значений</translation>
    </message>
</context>
<context>
    <name>KvDeskValueTable</name>
    <message>
        <source>Measured values</source>
        <translation>Измеренные значения</translation>
    </message>
    <message>
        <source>Hide the measured values</source>
        <translation>Скрыть измеренные значения</translation>
    </message>
    <message>
        <source>Filter by type, object or value name</source>
        <translation>Фильтр по типу, объекту или величине</translation>
    </message>
    <message>
        <source>Filter of the measured values</source>
        <translation>Фильтр измеренных значений</translation>
    </message>
    <message>
        <source>Shows only rows that have all of these words</source>
        <translation>Показывает только строки, содержащие все эти слова</translation>
    </message>
    <message>
        <source>No measured value matches the filter</source>
        <translation>Нет измеренных значений, подходящих под фильтр</translation>
    </message>
    <message>
        <source>Clear the filter</source>
        <translation>Очистить фильтр</translation>
    </message>
    <message>
        <source>%1 of %2</source>
        <extracomment>rows that match the filter, all rows</extracomment>
        <translation>%1 из %2</translation>
    </message>
    <message>
        <source>Measured values appear here once something is measured or imported</source>
        <translation>Измеренные значения появятся здесь после измерения или импорта</translation>
    </message>
    <message>
        <source>There are no measured values yet</source>
        <translation>Измеренных значений пока нет</translation>
    </message>
</context>
<context>
    <name>KvDeskValueTableModel</name>
    <message>
        <source>Type</source>
        <translation>Тип</translation>
    </message>
    <message>
        <source>Object</source>
        <translation>Объект</translation>
    </message>
    <message>
        <source>Value name</source>
        <translation>Величина</translation>
    </message>
    <message>
        <source>Value</source>
        <translation>Значение</translation>
    </message>
</context>
<context>
    <name>KvToolBase</name>
    <message>
        <source>Reset</source>
        <translation>Сброс</translation>
    </message>
    <message>
        <source>Reset to the default values</source>
        <translation>Вернуть значения по умолчанию</translation>
    </message>
</context>
<context>
    <name>QPlatformTheme</name>
    <message>
        <source>OK</source>
        <translation>ОК</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Отмена</translation>
    </message>
    <message>
        <source>Apply</source>
        <translation>Применить</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>Сохранить</translation>
    </message>
    <message>
        <source>Open</source>
        <translation>Открыть</translation>
    </message>
    <message>
        <source>Close</source>
        <translation>Закрыть</translation>
    </message>
    <message>
        <source>Discard</source>
        <translation>Не сохранять</translation>
    </message>
    <message>
        <source>&amp;Yes</source>
        <translation>&amp;Да</translation>
    </message>
    <message>
        <source>&amp;No</source>
        <translation>&amp;Нет</translation>
    </message>
</context>
<context>
    <name>ZtAppSettings</name>
    <message>
        <source>The settings could not be saved to %1. Check that the folder is writable.</source>
        <translation>Не удалось сохранить настройки в %1. Проверьте, доступна ли папка для записи.</translation>
    </message>
    <message>
        <source>The settings file %1 cannot be read. Changes to the settings will not be kept.</source>
        <translation>Не удаётся прочитать файл настроек %1. Изменения настроек не сохранятся.</translation>
    </message>
    <message>
        <source>The settings file %1 is damaged. It was renamed to %2; all settings are back at their defaults.</source>
        <translation>Файл настроек %1 повреждён. Он переименован в %2; всем настройкам возвращены значения по умолчанию.</translation>
    </message>
    <message>
        <source>The settings file %1 is damaged and could not be renamed to %2. Changes to the settings will not be kept.</source>
        <translation>Файл настроек %1 повреждён, и его не удалось переименовать в %2. Изменения настроек не сохранятся.</translation>
    </message>
</context>
<context>
    <name>ZtAravisSource</name>
    <message>
        <source>%1 is disconnected; its last picture stays</source>
        <translation>%1: соединение потеряно; остаётся последний кадр</translation>
    </message>
    <message>
        <source>%1 delivers pictures of a kind that cannot be shown</source>
        <translation>%1 передаёт изображения в формате, который нельзя показать</translation>
    </message>
    <message>
        <source>The camera does not take the setting (%1)</source>
        <translation>Камера не принимает настройку (%1)</translation>
    </message>
    <message>
        <source>%1 cannot be opened (%2)</source>
        <translation>Не удаётся открыть %1 (%2)</translation>
    </message>
</context>
<context>
    <name>ZtCalibrationStore</name>
    <message>
        <source>This is not a calibration</source>
        <translation>Это не калибровка</translation>
    </message>
    <message>
        <source>A calibration in the settings is damaged and was left out (%1: %2)</source>
        <translation>Калибровка в настройках повреждена и пропущена (%1: %2)</translation>
    </message>
</context>
<context>
    <name>ZtCsvReader</name>
    <message>
        <source>A quoted text does not end</source>
        <translation>Не закрыты кавычки у текста</translation>
    </message>
    <message>
        <source>There is text after a closing quote</source>
        <translation>После закрывающей кавычки стоит текст</translation>
    </message>
    <message>
        <source>Reading was cancelled</source>
        <translation>Чтение отменено</translation>
    </message>
</context>
<context>
    <name>ZtDrawnType</name>
    <message>
        <source>Rectangle</source>
        <translation>Прямоугольник</translation>
    </message>
    <message>
        <source>Width</source>
        <translation>Ширина</translation>
    </message>
    <message>
        <source>Height</source>
        <translation>Высота</translation>
    </message>
    <message>
        <source>Area</source>
        <translation>Площадь</translation>
    </message>
    <message>
        <source>Line</source>
        <translation>Линия</translation>
    </message>
    <message>
        <source>Length</source>
        <translation>Длина</translation>
    </message>
    <message>
        <source>Arc</source>
        <translation>Дуга</translation>
    </message>
    <message>
        <source>Angle</source>
        <translation>Угол</translation>
    </message>
    <message>
        <source>Arc length</source>
        <translation>Длина дуги</translation>
    </message>
    <message>
        <source>Polygon</source>
        <translation>Многоугольник</translation>
    </message>
    <message>
        <source>Perimeter</source>
        <translation>Периметр</translation>
    </message>
    <message>
        <source>Polyline</source>
        <translation>Ломаная</translation>
    </message>
    <message>
        <source>Parallel distance</source>
        <translation>Расстояние до линии</translation>
    </message>
    <message>
        <source>Distance</source>
        <translation>Расстояние</translation>
    </message>
    <message>
        <source>Text note</source>
        <translation>Надпись</translation>
    </message>
    <message>
        <source>Scale bar</source>
        <translation>Масштабный отрезок</translation>
    </message>
    <message>
        <source>Counter</source>
        <translation>Счётчик</translation>
    </message>
    <message>
        <source>Count</source>
        <translation>Количество</translation>
    </message>
    <message>
        <source>Share</source>
        <translation>Доля</translation>
    </message>
    <message>
        <source>Circle</source>
        <translation>Окружность</translation>
    </message>
    <message>
        <source>Diameter</source>
        <translation>Диаметр</translation>
    </message>
</context>
<context>
    <name>ZtFileFault</name>
    <message>
        <source>No such file or directory</source>
        <translation>нет такого файла или каталога</translation>
    </message>
    <message>
        <source>Permission denied</source>
        <translation>отказано в доступе</translation>
    </message>
    <message>
        <source>Is a directory</source>
        <translation>это каталог</translation>
    </message>
    <message>
        <source>Not a directory</source>
        <translation>это не каталог</translation>
    </message>
    <message>
        <source>File name too long</source>
        <translation>слишком длинное имя файла</translation>
    </message>
    <message>
        <source>No space left on device</source>
        <translation>на устройстве не осталось свободного места</translation>
    </message>
    <message>
        <source>Read-only file system</source>
        <translation>файловая система доступна только для чтения</translation>
    </message>
    <message>
        <source>Input/output error</source>
        <translation>ошибка ввода/вывода</translation>
    </message>
</context>
<context>
    <name>ZtFrameSourceCatalogue</name>
    <message>
        <source>This program cannot play videos</source>
        <translation>Эта программа не может воспроизводить видео</translation>
    </message>
    <message>
        <source>This program knows no cameras of this kind</source>
        <translation>Эта программа не поддерживает камеры такого типа</translation>
    </message>
</context>
<context>
    <name>ZtImageFolderSource</name>
    <message>
        <source>%1: no picture of the folder can be shown</source>
        <translation>%1: в папке нет изображений, которые можно показать</translation>
    </message>
    <message>
        <source>The folder does not exist</source>
        <translation>Папка не существует</translation>
    </message>
    <message>
        <source>The folder cannot be read</source>
        <translation>Не удаётся прочитать папку</translation>
    </message>
    <message>
        <source>The folder holds no pictures</source>
        <translation>В папке нет изображений</translation>
    </message>
</context>
<context>
    <name>ZtKernelImage</name>
    <message>
        <source>%1 delivers pictures again</source>
        <translation>%1 снова передаёт кадры</translation>
    </message>
</context>
<context>
    <name>ZtLiveFrameSource</name>
    <message>
        <source>%1 has stopped delivering pictures; the last one stays</source>
        <translation>%1 больше не передаёт кадры; остаётся последний</translation>
    </message>
</context>
<context>
    <name>ZtMeasureFormat</name>
    <message>
        <source>pcs</source>
        <translation>шт.</translation>
    </message>
</context>
<context>
    <name>ZtSession</name>
    <message>
        <source>The file is empty</source>
        <translation>Файл пуст</translation>
    </message>
    <message>
        <source>The file is not a session</source>
        <translation>Файл не является сеансом</translation>
    </message>
    <message>
        <source>The file cannot be written (%1)</source>
        <translation>Не удаётся записать файл (%1)</translation>
    </message>
    <message>
        <source>This must be a list</source>
        <translation>Здесь должен быть список</translation>
    </message>
    <message>
        <source>This must be a text</source>
        <translation>Здесь должен быть текст</translation>
    </message>
    <message>
        <source>This must be a whole number from 1</source>
        <translation>Здесь должно быть целое число не меньше 1</translation>
    </message>
    <message>
        <source>This must be a number</source>
        <translation>Здесь должно быть число</translation>
    </message>
    <message>
        <source>This must be a number greater than 0</source>
        <translation>Здесь должно быть число больше 0</translation>
    </message>
    <message>
        <source>Another object of this type has the same number</source>
        <translation>Другой объект этого типа имеет тот же номер</translation>
    </message>
    <message>
        <source>This must be an object</source>
        <translation>Здесь должен быть объект</translation>
    </message>
    <message>
        <source>&quot;%1&quot; is not a type of objects</source>
        <translation>«%1» не является типом объектов</translation>
    </message>
    <message>
        <source>An object of type &quot;%1&quot; cannot have this number of points (%2)</source>
        <translation>У объекта типа «%1» не может быть столько точек (%2)</translation>
    </message>
    <message>
        <source>A point must be a list of two numbers between -1e9 and 1e9</source>
        <translation>Точка должна быть списком из двух чисел от -1e9 до 1e9</translation>
    </message>
    <message>
        <source>This must be the name of a value</source>
        <translation>Здесь должно быть имя величины</translation>
    </message>
    <message>
        <source>The type has no name</source>
        <translation>У типа нет имени</translation>
    </message>
    <message>
        <source>A value must have a name of its own</source>
        <translation>Величина должна иметь собственное имя</translation>
    </message>
    <message>
        <source>The numbers of the rows must rise</source>
        <translation>Номера строк должны возрастать</translation>
    </message>
    <message>
        <source>A row must be a list of number, name and values</source>
        <translation>Строка должна быть списком из номера, имени и значений</translation>
    </message>
    <message>
        <source>This must be a text or null</source>
        <translation>Здесь должен быть текст или null</translation>
    </message>
    <message>
        <source>This must be a list or an object</source>
        <translation>Здесь должен быть список или объект</translation>
    </message>
    <message>
        <source>The table has no such value</source>
        <translation>В таблице нет такой величины</translation>
    </message>
    <message>
        <source>This must be the text of a number</source>
        <translation>Здесь должно быть число в виде текста</translation>
    </message>
    <message>
        <source>The unit does not fit that of the value</source>
        <translation>Единица не подходит к единице величины</translation>
    </message>
    <message>
        <source>The file is nested too deeply</source>
        <translation>Слишком глубокая вложенность в файле</translation>
    </message>
    <message>
        <source>The file is not valid JSON (%1)</source>
        <translation>Файл содержит некорректный JSON (%1)</translation>
    </message>
    <message>
        <source>The file does not exist</source>
        <translation>Файл не существует</translation>
    </message>
    <message>
        <source>This is a folder, not a file</source>
        <translation>Это папка, а не файл</translation>
    </message>
    <message>
        <source>The file cannot be read (%1)</source>
        <translation>Не удаётся прочитать файл (%1)</translation>
    </message>
    <message>
        <source>The file is too large for a session</source>
        <translation>Файл слишком велик для сеанса</translation>
    </message>
    <message>
        <source>This must be a date such as 2026-01-31T12:00:00Z</source>
        <translation>Здесь должна быть дата вида 2026-01-31T12:00:00Z</translation>
    </message>
    <message>
        <source>This must be &quot;knownDistance&quot;, &quot;metadata&quot; or &quot;typed&quot;</source>
        <translation>Здесь должно быть &quot;knownDistance&quot;, &quot;metadata&quot; или &quot;typed&quot;</translation>
    </message>
    <message>
        <source>The file is write-protected</source>
        <translation>Файл защищён от записи</translation>
    </message>
    <message>
        <source>Writing was cancelled</source>
        <translation>Запись отменена</translation>
    </message>
    <message>
        <source>Reading was cancelled</source>
        <translation>Чтение отменено</translation>
    </message>
    <message>
        <source>The session is of the newer version %1; this program reads versions up to %2</source>
        <translation>Сеанс имеет более новую версию %1; эта программа читает версии не новее %2</translation>
    </message>
    <message>
        <source>Sessions of version %1 are not known; this program reads versions %2 to %3</source>
        <translation>Сеансы версии %1 неизвестны; эта программа читает версии с %2 по %3</translation>
    </message>
    <message>
        <source>This file is a table of values; import it</source>
        <translation>Этот файл — таблица значений; импортируйте его</translation>
    </message>
</context>
<context>
    <name>ZtStillImageSource</name>
    <message>
        <source>The picture does not exist</source>
        <translation>Изображение не существует</translation>
    </message>
    <message>
        <source>This is a folder, not a picture</source>
        <translation>Это папка, а не изображение</translation>
    </message>
    <message>
        <source>The picture cannot be read</source>
        <translation>Не удаётся прочитать изображение</translation>
    </message>
    <message>
        <source>The picture has %1 x %2 pixels, which is too many</source>
        <translation>Размер изображения %1 × %2 пикселей слишком велик</translation>
    </message>
    <message>
        <source>The picture cannot be decoded (%1)</source>
        <translation>Не удаётся декодировать изображение (%1)</translation>
    </message>
    <message>
        <source>the file is empty</source>
        <translation>файл пуст</translation>
    </message>
    <message>
        <source>it has no size</source>
        <translation>размер отсутствует</translation>
    </message>
    <message>
        <source>the file is damaged</source>
        <translation>файл повреждён</translation>
    </message>
    <message>
        <source>the file is too short for its picture</source>
        <translation>файл короче, чем требует изображение</translation>
    </message>
    <message>
        <source>there is not enough memory</source>
        <translation>недостаточно памяти</translation>
    </message>
</context>
<context>
    <name>ZtTableImport</name>
    <message>
        <source>&quot;%1&quot; already has a value &quot;%2&quot; in line %3</source>
        <translation>У «%1» уже есть величина «%2» в строке %3</translation>
    </message>
    <message>
        <source>The file does not exist</source>
        <translation>Файл не существует</translation>
    </message>
    <message>
        <source>This is a folder, not a file</source>
        <translation>Это папка, а не файл</translation>
    </message>
    <message>
        <source>The file cannot be read (%1)</source>
        <translation>Не удаётся прочитать файл (%1)</translation>
    </message>
    <message>
        <source>The table is not open for reading</source>
        <translation>Таблица не открыта для чтения</translation>
    </message>
    <message>
        <source>The table has no rows</source>
        <translation>В таблице нет строк</translation>
    </message>
    <message>
        <source>The row and the header differ in their number of fields (%1 and %2)</source>
        <translation>Число полей в строке и в заголовке различается (%1 и %2)</translation>
    </message>
    <message>
        <source>%1 is not a finite number</source>
        <translation>%1 не является конечным числом</translation>
    </message>
    <message>
        <source>%1 is not a number</source>
        <translation>%1 не является числом</translation>
    </message>
    <message>
        <source>&quot;%1&quot; of &quot;%2&quot; is given in &quot;%3&quot; here, but in &quot;%4&quot; before</source>
        <translation>«%1» для «%2» здесь указано в «%3», а ранее — в «%4»</translation>
    </message>
    <message>
        <source>There is no column %1; the columns are %2</source>
        <translation>Столбца %1 нет; имеющиеся столбцы: %2</translation>
    </message>
    <message>
        <source>Object</source>
        <translation>Объект</translation>
    </message>
    <message>
        <source>There is no value %1 to give a unit; the values are %2</source>
        <translation>Нет величины %1, которой можно задать единицу; имеющиеся величины: %2</translation>
    </message>
    <message>
        <source>The first line announces rows without values</source>
        <translation>В первой строке заявлены строки без значений</translation>
    </message>
    <message>
        <source>There is no column %1; the columns of this table have no names</source>
        <translation>Столбца %1 нет; столбцы этой таблицы не имеют имён</translation>
    </message>
    <message>
        <source>%1 is not the index of a class; they go from 0 to %2</source>
        <translation>%1 не является индексом класса; индексы — от 0 до %2</translation>
    </message>
    <message>
        <source>Value %1</source>
        <translation>Величина %1</translation>
    </message>
    <message>
        <source>The file is larger than %1 MB</source>
        <translation>Файл больше %1 МБ</translation>
    </message>
    <message>
        <source>The file is empty</source>
        <translation>Файл пуст</translation>
    </message>
    <message>
        <source>The first line does not name the columns</source>
        <translation>В первой строке нет имён столбцов</translation>
    </message>
    <message>
        <source>Column %1 is not part of a list of values and was left out</source>
        <translation>Столбец %1 не входит в список значений и пропущен</translation>
    </message>
    <message>
        <source>Columns %1 are not part of a list of values and were left out</source>
        <translation>Столбцы %1 не входят в список значений и пропущены</translation>
    </message>
    <message>
        <source>The value has no name</source>
        <translation>У значения не указана величина</translation>
    </message>
    <message>
        <source>The row does not say which object it belongs to</source>
        <translation>В строке не указано, к какому объекту она относится</translation>
    </message>
    <message>
        <source>%1 is not a unit</source>
        <translation>%1 не является единицей измерения</translation>
    </message>
    <message>
        <source>There is no column of numbers</source>
        <translation>Нет столбца с числами</translation>
    </message>
    <message>
        <source>Column %1</source>
        <translation>Столбец %1</translation>
    </message>
    <message>
        <source>Column %1 holds text and was left out</source>
        <translation>Столбец %1 содержит текст и пропущен</translation>
    </message>
    <message>
        <source>Columns %1 hold text and were left out</source>
        <translation>Столбцы %1 содержат текст и пропущены</translation>
    </message>
    <message>
        <source>Reading was cancelled</source>
        <translation>Чтение отменено</translation>
    </message>
    <message numerus="yes">
        <source>The table has %n row(s), its first line announces %1</source>
        <translation>
            <numerusform>В таблице %n строка, а в первой строке заявлено: %1</numerusform>
            <numerusform>В таблице %n строки, а в первой строке заявлено: %1</numerusform>
            <numerusform>В таблице %n строк, а в первой строке заявлено: %1</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>The row has %n field(s) instead of %1</source>
        <translation>
            <numerusform>В строке %n поле вместо %1</numerusform>
            <numerusform>В строке %n поля вместо %1</numerusform>
            <numerusform>В строке %n полей вместо %1</numerusform>
        </translation>
    </message>
    <message>
        <source>The records have too many different names</source>
        <translation>В записях слишком много разных имён</translation>
    </message>
    <message>
        <source>This file is a session, not a table; open it</source>
        <translation>Этот файл — сеанс, а не таблица; откройте его</translation>
    </message>
    <message>
        <source>The file is neither a list of records nor an export of values</source>
        <translation>Файл не является ни списком записей, ни экспортом значений</translation>
    </message>
    <message>
        <source>This name comes twice</source>
        <translation>Это имя встречается дважды</translation>
    </message>
    <message>
        <source>This must be a text, a number or null</source>
        <translation>Здесь должен быть текст, число или null</translation>
    </message>
    <message>
        <source>The table is of version %1; this program reads version %2</source>
        <translation>Версия таблицы — %1; эта программа читает версию %2</translation>
    </message>
</context>
<context>
    <name>ZtTextDecoder</name>
    <message>
        <source>The file is not a text file: it holds a NUL character</source>
        <translation>Файл не является текстовым: он содержит символ NUL</translation>
    </message>
    <message>
        <source>The file is not valid UTF-16 text</source>
        <translation>Файл содержит некорректный текст UTF-16</translation>
    </message>
    <message>
        <source>The text is not valid UTF-8</source>
        <translation>Текст содержит некорректные данные UTF-8</translation>
    </message>
</context>
<context>
    <name>ZtUvcCameraSource</name>
    <message>
        <source>%1 is not connected</source>
        <translation>%1: нет подключения</translation>
    </message>
    <message>
        <source>%1 is disconnected or in use (%2)</source>
        <translation>%1: отключено или занято (%2)</translation>
    </message>
</context>
<context>
    <name>ZtVideoFileSource</name>
    <message>
        <source>The video does not exist</source>
        <translation>Видео не существует</translation>
    </message>
    <message>
        <source>The video cannot be read</source>
        <translation>Не удаётся прочитать видео</translation>
    </message>
    <message>
        <source>The video is empty</source>
        <translation>Видео пустое</translation>
    </message>
    <message>
        <source>there is only sound in it</source>
        <translation>в нём есть только звук</translation>
    </message>
    <message>
        <source>The video %1 cannot be played (%2)</source>
        <translation>Не удаётся воспроизвести видео %1 (%2)</translation>
    </message>
    <message>
        <source>the file is damaged</source>
        <translation>файл повреждён</translation>
    </message>
</context>
<context>
    <name>acss</name>
    <message>
        <source>The icon %1 is missing.</source>
        <translation>Значок %1 отсутствует.</translation>
    </message>
</context>
</TS>
