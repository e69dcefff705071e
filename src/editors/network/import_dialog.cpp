#include "editors/network/import_dialog.h"

#include "ks/units/edit_fields.h"

#include <QCheckBox>
#include <QComboBox>
#include <QDialogButtonBox>
#include <QFormLayout>
#include <QHBoxLayout>
#include <QHeaderView>
#include <QLabel>
#include <QLineEdit>
#include <QPlainTextEdit>
#include <QPushButton>
#include <QScopedValueRollback>
#include <QTableWidget>
#include <cmath>

namespace {

template <typename Box>
Box* Named(Box* widget, const char* name)
{
    widget->setObjectName(QString::fromLatin1(name));
    return widget;
}

QString LayerRemarkText(const CGisLayer& layer)
{
    if (layer.Lines() == 0)
        return CImportDialog::tr("cannot be taken: no lines among %1 features").arg(layer.features.size());
    return layer.IsComplete() ? QString() : CImportDialog::tr("incomplete or damaged");
}

/// What the features of a layer are; of a layer without any what it is meant for.
QString GeometriesOf(const CGisLayer& layer)
{
    QStringList kinds;
    for (const CGisFeature& feature : layer.features) {
        if (const QString kind = GeometryText(feature.geometry); !kind.isEmpty() && !kinds.contains(kind))
            kinds << kind;
    }
    return kinds.isEmpty() ? GeometryText(layer.geometry) : kinds.join(QStringLiteral(", "));
}

} // namespace

CImportDialog::CImportDialog(const QString& name, const CGisFile& file, const CGisLibrary& library,
                             const CNetwork& network, QWidget* parent)
    : QDialog(parent),
      m_file(file),
      m_library(library),
      m_network(network),
      m_own(library.FindSystem(network.System())),
      m_layers(Named(new QTableWidget, "layers")),
      m_name(Named(new QComboBox, "nameField")),
      m_start(Named(new QComboBox, "startField")),
      m_end(Named(new QComboBox, "endField")),
      m_parts(Named(new QComboBox, "parts")),
      m_target(Named(new QComboBox, "target")),
      m_code(Named(new QLineEdit, "code")),
      m_unnamed(Named(new QCheckBox(tr("Take lines &without a name, too")), "unnamed")),
      m_damaged(Named(new QCheckBox(tr("&Take what could be read of the damaged file")), "damaged")),
      m_declare(Named(new QCheckBox(tr("The branches of the network are in this coordinate s&ystem, too")), "declare")),
      m_warning(Named(new QLabel, "warning"))
{
    setObjectName(QStringLiteral("importDialog"));
    setWindowTitle(tr("Import Branches from %1").arg(name));
    m_import.file = name;
    auto* form = new QFormLayout(this);
    form->setFieldGrowthPolicy(QFormLayout::AllNonFixedFieldsGrow);
    MakeLayers(file);
    MakeFields(form);
    MakeButtons(form);
    resize(760, 720);
    m_layers->selectRow(FirstLayer());
}

void CImportDialog::MakeLayers(const CGisFile& file)
{
    const QStringList headers{tr("Layer"), tr("Geometry"), tr("Lines"), tr("Coordinate system"), tr("Remark")};
    m_layers->setColumnCount(int(headers.size()));
    m_layers->setRowCount(int(file.layers.size()));
    m_layers->setHorizontalHeaderLabels(headers);
    m_layers->verticalHeader()->hide();
    m_layers->horizontalHeader()->setStretchLastSection(true);
    m_layers->horizontalHeader()->setHighlightSections(false);
    m_layers->setSelectionBehavior(QAbstractItemView::SelectRows);
    m_layers->setSelectionMode(QAbstractItemView::SingleSelection);
    m_layers->setEditTriggers(QAbstractItemView::NoEditTriggers);
    m_layers->setTabKeyNavigation(false);
    m_layers->setWordWrap(false);
    m_layers->setAccessibleName(tr("Layers of the file"));
    for (int row = 0; row < m_layers->rowCount(); ++row) {
        const CGisLayer& layer = file.layers[std::size_t(row)];
        const QString texts[] = {layer.name, GeometriesOf(layer), QString::number(layer.Lines()),
                                 layer.system.IsKnown() ? layer.system.name : tr("none named"), LayerRemarkText(layer)};
        for (int column = 0; column < headers.size(); ++column) {
            auto* item = new QTableWidgetItem(texts[column]);
            item->setFlags(layer.Lines() > 0 ? Qt::ItemIsEnabled | Qt::ItemIsSelectable : Qt::NoItemFlags);
            m_layers->setItem(row, column, item);
        }
    }
    m_layers->resizeColumnsToContents();
    const int rows = std::min(m_layers->rowCount(), 5);
    m_layers->setFixedHeight(m_layers->horizontalHeader()->sizeHint().height() + 2 * m_layers->frameWidth() +
                             rows * m_layers->rowHeight(0) + m_layers->fontMetrics().height());
    connect(m_layers, &QTableWidget::itemSelectionChanged, this, &CImportDialog::LayerChanged);
}

