// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "repository/SourceTree.h"

#include <QPluginLoader>
#include <QProcess>
#include <QSet>
#include <QTranslator>
#include <QXmlStreamReader>

namespace {

const QStringList languages{QStringLiteral("English"),
                            QStringLiteral("German"),
                            QStringLiteral("French"),
                            QStringLiteral("Spanish"),
                            QStringLiteral("Italian"),
                            QStringLiteral("Russian"),
                            QStringLiteral("Japanese"),
                            QStringLiteral("Korean"),
                            QStringLiteral("Arabic"),
                            QStringLiteral("ChineseSimple"),
                            QStringLiteral("ChineseTraditional"),
                            QStringLiteral("Slovakian")};

/// Folder of the sources and folder of their translations.
const QVector<QPair<QString, QString>> products{
    {QStringLiteral("src"), QStringLiteral("src/resources/translations")},
    {QStringLiteral("host"), QStringLiteral("host/desk/translations")},
    {QStringLiteral("cli"), QStringLiteral("cli/translations")}};

struct Message
{
    QString context;
    QString source;
    QStringList translations; ///< several for plurals
    bool isPlural = false;
    bool isFinished = true; ///< false for texts without a translation, and for those that are gone

    QString key() const { return context + QStringLiteral(": ") + source; }
};

void readTranslation(QXmlStreamReader &xml, Message *message)
{
    message->isFinished = !xml.attributes().hasAttribute(QLatin1String("type"));
    if (!message->isPlural) {
        message->translations.append(xml.readElementText());
        return;
    }
    while (xml.readNextStartElement())
        message->translations.append(xml.readElementText());
}

Message readMessage(QXmlStreamReader &xml, const QString &context)
{
    Message message;
    message.context = context;
    message.isPlural = xml.attributes().value(QLatin1String("numerus")) == QLatin1String("yes");
    while (xml.readNextStartElement()) {
        if (xml.name() == QLatin1String("source"))
            message.source = xml.readElementText();
        else if (xml.name() == QLatin1String("translation"))
            readTranslation(xml, &message);
        else
            xml.skipCurrentElement();
    }
    return message;
}

QVector<Message> readMessages(QIODevice *device)
{
    QVector<Message> messages;
    QXmlStreamReader xml(device);
    QString context;
    while (!xml.atEnd()) {
        if (xml.readNext() != QXmlStreamReader::StartElement)
            continue;
        if (xml.name() == QLatin1String("name"))
            context = xml.readElementText();
        else if (xml.name() == QLatin1String("message"))
            messages.append(readMessage(xml, context));
    }
    return xml.hasError() ? QVector<Message>() : messages;
}

QVector<Message> readMessages(const QString &path)
{
    QFile file(path);
    return file.open(QIODevice::ReadOnly) ? readMessages(&file) : QVector<Message>();
}

QStringList keys(const QVector<Message> &messages)
{
    QStringList result;
    for (const Message &message : messages)
        result.append(message.key());
    result.sort();
    return result;
}

/// What is in \a all, but not in \a some.
QStringList missing(const QStringList &all, const QStringList &some)
{
    QStringList result(all);
    for (const QString &key : some)
        result.removeAll(key);
    return result;
}

/// "%1", "%2" ... and "%n", each once, sorted.
QStringList placeholders(const QString &text)
{
    static const QRegularExpression pattern(QStringLiteral("%L?(\\d{1,2}|n)"));
    QSet<QString> found;
    QRegularExpressionMatchIterator it = pattern.globalMatch(text);
    while (it.hasNext())
        found.insert(it.next().captured(1));
    QStringList result(found.cbegin(), found.cend());
    result.sort();
    return result;
}

/// A language may say "none", "one" or "two" in words; the last form of a plural is for all larger numbers.
bool hasThePlaceholders(const Message &message, int form)
{
    QStringList wanted = placeholders(message.source);
    QStringList found = placeholders(message.translations.at(form));
    if (message.isPlural && form + 1 < message.translations.size()) {
        wanted.removeAll(QStringLiteral("n"));
        found.removeAll(QStringLiteral("n"));
    }
    return found == wanted;
}

/// Letters that a key with Alt stands for.
int shortcutCount(const QString &text)
{
    static const QRegularExpression pattern(QStringLiteral("&(?=\\w)(?!\\w+;)"),
                                            QRegularExpression::UseUnicodePropertiesOption);
    return QString(text).remove(QLatin1String("&&")).count(pattern);
}

bool hasTheShortcuts(const Message &message, int form)
{
    const int count = shortcutCount(message.translations.at(form));
    return count == qMin(1, shortcutCount(message.source));
}

/// What follows a command that asks for more, and the lines of the text.
bool hasTheShape(const Message &message, int form)
{
    const auto asksForMore = [](const QString &text) {
        return text.endsWith(QLatin1String("...")) || text.contains(QLatin1String("...(&"));
    };
    const QString translation = message.translations.at(form);
    return asksForMore(translation) == asksForMore(message.source) &&
           translation.count(QLatin1Char('\n')) == message.source.count(QLatin1Char('\n'));
}

/// Messages with a form of their translation that does not pass the check.
QStringList faultsOf(const QVector<Message> &messages, bool (*isGood)(const Message &message, int form))
{
    QStringList faults;
    for (const Message &message : messages) {
        for (int form = 0; form < message.translations.size(); ++form) {
            if (!message.translations.at(form).isEmpty() && !isGood(message, form))
                faults.append(message.key() + QStringLiteral(" -> ") + message.translations.at(form));
        }
    }
    return faults;
}

/// What every call of tr() and translate() with a variable in it is called with. lupdate does not see these
/// texts: they have to be marked where they stand, which is for a person to judge, call by call.
QStringList variableTexts(const SourceTree::Files &files)
{
    static const QRegularExpression call(QStringLiteral(
        "(?:\\btr\\(|QCoreApplication::translate\\(\\s*[\\w\"]+\\s*,)\\s*(?![\\s\")])([^,()]+)"));
    QStringList found;
    for (auto it = files.cbegin(); it != files.cend(); ++it) {
        QRegularExpressionMatchIterator calls = call.globalMatch(SourceTree::withoutComments(it.value()));
        while (calls.hasNext())
            found.append(it.key() + QStringLiteral(": ") + calls.next().captured(1).trimmed());
    }
    return found;
}

/// Sentences that are printed or shown as they stand in the code.
QStringList untranslatedTexts(const SourceTree::Files &files)
{
    static const QString text = QStringLiteral("\"(?:[^\"\\\\]|\\\\.)*\"");
    static const QString function = QStringLiteral(
        "\\b(?:v?f?printf|f?puts|set\\w*(?:Text|Title|Tip|Label|Name|Description|Message)|showMessage|"
        "add(?:Item|Action|Row|Menu|Tab|Button|Option)|question|warning|critical|information|about|"
        "Q(?:Label|Action|PushButton|CheckBox|RadioButton|GroupBox|MessageBox)(?: \\w+)?)\\(");
    // What may come before the text: translated texts, and words that are none.
    static const QString before =
        QStringLiteral("(?:\\btr\\(\\s*(?:%1\\s*)+(?:,\\s*%1)?|\\btranslate\\(\\s*\"\\w+\",\\s*(?:%1\\s*)+|"
                       "\"[^\" ]*\"|[^;\"])*+")
            .arg(text);
    static const QRegularExpression call(
        function + before + QStringLiteral("\"([^\"\\n]*\\p{L}{2,}[,.:;]? \\p{L}{2,}[^\"\\n]*)\""));
    QStringList found;
    for (auto it = files.cbegin(); it != files.cend(); ++it) {
        QRegularExpressionMatchIterator calls = call.globalMatch(SourceTree::withoutComments(it.value()));
        while (calls.hasNext())
            found.append(it.key() + QStringLiteral(": ") + calls.next().captured(1));
    }
    return found;
}

SourceTree::Files codeOfTheProducts()
{
    QStringList folders;
    for (const auto &product : products)
        folders.append(product.first);
    return SourceTree::read(StatReportTest::sourcePath(QString()), folders,
                            {QStringLiteral("*.h"), QStringLiteral("*.cpp")});
}

QByteArray lines(const QStringList &texts)
{
    return '\n' + texts.join(QLatin1Char('\n')).toUtf8();
}

} // namespace

class TranslationsTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void initTestCase();

    void seesLostPlaceholders_data();
    void seesLostPlaceholders();
    void seesLostCounts_data();
    void seesLostCounts();
    void seesOtherShortcuts_data();
    void seesOtherShortcuts();
    void seesOtherShapes_data();
    void seesOtherShapes();
    void seesUnmarkedTexts_data();
    void seesUnmarkedTexts();
    void seesUntranslatedTexts_data();
    void seesUntranslatedTexts();

    void thePluginHoldsEveryLanguage_data();
    void thePluginHoldsEveryLanguage();
    void thePluginTranslatesToEnglish_data();
    void thePluginTranslatesToEnglish();
    void everyLanguageHasTheSameTexts_data();
    void everyLanguageHasTheSameTexts();
    void everyLanguageIsComplete_data();
    void everyLanguageIsComplete();
    void placeholdersAreKept_data();
    void placeholdersAreKept();
    void shortcutsAreKept_data();
    void shortcutsAreKept();
    void dotsAndLinesAreKept_data();
    void dotsAndLinesAreKept();
    void theTextsOfTheCodeAreThere_data();
    void theTextsOfTheCodeAreThere();
    void contextsAreTheAgreedOnes_data();
    void contextsAreTheAgreedOnes();
    void noTextHidesFromLupdate();
    void noTextIsUntranslated();

