// SPDX-License-Identifier: MIT
#pragma once

#include "KvDeskRecoveryFile.h"

#include <QObject>

#include <memory>
#include <vector>

class KvDeskFileCommands;
class KvDeskSession;
class QLockFile;

/**
 * The copies of unsaved work that programs left which did not end in order, newest first.
 *
 * Copies that were found are locked, so that no other program offers them, too. One that was restored stays
 * until its changes are saved or the user does without them.
 */
class KvDeskRecovery : public QObject
{
    Q_OBJECT
public:
    /** Both have to outlive this, unless it is told so by end(). */
    KvDeskRecovery(KvDeskSession *session, KvDeskFileCommands *files, QObject *parent = nullptr);
    ~KvDeskRecovery() override;

    /** Looks for copies in a folder, and clears away what is left of others. */
    void find(const QString &folder);

    int count() const { return static_cast<int>(m_found.size()); }
    const KvDeskRecoveryFile &at(int index) const;
    /** What the user calls the session of a copy, and its size. */
    QString describe(int index) const;

    /** Opens a copy as a session with unsaved changes; false when the user or a fault prevents that. */
    bool restore(int index);
    /** Deletes a copy. */
    void discard(int index);
    /** The user has decided about the changes of what was restored. */
    void end();

signals:
    void signalChanged(); ///< count() or the copies

private slots:
    void slotSessionReplaced();
    void slotSessionStateChanged();

private:
    struct Copy;
    using Copies = std::vector<std::unique_ptr<Copy>>;

    static std::unique_ptr<QLockFile> lock(const QString &file);
    static void clearAway(const QString &folder);
    static void remove(Copy *copy);
    void removeRestored();

    KvDeskSession *m_session;
    KvDeskFileCommands *m_files;
    Copies m_found;
    Copies m_restored; ///< those that the session now open came from
};