void CImportDialog::MakeFields(QFormLayout* form)
{
    auto* layers = new QLabel(tr("&Layers:"));
    layers->setBuddy(m_layers);
    form->addRow(layers);
    form->addRow(m_layers);
    form->addRow(tr("Field with the &name:"), m_name);
    form->addRow(tr("Field with the &first chainage [m]:"), m_start);
    form->addRow(tr("Field with the la&st chainage [m]:"), m_end);
    m_parts->addItem(tr("become branches NAME-1, NAME-2, each from 0 to its length"), int(CImportParts::Branches));
    m_parts->addItem(tr("become branches that share the chainages of the line"), int(CImportParts::ShareChainages));
    m_parts->addItem(tr("are left out"), int(CImportParts::LeaveOut));
    form->addRow(tr("Lines whose &parts do not meet:"), m_parts);
    auto* systems = new QHBoxLayout;
    systems->addWidget(m_target, 1);
    systems->addWidget(m_code);
    KsShowHint(*m_code, QStringLiteral("EPSG"));
    m_code->setAccessibleName(tr("EPSG code of the coordinate system"));
    m_code->setMaximumWidth(9 * fontMetrics().averageCharWidth() + 24);
    auto* target = new QLabel(tr("&Coordinates in the network:"));
    target->setBuddy(m_target);
    form->addRow(target, systems);
    m_unnamed->setChecked(true);
    for (QCheckBox* box : {m_unnamed, m_declare, m_damaged})
        form->addRow(box);
    for (QComboBox* box : {m_name, m_start, m_end, m_parts})
        connect(box, &QComboBox::currentIndexChanged, this, &CImportDialog::Plan);
    connect(m_target, &QComboBox::currentIndexChanged, this, &CImportDialog::TargetChanged);
    connect(m_code, &QLineEdit::textChanged, this, &CImportDialog::TargetChanged);
    connect(m_unnamed, &QCheckBox::toggled, this, &CImportDialog::Plan);
    connect(m_damaged, &QCheckBox::toggled, this, &CImportDialog::ShowPlan);
}

void CImportDialog::MakeButtons(QFormLayout* form)
{
    m_warning->setWordWrap(true);
    QFont bold = font();
    bold.setBold(true);
    m_warning->setFont(bold);
    form->addRow(m_warning);
    auto* buttons = new QDialogButtonBox(QDialogButtonBox::Ok | QDialogButtonBox::Cancel);
    m_ok = buttons->button(QDialogButtonBox::Ok);
    m_ok->setText(tr("&Import"));
    m_report = MakeReportField(*buttons);
    auto* report = new QLabel(tr("What the import &gives:"));
    report->setBuddy(m_report);
    form->addRow(report);
    form->addRow(m_report);
    connect(buttons, &QDialogButtonBox::accepted, this, &QDialog::accept);
    connect(buttons, &QDialogButtonBox::rejected, this, &QDialog::reject);
    form->addRow(buttons);
}

/// The first one that has lines; the first of all when none has.
int CImportDialog::FirstLayer() const
{
    const auto found = std::ranges::find_if(m_file.layers, &CGisLayer::Lines);
    return found == m_file.layers.end() ? 0 : int(found - m_file.layers.begin());
}

// ---- choices -----------------------------------------------------------------------------------

void CImportDialog::LayerChanged()
{
    const auto rows = m_layers->selectionModel()->selectedRows();
    m_import.layer = rows.isEmpty() ? nullptr : &m_file.layers[std::size_t(rows.front().row())];
    if (m_import.layer) {
        const QScopedValueRollback filling(m_filling, true);
        OfferFields();
        OfferTargets();
        m_damaged->setVisible(!m_import.layer->IsComplete());
        m_damaged->setChecked(false);
    }
    TargetChanged();
}

void CImportDialog::OfferFields()
{
    const CGisLayer& layer = *m_import.layer;
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
    fill(m_end, tr("(none: by the length of the line)"), proposed.end);
}