private:
    void addFiles();
    QString path(const QString &folder, const QString &language) const
    {
        return sourcePath(QStringLiteral("%1/%2.ts").arg(folder, language));
    }
};

void TranslationsTest::initTestCase()
{
    QPluginLoader loader(QStringLiteral(STATREPORT_PLUGIN));
    QVERIFY2(loader.load(), qPrintable(loader.errorString()));
}

void TranslationsTest::seesLostPlaceholders_data()
{
    QTest::addColumn<QString>("source");
    QTest::addColumn<QString>("translation");
    QTest::addColumn<bool>("isFault");
    QTest::newRow("kept") << QStringLiteral("%1 of %2") << QStringLiteral("%2: %1") << false;
    QTest::newRow("not translated") << QStringLiteral("%1 of %2") << QString() << false;
    QTest::newRow("lost") << QStringLiteral("%1 of %2") << QStringLiteral("%1 von 2") << true;
    QTest::newRow("added") << QStringLiteral("Open") << QStringLiteral("Open %1") << true;
    QTest::newRow("per cent") << QStringLiteral("100 %") << QStringLiteral("100%") << false;
}

void TranslationsTest::seesLostPlaceholders()
{
    QFETCH(QString, source);
    QFETCH(QString, translation);
    QFETCH(bool, isFault);
    Message message;
    message.source = source;
    message.translations = QStringList(translation);
    QCOMPARE(faultsOf({message}, hasThePlaceholders).size(), isFault ? 1 : 0);
}

void TranslationsTest::seesLostCounts_data()
{
    QTest::addColumn<QStringList>("forms");
    QTest::addColumn<int>("faults");
    const auto row = [](const char *name, const QStringList &forms, int faults) {
        QTest::newRow(name) << forms << faults;
    };
    const QString counted = QStringLiteral("%n pages of %1");
    row("all forms", {counted, counted}, 0);
    row("one in words", {QStringLiteral("one page of %1"), counted}, 0);
    row("many in words", {counted, QStringLiteral("pages of %1")}, 1);
    row("a single form in words", {QStringLiteral("pages of %1")}, 1);
    row("another placeholder lost", {QStringLiteral("one page"), counted}, 1);
}

void TranslationsTest::seesLostCounts()
{
    QFETCH(QStringList, forms);
    Message message;
    message.source = QStringLiteral("%n page(s) of %1");
    message.isPlural = true;
    message.translations = forms;
    QTEST(faultsOf({message}, hasThePlaceholders).size(), "faults");
}

