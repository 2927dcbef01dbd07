// SPDX-License-Identifier: MIT
#pragma once

#include <QWidget>

class KvDeskActions;
class KvDeskStepRow;
class QGridLayout;
class QHBoxLayout;
class QLabel;
class QMenu;
class QPushButton;
class QToolButton;
class QVBoxLayout;

/**
 * What a user sees who has opened nothing yet: three steps from an image to a report, the example sessions,
 * and the sessions that were used last.
 *
 * Examples and recent sessions are looked for whenever the page is shown.
 */
class KvDeskStartPage : public QWidget
{
    Q_OBJECT
public:
    /** \a actions and \a sourceMenu have to live on; \a examplesFolder may be empty. */
    KvDeskStartPage(KvDeskActions *actions, QMenu *sourceMenu, const QString &examplesFolder,
                    QWidget *parent = nullptr);

    /** Whether there is something to calibrate, to measure, and to go back to. */
    void setAnythingOpen(bool isOpen);
    /** Buttons of the example sessions, from left to right. */
    QList<QToolButton *> exampleButtons() const { return m_examples; }
    QList<QPushButton *> recentButtons() const { return m_recent; }
    QPushButton *backButton() const { return m_back; }

    QSize minimumSizeHint() const override; ///< with everything below one another

signals:
    void signalExampleChosen(const QString &aPath);
    void signalRecentChosen(const QString &aPath);
    void signalLeft(); ///< the user wants to see the image again

protected:
    void showEvent(QShowEvent *event) override;
    void resizeEvent(QResizeEvent *event) override;
    void keyPressEvent(QKeyEvent *event) override;

private slots:
    void slotExampleClicked();
    void slotRecentClicked();

private:
    void createSteps(QVBoxLayout *layout, KvDeskActions *actions, QMenu *sourceMenu);
    void createExamples(QVBoxLayout *layout);
    void createRecent(QVBoxLayout *layout);
    void listExamples();
    void listRecent();
    void addExample(const QString &path);
    void addRecent(const QString &path);
    void placeExamples();
    void placeSteps();

    QString m_examplesFolder;
    QHBoxLayout *m_heading = nullptr;
    QList<KvDeskStepRow *> m_steps;
    KvDeskStepRow *m_calibrate = nullptr;
    KvDeskStepRow *m_measure = nullptr;
    QPushButton *m_back = nullptr;
    QWidget *m_examplesGroup = nullptr;
    QGridLayout *m_examplesLayout = nullptr;
    QList<QToolButton *> m_examples;
    QWidget *m_recentGroup = nullptr;
    QVBoxLayout *m_recentLayout = nullptr;
    QList<QPushButton *> m_recent;
};
