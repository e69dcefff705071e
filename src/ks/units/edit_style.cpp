#include "ks/units/edit_style.h"

#include "base/not_given.h"
#include "ks/units/unit_groups.h"

#include <QCoreApplication>
#include <QLocale>
#include <cmath>
#include <limits>

KsUnits& KsUnits::Instance()
{
    static KsUnits units;
    return units;
}

void KsUnits::SetSystem(KsUnitSystem system)
{
    if (system == m_system)
        return;
    m_system = system;
    emit Changed();
}

void KsUnits::SetAllDigits(bool all)
{
    if (all == m_allDigits)
        return;
    m_allDigits = all;
    emit DigitsChanged();
}

void CKsEditStyle::SetEumUnitBaseGroup(UnitGroup group, int unit)
{
    m_group = group;
    m_unit = unit;
}

KsUnitConversion CKsEditStyle::Conversion() const
{
    return {m_unit == 0 ? 1 : KsUnitFactor(m_group, KsUnits::Instance().System())};
}

double CKsEditStyle::UnitConvertFromBase(double value, int flag) const
{
    return flag ? Conversion().ToShown(value) : Conversion().ToBase(value);
}

CString CKsEditStyle::UnitConvertFromBase_T(double value, int flag) const
{
    return KsFormatNumber(m_format, UnitConvertFromBase(value, flag));
}

/// The shortest number that is the stored one when it is typed: what a conversion makes of the last place nobody typed.
CString CKsEditStyle::FullText(double value) const
{
    const double full = UnitConvertFromBase(value, 1);
    for (int digits = 14; digits <= 16 && Factor() != 1 && std::isfinite(full); ++digits) {
        const double typed = KsFormatNumber(QStringLiteral("%.%1lg").arg(digits), full).toDouble();
        if (UnitConvertFromBase(typed, 0) == value)
            return KsShortestNumber(typed);
    }
    return KsShortestNumber(full);
}

CString CKsEditStyle::ShownText(double value) const
{
    return KsUnits::Instance().AllDigits() ? FullText(value) : UnitConvertFromBase_T(value, 1);
}

CString CKsEditStyle::RoundedText(double value) const
{
    return KsShortestNumber(std::round(UnitConvertFromBase(value, 1) * 1000) / 1000);
}

bool CKsEditStyle::HidesDigits(double value, const CString& shown) const
{
    constexpr double LastPlaces = 4 * std::numeric_limits<double>::epsilon();
    const double full = UnitConvertFromBase(value, 1);
    bool isNumber = false;
    const double read = QLocale::c().toDouble(shown, &isNumber);
    if (!isNumber || !std::isfinite(full) || read == full)
        return false;
    return Factor() == 1 || std::fabs(read - full) > LastPlaces * std::fabs(full);
}

CString CKsEditStyle::UnitSymbol() const
{
    const KsUnitGroupRow* row = KsFindUnitGroup(m_group);
    if (!row)
        return {};
    // Without a conversion the base unit is what is shown.
    const bool base = Factor() == 1;
    return CString::fromUtf8((base ? row->base : row->Display(KsUnits::Instance().System())).symbol);
}

CString KsUnitToolTip(const CString& symbol)
{
    return symbol.isEmpty() ? CString() : QCoreApplication::translate("CKsEditStyle", "Unit: %1").arg(symbol);
}