void TranslationsTest::seesOtherShortcuts_data()
{
    QTest::addColumn<QString>("source");
    QTest::addColumn<QString>("translation");
    QTest::addColumn<bool>("isFault");
    QTest::newRow("kept") << QStringLiteral("&Open") << QStringLiteral("\u041E&\u0442") << false;
    QTest::newRow("behind the text") << QStringLiteral("&Open") << QStringLiteral("\u958B(&O)") << false;
    QTest::newRow("lost") << QStringLiteral("&Open") << QStringLiteral("Offen") << true;
    QTest::newRow("added") << QStringLiteral("Open") << QStringLiteral("&Offen") << true;
    QTest::newRow("two") << QStringLiteral("&Open") << QStringLiteral("&Of&fen") << true;
    QTest::newRow("no letter") << QStringLiteral("A & B") << QStringLiteral("A und B") << false;
    QTest::newRow("an ampersand") << QStringLiteral("A && B") << QStringLiteral("A &&B") << false;
    QTest::newRow("markup") << QStringLiteral("&lt;a") << QStringLiteral("a") << false;
}

void TranslationsTest::seesOtherShortcuts()
{
    QFETCH(QString, source);
    QFETCH(QString, translation);
    QFETCH(bool, isFault);
    Message message;
    message.source = source;
    message.translations = QStringList(translation);
    QCOMPARE(faultsOf({message}, hasTheShortcuts).size(), isFault ? 1 : 0);
}

void TranslationsTest::seesOtherShapes_data()
{
    QTest::addColumn<QString>("source");
    QTest::addColumn<QString>("translation");
    QTest::addColumn<bool>("isFault");
    QTest::newRow("kept") << QStringLiteral("Open...") << QStringLiteral("Offen...") << false;
    QTest::newRow("before a letter") << QStringLiteral("&Open...") << QStringLiteral("Offen...(&O)") << false;
    QTest::newRow("lost dots") << QStringLiteral("Open...") << QStringLiteral("Offen") << true;
    QTest::newRow("added dots") << QStringLiteral("Open") << QStringLiteral("Offen...") << true;
    QTest::newRow("another ellipsis") << QStringLiteral("Open...") << QStringLiteral("Offen\u2026") << true;
    QTest::newRow("lines") << QStringLiteral("a\nb") << QStringLiteral("c\nd") << false;
    QTest::newRow("a lost line") << QStringLiteral("a\nb") << QStringLiteral("c d") << true;
}

void TranslationsTest::seesOtherShapes()
{
    QFETCH(QString, source);
    QFETCH(QString, translation);
    QFETCH(bool, isFault);
    Message message;
    message.source = source;
    message.translations = QStringList(translation);
    QCOMPARE(faultsOf({message}, hasTheShape).size(), isFault ? 1 : 0);
}

void TranslationsTest::seesUnmarkedTexts_data()
{
    QTest::addColumn<QString>("text");
    QTest::addColumn<bool>("isFault");
    const QString call = QStringLiteral("QCoreApplication::translate(");
    const QString marked = QStringLiteral("QT_TRANSLATE_NOOP(\"KvA\", \"Open\") ");
    QTest::newRow("a text") << call + QStringLiteral("\"KvA\", \"Open\");") << false;
    QTest::newRow("a text on the next line") << call + QStringLiteral("\"KvA\",\n    \"Open\");") << false;
    QTest::newRow("a variable") << call + QStringLiteral("\"KvA\", text);") << true;
    QTest::newRow("a variable and a context") << call + QStringLiteral("context, text);") << true;
    // A mark says nothing of the other calls in its file.
    QTest::newRow("beside a marked text") << marked + call + QStringLiteral("\"KvA\", text);") << true;
    QTest::newRow("the second call") << call + QStringLiteral("\"KvA\", \"Open\");") + call +
                                            QStringLiteral("\"KvA\", text);")
                                     << true;
    QTest::newRow("of a class") << QStringLiteral("KvA::tr(text)") << true;
    QTest::newRow("of a class, a text") << QStringLiteral("tr(\"Open\")") << false;
    QTest::newRow("of a class, a text on the next line") << QStringLiteral("tr(\n   \"Open\")") << false;
    QTest::newRow("another function") << QStringLiteral("str(text)") << false;
    QTest::newRow("commented out") << QStringLiteral("// ") + call + QStringLiteral("\"KvA\", text);")
                                   << false;
    QTest::newRow("of a painter") << QStringLiteral("painter.translate(a, b);") << false;
}