/// Behind those offered, a system may be named by its code.
void CImportDialog::OfferTargets()
{
    const CGisLayer& layer = *m_import.layer;
    m_targets.clear();
    m_target->clear();
    const auto offer = [this](const QString& text, const CGisSystem& system) {
        m_target->addItem(text);
        m_targets.push_back(system);
    };
    // Branches that are to lie in one network lie in its coordinate system.
    if (!layer.system.IsKnown() || m_own.IsKnown()) {
        offer(layer.system.IsKnown() ? tr("the network's: %1").arg(m_own.name)
              : m_own.IsKnown()      ? tr("taken as the network's: %1").arg(m_own.name)
                                     : tr("as in the file, taken as meters"),
              layer.system.IsKnown() ? m_own : CGisSystem());
    } else {
        if (!layer.system.degrees)
            offer(tr("as in the file: %1").arg(layer.system.name), layer.system);
        const CGisSystem zone = m_library.UtmZone(layer);
        if (zone.IsKnown() && zone.definition != layer.system.definition)
            offer(tr("projected to %1").arg(zone.name), zone);
        m_target->addItem(tr("another one, by its EPSG code:"));
    }
    m_target->setCurrentIndex(ProposedTarget());
    m_target->setEnabled(m_target->count() > 1);
}

/// The file's own system, unless its lengths are wrong and there is nothing that the lines have to fit.
int CImportDialog::ProposedTarget() const
{
    constexpr double tolerable = 0.01;
    if (m_targets.size() < 2 || !m_network.branches.empty())
        return 0;
    const CGisMap map = m_library.MapOf(*m_import.layer, m_targets[0]);
    return std::abs(map.scale - 1) > tolerable ? 1 : 0;
}

void CImportDialog::TargetChanged()
{
    if (m_filling)
        return;
    const auto chosen = std::size_t(m_target->currentIndex());
    const bool byCode = chosen >= m_targets.size();
    m_code->setVisible(byCode && m_import.layer);
    m_import.target = byCode ? m_library.FindSystem(m_code->text()) : m_targets[chosen];
    m_import.map = {};
    if (m_import.layer && byCode && !m_import.target.IsKnown())
        m_import.map.error = tr("\"%1\" is no EPSG code of a coordinate system. Expected a number, for example 25832.")
                                 .arg(m_code->text());
    else if (m_import.layer)
        m_import.map = m_library.MapOf(*m_import.layer, m_import.target);
    m_declare->setVisible(m_network.system.empty() && !m_network.branches.empty() && m_import.target.IsKnown());
    Plan();
}

QString CImportDialog::NetworkSystem() const
{
    const bool take = m_network.branches.empty() || m_declare->isChecked();
    return m_network.system.empty() && take ? m_import.target.definition : m_network.System();
}

// ---- preview -----------------------------------------------------------------------------------

void CImportDialog::Plan()
{
    if (m_filling)
        return;
    const CImportOptions options{
        {m_name->currentData().toInt(), m_start->currentData().toInt(), m_end->currentData().toInt()},
        CImportParts(m_parts->currentData().toInt()),
        m_unnamed->isChecked()};
    m_import.plan = m_import.layer ? PlanImport(*m_import.layer, m_import.map, options, m_network) : CImportPlan();
    ShowPlan();
}

/// Why nothing can be imported now; empty when it can.
QString CImportDialog::WhyNot() const
{
    if (!m_import.layer)
        return tr("Choose a layer.");
    if (!m_import.map.error.isEmpty())
        return m_import.map.error;
    return m_import.plan.branches.empty() ? tr("No line of this layer becomes a branch.") : QString();
}

void CImportDialog::ShowPlan()
{
    QStringList warnings;
    if (const QString reason = WhyNot(); !reason.isEmpty())
        warnings << reason;
    if (!m_network.system.empty() && !m_own.IsKnown())
        warnings
            << tr("The network names the coordinate system \"%1\", which is not known here.").arg(m_network.System());
    const CImportReport report = m_import.layer ? ReportOf(m_import, m_network) : CImportReport();
    warnings << report.warnings;
    warnings.removeDuplicates();
    m_warning->setText(warnings.join(u'\n'));
    m_warning->setVisible(!warnings.isEmpty());
    m_report->setPlainText(report.text);
    const bool whole = m_import.layer && (m_import.layer->IsComplete() || m_damaged->isChecked());
    m_ok->setEnabled(WhyNot().isEmpty() && whole);
}
