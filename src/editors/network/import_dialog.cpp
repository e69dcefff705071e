#include "editors/network/import_dialog.h"

#include <QComboBox>
#include <QDialogButtonBox>
#include <QFormLayout>
#include <QLabel>
#include <QPushButton>

CImportDialog::CImportDialog(const QString& name, const CGisFile& file, QWidget* parent)
    : QDialog(parent),
      m_file(file),
      m_layer(new QComboBox),
      m_name(new QComboBox),
      m_start(new QComboBox),
      m_end(new QComboBox),
      m_summary(new QLabel)
{
    setObjectName(QStringLiteral("importDialog"));
    setWindowTitle(tr("Import Branches from %1").arg(name));
    auto* form = new QFormLayout(this);
    form->addRow(tr("&Layer:"), m_layer);
    form->addRow(tr("Field with the &name:"), m_name);
    form->addRow(tr("Field with the &first chainage [m]:"), m_start);
    form->addRow(tr("Field with the la&st chainage [m]:"), m_end);
    form->addRow(m_summary);
    auto* buttons = new QDialogButtonBox(QDialogButtonBox::Ok | QDialogButtonBox::Cancel);
    buttons->button(QDialogButtonBox::Ok)->setText(tr("&Import"));
    form->addRow(buttons);
    m_layer->setObjectName(QStringLiteral("layer"));
    m_name->setObjectName(QStringLiteral("nameField"));
    m_start->setObjectName(QStringLiteral("startField"));
    m_end->setObjectName(QStringLiteral("endField"));
    connect(buttons, &QDialogButtonBox::accepted, this, &QDialog::accept);
    connect(buttons, &QDialogButtonBox::rejected, this, &QDialog::reject);
    for (const CGisLayer& layer : file.layers)
        m_layer->addItem(layer.name);
    connect(m_layer, &QComboBox::currentIndexChanged, this, &CImportDialog::LayerChanged);
    connect(m_name, &QComboBox::currentIndexChanged, this, &CImportDialog::UpdateSummary);
    LayerChanged();
}

int CImportDialog::Layer() const
{
    return m_layer->currentIndex();
}

CImportFields CImportDialog::Fields() const
{
    return {m_name->currentData().toInt(), m_start->currentData().toInt(), m_end->currentData().toInt()};
}

void CImportDialog::LayerChanged()
{
    const CGisLayer& layer = m_file.layers[std::size_t(Layer())];
    const CImportFields proposed = ProposeFields(layer);
    const auto fill = [&](QComboBox* box, const QString& none, int current) {
        box->clear();
        box->addItem(none, -1);
        for (int i = 0; i < layer.fields.size(); ++i)
            box->addItem(layer.fields[i], i);
        box->setCurrentIndex(box->findData(current));
    };
    fill(m_name, tr("(none: numbered)"), proposed.name);
    fill(m_start, tr("(none: 0)"), proposed.start);
    fill(m_end, tr("(none: length of the line)"), proposed.end);
    UpdateSummary();
}

void CImportDialog::UpdateSummary()
{
    const CGisLayer& layer = m_file.layers[std::size_t(Layer())];
    QString text = tr("Lines: %1").arg(layer.lines.size());
    const QString first = layer.lines.front().values.value(m_name->currentData().toInt());
    if (m_name->currentData().toInt() >= 0)
        text += tr(", the first is named \"%1\"").arg(first);
    if (layer.others > 0)
        text += u'\n' + tr("Left out, because they are no lines: %1").arg(layer.others);
    m_summary->setText(text);
}