void TranslationsTest::seesUnmarkedTexts()
{
    QFETCH(QString, text);
    QFETCH(bool, isFault);
    QCOMPARE(variableTexts({{QStringLiteral("a.cpp"), text}}).size(), isFault ? 1 : 0);
}

void TranslationsTest::seesUntranslatedTexts_data()
{
    QTest::addColumn<QString>("text");
    QTest::addColumn<bool>("isFault");
    const auto row = [](const char *text, bool isFault) { QTest::newRow(text) << text << isFault; };
    row("std::fputs(\"No such file\", stderr);", true);
    row("std::fprintf(stderr, \"program: %s (program --help tells more)\\n\", fault);", true);
    row("printf(\"%s\\n\", qPrintable(text));", false);
    row("label->setText(QStringLiteral(\"Two words\"));", true);
    row("label->setText(isGood ? QLatin1String(\"Two words\") : QString());", true);
    row("label->setText(tr(\"Two words\"));", false);
    row("label->setText(QStringLiteral(\"%1 %2\").arg(a, b));", false);
    row("button->setToolTip(\"Two words\");", true);
    row("auto *const label = new QLabel(QStringLiteral(\"Two words\"), this);", true);
    row("const QLabel label(QStringLiteral(\"Two words\"));", true);
    row("menu->addAction(icon, QStringLiteral(\"Two words\"));", true);
    row("QMessageBox::warning(this, tr(\"Two words\"), QStringLiteral(\"And three more\"));", true);
    row("action->setText(a); f(QStringLiteral(\"no text\"));", false);
    row("// label->setText(QStringLiteral(\"Two words\"));", false);
    row("setStyleSheet(QStringLiteral(\"color: black\"));", false);
}

void TranslationsTest::seesUntranslatedTexts()
{
    QFETCH(QString, text);
    QFETCH(bool, isFault);
    QCOMPARE(untranslatedTexts({{QStringLiteral("a.cpp"), text}}).size(), isFault ? 1 : 0);
}

void TranslationsTest::thePluginHoldsEveryLanguage_data()
{
    QTest::addColumn<QString>("language");
    for (const QString &language : languages)
        QTest::newRow(qPrintable(language)) << language;
}

void TranslationsTest::thePluginHoldsEveryLanguage()
{
    QFETCH(QString, language);
    const QString resource = QStringLiteral(":/statreportingplugin/%1.qm").arg(language);
    QVERIFY(QFile::exists(resource));
    QTranslator translator;
    QVERIFY(translator.load(resource));
}

void TranslationsTest::thePluginTranslatesToEnglish_data()
{
    QTest::addColumn<QByteArray>("context");
    QTest::addColumn<QByteArray>("source");
    QTest::addColumn<QString>("translation");
    const auto row = [](const char *context, const char *source, const char *translation) {
        QTest::addRow("%s: %s", context, source)
            << QByteArray(context) << QByteArray(source) << QString::fromUtf8(translation);
    };
    row("StatReportingPlugin", "Statistics tools", "Report & Statistic");
    row("StatReportingPlugin", "Select Template File", "Select Report Template File");
    row("StatReportingPlugin", "Report Template File (*.rtp)", "Report Template File (*.rtp)");
    row("StatReportingPlugin", "No report template selected.", "No report template selected.");
    row("GuiStatReportingPluginUi", "Template:", "Template:");
    row("KvBaseEditorNodeFactory", "Text Document", "Text Document");
    row("KvReportKeywords", "Creation time", "Creation time");
}

void TranslationsTest::thePluginTranslatesToEnglish()
{
    QFETCH(QByteArray, context);
    QFETCH(QByteArray, source);
    QTranslator translator;
    QVERIFY(translator.load(QStringLiteral(":/statreportingplugin/English.qm")));
    QTEST(translator.translate(context.constData(), source.constData()), "translation");
}

void TranslationsTest::addFiles()
{
    QTest::addColumn<QString>("folder");
    QTest::addColumn<QString>("language");
    for (const auto &product : products) {
        for (const QString &language : languages)
            QTest::addRow("%s, %s", qPrintable(product.first), qPrintable(language))
                << product.second << language;
    }
}

void TranslationsTest::everyLanguageHasTheSameTexts_data()
{
    addFiles();
}

