// SPDX-License-Identifier: MIT
#include "KvDeskStatusBar.h"

#include "KvDeskCalibrationText.h"
#include "KvDeskElidedLabel.h"
#include "KvDeskStatus.h"
#include "gui/QtAdvancedStylesheet.h"
#include "gui/acss.h"

#include <QHBoxLayout>
#include <QLabel>
#include <QVariant>
#include <QtMath>

namespace {

constexpr int toolIconStyle = 6;
constexpr QSize iconSize(16, 16);

template <typename Label>
Label *caption(QWidget *parent)
{
    auto *const label = new Label(parent);
    label->setProperty("caption", true);
    // Numbers and units read from left to right in every language.
    label->setLayoutDirection(Qt::LeftToRight);
    return label;
}

} // namespace

KvDeskStatusBar::KvDeskStatusBar(QWidget *parent)
    : QStatusBar(parent)
    , m_icon(new QLabel(this))
    , m_category(new QLabel(this))
    , m_message(new KvDeskElidedLabel(this))
    , m_statistics(caption<KvDeskElidedLabel>(this))
    , m_position(caption<QLabel>(this))
    , m_image(caption<QLabel>(this))
    , m_zoom(caption<QLabel>(this))
{
    setProperty("panel", true);
    setSizeGripEnabled(false);
    setContentsMargins(8, 0, 8, 0);
    auto *const messageRow = new QWidget(this);
    auto *const layout = new QHBoxLayout(messageRow);
    layout->setContentsMargins(0, 4, 0, 4);
    layout->setSpacing(8);
    layout->addWidget(m_icon);
    layout->addWidget(m_category);
    layout->addWidget(m_message, 1);
    addWidget(messageRow, 1);
    const QList<QLabel *> labels{m_statistics, m_position, m_image, m_zoom};
    for (QLabel *const label : labels) {
        label->setContentsMargins(8, 0, 8, 0);
        addPermanentWidget(label);
    }
    const ZtStatusLog *const log = ZtStatusLog::getInstance();
    connect(log, SIGNAL(signalEntryLogged(ZtStatusEntry)), this, SLOT(slotEntryLogged(ZtStatusEntry)));
    connect(log, SIGNAL(signalCleared()), this, SLOT(slotCleared()));
    connect(acss::QtAdvancedStylesheet::getInstance(), SIGNAL(currentThemeChanged(QString)), this,
                                                              SLOT(slotThemeChanged()));
    m_statistics->setAccessibleName(tr("Statistics of the selected values"));
    m_statistics->hide();
    setImage(QSize(), ZtCalibration());
    showLastEntry();
}

void KvDeskStatusBar::showLastEntry()
{
    const QVector<ZtStatusEntry> &entries = ZtStatusLog::getInstance()->entries();
    if (entries.isEmpty())
        slotCleared();
    else
        showEntry(entries.last());
}

void KvDeskStatusBar::showEntry(const ZtStatusEntry &entry)
{
    m_icon->setPixmap(acss::createIcon(toolIconStyle, KvDeskStatus::iconPath(entry.category), iconSize)
                          .pixmap(window()->windowHandle(), iconSize));
    m_category->setText(KvDeskStatus::categoryName(entry.category));
    QPalette colors = m_category->palette();
    colors.setColor(QPalette::WindowText, KvDeskStatus::color(entry.category));
    m_category->setPalette(colors);
    m_message->setText(entry.message.simplified());
}

void KvDeskStatusBar::slotEntryLogged(const ZtStatusEntry &aEntry)
{
    showEntry(aEntry);
}

void KvDeskStatusBar::slotCleared()
{
    m_icon->setPixmap(QPixmap());
    m_category->clear();
    m_message->clear();
}

void KvDeskStatusBar::slotThemeChanged()
{
    showLastEntry();
}

QString KvDeskStatusBar::message() const
{
    return m_message->text();
}

void KvDeskStatusBar::setImage(const QSize &size, const ZtCalibration &calibration)
{
    QString text = size.isEmpty() ? QString() : tr("%1 × %2 px").arg(size.width()).arg(size.height());
    if (!size.isEmpty() && calibration.isCalibrated()) {
        const QString objective = calibration.objective();
        text += objective.isEmpty() ? QString() : tr(", %1", "objective").arg(objective);
        text += tr(", %1/px", "size of a pixel").arg(KvDeskCalibrationText::pixelSize(calibration));
    }
    m_image->setToolTip(KvDeskCalibrationText::summary(calibration));
    m_image->setText(text);
    m_image->setVisible(!text.isEmpty());
    m_zoom->setVisible(!text.isEmpty());
    slotPointerLeft();
}

QString KvDeskStatusBar::imageText() const
{
    return m_image->text();
}

QString KvDeskStatusBar::zoomText() const
{
    return m_zoom->text();
}

QString KvDeskStatusBar::positionText() const
{
    return m_position->text();
}

QString KvDeskStatusBar::statisticsText() const
{
    return m_statistics->text();
}

void KvDeskStatusBar::slotSetStatistics(const QString &aText, const QString &aDetails)
{
    m_statistics->setText(aText);
    m_statistics->setDetails(aDetails);
    m_statistics->setVisible(!aText.isEmpty());
}

void KvDeskStatusBar::slotZoomChanged(double aZoom)
{
    m_zoom->setText(tr("%1 %", "zoom").arg(qRound(aZoom * 100.0)));
}

void KvDeskStatusBar::slotPointerMoved(QPointF aPosition)
{
    m_position->setText(
        tr("x %1, y %2", "pixel below the pointer").arg(qFloor(aPosition.x())).arg(qFloor(aPosition.y())));
}

void KvDeskStatusBar::slotPointerLeft()
{
    m_position->clear();
}
