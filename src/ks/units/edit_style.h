// How a number of one quantity is shown: unit group, unit of the user's unit system, format.
#pragma once

#include "base/not_given.h"
#include "base/unit_group.h"
#include "ks/fc/types.h"
#include "ks/ks_export.h"

#include <QObject>
#include <cmath>

enum class KsUnitSystem
{
    Metric,
    UsCustomary
};

/// How the user wants numbers shown, for the whole program.
class KS_API KsUnits : public QObject
{
    Q_OBJECT
public:
    static KsUnits& Instance();
    KsUnitSystem System() const { return m_system; }
    void SetSystem(KsUnitSystem system);
    /// Cells and fields show every digit of their numbers instead of those that their format leaves.
    bool AllDigits() const { return m_allDigits; }
    void SetAllDigits(bool all);
signals:
    /// The unit system was switched.
    void Changed();
    /// AllDigits was switched; no text that is being typed is concerned.
    void DigitsChanged();

private:
    KsUnits() = default;
    KsUnitSystem m_system = KsUnitSystem::Metric;
    bool m_allDigits = false;
};

/// "Unit: m"; empty for a quantity without unit.
KS_API CString KsUnitToolTip(const CString& symbol);

/// Between a base unit and the one that the user sees, looked up once for many numbers. Values not given (1e10) and
/// non-numbers pass unchanged.
struct KsUnitConversion
{
    double factor = 1; // of the unit that the user sees, in base units
    double ToShown(double base) const { return IsConverted(base) ? base / factor : base; }
    double ToBase(double shown) const { return IsConverted(shown) ? shown * factor : shown; }

private:
    bool IsConverted(double value) const { return factor != 1 && value != NotGiven && std::isfinite(value); }
};

class KS_API CKsEditStyle
{
public:
    CKsEditStyle() = default;
    explicit CKsEditStyle(UnitGroup group, const char* format = "%-lf") : m_group(group), m_format(format) {}

    /// `unit` -1 takes the display unit of the user's unit system, 0 the base unit itself.
    void SetEumUnitBaseGroup(UnitGroup group, int unit = -1);
    UnitGroup Group() const { return m_group; }
    /// A printf format for one double ("%-lf", "%.6lg", "%-.3E"). The C locale plays no part.
    void SetFormat(const CString& format) { m_format = format; }
    const CString& GetFormat() const { return m_format; }

    KsUnitConversion Conversion() const;
    /// The same for one number. flag 1: base to display; flag 0: display to base.
    double UnitConvertFromBase(double value, int flag) const;
    /// The converted value as text in the style's format.
    CString UnitConvertFromBase_T(double value, int flag) const;
    /// A base value in display units with every digit: reads back to the same number.
    CString FullText(double value) const;
    /// A base value as the user wants to see it: as UnitConvertFromBase_T has it, or in full (KsUnits::AllDigits).
    CString ShownText(double value) const;
    /// A base value in display units, to a thousandth.
    CString RoundedText(double value) const;
    /// Whether `shown`, a text of a base value, leaves out some of its digits. What a conversion of units adds in the
    /// last place of a double is none.
    bool HidesDigits(double value, const CString& shown) const;
    /// KsUnitToolTip of the display unit.
    CString GetEumToolTipText() const { return KsUnitToolTip(UnitSymbol()); }
    /// Symbol of the display unit ("ft³/s"), empty without one.
    CString UnitSymbol() const;

private:
    double Factor() const { return Conversion().factor; }
    UnitGroup m_group = UnitGroup::None;
    int m_unit = -1;
    CString m_format = QStringLiteral("%-lf");
};

/// Prints one double in a printf floating format, independent of the locale; in the shortest form when it is none.
KS_API CString KsFormatNumber(const CString& format, double value);
/// The nearest number of fifteen significant digits, as spreadsheets keep results: 0.3 for 0.1 + 0.2. One of a
/// magnitude that no quantity has stays as it is.
KS_API double KsFifteenDigits(double value);
/// Likewise to the last of the fifteen digits of a number as large as `of`: a difference of such numbers has no more.
KS_API double KsFifteenDigits(double value, double of);
/// The fewest digits that read back to the same number, without exponent from 1e-5 up to 1e15.
KS_API CString KsShortestNumber(double value);
