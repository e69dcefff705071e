#include "pages/resistance_formula.h"

#include "document/document.h"
#include "grid/row_index.h"
#include "ks/fc/doc_command.h"
#include "ks/fc/message_box.h"
#include "ks/units/edit_style.h"
#include "res/strings.h"

#include <QComboBox>
#include <QUndoStack>

namespace {

enum Formula
{
    ManningM,
    ManningN,
    Chezy,
    FormulaCount
};

bool IsKnown(std::int32_t formula)
{
    return formula >= 0 && formula < FormulaCount;
}

/// M = 1/n. What is not above 0 is no resistance but stands for "none" or "not set", and stays.
double Inverse(double resistance)
{
    return resistance > 0 ? 1 / resistance : resistance;
}

/// A number of the document: in place as long as its record exists, or in a table whose rows may move.
struct Change
{
    const void* owner; // the record, or the table; null for a global value
    double* value;
    std::vector<CBRTVeloRes>* table;
    std::size_t row;
    double before, after;
    double& Target() const { return table ? (*table)[row].ResValue : *value; }
};

/// What the switch makes of numbers, for as long as somebody has to know.
class CConversion : public KsLineChange
{
public:
    void TakeBack(KsTracedLine& line, bool forward) const override
    {
        if (changes.empty())
            return;
        const auto ownerOf = [this](std::uint32_t number) { return RowKey(changes[number].owner); };
        if (!m_owners.IsMade())
            m_owners.Make(changes.size(), ownerOf);
        m_owners.ForRowsOf(line.key.value_or(RowKey(line.data)), forward, ownerOf, [&](std::uint32_t number) {
            TakeBack(line, changes[number], forward ? changes[number].before : changes[number].after);
        });
    }

    std::vector<Change> changes;

private:
    static void TakeBack(KsTracedLine& line, const Change& change, double number)
    {
        if (change.table) {
            if (change.row == line.place)
                static_cast<CBRTVeloRes*>(line.object())->ResValue = number;
            return;
        }
        // An object of the same class holds it at the same place.
        const std::ptrdiff_t offset =
            reinterpret_cast<const std::byte*>(change.value) - static_cast<const std::byte*>(change.owner);
        *reinterpret_cast<double*>(static_cast<std::byte*>(line.object()) + offset) = number;
    }
    mutable CRowIndex m_owners;
};

/// Another formula, and other resistances with it.
class CSwitchFormula : public CDocumentCommand
{
public:
    CSwitchFormula(CKavo0_hdDoc& document, std::int32_t formula, bool convert);
    /// Numbers that the conversion between M and n changes.
    std::size_t ChangeCount() const { return m_conversion->changes.size(); }

protected:
    ChangePlace Apply() override { return Set(m_after, &Change::after); }
    ChangePlace Revert() override { return Set(m_before, &Change::before); }
    std::shared_ptr<const KsLineChange> LineChange() const override { return m_conversion; }

private:
    template <typename Tools>
    void ConvertTools(Tools& tools, const HD_RiverPos* record);
    ChangePlace Set(std::int32_t formula, double Change::*value);
    void Put(const HD_RiverPos* record, double& value, double after);
    void Invert(const HD_RiverPos* record, double& value) { Put(record, value, Inverse(value)); }

