// SPDX-License-Identifier: MIT
#include "KvDeskGuideWindow.h"

#include "KvDeskActions.h"
#include "KvDeskGuideText.h"
#include "gui/acss.h"
#include "kernel/ZtAppSettings.h"

#include <QAction>
#include <QCloseEvent>
#include <QIcon>
#include <QLabel>
#include <QLineEdit>
#include <QListWidget>
#include <QScreen>
#include <QShortcut>
#include <QSplitter>
#include <QToolBar>

namespace {

constexpr QSize firstSize(1024, 768);
constexpr QSize smallestSize(480, 320);
constexpr int contentsWidth = 272;
constexpr int itemHeight = 24;
constexpr int itemSpacing = 2;
constexpr int findWidth = 240;
constexpr int resultWidth = 96;
constexpr int deepestContents = 2; ///< level of headings
constexpr int toolIconStyle = 6;
constexpr QSize toolIconSize(24, 24);

const char windowGroup[] = "DeskGuideWindow";
const char geometryKey[] = "geometry";
const char splitterKey[] = "splitter";
const char zoomKey[] = "zoom";

void setPossible(QAction *action, bool isPossible, const QString &reason)
{
    const QString name = KvDeskActions::withShortcut(action->text(), action->shortcut());
    action->setEnabled(isPossible);
    action->setToolTip(isPossible ? name : name + QLatin1Char('\n') + reason);
}

} // namespace

KvDeskGuideWindow::KvDeskGuideWindow(const QString &path, QWidget *parent)
    : QMainWindow(parent)
    , m_text(new KvDeskGuideText(path, this))
    , m_contents(new QListWidget(this))
    , m_splitter(new QSplitter(Qt::Horizontal, this))
{
    setObjectName(QStringLiteral("DeskGuideWindow"));
    setWindowTitle(tr("User guide"));
    setWindowIcon(QIcon(acss::getPathSVG(QStringLiteral("Icons/measuringdesk"))));
    setContextMenuPolicy(Qt::PreventContextMenu);
    setMinimumSize(smallestSize);
    m_text->setAccessibleName(windowTitle());
    createContents();
    m_splitter->addWidget(m_contents);
    m_splitter->addWidget(m_text);
    m_splitter->setChildrenCollapsible(false);
    m_splitter->setStretchFactor(1, 1);
    m_splitter->setSizes({contentsWidth, firstSize.width() - contentsWidth});
    setCentralWidget(m_splitter);
    createToolBar();
    connectSignals();
    restoreWindow();
    m_text->setFocus();
}

void KvDeskGuideWindow::createContents()
{
    m_contents->setAccessibleName(tr("Contents"));
    m_contents->setFrameShape(QFrame::NoFrame);
    m_contents->setSpacing(itemSpacing);
    m_contents->setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    // The headings are in the language of the guide.
    m_contents->setLayoutDirection(m_text->layoutDirection());
    const QVector<KvDeskGuideText::Heading> &headings = m_text->headings();
    for (int i = 0; i < headings.size(); ++i) {
        if (headings.at(i).level > deepestContents)
            continue;
        auto *const item = new QListWidgetItem(headings.at(i).title, m_contents);
        item->setData(Qt::UserRole, i);
        item->setSizeHint(QSize(0, itemHeight));
    }
    m_contents->setCurrentRow(0);
}

QAction *KvDeskGuideWindow::addTo(QToolBar *bar, const char *icon, const QString &name,
                                  const QList<QKeySequence> &keys)
{
    const QString path = QStringLiteral("Icons/") + QLatin1String(icon);
    QAction *const action = bar->addAction(acss::createIcon(toolIconStyle, path, toolIconSize), name);
    action->setShortcuts(keys);
    action->setToolTip(KvDeskActions::withShortcut(name, keys.first()));
    return action;
}

void KvDeskGuideWindow::createToolBar()
{
    QToolBar *const bar = addToolBar(windowTitle());
    bar->setMovable(false);
    bar->setIconSize(toolIconSize);
    const bool isMirrored = layoutDirection() == Qt::RightToLeft;
    m_back = addTo(bar, isMirrored ? "forward" : "back", tr("Back"), {QKeySequence(Qt::ALT + Qt::Key_Left)});
    m_forward =
        addTo(bar, isMirrored ? "back" : "forward", tr("Forward"), {QKeySequence(Qt::ALT + Qt::Key_Right)});
    bar->addSeparator();
    m_zoomOut =
        addTo(bar, "zoom-out", KvDeskActions::tr("Zoom out"), {QKeySequence(Qt::CTRL + Qt::Key_Minus)});
    m_zoomIn = addTo(bar, "zoom-in", KvDeskActions::tr("Zoom in"),
                     {QKeySequence(Qt::CTRL + Qt::Key_Plus), QKeySequence(Qt::CTRL + Qt::Key_Equal)});
    m_zoomNormal = new QAction(this);
    m_zoomNormal->setShortcut(Qt::CTRL + Qt::Key_0);
    addAction(m_zoomNormal);
    bar->addSeparator();
    createFind(bar);
}

void KvDeskGuideWindow::createFind(QToolBar *bar)
{
    m_findField = new QLineEdit(bar);
    m_findField->setFixedWidth(findWidth);
    m_findField->setPlaceholderText(tr("Find in the guide"));
    m_findField->setAccessibleName(m_findField->placeholderText());
    m_findField->setToolTip(KvDeskActions::withShortcut(m_findField->placeholderText(), QKeySequence::Find));
    m_findField->setClearButtonEnabled(true);
    bar->addWidget(m_findField);
    m_findPrevious = addTo(bar, "previous", tr("Find previous"),
                           {QKeySequence(Qt::SHIFT + Qt::Key_F3), QKeySequence(Qt::SHIFT + Qt::Key_Return)});
    m_findNext = addTo(bar, "next", tr("Find next"), {QKeySequence(Qt::Key_F3)});
    m_askWhatToFind = new QAction(this);
    m_askWhatToFind->setShortcuts(m_findPrevious->shortcuts() + m_findNext->shortcuts());
    addAction(m_askWhatToFind);
    m_findResult = new QLabel(bar);
    m_findResult->setProperty("caption", true);
    m_findResult->setMinimumWidth(resultWidth);
    bar->addWidget(m_findResult);
}

