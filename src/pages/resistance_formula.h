// The resistance formula: the unit that bed resistances are given in, and what becomes of them when it is switched.
#pragma once

#include <QString>
#include <cstdint>

class CKavo0_hdDoc;
class QComboBox;

/// `formula` as "resist_num": 0 Manning's M, 1 Manning's n, 2 Chezy; empty for another number.
QString ResistanceUnit(std::int32_t formula);

/// Switches the formula, as one undo step, after asking whether the resistances shall be converted. Nothing changes
/// when the user thinks better of it. `box` names the formulas.
void SwitchResistanceFormula(CKavo0_hdDoc& document, std::int32_t formula, QComboBox& box);
