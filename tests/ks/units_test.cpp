#include "ks/units/unit_groups.h"

#include <QSignalSpy>
#include <cmath>
#include <gtest/gtest.h>
#include <udunits2.h>

namespace {

class Units : public testing::Test
{
protected:
    void TearDown() override { KsUnits::Instance().SetSystem(KsUnitSystem::Metric); }
    static void UseUs() { KsUnits::Instance().SetSystem(KsUnitSystem::UsCustomary); }
};

} // namespace

TEST_F(Units, EveryRowConvertsThereAndBackAndMetricIsWhatIsStored)
{
    ut_set_error_message_handler(ut_ignore);
    ut_system* system = ut_read_xml(nullptr);
    ASSERT_TRUE(system);
    int rows = 0;
    for (int number = 100000; number < 101000; ++number) {
        const KsUnitGroupRow* found = KsFindUnitGroup(UnitGroup(number));
        if (!found)
            continue;
        const KsUnitGroupRow& row = *found;
        SCOPED_TRACE(row.quantity);
        ++rows;
        EXPECT_EQ(row.group, UnitGroup(number));
        const bool open = !row.base.spelling;
        for (const KsUnit& unit : {row.base, row.usCustomary}) {
            ASSERT_EQ(unit.spelling == nullptr, open) << "a group is known in all units or in none";
            ut_unit* parsed = open ? nullptr : ut_parse(system, unit.spelling, UT_ASCII);
            EXPECT_EQ(parsed == nullptr, open) << unit.spelling;
            ut_free(parsed);
        }
        EXPECT_EQ(KsUnitFactor(row.group, KsUnitSystem::Metric), 1);
        const bool changes = !open && std::string(row.base.spelling) != row.usCustomary.spelling;
        EXPECT_EQ(KsUnitFactor(row.group, KsUnitSystem::UsCustomary) != 1, changes);

        UseUs();
        const CKsEditStyle style(row.group);
        for (const double value : {0.0, 1.0, -99.0, 0.003, 12345.678, -1e-9, 1e300}) {
            const double there = style.UnitConvertFromBase(value, 1);
            EXPECT_NEAR(style.UnitConvertFromBase(there, 0), value, std::fabs(value) * 4e-16);
        }
        EXPECT_EQ(style.UnitSymbol(), QString::fromUtf8(row.usCustomary.symbol));
        KsUnits::Instance().SetSystem(KsUnitSystem::Metric);
        for (const double value : {0.1, 1.0 / 3, 12345.678})
            EXPECT_EQ(style.UnitConvertFromBase(value, 1), value) << "to the last bit";
    }
    EXPECT_GT(rows, 0);
    ut_free_system(system);
}

TEST_F(Units, FeetAreInternationalFeet)
{
    struct Case
    {
        UnitGroup group;
        double base, display;
        const char* symbol;
    };
    const Case cases[] = {
        {UnitGroup::WaterLevel, 3.048, 10, "ft"},
        {UnitGroup::Chainage, 304.8, 1000, "ft"},
        {UnitGroup::Area, 0.09290304, 1, "ft²"},
        {UnitGroup::Discharge, 0.028316846592, 1, "ft³/s"},
        {UnitGroup::Velocity, 0.3048, 1, "ft/s"},
        {UnitGroup::LightAttenuation, 1, 0.3048, "1/ft"},
        {UnitGroup::Viscosity, 0.09290304, 1, "ft²/s"},
        {UnitGroup::GeoAngle, 52.5, 52.5, "°"},
        {UnitGroup::Slope, 0.001, 0.001, ""},
        {UnitGroup::FloodPlainResistance, -99, -99, ""},
        {UnitGroup::None, 7, 7, ""},
        {UnitGroup(12345), 7, 7, ""},
    };
    UseUs();
    for (const Case& c : cases) {
        const CKsEditStyle style(c.group);
        EXPECT_NEAR(style.UnitConvertFromBase(c.base, 1), c.display, 1e-12 * std::fabs(c.display)) << int(c.group);
        EXPECT_NEAR(style.UnitConvertFromBase(c.display, 0), c.base, 1e-14 * std::fabs(c.base)) << int(c.group);
        EXPECT_EQ(style.UnitSymbol(), QString::fromUtf8(c.symbol)) << int(c.group);
        EXPECT_EQ(style.GetEumToolTipText(), c.symbol[0] ? "Unit: " + QString::fromUtf8(c.symbol) : QString());
    }
    EXPECT_EQ(CKsEditStyle(UnitGroup::WaterLevel).UnitConvertFromBase(10, 0), 3.048) << "typed feet are stored exactly";
}

TEST_F(Units, WhatIsNoValueIsNotConverted)
{
    UseUs();
    CKsEditStyle style(UnitGroup::Chainage);
    for (const int flag : {0, 1}) {
        EXPECT_EQ(style.UnitConvertFromBase(1e10, flag), 1e10) << "not given";
        EXPECT_TRUE(std::isnan(style.UnitConvertFromBase(std::nan(""), flag)));
        EXPECT_TRUE(std::isinf(style.UnitConvertFromBase(-INFINITY, flag)));
    }
    style.SetEumUnitBaseGroup(UnitGroup::Chainage, 0);
    EXPECT_EQ(style.UnitConvertFromBase(3.048, 1), 3.048) << "unit 0 is the base unit";
    EXPECT_EQ(style.UnitSymbol(), "m");
}

TEST_F(Units, StylesFollowTheUnitSystemAtOnce)
{
    QSignalSpy changed(&KsUnits::Instance(), &KsUnits::Changed);
    CKsEditStyle style(UnitGroup::WaterLevel, "%.2lf");
    EXPECT_EQ(style.UnitConvertFromBase_T(3.048, 1), "3.05");
    UseUs();
    UseUs();
    EXPECT_EQ(changed.count(), 1);
    EXPECT_EQ(style.UnitConvertFromBase_T(3.048, 1), "10.00");
}
