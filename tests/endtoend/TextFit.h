// SPDX-License-Identifier: MIT
#pragma once

#include "KvDeskCellDelegate.h"

#include <QAbstractButton>
#include <QAbstractScrollArea>
#include <QAbstractSpinBox>
#include <QApplication>
#include <QBoxLayout>
#include <QComboBox>
#include <QFormLayout>
#include <QGroupBox>
#include <QHeaderView>
#include <QLabel>
#include <QLineEdit>
#include <QMenuBar>
#include <QStringList>
#include <QStyle>
#include <QStyleOptionButton>
#include <QStyleOptionComboBox>
#include <QTabBar>
#include <QTableView>
#include <QToolButton>

/** Looks for texts of a window that have too little room where they stand. */
class TextFit
{
public:
    /** A line for each visible text of \a window that is cut. */
    static QStringList faults(QWidget *window)
    {
        TextFit fit(window);
        fit.check(window);
        for (QWidget *widget : window->findChildren<QWidget *>()) {
            if (widget->isVisibleTo(window) && widget->window() == window)
                fit.check(widget);
        }
        return fit.m_faults;
    }

private:
    explicit TextFit(QWidget *window)
        : m_window(window)
    {}

    void check(QWidget *widget)
    {
        if (widget->layout())
            checkOverlaps(widget);
        if (auto *label = qobject_cast<QLabel *>(widget))
            checkLabel(label);
        else if (auto *button = qobject_cast<QAbstractButton *>(widget))
            checkButton(button);
        else if (auto *group = qobject_cast<QGroupBox *>(widget))
            need(group, group->title(), group->minimumSizeHint().width(), group->width());
        else if (auto *combo = qobject_cast<QComboBox *>(widget))
            checkCombo(combo);
        else if (auto *tabs = qobject_cast<QTabBar *>(widget))
            checkTabs(tabs);
        else if (auto *header = qobject_cast<QHeaderView *>(widget))
            checkHeader(header);
        else if (auto *edit = qobject_cast<QLineEdit *>(widget))
            checkEdit(edit);
        else if (auto *bar = qobject_cast<QMenuBar *>(widget))
            checkBar(bar);
        else if (auto *table = qobject_cast<QTableView *>(widget))
            checkTable(table);
    }

    /** The visible widgets of a layout and those within it; other layouts may put widgets on one another. */
    static QList<QWidget *> widgetsOf(const QLayout *layout)
    {
        QList<QWidget *> found;
        if (!qobject_cast<const QBoxLayout *>(layout) && !qobject_cast<const QFormLayout *>(layout))
            return found;
        for (int i = 0; i < layout->count(); ++i) {
            QLayoutItem *const item = layout->itemAt(i);
            if (item->layout())
                found += widgetsOf(item->layout());
            else if (item->widget() && item->widget()->isVisible())
                found.append(item->widget());
        }
        return found;
    }

    // A window that is too low for its layout puts one thing over another.
    void checkOverlaps(QWidget *widget)
    {
        const QList<QWidget *> parts = widgetsOf(widget->layout());
        for (int i = 0; i < parts.size(); ++i) {
            for (int j = 0; j < i; ++j) {
                if (parts.at(i)->geometry().intersects(parts.at(j)->geometry()))
                    fault(parts.at(i), QString(), QStringLiteral("lies over ") + describe(parts.at(j)));
            }
        }
    }

    void checkLabel(QLabel *label)
    {
        if (label->text().isEmpty())
            return;
        if (QString::fromLatin1(label->metaObject()->className()).contains(QLatin1String("ElidedLabel"))) {
            // What is left out has to be readable somewhere.
            if (advance(label, label->text()) > label->contentsRect().width() && label->toolTip().isEmpty())
                fault(label, label->text(), QStringLiteral("elided without a tool tip"));
            return;
        }
        if (!label->wordWrap()) {
            need(label, label->text(), label->sizeHint().width(), label->width());
            need(label, label->text(), label->sizeHint().height(), label->height());
        } else {
            need(label, label->text(), label->heightForWidth(label->width()), label->height());
            need(label, label->text(), label->minimumSizeHint().width(), label->width());
        }
        checkClipping(label, label->text());
    }

    void checkButton(QAbstractButton *button)
    {
        auto *tool = qobject_cast<QToolButton *>(button);
        const bool isIcon =
            tool && tool->toolButtonStyle() == Qt::ToolButtonIconOnly && !tool->icon().isNull();
        if (button->text().isEmpty() || isIcon)
            return;
        const int icon = button->icon().isNull() ? 0 : button->iconSize().width() + 4;
        need(button, button->text(),
             qMin(button->sizeHint().width(), advance(button, button->text()) + icon + 8), button->width());
        checkClipping(button, button->text());
    }

    void checkCombo(QComboBox *combo)
    {
        QStyleOptionComboBox option;
        option.initFrom(combo);
        option.editable = combo->isEditable();
        const QRect field =
            combo->style()->subControlRect(QStyle::CC_ComboBox, &option, QStyle::SC_ComboBoxEditField, combo);
        // Names of files and folders may be of any length.
        const bool isData = combo->objectName() == QLatin1String("theTemplatePath") ||
                            combo->objectName() == QLatin1String("lookInCombo");
        for (int i = 0; i < combo->count() && !isData; ++i) {
            if (combo->itemData(i, Qt::ToolTipRole).isNull())
                need(combo, combo->itemText(i), combo->fontMetrics().boundingRect(combo->itemText(i)).width(),
                     field.width());
        }
        checkClipping(combo, combo->currentText());
    }

