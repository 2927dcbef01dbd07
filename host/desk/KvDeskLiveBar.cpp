// SPDX-License-Identifier: MIT
#include "KvDeskLiveBar.h"

#include "KvDeskActions.h"
#include "KvDeskElidedLabel.h"
#include "KvDeskExposureControl.h"
#include "gui/QtAdvancedStylesheet.h"
#include "gui/acss.h"
#include "kernel/ZtLeftToRight.h"
#include "measuring/ZtFrameSource.h"
#include "measuring/ZtKernelImage.h"
#include "measuring/ZtMeasuringDocument.h"

#include <QAction>
#include <QHBoxLayout>
#include <QLabel>
#include <QPushButton>
#include <QToolButton>
#include <QVariant>

namespace {

constexpr int margin = 8;
constexpr int thinMargin = 4;
constexpr int groupSpacing = 16;
constexpr int oneLineWidth = 600; ///< a narrower bar has two lines
constexpr int rateInterval = 500; ///< milliseconds
constexpr QSize iconSize(16, 16);
constexpr QSize buttonSize(32, 28);

} // namespace

KvDeskLiveBar::KvDeskLiveBar(KvDeskActions *actions, ZtMeasuringDocument *document, QWidget *parent)
    : QFrame(parent)
    , m_actions(actions)
    , m_document(document)
{
    setProperty("panel", true);
    setSizePolicy(QSizePolicy::Preferred, QSizePolicy::Fixed);
    setAccessibleName(tr("Live image"));
    m_rateTimer.setInterval(rateInterval);
    createWidgets();
    connectSignals();
    slotSourceChanged();
}

void KvDeskLiveBar::createWidgets()
{
    m_freeze = new QToolButton(this);
    m_freeze->setDefaultAction(m_actions->action(KvDeskActions::Freeze));
    m_freeze->setAutoRaise(true);
    m_freeze->setIconSize(iconSize);
    m_freeze->setFixedSize(buttonSize);
    m_freeze->setAccessibleName(tr("Freeze"));
    m_icon = new QLabel(this);
    m_status = new KvDeskElidedLabel(this);
    m_status->setSizePolicy(QSizePolicy::Expanding, QSizePolicy::Preferred);
    m_run = new QPushButton(this);
    m_exposure = new KvDeskExposureControl(this);
    m_frameRate = new QLabel(this);
    m_frameRate->setProperty("caption", true);
    m_frameRate->setAlignment(Qt::AlignRight | Qt::AlignVCenter);
    // Its neighbours do not move when the number changes.
    m_frameRate->setMinimumWidth(
        m_frameRate->fontMetrics().horizontalAdvance(tr("%1 fps").arg(QStringLiteral("000.0"))));

    m_first = new QHBoxLayout;
    m_first->setSpacing(margin);
    m_first->addWidget(m_freeze);
    m_first->addWidget(m_icon);
    m_first->addWidget(m_status, 1);
    m_first->addWidget(m_run);
    auto *const second = new QHBoxLayout;
    second->setSpacing(groupSpacing);
    second->addWidget(m_exposure);
    second->addWidget(m_frameRate);
    m_layout = new QBoxLayout(QBoxLayout::LeftToRight, this);
    m_layout->setContentsMargins(margin, thinMargin, margin, thinMargin);
    m_layout->addLayout(m_first, 1);
    m_layout->addLayout(second);
    m_layout->setSpacing(groupSpacing);
}

// Of two lines.
QSize KvDeskLiveBar::minimumSizeHint() const
{
    return QSize(m_first->minimumSize().width() + 2 * margin, QFrame::minimumSizeHint().height());
}

void KvDeskLiveBar::resizeEvent(QResizeEvent *event)
{
    QFrame::resizeEvent(event);
    const bool isNarrow = width() < oneLineWidth;
    m_layout->setDirection(isNarrow ? QBoxLayout::TopToBottom : QBoxLayout::LeftToRight);
    m_layout->setSpacing(isNarrow ? thinMargin : groupSpacing);
    m_exposure->setCompact(isNarrow);
    updateGeometry();
}

void KvDeskLiveBar::connectSignals()
{
    connect(m_document, SIGNAL(signalImageChanged()), this, SLOT(slotSourceChanged()));
    connect(m_document->kernelImage(), SIGNAL(signalFrozenChanged(bool)), this, SLOT(slotUpdate()));
    connect(m_actions->action(KvDeskActions::Freeze), SIGNAL(toggled(bool)), this, SLOT(slotFreeze(bool)));
    connect(m_run, SIGNAL(clicked()), this, SLOT(slotStartOrStop()));
    connect(m_exposure, SIGNAL(signalExposureChosen(double)), this, SLOT(slotExposureChosen(double)));
    connect(&m_rateTimer, SIGNAL(timeout()), this, SLOT(slotUpdateRate()));
    connect(acss::QtAdvancedStylesheet::getInstance(), SIGNAL(currentThemeChanged(QString)), this,
                                                              SLOT(slotUpdate()));
}

