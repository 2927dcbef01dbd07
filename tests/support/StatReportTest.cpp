// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "kernel/ZtAppSettings.h"

#include <QApplication>

#include <memory>

namespace {

struct WarningState
{
    QtMessageHandler chained = nullptr;
    QStringList unexpected;
    QList<QRegularExpression> announced;
    int unexpectedTotal = 0;
};

WarningState &warningState()
{
    static WarningState state;
    return state;
}

// The offscreen platform says the one of every window that is shown. The other comes from an X server without a
// window manager when a window wants the keyboard before it is mapped. Neither means anything.
bool isPlatformNoise(const QString &message)
{
    return message == QLatin1String("This plugin does not support propagateSizeHints()") ||
           (message.startsWith(QLatin1String("QXcbConnection: XCB error: 8 (BadMatch)")) &&
            message.contains(QLatin1String("(SetInputFocus)")));
}

bool takeAnnounced(const QString &message)
{
    QList<QRegularExpression> &announced = warningState().announced;
    for (int i = 0; i < announced.size(); ++i) {
        if (announced.at(i).match(message).hasMatch()) {
            announced.removeAt(i);
            return true;
        }
    }
    return false;
}

void handleMessage(QtMsgType type, const QMessageLogContext &context, const QString &message)
{
    WarningState &state = warningState();
    if ((type == QtWarningMsg || type == QtCriticalMsg) && !isPlatformNoise(message)
        && !takeAnnounced(message)) {
        state.unexpected.append(message);
        ++state.unexpectedTotal;
    }
    if (state.chained)
        state.chained(type, context, message);
}

// QTest installs its own handler when it starts a test object, so ours has to come on top of it later.
void installHandler()
{
    const QtMessageHandler previous = qInstallMessageHandler(handleMessage);
    if (previous != handleMessage)
        warningState().chained = previous;
}

QTemporaryDir &temporaryDir()
{
    static QTemporaryDir dir;
    return dir;
}

} // namespace

StatReportTest::StatReportTest()
{
    installHandler();
}

StatReportTest::~StatReportTest() = default;

void StatReportTest::expectWarning(const QRegularExpression &pattern)
{
    warningState().announced.append(pattern);
}

int StatReportTest::unexpectedWarningCount()
{
    return warningState().unexpectedTotal;
}

QString StatReportTest::temporaryPath(const QString &fileName)
{
    return temporaryDir().filePath(fileName);
}

QString StatReportTest::sourcePath(const QString &relativePath)
{
    return QStringLiteral(STATREPORT_SOURCE_DIR "/") + relativePath;
}

void StatReportTest::init()
{
    installHandler();
}

void StatReportTest::cleanup()
{
    WarningState &state = warningState();
    const QStringList unexpected = state.unexpected;
    const QList<QRegularExpression> missing = state.announced;
    state.unexpected.clear();
    state.announced.clear();
    QVERIFY2(unexpected.isEmpty(), qPrintable(QStringLiteral("Qt warned: ") + unexpected.join(QLatin1String(" | "))));
    QVERIFY2(missing.isEmpty(), "a warning that the test announced did not come");
}

int runStatReportTest(int argc, char **argv, StatReportTest *(*create)())
{
    QCoreApplication::setAttribute(Qt::AA_Use96Dpi);
    QApplication app(argc, argv);
    QFont::insertSubstitutions(QStringLiteral("Segoe UI"),
                               {QStringLiteral("Open Sans"), QStringLiteral("Noto Sans"), QStringLiteral("DejaVu Sans")});
    ZtAppSettings::getInstance()->setStoragePath(QString());
    const std::unique_ptr<StatReportTest> test(create());
    const int failures = QTest::qExec(test.get(), argc, argv);
    // Warnings of initTestCase() and of destructors count too.
    return failures + StatReportTest::unexpectedWarningCount();
}
