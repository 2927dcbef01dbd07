// SPDX-License-Identifier: MIT
#include "KvDeskStartPage.h"

#include "KvDeskActions.h"
#include "KvDeskExamples.h"
#include "KvDeskRecentFiles.h"
#include "KvDeskStepRow.h"
#include "KvDeskThumbnailReader.h"
#include "kernel/ZtLeftToRight.h"
#include "measuring/ZtFault.h"
#include "measuring/ZtSession.h"

#include <QDir>
#include <QFileInfo>
#include <QGridLayout>
#include <QKeyEvent>
#include <QLabel>
#include <QMenu>
#include <QPushButton>
#include <QToolButton>
#include <QVBoxLayout>

namespace {

constexpr int controlSpacing = 8;
constexpr int groupSpacing = 16;
constexpr int pageMargin = 24;
constexpr int narrowMargin = 8;
constexpr int widestPage = 720;
constexpr int narrowStep = 400; ///< below it, steps have their buttons under the text
constexpr QSize thumbnailSize(148, 111);
constexpr QSize exampleSize(160, 142);
constexpr int mostRecent = 4;

QLabel *groupTitle(const QString &text, QWidget *parent)
{
    auto *const label = new QLabel(text, parent);
    label->setProperty("groupTitle", true);
    label->setWordWrap(true);
    return label;
}

// Null for a session that cannot be read or has no picture: then its name has to do.
QPixmap thumbnail(const QString &sessionPath, double pixelRatio)
{
    ZtSession session;
    ZtFault fault;
    if (!ZtSession::load(sessionPath, &session, &fault))
        return QPixmap();
    return QPixmap::fromImage(
        KvDeskThumbnailReader::read(session.imagePath, thumbnailSize * pixelRatio).image);
}

// An ampersand would underline the letter after it.
QString buttonText(QString text)
{
    return text.replace(QLatin1Char('&'), QLatin1String("&&"));
}

QVBoxLayout *groupLayout(QWidget *group)
{
    auto *const layout = new QVBoxLayout(group);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(controlSpacing);
    return layout;
}

} // namespace

KvDeskStartPage::KvDeskStartPage(KvDeskActions *actions, QMenu *sourceMenu, const QString &examplesFolder,
                                 QWidget *parent)
    : QWidget(parent)
    , m_examplesFolder(examplesFolder)
{
    setMaximumWidth(widestPage);
    auto *const layout = new QVBoxLayout(this);
    layout->setContentsMargins(pageMargin, pageMargin, pageMargin, pageMargin);
    layout->setSpacing(groupSpacing);
    layout->addStretch();
    createSteps(layout, actions, sourceMenu);
    createExamples(layout);
    createRecent(layout);
    layout->addStretch();
    setAnythingOpen(false);
}

void KvDeskStartPage::createSteps(QVBoxLayout *layout, KvDeskActions *actions, QMenu *sourceMenu)
{
    m_heading = new QHBoxLayout;
    m_heading->addWidget(groupTitle(tr("From an image to a report"), this), 1);
    m_back = new QPushButton(tr("Back to the image"), this);
    m_back->setToolTip(
        tr("%1 (%2)", "command (shortcut)")
            .arg(m_back->text(), QKeySequence(Qt::Key_Escape).toString(QKeySequence::NativeText)));
    connect(m_back, SIGNAL(clicked()), this, SIGNAL(signalLeft()));
    m_heading->addWidget(m_back);

    auto *const open =
        new KvDeskStepRow(1, tr("Open an image"), tr("A picture file, or the live image of a camera."), this);
    open->addMenu(sourceMenu, tr("Choose a camera or another source"));
    open->addAction(actions->action(KvDeskActions::OpenImage), true);
    m_calibrate = new KvDeskStepRow(
        2, tr("Calibrate"), tr("Say how large a pixel is. The examples are calibrated already."), this);
    m_calibrate->addAction(actions->action(KvDeskActions::Calibrate), false);
    m_measure = new KvDeskStepRow(3, tr("Measure and report"),
                                  tr("Drag a line over the image: its length is listed at once. The report "
                                     "panel makes a PDF of all values."),
                                  this);
    m_measure->addAction(actions->action(KvDeskActions::LineTool), false);

    auto *const steps = new QVBoxLayout;
    steps->setSpacing(controlSpacing);
    steps->addLayout(m_heading);
    m_steps = {open, m_calibrate, m_measure};
    for (KvDeskStepRow *const row : qAsConst(m_steps))
        steps->addWidget(row);
    layout->addLayout(steps);
}

void KvDeskStartPage::createExamples(QVBoxLayout *layout)
{
    m_examplesGroup = new QWidget(this);
    QVBoxLayout *const group = groupLayout(m_examplesGroup);
    group->addWidget(groupTitle(tr("Examples to try"), m_examplesGroup));
    m_examplesLayout = new QGridLayout;
    m_examplesLayout->setSpacing(controlSpacing);
    group->addLayout(m_examplesLayout);
    layout->addWidget(m_examplesGroup);
}

