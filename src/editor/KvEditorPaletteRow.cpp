// SPDX-License-Identifier: MIT
#include "editor/KvEditorPaletteRow.h"

#include "gui/QtAdvancedStylesheet.h"
#include "gui/acss.h"
#include "resources/KvReportResources.h"
#include "widgets/KvThemePainting.h"

#include <QHBoxLayout>
#include <QKeyEvent>
#include <QLabel>
#include <QPainter>

namespace {

constexpr int kIconExtent = 24;
constexpr int kIconMode = 6;
constexpr int kMargin = 4;
constexpr int kSpacing = 8;

/// Drawn rather than asked for: an icon's own pixmap is as coarse as the application's attributes say.
QPixmap sharpPixmap(const QIcon &icon, qreal ratio)
{
    if (icon.isNull())
        return QPixmap();
    const QRect rect(0, 0, kIconExtent, kIconExtent);
    QPixmap pixmap((QSizeF(rect.size()) * ratio).toSize());
    pixmap.setDevicePixelRatio(ratio);
    pixmap.fill(Qt::transparent);
    QPainter painter(&pixmap);
    icon.paint(&painter, rect);
    return pixmap;
}

} // namespace

KvEditorPaletteRow::KvEditorPaletteRow(QWidget *parent)
    : QFrame(parent)
    , m_iconLabel(new QLabel(this))
    , m_nameLabel(new QLabel(this))
    , m_markLabel(new QLabel(this))
{
    KvReportResources::ensure();
    setAttribute(Qt::WA_Hover);
    // Not by mouse: a press starts a drag onto a page whose selected block keeps the keyboard.
    setFocusPolicy(Qt::TabFocus);
    m_iconLabel->setFixedSize(kIconExtent, kIconExtent);
    m_markLabel->setFixedWidth(kIconExtent);
    m_markLabel->setAlignment(Qt::AlignCenter);
    auto *row = new QHBoxLayout(this);
    row->setContentsMargins(kMargin, kMargin, kMargin, kMargin);
    row->setSpacing(kSpacing);
    row->addWidget(m_iconLabel);
    row->addWidget(m_nameLabel, 1);
    row->addWidget(m_markLabel);
    connect(acss::QtAdvancedStylesheet::getInstance(), SIGNAL(currentThemeChanged(QString)), this,
                                                              SLOT(slotDrawIcons()));
}

QString KvEditorPaletteRow::text() const
{
    return m_nameLabel->text();
}

void KvEditorPaletteRow::setText(const QString &text)
{
    m_nameLabel->setText(text);
    setAccessibleName(text);
}

void KvEditorPaletteRow::setIcon(const QIcon &icon)
{
    m_icon = icon;
    slotDrawIcons();
}

void KvEditorPaletteRow::setMark(const QString &iconPath, const QSize &size)
{
    m_markPath = iconPath;
    m_markSize = size;
    slotDrawIcons();
}

void KvEditorPaletteRow::slotDrawIcons()
{
    m_iconLabel->setPixmap(sharpPixmap(m_icon, devicePixelRatioF()));
    if (!m_markPath.isEmpty())
        m_markLabel->setPixmap(acss::createPixmap(kIconMode, m_markPath, m_markSize));
}

void KvEditorPaletteRow::activate()
{
    emit signalActivated();
}

void KvEditorPaletteRow::paintEvent(QPaintEvent *event)
{
    Q_UNUSED(event)
    QPainter painter(this);
    painter.setRenderHint(QPainter::Antialiasing);
    if (underMouse()) {
        painter.setPen(Qt::NoPen);
        painter.setBrush(KvThemePainting::color("raised-hover"));
        painter.drawRoundedRect(rect(), KvThemePainting::Radius, KvThemePainting::Radius);
    }
    if (hasFocus())
        KvThemePainting::drawFocusRing(painter, rect(), KvThemePainting::color("accent"));
}

void KvEditorPaletteRow::keyPressEvent(QKeyEvent *event)
{
    const bool isActivation =
        event->key() == Qt::Key_Space || event->key() == Qt::Key_Return || event->key() == Qt::Key_Enter;
    if (isActivation && !event->isAutoRepeat())
        activate();
    else
        QFrame::keyPressEvent(event);
}

void KvEditorPaletteRow::mousePressEvent(QMouseEvent *event)
{
    event->setAccepted(event->button() == Qt::LeftButton);
}

void KvEditorPaletteRow::mouseReleaseEvent(QMouseEvent *event)
{
    if (event->button() == Qt::LeftButton && rect().contains(event->pos()))
        activate();
}
