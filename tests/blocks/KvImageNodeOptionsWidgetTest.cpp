// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "KvImagePanelProbe.h"
#include "KvImageSamples.h"
#include "MetaMethods.h"
#include "blocks/image/KvImageNodeCfg.h"
#include "blocks/image/KvImageNodeOptionsWidget.h"
#include "blocks/textdocument/KvTextDocumentNodeCfg.h"
#include "common/ZtAppStatus.h"
#include "gui/QtAdvancedStylesheet.h"
#include "kernel/ZtAppSettings.h"

#include <QComboBox>
#include <QFileDialog>
#include <QPushButton>
#include <QSpinBox>

using Panel = KvImageNodeOptionsWidget;

namespace {

/// Counts all that the panel says.
struct PanelSpies
{
    explicit PanelSpies(Panel *panel)
        : width(panel, SIGNAL(signalWidthChanged(int)))
                , alignment(panel, SIGNAL(signalAlignmentChanged(Qt::Alignment)))
                            , path(panel, SIGNAL(signalImagePathChanged(QString,QPixmap)))
                                   , angle(panel, SIGNAL(signalRotateAngleChanged(int)))
    {}
    int total() const { return width.count() + alignment.count() + path.count() + angle.count(); }

    QSignalSpy width;
    QSignalSpy alignment;
    QSignalSpy path;
    QSignalSpy angle;
};

/// While it lives, notes the open-file dialog and chooses a file in it, or cancels it.
class FileChooser : public QObject
{
    Q_OBJECT
public:
    explicit FileChooser(const QString &path)
        : m_path(path)
    {
        connect(&m_timer, SIGNAL(timeout()), this, SLOT(slotLook()));
        m_timer.start(5);
    }

    int dialogs = 0;
    QString title;
    QStringList filters;
    QString directory;
    Panel *panelToDelete = nullptr;

private slots:
    void slotLook()
    {
        auto *dialog = qobject_cast<QFileDialog *>(QApplication::activeModalWidget());
        if (!dialog || !dialog->isVisible())
            return;
        m_timer.stop();
        ++dialogs;
        title = dialog->windowTitle();
        filters = dialog->nameFilters();
        directory = dialog->directory().absolutePath();
        if (panelToDelete) {
            delete panelToDelete;
        } else if (m_path.isEmpty()) {
            dialog->reject();
        } else {
            dialog->selectFile(m_path);
            static_cast<QDialog *>(dialog)->accept();
        }
    }

private:
    QString m_path;
    QTimer m_timer;
};

const QString kDirectoryKey = QStringLiteral("ImageNodeDirectoryPath");

} // namespace

class KvImageNodeOptionsWidgetTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void init();
    void cleanup();
    void declaresSignalsAndSlotsInOrder();
    void hasItsNamesAndTexts();
    void rowsStandInOrder();
    void fitsTheSide();
    void tabGoesFromTopToBottom();
    void showsTheConfiguration_data();
    void showsTheConfiguration();
    void fillingEmitsNothing();
    void widthIsTyped();
    void angleIsChosen();
    void alignmentIsClicked();
    void writesNothingItself();
    void withoutPlacementTwoRowsAreMissing();
    void ignoresOtherConfigurations();

    void aFileIsChosen();
    void theDialogStartsWhereTheLastEnded();
    void cancellingChangesNothing();
    void anUnreadableFileIsTold();
    void survivesItsEndDuringTheDialog();

private:
    QPushButton *browseButton() const
    {
        return m_panel->findChild<QPushButton *>(QStringLiteral("accentButton"));
    }
    QList<QPushButton *> alignmentButtons() const
    {
        return KvImagePanelProbe::alignmentButtons(m_panel.get());
    }

    std::unique_ptr<KvImageNodeCfg> m_cfg;
    std::unique_ptr<Panel> m_panel;
};

void KvImageNodeOptionsWidgetTest::init()
{
    StatReportTest::init();
    ZtStatusLog::getInstance()->clear();
    m_cfg = std::make_unique<KvImageNodeCfg>(nullptr);
    m_panel = std::make_unique<Panel>(m_cfg.get(), nullptr, true);
    QVERIFY(PanelProbe::show(m_panel.get()));
}

void KvImageNodeOptionsWidgetTest::cleanup()
{
    m_panel.reset();
    m_cfg.reset();
    ZtAppSettings::getInstance()->setStoragePath(QString());
    StatReportTest::cleanup();
}

void KvImageNodeOptionsWidgetTest::declaresSignalsAndSlotsInOrder()
{
    QCOMPARE(ownMethods(Panel::staticMetaObject, QMetaMethod::Signal),
             QStringList({"signalWidthChanged(int)", "signalAlignmentChanged(Qt::Alignment)",
                          "signalImagePathChanged(QString,QPixmap)", "signalRotateAngleChanged(int)"}));
    QCOMPARE(ownMethods(Panel::staticMetaObject, QMetaMethod::Slot),
             QStringList({"slotAngleIndexChanged()", "slotAlignLeftClicked()", "slotAlignCenterClicked()",
                          "slotAlignRightClicked()", "slotOnBrowseButtonClicked()"}));
}

