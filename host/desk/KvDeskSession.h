// SPDX-License-Identifier: MIT
#pragma once

#include <QObject>
#include <QString>
#include <QStringList>

class ZtMeasuringDocument;
struct ZtFault;

/**
 * The session that the user works on: the document, the file it belongs to, and whether the file lacks
 * anything.
 *
 * Operations that read a file change nothing when they fail.
 */
class KvDeskSession : public QObject
{
    Q_OBJECT
public:
    /** \a document has to outlive this. */
    explicit KvDeskSession(ZtMeasuringDocument *document, QObject *parent = nullptr);

    ZtMeasuringDocument *document() const { return m_document; }
    /** Absolute path of the session file; empty as long as there is none. */
    QString path() const { return m_path; }
    /** File name of the session, or what to call one without a file. */
    QString displayName() const;
    bool isModified() const { return m_isModified; }
    /** Number of objects of all types. */
    int objectCount() const;

    /** Starts an empty session without a file. */
    void clear();
    /** A session whose image is missing is a fault unless \a withoutImage allows it. */
    bool open(const QString &path, bool withoutImage, ZtFault *fault);
    /** Saves to \a path, which becomes the session's file. */
    bool save(const QString &path, ZtFault *fault);
    /**
     * Shows another image below the same objects. Its pixel size is taken over when nothing was calibrated or
     * measured before. Looking at an image alone is nothing that would be lost.
     */
    bool openImage(const QString &path, ZtFault *fault);
    /** Adds the objects of a table; \a notes tells what was left out of it. */
    bool importTable(const QString &path, ZtFault *fault, QStringList *notes);

signals:
    void signalStateChanged(); ///< path() or isModified()

private slots:
    void slotMarkModified();

private:
    void connectSignals();
    void setState(const QString &path, bool isModified);

    ZtMeasuringDocument *m_document;
    QString m_path;
    bool m_isModified = false;
    bool m_isReplacing = false; ///< the document changes because a file is read, not because of the user
};
