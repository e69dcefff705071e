// The resistance formula: the unit that bed resistances are given in, and what becomes of them when it is switched.
#pragma once

#include "ks/fc/doc_command.h"

#include <QString>
#include <cstdint>
#include <vector>

class CKavo0_hdDoc;
class QComboBox;
struct CBRTVeloRes;

/// `formula` as "resist_num": 0 Manning's M, 1 Manning's n, 2 Chezy; empty for another number.
QString ResistanceUnit(std::int32_t formula);

/// Switches the formula, as one undo step, after asking whether the resistances shall be converted. Nothing changes
/// when the user thinks better of it. `box` names the formulas.
void SwitchResistanceFormula(CKavo0_hdDoc& document, std::int32_t formula, QComboBox& box);

/// Another formula, and other resistances with it.
class CSwitchFormula : public CDocumentCommand
{
public:
    CSwitchFormula(CKavo0_hdDoc& document, std::int32_t formula, bool convert);
    /// Numbers that the conversion between M and n changes.
    std::size_t ChangeCount() const { return m_changes.size(); }

protected:
    ChangePlace Apply() override;
    ChangePlace Revert() override;

private:
    /// A number of the document: in place as long as its record exists, or in a table whose rows may move.
    struct Change
    {
        double* value;
        std::vector<CBRTVeloRes>* table;
        std::size_t row;
        double before, after;
        double& Target() const;
    };
    template <typename Tools>
    void ConvertTools(Tools& tools);
    void Put(double& value, double after);
    void Invert(double& value);

    std::int32_t& m_formula; // of the document
    std::int32_t m_before, m_after;
    std::vector<Change> m_changes;
};
