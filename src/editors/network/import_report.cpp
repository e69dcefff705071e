#include "editors/network/import_report.h"

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

QString Factor(double value)
{
    return QString::number(value, 'f', std::abs(value - 1) < 0.01 ? 4 : 2);
}

class CTeller
{
public:
    CTeller(const CImport& import, const CNetwork& network) : m_import(import), m_network(network) {}

    CImportReport Report()
    {
        Say(Text::tr("%1, layer \"%2\"").arg(m_import.file, m_import.layer->name));
        double whole = 0;
        QStringList branches;
        for (const CNetworkBranch& branch : m_import.plan.branches) {
            whole += branch.Length();
            branches << Text::tr("%1: %2 long, chainages from %3 to %4")
                            .arg(branch.Name(), LengthText(branch.Length()), LengthText(branch.start),
                                 LengthText(branch.end));
        }
        Say(Text::tr("Branches: %1, in all %2").arg(branches.size()).arg(LengthText(whole)));
        if (!m_import.map.error.isEmpty()) {
            Say(m_import.map.error, true);
        } else {
            TellSystem();
            TellScale();
            TellErrors();
            TellDistance();
        }
        List(Text::tr("Left out"), m_import.plan.leftOut);
        List(Text::tr("Changed"), m_import.plan.changed);
        List(Text::tr("Branches"), branches);
        return m_report;
    }

private:
    void Say(const QString& text, bool warning = false)
    {
        m_report.text += text + u'\n';
        if (warning)
            m_report.warnings << text;
    }

    void TellSystem()
    {
        const CGisSystem& from = m_import.layer->system;
        if (!from.IsKnown())
            Say(Text::tr("The layer names no coordinate system: its numbers are taken as meters on a map."), true);
        else if (from.definition == m_import.target.definition)
            Say(Text::tr("Coordinate system: %1, as in the file.").arg(from.name));
        else
            Say(Text::tr("Coordinate system: %1, projected from %2.").arg(m_import.target.name, from.name));
    }

    /// How lengths on the map compare with the ground: nothing when that is not known.
    void TellScale()
    {
        constexpr double notable = 0.01, spread = 0.01;
        const CGisMap& map = m_import.map;
        if (std::isnan(map.scale))
            return;
        QString text = Text::tr("Lengths on this map are %1 times those on the ground").arg(Factor(map.scale));
        if (map.largest - map.least > spread)
            text += Text::tr(" (from %1 to %2 by line)").arg(Factor(map.least), Factor(map.largest));
        text += Text::tr(".");
        const bool warning = std::max(std::abs(map.least - 1), std::abs(map.largest - 1)) > notable;
        if (warning)
            text += u' ' + Text::tr("So are chainages that follow from them. Another coordinate system avoids this.");
        Say(text, warning);
    }

    void TellErrors()
    {
        const CGisLayer& layer = *m_import.layer;
        if (layer.IsComplete())
            return;
        const auto read = qint64(layer.features.size());
        const auto good = std::ranges::count_if(layer.features, &QString::isEmpty, &CGisFeature::error);
        QStringList texts{Text::tr("The file is incomplete or damaged.")};
        if (good < read)
            texts << Text::tr("Features with errors: %1 of %2.").arg(read - good).arg(read);
        if (read < layer.announced)
            texts << Text::tr("The file counts %1 features, but only %2 could be read.").arg(layer.announced).arg(read);
        Say((texts + layer.errors).join(u' '), true);
    }

    /// Branches that lie farther from the network than either is large are hardly in its coordinate system.
    void TellDistance()
    {
        CNetwork added;
        added.branches = m_import.plan.branches;
        const QRectF there = m_network.Extent(), here = added.Extent(), both = here | there;
        if (there.isNull() || here.isNull())
            return;
        const double gap = std::hypot(std::max(both.width() - here.width() - there.width(), 0.0),
                                      std::max(both.height() - here.height() - there.height(), 0.0));
        const auto across = [](const QRectF& box) { return std::hypot(box.width(), box.height()); };
        if (gap > std::max(across(here), across(there)))
            Say(Text::tr("These lines lie %1 away from the branches of the network: they may be in different "
                         "coordinate systems.")
                    .arg(LengthText(std::round(gap))),
                true);
    }

    void List(const QString& title, const QStringList& entries)
    {
        if (!entries.isEmpty())
            Say(QStringLiteral("\n%1 (%2)").arg(title, QString::number(entries.size())));
        for (const QString& entry : entries)
            Say(QStringLiteral("  ") + entry);
    }

    const CImport& m_import;
    const CNetwork& m_network;
    CImportReport m_report;
};

} // namespace

CImportReport ReportOf(const CImport& import, const CNetwork& network)
{
    return CTeller(import, network).Report();
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
