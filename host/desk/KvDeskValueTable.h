// SPDX-License-Identifier: MIT
#pragma once

#include "KvDeskObjectId.h"
#include "KvDeskPanel.h"

#include <QStringList>
#include <QTimer>
#include <QVector>

class KvDeskEmptyState;
class KvDeskObjectEditor;
class KvDeskTableView;
class KvDeskValueCommands;
class KvDeskValueDelegate;
class KvDeskValueSelection;
class KvDeskValueSortModel;
class KvDeskValueTableModel;
class QLineEdit;

/** Panel with the table of measured values and a field that filters them. */
class KvDeskValueTable : public KvDeskPanel
{
    Q_OBJECT
public:
    static constexpr int filterDelayMs = 150;

    explicit KvDeskValueTable(QWidget *parent = nullptr);
    ~KvDeskValueTable() override;

    /** Does what the user asks for, and has the selected objects; called once, has to outlive this. */
    void setEditor(KvDeskObjectEditor *editor);

    KvDeskValueTableModel *model() const { return m_model; }
    KvDeskTableView *view() const { return m_view; }
    KvDeskValueSelection *selection() const { return m_selection; }
    /** Null without an editor. */
    KvDeskValueCommands *commands() const { return m_commands; }
    QLineEdit *filterField() const { return m_filter; }

public slots:
    void slotFocusFilter();
    void slotClearFilter();

signals:
    /** What the selected values come to, in one line and in several; empty for none. */
    void signalStatisticsChanged(const QString &aText, const QString &aDetails);

protected:
    void resizeEvent(QResizeEvent *event) override;
    bool eventFilter(QObject *watched, QEvent *event) override;

private slots:
    void slotFilterChanged();
    void slotApplyFilter();
    void slotRowsReset();
    void slotRowsChanged();
    void slotMeasureTexts();
    void slotColumnResized(int aColumn, int aOldWidth, int aNewWidth);
    void slotUpdateStatistics();

private:
    void createView();
    void createFilter();
    void createEmptyStates();
    void setUpColumns();
    void connectSignals();
    void updateEmptyStates();
    QString note() const;
    void measureRow(int row);
    void makeRoomForValues();
    int headingWidth(int column) const;
    int wantedWidth(int column) const;
    bool filterKeyPressed(int key);

    KvDeskValueTableModel *m_model;
    KvDeskValueSortModel *m_sorted;
    KvDeskTableView *m_view = nullptr;
    KvDeskValueSelection *m_selection = nullptr;
    KvDeskValueCommands *m_commands = nullptr;
    KvDeskValueDelegate *m_delegate = nullptr;
    KvDeskEmptyState *m_emptyState = nullptr;
    KvDeskEmptyState *m_noMatchState = nullptr;
    QLineEdit *m_filter = nullptr;
    QTimer m_filterTimer;
    QTimer m_measureTimer;
    int m_numberWidth = 0;     ///< pixels of the longest number seen so far
    int m_unitWidth = 0;       ///< pixels of the longest unit seen so far
    int m_valueWidth = 0;      ///< pixels that both take
    QVector<int> m_textWidths; ///< pixels of the longest text of each column before the values
    QVector<int> m_userWidths; ///< of these columns, as the user wants them; 0 for as its texts do
    bool m_isFitting = false;  ///< columns change because of the program
};