    std::int32_t& m_formula; // of the document
    std::int32_t m_before, m_after;
    std::shared_ptr<CConversion> m_conversion = std::make_shared<CConversion>();
};

void CSwitchFormula::Put(const HD_RiverPos* record, double& value, double after)
{
    if (value != after)
        m_conversion->changes.push_back({record, &value, nullptr, 0, value, after});
}

template <typename Tools>
void CSwitchFormula::ConvertTools(Tools& tools, const HD_RiverPos* record)
{
    // Where M = a (VR)^b, n = 1/a (VR)^-b; and what was the smallest M is the largest n.
    Invert(record, tools.CoefA);
    Put(record, tools.CoefB, tools.CoefB == 0 ? 0 : -tools.CoefB);
    const double smallest = tools.MinRes, largest = tools.MaxRes;
    Put(record, tools.MinRes, Inverse(largest));
    Put(record, tools.MaxRes, Inverse(smallest));
    for (std::size_t row = 0; row < tools.VeloRes.size(); ++row) {
        const double before = tools.VeloRes[row].ResValue;
        if (before > 0)
            m_conversion->changes.push_back({&tools.VeloRes, nullptr, &tools.VeloRes, row, before, Inverse(before)});
    }
}

CSwitchFormula::CSwitchFormula(CKavo0_hdDoc& document, std::int32_t formula, bool convert)
    : CDocumentCommand(document, LoadString(convert ? Str::UndoConvert : Str::UndoValue)),
      m_formula(document.Parameters().Global.resist_num),
      m_before(m_formula),
      m_after(formula)
{
    if (!convert)
        return;
    HD_Parameters& parameters = document.Parameters();
    HD_Global_Var& globals = parameters.Global;
    for (double* value :
         {&globals.G_resistance, &globals.ZoneResistance1, &globals.ZoneResistance2, &globals.ZoneResistance3})
        Invert(nullptr, *value);
    ConvertTools(globals.BedResist, nullptr);
    for (std::size_t line = 0; line < parameters.BedList.GetCount(); ++line) {
        HD_Resistfact& record = parameters.BedList.GetAt(line);
        for (double* value :
             {&record.Resistance, &record.ZoneResistance1, &record.ZoneResistance2, &record.ZoneResistance3})
            Invert(&record, *value);
    }
    for (std::size_t line = 0; line < parameters.BedResistanceToolboxList.GetCount(); ++line) {
        HDBedResTool& record = parameters.BedResistanceToolboxList.GetAt(line);
        ConvertTools(record, &record);
    }
}

ChangePlace CSwitchFormula::Set(std::int32_t formula, double Change::*value)
{
    m_formula = formula;
    for (const Change& change : m_conversion->changes)
        change.Target() = change.*value;
    return {};
}

} // namespace

// Units as in V. T. Chow, Open-Channel Hydraulics (1959), sections 5-4 and 5-6, in SI; M = 1/n is Strickler's form.
QString ResistanceUnit(std::int32_t formula)
{
    switch (formula) {
    case ManningM:
        return QStringLiteral("m¹⁄³/s");
    case ManningN:
        return QStringLiteral("s/m¹⁄³");
    case Chezy:
        return QStringLiteral("m¹⁄²/s");
    default:
        return {};
    }
}

void SwitchResistanceFormula(CKavo0_hdDoc& document, std::int32_t formula, QComboBox& box)
{
    using Button = QMessageBox::StandardButton;
    const HD_Global_Var& globals = document.Parameters().Global;
    const std::int32_t before = globals.resist_num;
    if (formula == before || !document.MayChange())
        return;
    auto converted = std::make_unique<CSwitchFormula>(document, formula, true);
    Button answer = Button::No;
    if (before == Chezy || formula == Chezy) {
        if (IsKnown(before))
            answer = KsMessageBox(LoadString(Str::CannotConvert)
                                      .arg(box.itemText(before), box.itemText(formula))
                                      .arg(converted->ChangeCount()),
                                  Button::Ok | Button::Cancel, &box, {}, Button::Ok);
    } else if (IsKnown(before) && converted->ChangeCount() > 0) {
        answer = KsMessageBox(LoadString(Str::OfferConversion)
                                  .arg(box.itemText(before), box.itemText(formula))
                                  .arg(converted->ChangeCount())
                                  .arg(KsShortestNumber(globals.G_resistance),
                                       KsFormatNumber(QStringLiteral("%.6lg"), Inverse(globals.G_resistance))),
                              Button::Yes | Button::No | Button::Cancel, &box, {}, Button::No);
    }
    if (answer == Button::Cancel)
        return;
    document.UndoStack().push(
        (answer == Button::Yes ? std::move(converted) : std::make_unique<CSwitchFormula>(document, formula, false))
            .release());
}
