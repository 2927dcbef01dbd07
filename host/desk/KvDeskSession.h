// SPDX-License-Identifier: MIT
#pragma once

#include "KvDeskFileStamp.h"

#include <QObject>
#include <QString>
#include <QStringList>

#include <memory>
#include <vector>

class ZtFrameSource;
class ZtCalibration;
class ZtMeasuringDocument;
class ZtReadyObjects;
class ZtStillImageSource;
struct ZtFault;
struct ZtLoadedSession;

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
    /** Every change since the file was read or written was undone. */
    void setUnmodified() { setState(m_path, false); }
    /** Grows with every change that would be lost. */
    quint64 changeCount() const { return m_changeCount; }
    /** The session's file when it was read or written last. */
    const KvDeskFileStamp &fileStamp() const { return m_stamp; }
    /** Another program wrote the session's file since it was read or written. */
    bool isChangedOnDisk() const;
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
    /** Shows a live image below the same objects; its frames belong to no file. */
    void showSource(std::unique_ptr<ZtFrameSource> source);
    /** Adds the objects of a table; \a notes tells what was left out of it. */
    bool importTable(const QString &path, ZtFault *fault, QStringList *notes);

    /** The same with what was read already; \a stamp is that of the file before it was read. */
    void setSession(ZtLoadedSession *loaded, const QString &path, const KvDeskFileStamp &stamp);
    /** As setSession(), but without a file. */
    void setCopy(ZtLoadedSession *loaded);
    void showImage(std::unique_ptr<ZtStillImageSource> image);
    void addTable(std::vector<ZtReadyObjects> *ready);
    /** As setSession(), but with changes that \a path, which may be empty, has not got. */
    void restore(ZtLoadedSession *loaded, const QString &path, const KvDeskFileStamp &stamp);
    /** The session as it was at \a changeCount was written to \a path. */
    void setSaved(const QString &path, quint64 changeCount);

signals:
    void signalChanged();      ///< something changed that would be lost; comes with every change
    void signalStateChanged(); ///< path() or isModified()
    void signalReplaced();     ///< another session was opened or started: all objects are others
    void signalImageOpened();  ///< an image file was opened in this session

private slots:
    void slotMarkModified();

private:
    void connectSignals();
    void setState(const QString &path, bool isModified);
    ZtCalibration offeredNow() const;
    void replaceBy(ZtLoadedSession *loaded, const KvDeskFileStamp &stamp);

    ZtMeasuringDocument *m_document;
    QString m_path;
    KvDeskFileStamp m_stamp;
    quint64 m_changeCount = 0;
    bool m_isModified = false;
    bool m_isReplacing = false; ///< the document changes because a file is read, not because of the user
};
