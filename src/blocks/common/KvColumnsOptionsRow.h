// SPDX-License-Identifier: MIT
#pragma once

#include <QSet>
#include <QStringList>
#include <QVector>
#include <QWidget>

class QCheckBox;

/** Options row with one check box per column of a table. */
class KvColumnsOptionsRow : public QWidget
{
    Q_OBJECT
public:
    /** \a names are the untranslated names of the columns, \a labels their translations. */
    KvColumnsOptionsRow(const QStringList &names, const QStringList &labels, QWidget *parent = nullptr);

    void setColumns(const QSet<QString> &columns); ///< emits nothing

signals:
    void signalColumnStateChanged(const QString &aName, int aState); ///< a Qt::CheckState

private slots:
    void slotStateChanged(int aState);

private:
    QStringList m_names;
    QVector<QCheckBox *> m_boxes;
};