    void checkTabs(QTabBar *tabs)
    {
        for (int i = 0; i < tabs->count(); ++i)
            need(tabs, tabs->tabText(i), advance(tabs, tabs->tabText(i)), tabs->tabRect(i).width() - 8);
    }

    void checkHeader(QHeaderView *header)
    {
        if (header->orientation() != Qt::Horizontal || !header->model())
            return;
        for (int i = 0; i < header->count(); ++i) {
            const QString text = header->model()->headerData(i, Qt::Horizontal).toString();
            // Headings elide by themselves; what is left out has to be readable somewhere.
            const QVariant toolTip = header->model()->headerData(i, Qt::Horizontal, Qt::ToolTipRole);
            if (!header->isSectionHidden(i) && !text.isEmpty() && toolTip.toString() != text)
                need(header, text, header->fontMetrics().size(0, text).width() + 4, header->sectionSize(i));
        }
    }

    void checkEdit(QLineEdit *edit)
    {
        // What somebody types may be longer than the field, what a field says by itself may not.
        if (qobject_cast<QAbstractSpinBox *>(edit->parentWidget()))
            need(edit, edit->text(), advance(edit, edit->text()), edit->contentsRect().width() - 2);
        // A field elides by itself; what is left out has to be readable somewhere.
        if (!edit->toolTip().contains(edit->placeholderText()))
            need(edit, edit->placeholderText(), advance(edit, edit->placeholderText()),
                 edit->contentsRect().width());
    }

    void checkBar(QMenuBar *bar)
    {
        for (QAction *action : bar->actions()) {
            if (!bar->rect().contains(bar->actionGeometry(action)))
                fault(bar, action->text(), QStringLiteral("is outside of the menu bar"));
        }
    }

    // Texts of cells elide by themselves, but two of a column must not look alike then.
    void checkTable(QTableView *table)
    {
        for (int column = 0; table->model() && column < table->model()->columnCount(); ++column) {
            QHash<QString, QString> shown;
            for (int row = 0; row < table->model()->rowCount() && table->rowAt(0) >= 0; ++row) {
                const QModelIndex index = table->model()->index(row, column);
                const auto *delegate = qobject_cast<const KvDeskCellDelegate *>(table->itemDelegate(index));
                if (!delegate || !table->viewport()->rect().intersects(table->visualRect(index)))
                    continue;
                QStyleOptionViewItem cell;
                cell.initFrom(table);
                cell.widget = table;
                cell.rect = table->visualRect(index);
                const QString text = index.data().toString();
                const QString other = shown.value(delegate->shownText(cell, index), text);
                if (other != text)
                    fault(table, text, QStringLiteral("looks like ") + other);
                shown.insert(delegate->shownText(cell, index), text);
            }
        }
    }

    // A text may also lie below the edge of what it is in; what scrolls up and down can be brought into view.
    void checkClipping(QWidget *widget, const QString &text)
    {
        const QRect place = widget->rect();
        for (QWidget *above = widget->parentWidget(); above && above != m_window->parentWidget();
             above = above->parentWidget()) {
            const QRect there(widget->mapTo(above, place.topLeft()), place.size());
            auto *const area = qobject_cast<QAbstractScrollArea *>(above);
            const bool isInside =
                area ? there.left() >= 0 && there.right() < above->width() : above->rect().contains(there);
            // The viewport is where the content scrolls.
            const bool isViewport = qobject_cast<QAbstractScrollArea *>(above->parentWidget());
            if (!isInside && !isViewport && !isContentOfArea(above)) {
                fault(widget, text, QStringLiteral("lies outside of ") + describe(above));
                return;
            }
            if (above == m_window || area)
                return;
        }
    }

    static bool isContentOfArea(const QWidget *widget)
    {
        const QWidget *const viewport = widget->parentWidget();
        return viewport && qobject_cast<QAbstractScrollArea *>(viewport->parentWidget());
    }

    static int advance(const QWidget *widget, const QString &text)
    {
        return widget->fontMetrics().size(Qt::TextShowMnemonic, text).width();
    }

    void need(QWidget *widget, const QString &text, int needed, int given)
    {
        if (needed > given)
            fault(widget, text, QStringLiteral("needs %1 px, has %2").arg(needed).arg(given));
    }

    void fault(QWidget *widget, const QString &text, const QString &what)
    {
        m_faults.append(QStringLiteral("%1 \"%2\" %3").arg(describe(widget), text, what));
    }

    static QString describe(const QWidget *widget)
    {
        QStringList names;
        for (const QWidget *it = widget; it && names.size() < 3; it = it->parentWidget())
            names.prepend(QLatin1String(it->metaObject()->className()) +
                          (it->objectName().isEmpty() ? QString() : QLatin1Char('#') + it->objectName()));
        return names.join(QLatin1Char('/'));
    }

    QWidget *m_window;
    QStringList m_faults;
};
