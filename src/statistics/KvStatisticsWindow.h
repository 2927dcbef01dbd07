// SPDX-License-Identifier: MIT
#pragma once

#include <QMainWindow>
#include <QPointer>

#include <array>
#include <memory>

class KvBaseDisplayWidget;
class KvBaseEditorNodeCfg;
class KvBaseEditorNodeFactory;
class KvBlockRegistry;
class KvReportKernelData;
class KvStatisticsToolIconButton;
class QLabel;

namespace Ui {
class KvStatisticsWindowUi;
}

/**
 * The "Measurement statistics" window: shows one statistics block at a time, live on the current
 * measurements, with its options beside it. Every change of an option is stored in the settings at once.
 *
 * Follows the frame of its parent: below a window without a frame it draws its own title bar, and its height
 * can be changed by dragging its bottom edge. The width is fixed.
 */
class KvStatisticsWindow : public QMainWindow
{
    Q_OBJECT
public:
    /** \a kernelData is not owned and may die before the window. */
    explicit KvStatisticsWindow(KvReportKernelData *kernelData, QWidget *parent = nullptr);
    /** With other block types; of these it offers the four statistics blocks that it knows by name. */
    KvStatisticsWindow(std::unique_ptr<KvBlockRegistry> blocks, KvReportKernelData *kernelData,
                       QWidget *parent = nullptr);
    ~KvStatisticsWindow() override;

signals:
    void windowClosed(); ///< the user or the program closed the window; it is hidden, not deleted

public slots:
    void slotToolsTableClicked();
    void slotToolsCounterPieClicked();
    void slotToolsMinMedMaxBoxClicked();
    void slotToolsTrendClicked();
    void slotWidgetConfigChanged(const KvBaseEditorNodeCfg *aCfg);

protected:
    void showEvent(QShowEvent *event) override;
    void hideEvent(QHideEvent *event) override;
    void closeEvent(QCloseEvent *event) override;
    void mousePressEvent(QMouseEvent *event) override;
    void mouseMoveEvent(QMouseEvent *event) override;
    void mouseReleaseEvent(QMouseEvent *event) override;

private:
    /** The statistics blocks, in the order of their buttons. */
    enum Tool { Table, CounterPie, MinMedMaxBox, Trend, ToolCount };

    struct ToolState
    {
        KvBaseEditorNodeFactory *factory = nullptr; ///< of the registry; null where it has no such block
        KvStatisticsToolIconButton *button = nullptr;
        std::unique_ptr<KvBaseEditorNodeCfg> cfg; ///< made when the block is first shown
    };

    void createFrame();
    void createTools();
    void createHint();
    void addToolButton(Tool tool);
    void restoreWindow();
    void openTool(Tool tool);
    KvBaseEditorNodeCfg *configOf(Tool tool);
    std::unique_ptr<KvBaseEditorNodeCfg> readConfig(Tool tool) const;
    void showBlock(KvStatisticsToolIconButton *button, KvBaseEditorNodeCfg *cfg,
                   KvBaseDisplayWidget *display);
    void showOptions();
    void removeBlock();
    void selectButton(KvStatisticsToolIconButton *button);
    void forgetDisplayWidget();
    void setTracking(bool on);
    bool isOnBottomEdge(const QPoint &position) const;
    void dragBottomEdge(int globalY);

    std::unique_ptr<KvBlockRegistry> m_blocks;
    std::unique_ptr<Ui::KvStatisticsWindowUi> m_ui;
    bool m_frameless;
    QPointer<KvReportKernelData> m_kernelData;
    bool m_shown = false; ///< between a show and a hide: live tracking is on
    KvStatisticsToolIconButton *m_currentButton = nullptr;
    KvBaseDisplayWidget *m_displayWidget = nullptr; ///< owned; null when it was deleted elsewhere
    const KvBaseEditorNodeCfg *m_currentCfg = nullptr;
    std::array<ToolState, ToolCount> m_tools;
    QLabel *m_hint = nullptr; ///< says what to do while no block is shown; null afterwards
    int m_lastGlobalY = 0;
    bool m_dragging = false;
};
