// SPDX-License-Identifier: MIT
#pragma once

#include "blocks/common/KvPictureRendition.h"
#include "report/KvBaseDisplayWidget.h"

#include <QWidget>

class KvBaseEditorNodeCfg;
struct KvPicturePlacement;

/**
 * Base of the display widgets that show one picture, as wide as the page's content. While there is none a
 * small placeholder stands in for it.
 *
 * Picture and placement are asked for whenever they are needed: a configuration that is read anew shows at
 * once.
 */
class KvPictureWidget
    : public QWidget
    , public KvBaseDisplayWidget
{
    Q_OBJECT
public:
    /** The widget itself. */
    QWidget *subWidgetAt(int index) override;
    QSize sizeHint() const override;

protected:
    /** \a cfg is not owned and outlives the widget. */
    KvPictureWidget(QWidget *parent, KvBaseEditorNodeCfg *cfg);

    virtual const KvPicturePlacement &placement() const = 0;
    /** Null while there is none. */
    virtual QPixmap picture() const = 0;

    /** Tells that the user changed the configuration. */
    void announceConfigChanged();
    /** Tells that the block looks different now and may have another size. */
    void announceChanged();

    void paintEvent(QPaintEvent *event) override;

private:
    struct Shown
    {
        QPixmap pixmap;
        int widthPercent;
    };

    Shown shown() const;
    QSize room(int width) const;

    KvBaseEditorNodeCfg *m_cfg;
    KvPictureRendition m_rendition;
};
