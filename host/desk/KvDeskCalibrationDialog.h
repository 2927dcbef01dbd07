// SPDX-License-Identifier: MIT
#pragma once

#include <QDialog>
#include <QVector>

class KvDeskCalibrationHistory;
class KvDeskCalibrationWay;
class KvDeskCalibrator;
class KvDeskFilePixelSize;
class KvDeskKnownDistance;
class KvDeskTableView;
class KvDeskTypedPixelSize;
class QAbstractButton;
class QButtonGroup;
class QComboBox;
class QFormLayout;
class QLabel;
class QLineEdit;
class QPushButton;
class QStackedWidget;
class QVBoxLayout;

/**
 * Window in which the session is calibrated: by a known distance, by the image's file or by typed numbers,
 * for one of the objectives; below, what an objective was calibrated with before. It stays open beside the
 * image.
 */
class KvDeskCalibrationDialog : public QDialog
{
    Q_OBJECT
public:
    enum Way { KnownDistance, ImageFile, Typed, WayCount };

    /** \a calibrator has to outlive the dialog. */
    explicit KvDeskCalibrationDialog(KvDeskCalibrator *calibrator, QWidget *parent = nullptr);

    /** The objective that is chosen or typed. */
    QString objective() const;
    Way way() const;
    void setWay(Way way);

    QComboBox *objectiveBox() const { return m_objective; }
    QAbstractButton *wayButton(Way way) const;
    KvDeskKnownDistance *knownDistance() const { return m_knownDistance; }
    KvDeskFilePixelSize *imageFile() const { return m_imageFile; }
    KvDeskTypedPixelSize *typed() const { return m_typed; }
    QLineEdit *nameEdit() const { return m_name; }
    QLineEdit *authorEdit() const { return m_author; }
    QLineEdit *noteEdit() const { return m_note; }
    QPushButton *calibrateButton() const { return m_calibrate; }
    KvDeskTableView *historyView() const { return m_historyView; }
    KvDeskCalibrationHistory *history() const { return m_history; }
    QPushButton *useAgainButton() const { return m_useAgain; }
    QString currentText() const; ///< what the session measures with
    QString resultText() const;  ///< the pixel size that would be used

private slots:
    void slotRefresh();
    void slotObjectiveChanged();
    void slotWayChanged();
    void slotResultChanged();
    void slotSelectionChanged();
    void slotCalibrate();
    void slotUseAgain();

private:
    void addObjective(QVBoxLayout *layout);
    void addWays(QVBoxLayout *layout);
    void addDescription(QVBoxLayout *layout);
    void addHistory(QVBoxLayout *layout);
    void addTitle(QVBoxLayout *layout, const QString &title);
    QFormLayout *createForm();
    void addRow(QFormLayout *form, const QString &name, QWidget *field);
    QLineEdit *createField(QFormLayout *form, const QString &name);
    void alignLabels();
    void connectSignals();
    void fillObjectives();
    void showHistory();
    KvDeskCalibrationWay *page() const;

    KvDeskCalibrator *m_calibrator;
    QVector<QLabel *> m_labels; ///< of the fields of all forms
    QComboBox *m_objective = nullptr;
    QLabel *m_current = nullptr;
    QButtonGroup *m_ways = nullptr;
    QStackedWidget *m_pages = nullptr;
    KvDeskKnownDistance *m_knownDistance = nullptr;
    KvDeskFilePixelSize *m_imageFile = nullptr;
    KvDeskTypedPixelSize *m_typed = nullptr;
    QLineEdit *m_name = nullptr;
    QLineEdit *m_author = nullptr;
    QLineEdit *m_note = nullptr;
    QLabel *m_result = nullptr;
    QPushButton *m_calibrate = nullptr;
    KvDeskCalibrationHistory *m_history = nullptr;
    KvDeskTableView *m_historyView = nullptr;
    QLabel *m_noHistory = nullptr;
    QPushButton *m_useAgain = nullptr;
    QPushButton *m_close = nullptr;
};