void KvImageNodeOptionsWidgetTest::hasItsNamesAndTexts()
{
    QCOMPARE(m_panel->objectName(), QStringLiteral("KvImageNodeOptionsWidget"));
    QCOMPARE(m_panel->findChild<QLabel *>(QStringLiteral("sideHeader"))->text(),
             QStringLiteral("Image view"));
    QVERIFY(PanelProbe::labelTexts(m_panel.get()).contains(QStringLiteral("W")));
    QCOMPARE(browseButton()->text(), QStringLiteral("Browse"));
    const auto *box = m_panel->findChild<QSpinBox *>();
    QCOMPARE(box->suffix(), QStringLiteral("%"));
    QCOMPARE(box->minimum(), 1);
    QCOMPARE(box->maximum(), 100);
    for (const QWidget *control : m_panel->findChildren<QAbstractButton *>())
        QVERIFY(!control->toolTip().isEmpty());
}

void KvImageNodeOptionsWidgetTest::rowsStandInOrder()
{
    const auto top = [this](const QWidget *control) {
        return control->mapTo(m_panel.get(), QPoint(0, 0)).y();
    };
    const auto bottom = [top](const QWidget *control) { return top(control) + control->height(); };
    const auto *width = m_panel->findChild<QSpinBox *>();
    const auto *angle = m_panel->findChild<QComboBox *>();
    QCOMPARE(PanelProbe::controls<QPushButton>(m_panel.get()).size(), 4);
    QVERIFY(bottom(m_panel->findChild<QLabel *>(QStringLiteral("sideHeader"))) <= top(width));
    QVERIFY(bottom(width) <= top(angle));
    QVERIFY(bottom(angle) <= top(alignmentButtons().first()));
    QCOMPARE(top(alignmentButtons().last()), top(alignmentButtons().first()));
    QVERIFY(bottom(alignmentButtons().first()) <= top(browseButton()));
    QCOMPARE(width->mapTo(m_panel.get(), QPoint(0, 0)).x(), angle->mapTo(m_panel.get(), QPoint(0, 0)).x());
}

void KvImageNodeOptionsWidgetTest::fitsTheSide()
{
    acss::QtAdvancedStylesheet::getInstance()->applyTo(qApp);
    Panel panel(m_cfg.get(), nullptr, true);
    panel.setFixedWidth(290);
    QVERIFY(PanelProbe::show(&panel));
    QVERIFY(panel.minimumSizeHint().width() <= 290);
    QCOMPARE(KvImagePanelProbe::controlHeights(&panel), QList<int>({28, 28, 24, 24, 24, 28}));
    qApp->setStyleSheet(QString());
}

void KvImageNodeOptionsWidgetTest::tabGoesFromTopToBottom()
{
    QList<QWidget *> expected{KvImagePanelProbe::widthBox(m_panel.get()),
                              KvImagePanelProbe::angleBox(m_panel.get())};
    for (QPushButton *button : KvImagePanelProbe::alignmentButtons(m_panel.get()))
        expected.append(button);
    expected.append(browseButton());
    QCOMPARE(KvImagePanelProbe::tabChain(m_panel.get()), expected);
}

void KvImageNodeOptionsWidgetTest::showsTheConfiguration_data()
{
    KvImagePanelProbe::addPlacementRows();
}

void KvImageNodeOptionsWidgetTest::showsTheConfiguration()
{
    QFETCH(QVector<int>, placement);
    QFETCH(QString, shown);
    m_panel->findChild<QComboBox *>()->setCurrentIndex(2);
    m_cfg->setPlacement({Qt::Alignment(placement.at(0)), placement.at(1), placement.at(2)});
    m_panel->setFromConfig(m_cfg.get());
    QCOMPARE(KvImagePanelProbe::shownPlacement(m_panel.get()), shown);
    const Panel fresh(m_cfg.get(), nullptr, true);
    QCOMPARE(KvImagePanelProbe::shownPlacement(&fresh), shown);
}

void KvImageNodeOptionsWidgetTest::fillingEmitsNothing()
{
    PanelSpies spies(m_panel.get());
    KvImageNodeCfg other(nullptr);
    other.setPlacement({Qt::AlignRight, 12, 270});
    m_panel->setFromConfig(&other);
    QCOMPARE(m_panel->findChild<QSpinBox *>()->value(), 12);
    QCOMPARE(spies.total(), 0);
}

void KvImageNodeOptionsWidgetTest::widthIsTyped()
{
    PanelSpies spies(m_panel.get());
    auto *box = m_panel->findChild<QSpinBox *>();
    QTest::keyClick(box, Qt::Key_Up);
    QCOMPARE(spies.width.count(), 1);
    QCOMPARE(spies.width.first().first().toInt(), 76);
    QCOMPARE(spies.total(), 1);
}

void KvImageNodeOptionsWidgetTest::angleIsChosen()
{
    PanelSpies spies(m_panel.get());
    auto *box = m_panel->findChild<QComboBox *>();
    for (const int angle : {90, 180, 270}) {
        QTest::keyClick(box, Qt::Key_Down);
        QCOMPARE(spies.angle.last().first().toInt(), angle);
    }
    QCOMPARE(spies.total(), 3);
    QTest::keyClick(box, Qt::Key_Home);
    QCOMPARE(spies.angle.last().first().toInt(), 0);
}