void TranslationsTest::everyLanguageHasTheSameTexts()
{
    QFETCH(QString, folder);
    QFETCH(QString, language);
    const QStringList english = keys(readMessages(path(folder, QStringLiteral("English"))));
    const QStringList own = keys(readMessages(path(folder, language)));
    QVERIFY(english.size() > 50);
    QVERIFY2(missing(english, own).isEmpty(), lines(missing(english, own)));
    QVERIFY2(missing(own, english).isEmpty(), lines(missing(own, english)));
    QCOMPARE(QStringList(own).removeDuplicates(), 0);
}

void TranslationsTest::everyLanguageIsComplete_data()
{
    addFiles();
}

/// Nothing is left to translate, and nothing is left over.
void TranslationsTest::everyLanguageIsComplete()
{
    static const QHash<QString, int> pluralForms{{QStringLiteral("Russian"), 3},
                                                 {QStringLiteral("Slovakian"), 3},
                                                 {QStringLiteral("Arabic"), 6},
                                                 {QStringLiteral("Japanese"), 1},
                                                 {QStringLiteral("Korean"), 1},
                                                 {QStringLiteral("ChineseSimple"), 1},
                                                 {QStringLiteral("ChineseTraditional"), 1}};
    QFETCH(QString, folder);
    QFETCH(QString, language);
    QStringList faults;
    for (const Message &message : readMessages(path(folder, language))) {
        const int forms = message.isPlural ? pluralForms.value(language, 2) : 1;
        const bool isEmpty = message.translations.contains(QString());
        if (!message.isFinished || isEmpty || message.translations.size() != forms)
            faults.append(message.key());
    }
    QVERIFY2(faults.isEmpty(), lines(faults));
}

void TranslationsTest::placeholdersAreKept_data()
{
    addFiles();
}

void TranslationsTest::placeholdersAreKept()
{
    QFETCH(QString, folder);
    QFETCH(QString, language);
    const QStringList faults = faultsOf(readMessages(path(folder, language)), hasThePlaceholders);
    QVERIFY2(faults.isEmpty(), lines(faults));
}

void TranslationsTest::shortcutsAreKept_data()
{
    addFiles();
}

void TranslationsTest::shortcutsAreKept()
{
    QFETCH(QString, folder);
    QFETCH(QString, language);
    const QStringList faults = faultsOf(readMessages(path(folder, language)), hasTheShortcuts);
    QVERIFY2(faults.isEmpty(), lines(faults));
}

void TranslationsTest::dotsAndLinesAreKept_data()
{
    addFiles();
}

void TranslationsTest::dotsAndLinesAreKept()
{
    QFETCH(QString, folder);
    QFETCH(QString, language);
    const QStringList faults = faultsOf(readMessages(path(folder, language)), hasTheShape);
    QVERIFY2(faults.isEmpty(), lines(faults));
}

void TranslationsTest::theTextsOfTheCodeAreThere_data()
{
    QTest::addColumn<QString>("sources");
    QTest::addColumn<QString>("folder");
    for (const auto &product : products)
        QTest::newRow(qPrintable(product.first)) << product.first << product.second;
}

/// Fails after a change of texts until scripts/update-translations has run.
void TranslationsTest::theTextsOfTheCodeAreThere()
{
    QFETCH(QString, sources);
    QFETCH(QString, folder);
    const QString extracted = temporaryPath(sources + QStringLiteral(".ts"));
    QProcess lupdate;
    lupdate.setWorkingDirectory(sourcePath(QString()));
    lupdate.start(QStringLiteral(STATREPORT_LUPDATE),
                  {QStringLiteral("-silent"), QStringLiteral("-locations"), QStringLiteral("none"),
                   QStringLiteral("-extensions"), QStringLiteral("cpp,h,ui"), sources, QStringLiteral("-ts"),
                   extracted});
    QVERIFY(lupdate.waitForFinished(60000));
    QCOMPARE(lupdate.exitCode(), 0);
    // Texts that it cannot tell the context of are complaints here.
    const QByteArray complaints = lupdate.readAllStandardError();
    QVERIFY2(complaints.isEmpty(), complaints.constData());

    const QStringList inCode = keys(readMessages(extracted));
    const QStringList inFile = keys(readMessages(path(folder, QStringLiteral("English"))));
    QVERIFY(inCode.size() > 50);
    QVERIFY2(missing(inCode, inFile).isEmpty(), lines(missing(inCode, inFile)));
    QVERIFY2(missing(inFile, inCode).isEmpty(), lines(missing(inFile, inCode)));
}