void KvDeskStartPage::createRecent(QVBoxLayout *layout)
{
    m_recentGroup = new QWidget(this);
    m_recentLayout = groupLayout(m_recentGroup);
    m_recentLayout->addWidget(groupTitle(tr("Recent sessions"), m_recentGroup));
    layout->addWidget(m_recentGroup);
}

void KvDeskStartPage::setAnythingOpen(bool isOpen)
{
    const QString obstacle = isOpen ? QString() : tr("Open an image first");
    m_calibrate->setObstacle(obstacle);
    m_measure->setObstacle(obstacle);
    m_back->setVisible(isOpen);
}

void KvDeskStartPage::addExample(const QString &path)
{
    auto *const button = new QToolButton(m_examplesGroup);
    button->setToolButtonStyle(Qt::ToolButtonTextUnderIcon);
    button->setIcon(thumbnail(path, devicePixelRatioF()));
    button->setIconSize(thumbnailSize);
    button->setFixedSize(exampleSize);
    button->setText(buttonText(KvDeskExamples::title(path)));
    button->setFocusPolicy(Qt::StrongFocus);
    button->setToolTip(tr("Open a copy of this example"));
    button->setAccessibleName(KvDeskExamples::title(path));
    button->setAccessibleDescription(button->toolTip());
    button->setProperty("path", path);
    connect(button, SIGNAL(clicked()), this, SLOT(slotExampleClicked()));
    m_examples.append(button);
}

void KvDeskStartPage::addRecent(const QString &path)
{
    auto *const button =
        new QPushButton(buttonText(ZtLeftToRight::isolated(QFileInfo(path).fileName())), m_recentGroup);
    button->setProperty("link", true);
    button->setToolTip(ZtLeftToRight::isolated(QDir::toNativeSeparators(path)));
    button->setAccessibleName(QFileInfo(path).fileName());
    button->setProperty("path", path);
    connect(button, SIGNAL(clicked()), this, SLOT(slotRecentClicked()));
    m_recentLayout->addWidget(button, 0, Qt::AlignLeading);
    m_recent.append(button);
}

// Examples do not change while the program runs; their pictures are read once.
void KvDeskStartPage::listExamples()
{
    if (m_examples.isEmpty()) {
        for (const QString &path : KvDeskExamples::sessions(m_examplesFolder))
            addExample(path);
        placeExamples();
    }
    m_examplesGroup->setVisible(!m_examples.isEmpty());
}

void KvDeskStartPage::listRecent()
{
    // Later: one of them may have been clicked to get here.
    for (QPushButton *const button : qAsConst(m_recent)) {
        button->hide();
        button->deleteLater();
    }
    m_recent.clear();
    for (const QString &path : KvDeskRecentFiles::paths()) {
        if (m_recent.size() < mostRecent && QFileInfo::exists(path))
            addRecent(path);
    }
    m_recentGroup->setVisible(!m_recent.isEmpty());
}

void KvDeskStartPage::placeExamples()
{
    const QMargins margins = layout()->contentsMargins();
    const int room = width() - margins.left() - margins.right() + controlSpacing;
    const int columns = qMax(1, room / (exampleSize.width() + controlSpacing));
    for (int i = 0; i < m_examples.size(); ++i)
        m_examplesLayout->addWidget(m_examples.at(i), i / columns, i % columns);
    for (int i = 0; i <= m_examples.size(); ++i)
        m_examplesLayout->setColumnStretch(i, i == columns ? 1 : 0);
}

void KvDeskStartPage::placeSteps()
{
    const bool isNarrow = width() - 2 * pageMargin < narrowStep;
    const int margin = isNarrow ? narrowMargin : pageMargin;
    layout()->setContentsMargins(margin, margin, margin, margin);
    for (KvDeskStepRow *const row : qAsConst(m_steps))
        row->setNarrow(isNarrow);
}

// The layout's would be that of the present places, and the page could never become narrower.
QSize KvDeskStartPage::minimumSizeHint() const
{
    int content = qMax(exampleSize.width(), m_heading->minimumSize().width());
    for (const KvDeskStepRow *const row : m_steps)
        content = qMax(content, row->minimumSizeHint().width());
    return QSize(content + 2 * narrowMargin, QWidget::minimumSizeHint().height());
}

void KvDeskStartPage::showEvent(QShowEvent *event)
{
    listExamples();
    listRecent();
    QWidget::showEvent(event);
}

void KvDeskStartPage::resizeEvent(QResizeEvent *event)
{
    QWidget::resizeEvent(event);
    placeSteps();
    placeExamples();
}

void KvDeskStartPage::keyPressEvent(QKeyEvent *event)
{
    if (event->key() == Qt::Key_Escape && !m_back->isHidden())
        emit signalLeft();
    else
        QWidget::keyPressEvent(event);
}

void KvDeskStartPage::slotExampleClicked()
{
    emit signalExampleChosen(sender()->property("path").toString());
}

void KvDeskStartPage::slotRecentClicked()
{
    emit signalRecentChosen(sender()->property("path").toString());
}
