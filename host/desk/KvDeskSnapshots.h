// SPDX-License-Identifier: MIT
#pragma once

#include <QImage>
#include <QObject>
#include <QString>
#include <QStringList>
#include <QVector>

#include <memory>

class KvDeskActions;
class ZtMeasuringDocument;
class ZtWorkerThread;
struct ZtFault;

/**
 * Takes snapshots of the image, into the snapshots' folder.
 *
 * Files are written in a thread, one after the other; the user can go on at once.
 */
class KvDeskSnapshots : public QObject
{
    Q_OBJECT
public:
    /** So many pictures may wait to be written; more are not taken, as they take memory. */
    static constexpr int maximumWaiting = 16;

    /** Both have to outlive this. */
    KvDeskSnapshots(KvDeskActions *actions, ZtMeasuringDocument *document, QObject *parent = nullptr);
    ~KvDeskSnapshots() override;

    bool isSaving() const { return m_thread != nullptr; }

public slots:
    void slotTake();
    void slotUpdate(); ///< there is an image now, or there is none any more

signals:
    void signalSaved(const QString &aPath);

private slots:
    void slotFinished();
    void slotMeasurementsToggled(bool aChecked);

private:
    struct Snapshot
    {
        QImage image;
        QString path;
    };

    QImage picture() const;
    QStringList takenPaths() const;
    void startNext();
    void tellFault(const QString &text) const;

    KvDeskActions *m_actions;
    ZtMeasuringDocument *m_document;
    QVector<Snapshot> m_waiting;
    QString m_path;                    ///< that is being written
    std::shared_ptr<ZtFault> m_result; ///< belongs to the thread until it ends
    std::unique_ptr<ZtWorkerThread> m_thread;
};
