// SPDX-License-Identifier: MIT
#include "KvDeskAutosave.h"
#include "KvDeskFileCommands.h"
#include "KvDeskMainWindow.h"
#include "KvDeskSession.h"
#include "kernel/ZtAppSettings.h"
#include "measuring/ZtDrawnType.h"
#include "measuring/ZtMeasuringDocument.h"

#include <QApplication>
#include <QTimer>

#include <cstdio>

/**
 * The Measuring Desk with a user who never stops: draws an object every few milliseconds, and saves now and
 * then. It prints how many objects there are after each measurement ("measured 5"), saving ("saved 5") and
 * copy
 * ("copied 5"), and ends only by being killed.
 *
 * Arguments: session file, recovery folder, "save" or "measure".
 */
class SteadyMeasuring : public QObject
{
    Q_OBJECT
public:
    SteadyMeasuring(const QString &session, const QString &recoveryFolder, bool isSaving)
        : m_window(&m_document)
        , m_path(session)
    {
        m_window.startRecovery(recoveryFolder);
        m_window.autosave()->setDelay(100);
        m_window.show();
        m_window.files()->openSession(session);
        connect(&m_measure, SIGNAL(timeout()), this, SLOT(slotMeasure()));
        connect(&m_save, SIGNAL(timeout()), this, SLOT(slotSave()));
        connect(m_window.autosave(), SIGNAL(signalWritten()), this, SLOT(slotCopied()));
        m_measure.start(2);
        if (isSaving)
            m_save.start(10);
    }

private slots:
    void slotMeasure()
    {
        m_document.addObject(ZtDrawnType::Line, QPolygonF(QVector<QPointF>{QPointF(0, 0), QPointF(5, 5)}));
        tell("measured");
    }
    void slotSave()
    {
        const int count = m_window.session()->objectCount();
        if (m_window.files()->saveSession(m_path))
            tell("saved", count);
    }
    void slotCopied() { tell("copied"); }

private:
    void tell(const char *what) const { tell(what, m_window.session()->objectCount()); }
    static void tell(const char *what, int count)
    {
        std::printf("%s %d\n", what, count);
        std::fflush(stdout);
    }

    ZtMeasuringDocument m_document;
    KvDeskMainWindow m_window;
    QString m_path;
    QTimer m_measure;
    QTimer m_save;
};

int main(int argc, char **argv)
{
    QApplication application(argc, argv);
    ZtAppSettings::getInstance()->setStoragePath(QString());
    const QStringList arguments = QCoreApplication::arguments();
    if (arguments.size() != 4)
        return 2;
    const SteadyMeasuring user(arguments.at(1), arguments.at(2), arguments.at(3) == QLatin1String("save"));
    return QApplication::exec();
}

#include "SteadyMeasuring.moc"
