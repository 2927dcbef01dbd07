// SPDX-License-Identifier: MIT
#pragma once

#include "KvDeskObjectChanges.h"
#include "KvDeskObjectId.h"

#include <QFrame>
#include <QIcon>
#include <QVector>

class KvDeskImageView;
class KvDeskToolBox;
class QAction;
class QComboBox;
class QLabel;
class QToolButton;

/** A bar over the image while the user counts: which counter gets the clicks, and a button for another one.
 */
class KvDeskCounterBar : public QFrame
{
    Q_OBJECT
public:
    /** Both have to outlive the bar. */
    KvDeskCounterBar(KvDeskToolBox *toolBox, KvDeskImageView *view);

    QComboBox *classes() const { return m_classes; }
    QToolButton *newClassButton() const { return m_newClass; }

protected:
    bool eventFilter(QObject *watched, QEvent *event) override;

private slots:
    void slotToolChanged();
    void slotUpdate();
    void slotChosen(int aIndex);
    void slotNewClass();

private:
    void createWidgets();
    void createNewClass();
    void place();
    void showWhatFits();
    int widthOf(const QList<QWidget *> &parts, int classesWidth) const;
    void showColors();
    QString classText(const KvDeskObjectId &counter) const;

    KvDeskToolBox *m_toolBox;
    KvDeskImageView *m_view;
    KvDeskObjectChanges m_changes;
    QVector<KvDeskObjectId> m_counters; ///< in the order of the list
    QComboBox *m_classes = nullptr;
    QVector<QIcon> m_swatches; ///< in the order of the counters' colours
    QToolButton *m_newClass = nullptr;
    QAction *m_newClassAction = nullptr;
    QLabel *m_label = nullptr;
    QLabel *m_hint = nullptr;
};
