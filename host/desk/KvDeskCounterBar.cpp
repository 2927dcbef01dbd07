// SPDX-License-Identifier: MIT
#include "KvDeskCounterBar.h"

#include "KvDeskActions.h"
#include "KvDeskCounterTool.h"
#include "KvDeskImageView.h"
#include "KvDeskSelection.h"
#include "KvDeskToolBox.h"
#include "gui/acss.h"
#include "kernel/ZtGsManipulator.h"
#include "kernel/ZtKernelData.h"
#include "measuring/ZtDrawnObjectPainter.h"
#include "measuring/ZtMeasureFormat.h"

#include <QAction>
#include <QComboBox>
#include <QEvent>
#include <QHBoxLayout>
#include <QLabel>
#include <QPainter>
#include <QToolButton>
#include <QVariant>

namespace {

constexpr int margin = 8;
constexpr int classesWidth = 240;
constexpr int leastClassesWidth = 96;
constexpr QSize iconSize(24, 24);
constexpr QSize buttonSize(32, 28);

// As a marker is on the image: its colour on a dark ground.
QIcon swatch(const QColor &color, qreal ratio)
{
    constexpr int side = 16;
    constexpr int border = 2;
    QPixmap pixmap(QSize(side, side) * ratio);
    pixmap.setDevicePixelRatio(ratio);
    QColor dark = ZtDrawnObjectPainter::haloColor();
    dark.setAlpha(255);
    pixmap.fill(dark);
    QPainter(&pixmap).fillRect(border, border, side - 2 * border, side - 2 * border, color);
    return QIcon(pixmap);
}

} // namespace

KvDeskCounterBar::KvDeskCounterBar(KvDeskToolBox *toolBox, KvDeskImageView *view)
    : QFrame(view->viewport())
    , m_toolBox(toolBox)
    , m_view(view)
{
    setProperty("panel", true);
    setAutoFillBackground(true);
    setLayoutDirection(QGuiApplication::layoutDirection());
    createWidgets();
    connect(toolBox, SIGNAL(signalToolChanged()), this, SLOT(slotToolChanged()));
    connect(&m_changes, SIGNAL(signalChanged()), this, SLOT(slotUpdate()));
    connect(m_classes, SIGNAL(activated(int)), this, SLOT(slotChosen(int)));
    connect(m_newClassAction, SIGNAL(triggered()), this, SLOT(slotNewClass()));
    view->viewport()->installEventFilter(this);
    slotToolChanged();
}

void KvDeskCounterBar::createWidgets()
{
    m_label = new QLabel(tr("Clicks count for"), this);
    m_classes = new QComboBox(this);
    // As wide as may be whatever it lists, which changes with every click; narrower only where there is no
    // room.
    m_classes->setSizeAdjustPolicy(QComboBox::AdjustToMinimumContentsLengthWithIcon);
    m_classes->setMinimumContentsLength(classesWidth);
    m_classes->setMinimumWidth(leastClassesWidth);
    m_classes->setMaximumWidth(classesWidth);
    m_classes->setSizePolicy(QSizePolicy::Preferred, QSizePolicy::Fixed);
    m_classes->setAccessibleName(m_label->text());
    createNewClass();
    m_hint = new QLabel(tr("A right click takes a place away"), this);
    m_hint->setProperty("caption", true);
    auto *const layout = new QHBoxLayout(this);
    layout->setContentsMargins(margin, margin, margin, margin);
    layout->setSpacing(margin);
    layout->addWidget(m_label);
    layout->addWidget(m_classes);
    layout->addWidget(m_newClass);
    layout->addWidget(m_hint);
}

// The key is that of the tool with Shift; it works on the image while the user counts.
void KvDeskCounterBar::createNewClass()
{
    m_newClassAction = new QAction(tr("Count another class"), this);
    m_newClassAction->setIcon(acss::createIcon(6, QStringLiteral("Icons/counter-new"), iconSize));
    m_newClassAction->setShortcut(QKeySequence(static_cast<int>(Qt::SHIFT) | Qt::Key_N));
    m_newClassAction->setShortcutContext(Qt::WidgetWithChildrenShortcut);
    m_newClassAction->setToolTip(
        KvDeskActions::withShortcut(m_newClassAction->text(), m_newClassAction->shortcut()));
    m_view->addAction(m_newClassAction);
    m_newClass = new QToolButton(this);
    m_newClass->setDefaultAction(m_newClassAction);
    m_newClass->setIconSize(iconSize);
    m_newClass->setFixedSize(buttonSize);
    m_newClass->setAutoRaise(true);
    m_newClass->setAccessibleName(m_newClassAction->text());
}