ZtFrameSource *KvDeskLiveBar::liveSource() const
{
    ZtFrameSource *const source = m_document->frameSource();
    return source && source->isLive() ? source : nullptr;
}

void KvDeskLiveBar::slotSourceChanged()
{
    ZtFrameSource *const source = liveSource();
    if (source) {
        connect(source, SIGNAL(signalStateChanged()), this, SLOT(slotUpdate()), Qt::UniqueConnection);
        connect(source, SIGNAL(signalExposureChanged()), this,
                               SLOT(slotUpdateExposure()), Qt::UniqueConnection);
        m_rateTimer.start();
    } else {
        m_rateTimer.stop();
    }
    setVisible(source != nullptr);
    slotUpdate();
}

QString KvDeskLiveBar::statusText(const ZtFrameSource &source) const
{
    const QString name = ZtLeftToRight::isolated(source.displayName());
    const bool hasFrame = !source.frame().isNull();
    switch (source.state()) {
    case ZtFrameSource::Lost:
        return hasFrame ? tr("%1 delivers no pictures any more; this is the last one").arg(name)
                        : tr("%1 delivers no pictures").arg(name);
    case ZtFrameSource::Stopped:
        return tr("%1 is stopped").arg(name);
    default:
        break;
    }
    if (!hasFrame)
        return tr("Waiting for the first picture of %1").arg(name);
    return m_document->kernelImage()->isFrozen() ? tr("Frozen: %1").arg(name) : tr("Live: %1").arg(name);
}

QString KvDeskLiveBar::statusIcon(const ZtFrameSource &source) const
{
    if (source.state() != ZtFrameSource::Running)
        return QStringLiteral("Icons/status-warning");
    return m_document->kernelImage()->isFrozen() ? QStringLiteral("Icons/freeze")
                                                 : QStringLiteral("Icons/live");
}

void KvDeskLiveBar::updateRunButton(const ZtFrameSource &source)
{
    const ZtFrameSource::State state = source.state();
    const bool isRunning = state == ZtFrameSource::Running;
    m_run->setIcon(acss::createIcon(
        6, isRunning ? QStringLiteral("Icons/stop") : QStringLiteral("Icons/reconnect"), iconSize));
    // Stopping is the rare case, and the space is needed for the exposure.
    if (isRunning)
        m_run->setText(QString());
    else
        m_run->setText(state == ZtFrameSource::Lost ? tr("&Reconnect") : tr("&Start"));
    m_run->setMaximumWidth(isRunning ? buttonSize.width() : QWIDGETSIZE_MAX);
    m_run->setToolTip(isRunning ? tr("Stop the live image; other programs can use the camera then")
                                : QString());
    m_run->setAccessibleName(m_run->toolTip());
}

void KvDeskLiveBar::slotUpdate()
{
    const ZtFrameSource *const source = liveSource();
    m_actions->setPossible(KvDeskActions::Freeze, source != nullptr, tr("This image is not live"));
    m_actions->action(KvDeskActions::Freeze)->setChecked(source && m_document->kernelImage()->isFrozen());
    if (!source)
        return;
    m_status->setText(statusText(*source));
    m_icon->setPixmap(acss::createPixmap(6, statusIcon(*source), iconSize));
    updateRunButton(*source);
    slotUpdateExposure();
    slotUpdateRate();
}

void KvDeskLiveBar::slotUpdateExposure()
{
    const ZtFrameSource *const source = liveSource();
    const std::optional<ZtExposureRange> range = source ? source->exposureRange() : std::nullopt;
    // A camera that is gone has none to be set; the space is for what is said about it.
    m_exposure->setVisible(range.has_value() && source->state() == ZtFrameSource::Running);
    if (range)
        m_exposure->setExposure(*range, source->exposure());
}

void KvDeskLiveBar::slotUpdateRate()
{
    const ZtFrameSource *const source = liveSource();
    if (!source)
        return;
    // The first picture is not announced as a change of state.
    m_status->setText(statusText(*source));
    //: frames per second
    m_frameRate->setText(tr("%1 fps").arg(QString::number(source->frameRate(), 'f', 1)));
    m_frameRate->setToolTip(
        tr("Frames per second\nDropped, because newer ones came first: %1").arg(source->droppedFrames()));
}

void KvDeskLiveBar::slotFreeze(bool aFrozen)
{
    if (liveSource())
        m_document->kernelImage()->setFrozen(aFrozen);
}

void KvDeskLiveBar::slotExposureChosen(double aMilliseconds)
{
    if (ZtFrameSource *const source = liveSource())
        source->setExposure(aMilliseconds);
}

void KvDeskLiveBar::slotStartOrStop()
{
    ZtFrameSource *const source = liveSource();
    if (!source)
        return;
    if (source->state() == ZtFrameSource::Running)
        source->stop();
    else
        source->start();
}
