// SPDX-License-Identifier: MIT
#pragma once

#include <QMenu>

class KvDeskSourceCommands;
class ZtFrameSourceScan;

/** Menu with everything that an image can come from. Cameras are looked for whenever it is opened. */
class KvDeskSourceMenu : public QMenu
{
    Q_OBJECT
public:
    /** \a commands has to outlive the menu. */
    explicit KvDeskSourceMenu(KvDeskSourceCommands *commands, QWidget *parent = nullptr);
    ~KvDeskSourceMenu() override;

    /** The cameras, or one entry that says why there are none. */
    QList<QAction *> cameraActions() const { return m_cameras; }
    ZtFrameSourceScan *scan() const { return m_scan; }

private slots:
    void slotAboutToShow();
    void slotListCameras();
    void slotTriggered(QAction *aAction);

private:
    void createFiles();
    void clearCameras();
    void addRemark(const QString &text);

    KvDeskSourceCommands *m_commands;
    ZtFrameSourceScan *m_scan;
    QList<QAction *> m_cameras;
};
