// SPDX-License-Identifier: MIT
#pragma once

#include <QMetaType>
#include <QString>

#include <memory>

class KvBaseDisplayWidgetSignals;
class QWidget;

/**
 * Interface of every block's display widget, which is laid out in one or more pieces.
 *
 * Implemented beside a QWidget or QObject base. The signals object dies in this class's destructor, when the
 * derived class is already gone: what is connected to its destroyed() may only clear pointers.
 */
class KvBaseDisplayWidget
{
public:
    KvBaseDisplayWidget();
    virtual ~KvBaseDisplayWidget();

    /** Translated name of the block for the user. */
    virtual QString displayName() const = 0;
    /** Number of pieces, in page order. */
    virtual int subWidgetCount();
    /** The widget of a piece; null for a piece to skip. */
    virtual QWidget *subWidgetAt(int index) = 0;
    /**
     * A new options panel as a child of \a parent, or null where the block has no options.
     * \param withPlacement false leaves out the rows for width and alignment, which mean nothing off a page
     */
    virtual QWidget *createOptionsWidget(QWidget *parent, bool withPlacement) = 0;

    KvBaseDisplayWidgetSignals *displaySignals() const { return m_signals.get(); }

private:
    Q_DISABLE_COPY(KvBaseDisplayWidget)

    std::unique_ptr<KvBaseDisplayWidgetSignals> m_signals;
};

Q_DECLARE_METATYPE(KvBaseDisplayWidget *)