void KvDeskCounterBar::slotToolChanged()
{
    const bool isCounting = m_view->tool() == m_toolBox->counterTool();
    if (isCounting)
        connect(m_view->selection(), SIGNAL(signalSelectionChanged()), this,
                                            SLOT(slotUpdate()), Qt::UniqueConnection);
    m_newClassAction->setEnabled(isCounting);
    setVisible(isCounting);
    slotUpdate();
}

QString KvDeskCounterBar::classText(const KvDeskObjectId &counter) const
{
    const ZtGsManipulator *const manipulator = ZtKernelData::getInstance()->getGsManipulator(counter.type);
    const ZtKernelObjectData *const object = ZtKernelData::getInstance()->object(counter.type, counter.id);
    QStringList values;
    for (const QString &name : manipulator->getValueNames())
        values.append(manipulator->valueText(name, object));
    return ZtMeasureFormat::named(manipulator->getObjectName(counter.id), values.join(QStringLiteral("  ")));
}

void KvDeskCounterBar::slotUpdate()
{
    if (isHidden())
        return;
    m_counters = KvDeskCounterTool::counters();
    QStringList texts;
    for (const KvDeskObjectId &counter : qAsConst(m_counters))
        texts.append(classText(counter));
    if (texts.isEmpty())
        texts.append(tr("A new counter"));
    for (int i = 0; i < texts.size() && i < m_classes->count(); ++i)
        m_classes->setItemText(i, texts.at(i));
    while (m_classes->count() > texts.size())
        m_classes->removeItem(m_classes->count() - 1);
    while (m_classes->count() < texts.size())
        m_classes->addItem(texts.at(m_classes->count()));
    showColors();
    // Where the names are cut.
    for (int i = 0; i < texts.size(); ++i)
        m_classes->setItemData(i, texts.at(i), Qt::ToolTipRole);
    m_classes->setCurrentIndex(qMax(0, m_counters.indexOf(m_toolBox->counterTool()->counter())));
    place();
}

void KvDeskCounterBar::showColors()
{
    if (m_swatches.isEmpty()) {
        for (const QColor &color : ZtDrawnObjectPainter::counterColors())
            m_swatches.append(swatch(color, devicePixelRatioF()));
    }
    for (int i = 0; i < m_classes->count(); ++i) {
        const int id = i < m_counters.size() ? m_counters.at(i).id : 1;
        m_classes->setItemIcon(i, m_swatches.at(ZtDrawnObjectPainter::counterColorIndex(id)));
    }
}

void KvDeskCounterBar::slotChosen(int aIndex)
{
    if (aIndex < m_counters.size())
        m_toolBox->counterTool()->choose(m_counters.at(aIndex));
    m_view->setFocus();
}

void KvDeskCounterBar::slotNewClass()
{
    m_toolBox->counterTool()->addClass();
    m_view->setFocus();
}

// Width of the bar with the box for the classes and other parts.
int KvDeskCounterBar::widthOf(const QList<QWidget *> &parts, int classesWidth) const
{
    int width = 2 * margin + classesWidth;
    for (const QWidget *const part : parts)
        width += margin + qBound(part->minimumWidth(), part->sizeHint().width(), part->maximumWidth());
    return width;
}

// In a narrow view the hint goes first, then the names of the classes are cut, and the label goes last. What
// is not there is said by the tool tip.
void KvDeskCounterBar::showWhatFits()
{
    const int room = parentWidget()->width();
    const bool hasHint = widthOf({m_label, m_newClass, m_hint}, classesWidth) <= room;
    const bool hasLabel = widthOf({m_label, m_newClass}, leastClassesWidth) <= room;
    m_hint->setVisible(hasHint);
    m_label->setVisible(hasLabel);
    QStringList lines(tr("The counter that gets the clicks (1 to 9)"));
    if (!hasLabel)
        lines.prepend(m_label->text());
    if (!hasHint)
        lines.append(m_hint->text());
    m_classes->setToolTip(lines.join(QLatin1Char('\n')));
}

void KvDeskCounterBar::place()
{
    showWhatFits();
    const QSize wanted = sizeHint();
    resize(qMin(wanted.width(), parentWidget()->width()), wanted.height());
    move((parentWidget()->width() - width()) / 2, margin);
}

bool KvDeskCounterBar::eventFilter(QObject *watched, QEvent *event)
{
    if (event->type() == QEvent::Resize && isVisible())
        place();
    return QFrame::eventFilter(watched, event);
}