void TranslationsTest::contextsAreTheAgreedOnes_data()
{
    QTest::addColumn<QString>("context");
    QTest::addColumn<QStringList>("texts");
    QTest::newRow("plug-in") << QStringLiteral("StatReportingPlugin")
                             << QStringList({QStringLiteral("No report template selected."),
                                             QStringLiteral("Report Template File (*.rtp)"),
                                             QStringLiteral("Select Template File"),
                                             QStringLiteral("Statistics tools")});
    QTest::newRow("panel") << QStringLiteral("GuiStatReportingPluginUi")
                           << QStringList({QStringLiteral("Browse Templates"),
                                           QStringLiteral("Exports current measurments to pdf file."),
                                           QStringLiteral("Form"), QStringLiteral("Generate Report File"),
                                           QStringLiteral("Open Statistics Window"),
                                           QStringLiteral("Open Templates Editor"),
                                           QStringLiteral("Opens Report Template Editor"),
                                           QStringLiteral("Opens default template for report generation"),
                                           QStringLiteral("Template:")});
    QTest::newRow("keywords") << QStringLiteral("KvReportKeywords")
                              << QStringList({QStringLiteral("Creation date (ISO)"),
                                              QStringLiteral("Creation date (Text)"),
                                              QStringLiteral("Creation time"), QStringLiteral("Program name"),
                                              QStringLiteral("Program vendor"),
                                              QStringLiteral("Program version")});
}

void TranslationsTest::contextsAreTheAgreedOnes()
{
    QFETCH(QString, context);
    QFETCH(QStringList, texts);
    QStringList found;
    for (const Message &message : readMessages(path(products.at(0).second, QStringLiteral("English")))) {
        if (message.context == context)
            found.append(message.source);
    }
    found.sort();
    QCOMPARE(found, texts);
}

void TranslationsTest::noTextHidesFromLupdate()
{
    // Each of these was looked up: its texts are marked, most of them in a table above the call.
    const QStringList expected{
        QStringLiteral("cli/KvCliParser.cpp: kParserTexts[0]"),
        QStringLiteral("cli/KvCliParser.cpp: kParserTexts[1]"),
        QStringLiteral("cli/KvStatsReport.cpp: heading"),
        QStringLiteral("host/desk/KvDeskActions.cpp: definition.text"),
        QStringLiteral("host/desk/KvDeskActions.cpp: definition.toolTip"),
        QStringLiteral("host/desk/KvDeskExamples.cpp: example->title"),
        QStringLiteral("host/desk/KvDeskKnownDistance.cpp: unit.text"),
        QStringLiteral("host/measuring/ZtDrawnType.cpp: name"),
        QStringLiteral("host/measuring/ZtDrawnType.cpp: value.name"),
        QStringLiteral("host/measuring/ZtFileFault.cpp: cause.text"),
        QStringLiteral("host/measuring/ZtFileFault.cpp: cause.text"),
        QStringLiteral("host/measuring/ZtJsonRows.cpp: text"),
        QStringLiteral("src/blocks/measurementstable/KvStatisticsMeasurementsTableNodeCfg.cpp: name.toUtf8"),
        QStringLiteral("src/blocks/statisticstable/KvStatisticsStatsTableNodeCfg.cpp: name.toUtf8"),
        QStringLiteral("src/data/KvStatisticsUnitConverter.cpp: text")};
    QStringList found = variableTexts(codeOfTheProducts());
    found.sort();
    QVERIFY2(found == expected, lines(found));
}

void TranslationsTest::noTextIsUntranslated()
{
    const QStringList faults = untranslatedTexts(codeOfTheProducts());
    QVERIFY2(faults.isEmpty(), lines(faults));
}

STATREPORT_TEST_MAIN(TranslationsTest)
#include "TranslationsTest.moc"