void KvImageNodeOptionsWidgetTest::alignmentIsClicked()
{
    QCOMPARE(KvImagePanelProbe::clickAlignments(m_panel.get()), KvImagePanelProbe::properAlignments());
}

void KvImageNodeOptionsWidgetTest::writesNothingItself()
{
    m_panel->findChild<QSpinBox *>()->setValue(3);
    m_panel->findChild<QComboBox *>()->setCurrentIndex(1);
    PanelProbe::click(alignmentButtons().first());
    QVERIFY(m_cfg->placement() == KvPicturePlacement());
    m_cfg.reset(); // nor does it need the configuration any longer
    m_panel->findChild<QSpinBox *>()->setValue(4);
}

void KvImageNodeOptionsWidgetTest::withoutPlacementTwoRowsAreMissing()
{
    Panel panel(m_cfg.get(), nullptr, false);
    QVERIFY(!panel.findChild<QSpinBox *>());
    QVERIFY(panel.findChild<QComboBox *>());
    QCOMPARE(panel.findChildren<QPushButton *>().size(), 1);
    panel.setFromConfig(m_cfg.get());
}

void KvImageNodeOptionsWidgetTest::ignoresOtherConfigurations()
{
    KvTextDocumentNodeCfg text(nullptr);
    m_panel->setFromConfig(&text);
    m_panel->setFromConfig(nullptr);
    QCOMPARE(m_panel->findChild<QSpinBox *>()->value(), 75);
}

void KvImageNodeOptionsWidgetTest::aFileIsChosen()
{
    const QString path = temporaryPath(QStringLiteral("picture.png"));
    QVERIFY(KvImageSamples::plain(QSize(21, 12)).save(path));
    PanelSpies spies(m_panel.get());
    FileChooser chooser(path);
    PanelProbe::click(browseButton());
    QCOMPARE(chooser.dialogs, 1);
    QCOMPARE(chooser.title, QStringLiteral("Choose image file"));
    QCOMPARE(chooser.filters, QStringList{"Image file(*.png *.jpg *.gif *.tif *.bmp)"});
    QCOMPARE(spies.path.count(), 1);
    QCOMPARE(spies.path.first().at(0).toString(), path);
    QCOMPARE(spies.path.first().at(1).value<QPixmap>().size(), QSize(21, 12));
    QCOMPARE(spies.total(), 1);
    QCOMPARE(ZtAppSettings::value(kDirectoryKey).toString(), QFileInfo(path).absolutePath());
    QVERIFY(ZtStatusLog::getInstance()->entries().isEmpty());
}

void KvImageNodeOptionsWidgetTest::theDialogStartsWhereTheLastEnded()
{
    const QString folder = temporaryPath(QStringLiteral("pictures"));
    QVERIFY(QDir().mkpath(folder));
    ZtAppSettings::setValue(kDirectoryKey, folder);
    FileChooser chooser{QString()};
    PanelProbe::click(browseButton());
    QCOMPARE(chooser.directory, folder);
}

void KvImageNodeOptionsWidgetTest::cancellingChangesNothing()
{
    ZtAppSettings::setValue(kDirectoryKey, QStringLiteral("/tmp"));
    PanelSpies spies(m_panel.get());
    FileChooser chooser{QString()};
    PanelProbe::click(browseButton());
    QCOMPARE(chooser.dialogs, 1);
    QCOMPARE(spies.total(), 0);
    QCOMPARE(ZtAppSettings::value(kDirectoryKey).toString(), QStringLiteral("/tmp"));
}

void KvImageNodeOptionsWidgetTest::anUnreadableFileIsTold()
{
    const QString path = temporaryPath(QStringLiteral("broken.png"));
    QFile file(path);
    QVERIFY(file.open(QIODevice::WriteOnly));
    file.write("no picture");
    file.close();
    PanelSpies spies(m_panel.get());
    FileChooser chooser(path);
    PanelProbe::click(browseButton());
    QCOMPARE(spies.path.count(), 1);
    QCOMPARE(spies.path.first().at(0).toString(), path);
    QVERIFY(spies.path.first().at(1).value<QPixmap>().isNull());
    QCOMPARE(ZtStatusLog::getInstance()->entries().size(), 1);
    QVERIFY(ZtStatusLog::getInstance()->entries().first().message.contains(path));
}

void KvImageNodeOptionsWidgetTest::survivesItsEndDuringTheDialog()
{
    FileChooser chooser(temporaryPath(QStringLiteral("any.png")));
    chooser.panelToDelete = m_panel.release();
    chooser.panelToDelete->slotOnBrowseButtonClicked();
    QCOMPARE(chooser.dialogs, 1);
    QVERIFY(!QApplication::activeModalWidget());
    QVERIFY(!ZtAppSettings::contains(kDirectoryKey));
}

STATREPORT_TEST_MAIN(KvImageNodeOptionsWidgetTest)
#include "KvImageNodeOptionsWidgetTest.moc"