void KvDeskGuideWindow::connectSignals()
{
    connect(m_contents, SIGNAL(itemClicked(QListWidgetItem*)), this, SLOT(slotShowHeading()));
    connect(m_contents, SIGNAL(itemActivated(QListWidgetItem*)), this, SLOT(slotShowHeading()));
    connect(m_text, SIGNAL(signalHeadingInViewChanged(int)), this, SLOT(slotMarkHeading(int)));
    connect(m_text, SIGNAL(historyChanged()), this, SLOT(slotUpdateSteps()));
    slotUpdateSteps();
    connect(m_back, SIGNAL(triggered()), m_text, SLOT(backward()));
    connect(m_forward, SIGNAL(triggered()), m_text, SLOT(forward()));
    connect(m_zoomOut, SIGNAL(triggered()), m_text, SLOT(slotZoomOut()));
    connect(m_zoomIn, SIGNAL(triggered()), m_text, SLOT(slotZoomIn()));
    connect(m_zoomNormal, SIGNAL(triggered()), m_text, SLOT(slotZoomNormal()));
    connect(m_findField, SIGNAL(textChanged(QString)), this, SLOT(slotFindTyped()));
    connect(m_findField, SIGNAL(returnPressed()), this, SLOT(slotFindNext()));
    connect(m_findNext, SIGNAL(triggered()), this, SLOT(slotFindNext()));
    connect(m_findPrevious, SIGNAL(triggered()), this, SLOT(slotFindPrevious()));
    connect(m_askWhatToFind, SIGNAL(triggered()), this, SLOT(slotFocusFind()));
    updateFind();
    connect(new QShortcut(QKeySequence::Find, this), SIGNAL(activated()), this, SLOT(slotFocusFind()));
    connect(new QShortcut(Qt::Key_Escape, this), SIGNAL(activated()), this, SLOT(slotEscape()));
}

void KvDeskGuideWindow::slotShowHeading()
{
    m_text->showHeading(m_contents->currentItem()->data(Qt::UserRole).toInt());
}

void KvDeskGuideWindow::slotMarkHeading(int aIndex)
{
    int row = 0;
    while (row + 1 < m_contents->count() && m_contents->item(row + 1)->data(Qt::UserRole).toInt() <= aIndex)
        ++row;
    m_contents->setCurrentRow(row);
}

void KvDeskGuideWindow::slotUpdateSteps()
{
    setPossible(m_back, m_text->isBackwardAvailable(), tr("This is the first place"));
    setPossible(m_forward, m_text->isForwardAvailable(), tr("This is the last place"));
}

void KvDeskGuideWindow::slotFocusFind()
{
    m_findField->setFocus(Qt::ShortcutFocusReason);
    m_findField->selectAll();
}

void KvDeskGuideWindow::updateFind()
{
    const bool isPossible = !m_findField->text().isEmpty();
    setPossible(m_findPrevious, isPossible, tr("Type what to find first"));
    setPossible(m_findNext, isPossible, tr("Type what to find first"));
    m_askWhatToFind->setEnabled(!isPossible);
}

void KvDeskGuideWindow::showFindResult(bool isFound)
{
    m_findResult->setText(isFound ? QString() : tr("Not found"));
}

void KvDeskGuideWindow::slotFindTyped()
{
    updateFind();
    const QString text = m_findField->text();
    showFindResult(text.isEmpty() || m_text->findTyped(text));
}

void KvDeskGuideWindow::slotFindNext()
{
    if (!m_findField->text().isEmpty())
        showFindResult(m_text->findNext(m_findField->text()));
}

void KvDeskGuideWindow::slotFindPrevious()
{
    showFindResult(m_text->findPrevious(m_findField->text()));
}

// As in other fields of that kind: first it is emptied.
void KvDeskGuideWindow::slotEscape()
{
    if (!m_findField->hasFocus()) {
        close();
        return;
    }
    m_findField->clear();
    m_text->setFocus();
}

void KvDeskGuideWindow::restoreWindow()
{
    ZtAppSettings::beginGroupAbsolute(QLatin1String(windowGroup));
    const auto stored = [](const char *key) { return ZtAppSettings::value(QLatin1String(key)); };
    if (!restoreGeometry(stored(geometryKey).toByteArray()))
        resize(firstSize.boundedTo(screen()->availableSize()));
    m_splitter->restoreState(stored(splitterKey).toByteArray());
    const int zoom = ZtAppSettings::value(QLatin1String(zoomKey), m_text->zoom()).toInt();
    ZtAppSettings::endGroup();
    m_text->setZoom(zoom);
}

void KvDeskGuideWindow::saveWindow() const
{
    ZtAppSettings::beginGroupAbsolute(QLatin1String(windowGroup));
    ZtAppSettings::setValue(QLatin1String(geometryKey), saveGeometry());
    ZtAppSettings::setValue(QLatin1String(splitterKey), m_splitter->saveState());
    ZtAppSettings::setValue(QLatin1String(zoomKey), m_text->zoom());
    ZtAppSettings::endGroup();
}

void KvDeskGuideWindow::closeEvent(QCloseEvent *event)
{
    saveWindow();
    QMainWindow::closeEvent(event);
}
