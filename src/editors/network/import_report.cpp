#include "editors/network/import_report.h"

#include "editors/common/quantity.h"

#include <QClipboard>
#include <QCoreApplication>
#include <QDialog>
#include <QDialogButtonBox>
#include <QGuiApplication>
#include <QPlainTextEdit>
#include <QPushButton>
#include <QVBoxLayout>
#include <algorithm>
#include <cmath>

namespace {

struct Text
{
    Q_DECLARE_TR_FUNCTIONS(ImportReport)
};

QString Length(double metres)
{
    return WithSymbol(UnitGroup::Chainage, metres);
}

QString Factor(double value)
{
    return QString::number(value, 'f', std::abs(value - 1) < 0.01 ? 4 : 2);
}

CImportRemark SystemRemark(const CImport& import)
{
    const CGisSystem& from = import.layer->system;
    if (!from.IsKnown())
        return {Text::tr("The layer names no coordinate system: its numbers are taken as meters on a map."), true};
    if (from.definition == import.target.definition)
        return {Text::tr("Coordinate system: %1, as in the file.").arg(from.name)};
    return {Text::tr("Coordinate system: %1, projected from %2.").arg(import.target.name, from.name)};
}

/// How lengths on the map compare with the ground: nothing when that is not known.
void AddScale(const CGisMap& map, std::vector<CImportRemark>& remarks)
{
    constexpr double notable = 0.01, spread = 0.01;
    if (std::isnan(map.scale))
        return;
    QString text = Text::tr("Lengths on this map are %1 times those on the ground").arg(Factor(map.scale));
    if (map.largest - map.least > spread)
        text += Text::tr(" (from %1 to %2 by line)").arg(Factor(map.least), Factor(map.largest));
    text += Text::tr(".");
    const bool warning = std::max(std::abs(map.least - 1), std::abs(map.largest - 1)) > notable;
    if (warning)
        text += u' ' + Text::tr("So are chainages that follow from them. Another coordinate system avoids this.");
    remarks.push_back({text, warning});
}

QString MissingFeatures(const CGisLayer& layer)
{
    const auto read = qint64(layer.features.size());
    return read < layer.announced
               ? Text::tr("The file counts %1 features, but only %2 could be read.").arg(layer.announced).arg(read)
               : QString();
}

void AddErrors(const CGisLayer& layer, std::vector<CImportRemark>& remarks)
{
    if (layer.IsComplete())
        return;
    const auto damaged = std::count_if(layer.features.begin(), layer.features.end(),
                                       [](const CGisFeature& feature) { return !feature.error.isEmpty(); });
    QStringList texts{Text::tr("The file is incomplete or damaged.")};
    if (damaged > 0)
        texts << Text::tr("Features with errors: %1 of %2.").arg(damaged).arg(layer.features.size());
    texts << MissingFeatures(layer) << layer.errors;
    texts.removeAll(QString());
    remarks.push_back({texts.join(u' '), true});
}

double Gap(double low, double high, double otherLow, double otherHigh)
{
    return std::max({0.0, otherLow - high, low - otherHigh});
}

/// Branches that lie farther from the network than either is large are hardly in its coordinate system.
void AddDistance(const CImport& import, const CNetwork& network, std::vector<CImportRemark>& remarks)
{
    CNetwork added;
    added.branches = import.plan.branches;
    const QRectF there = network.Extent(), here = added.Extent();
    if (there.isNull() || here.isNull())
        return;
    const double gap = std::hypot(Gap(here.left(), here.right(), there.left(), there.right()),
                                  Gap(here.top(), here.bottom(), there.top(), there.bottom()));
    const auto across = [](const QRectF& box) { return std::hypot(box.width(), box.height()); };
    if (gap > std::max(across(here), across(there)))
        remarks.push_back(
            {Text::tr("These lines lie %1 away from the branches of the network: they may be in different "
                      "coordinate systems.")
                 .arg(Length(std::round(gap))),
             true});
}

void AddList(const QString& title, const QStringList& entries, QStringList& lines)
{
    if (entries.isEmpty())
        return;
    lines << QString() << QStringLiteral("%1 (%2)").arg(title).arg(entries.size());
    for (const QString& entry : entries)
        lines << QStringLiteral("  ") + entry;
}

} // namespace

std::vector<CImportRemark> ImportRemarks(const CImport& import, const CNetwork& network)
{
    if (!import.map.error.isEmpty())
        return {{import.map.error, true}};
    std::vector<CImportRemark> remarks{SystemRemark(import)};
    AddScale(import.map, remarks);
    AddErrors(*import.layer, remarks);
    AddDistance(import, network, remarks);
    return remarks;
}

QString ImportReport(const CImport& import, const CNetwork& network)
{
    const CImportPlan& plan = import.plan;
    double whole = 0;
    QStringList branches;
    for (const CNetworkBranch& branch : plan.branches) {
        whole += branch.Length();
        branches << Text::tr("%1: %2 long, chainages from %3 to %4")
                        .arg(branch.Name(), Length(branch.Length()), Length(branch.start), Length(branch.end));
    }
    QStringList lines{Text::tr("%1, layer \"%2\"").arg(import.file, import.layer->name),
                      Text::tr("Branches: %1, in all %2").arg(plan.branches.size()).arg(Length(whole))};
    for (const CImportRemark& remark : ImportRemarks(import, network))
        lines << remark.text;
    AddList(Text::tr("Left out"), plan.leftOut, lines);
    AddList(Text::tr("Changed"), plan.changed, lines);
    AddList(Text::tr("Branches"), branches, lines);
    return lines.join(u'\n') + u'\n';
}

QPlainTextEdit* MakeReportField(QDialogButtonBox& buttons)
{
    auto* field = new QPlainTextEdit;
    field->setObjectName(QStringLiteral("report"));
    field->setReadOnly(true);
    field->setTextInteractionFlags(Qt::TextSelectableByMouse | Qt::TextSelectableByKeyboard);
    field->setTabChangesFocus(true);
    field->setAccessibleName(Text::tr("Report of the import"));
    const QPushButton* copy = buttons.addButton(Text::tr("C&opy"), QDialogButtonBox::ActionRole);
    QObject::connect(copy, &QPushButton::clicked, field,
                     [field] { QGuiApplication::clipboard()->setText(field->toPlainText()); });
    return field;
}

void ShowImportReport(const QString& report, QWidget* parent)
{
    QDialog dialog(parent);
    dialog.setObjectName(QStringLiteral("importReport"));
    dialog.setWindowTitle(Text::tr("Imported Branches"));
    auto* buttons = new QDialogButtonBox;
    QPlainTextEdit* field = MakeReportField(*buttons);
    field->setPlainText(report);
    QPushButton* close = buttons->addButton(Text::tr("&Close"), QDialogButtonBox::AcceptRole);
    QObject::connect(buttons, &QDialogButtonBox::accepted, &dialog, &QDialog::accept);
    auto* layout = new QVBoxLayout(&dialog);
    layout->addWidget(field);
    layout->addWidget(buttons);
    close->setDefault(true);
    close->setFocus();
    dialog.resize(680, 420);
    dialog.exec();
}
