// Asks which layer of a GIS file to import and how, and shows before anything is done what that would give.
#pragma once

#include "editors/network/import_report.h"

#include <QDialog>

class QCheckBox;
class QComboBox;
class QFormLayout;
class QLabel;
class QLineEdit;
class QPushButton;
class QTableWidget;

class CImportDialog : public QDialog
{
    Q_OBJECT
public:
    /// `name` is the file's. All of them outlive the dialog; `file` has layers.
    CImportDialog(const QString& name, const CGisFile& file, const CGisLibrary& library, const CNetwork& network,
                  QWidget* parent);

    /// What the user sees in the report.
    const CImport& Import() const { return m_import; }
    /// The coordinate system that the network names from now on: what it names now, unless it named none and the user
    /// or an empty network lets it take that of the lines.
    QString NetworkSystem() const;

private:
    void MakeLayers(const CGisFile& file);
    void MakeFields(QFormLayout* form);
    void MakeButtons(QFormLayout* form);
    int FirstLayer() const;
    void LayerChanged();
    void OfferFields();
    void OfferTargets();
    int ProposedTarget() const;
    void TargetChanged();
    void Plan();
    void ShowPlan();
    QString WhyNot() const;

    const CGisFile& m_file;
    const CGisLibrary& m_library;
    const CNetwork& m_network;
    CGisSystem m_own;                  // the network's
    std::vector<CGisSystem> m_targets; // offered; behind them one by its code
    CImport m_import;
    bool m_filling = false;

    QTableWidget* m_layers;
    QComboBox *m_name, *m_start, *m_end, *m_parts, *m_target;
    QLineEdit* m_code;
    QCheckBox *m_unnamed, *m_damaged, *m_declare;
    QLabel* m_warning;
    QPlainTextEdit* m_report = nullptr;
    QPushButton* m_ok = nullptr;
};
