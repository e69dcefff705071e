// Asks which layer of a GIS file to import, and which of its fields say what.
#pragma once

#include "editors/network/import_branches.h"

#include <QDialog>

class QComboBox;
class QLabel;

class CImportDialog : public QDialog
{
    Q_OBJECT
public:
    /// `file` has layers, and outlives the dialog.
    CImportDialog(const QString& name, const CGisFile& file, QWidget* parent);
    int Layer() const;
    CImportFields Fields() const;

private:
    void LayerChanged();
    void UpdateSummary();

    const CGisFile& m_file;
    QComboBox *m_layer, *m_name, *m_start, *m_end;
    QLabel* m_summary;
};
