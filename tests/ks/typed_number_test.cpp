// Numbers as users type them: plain, with a unit, as a formula.
#include "ks/units/formula.h"
#include "ks/units/typed_number.h"
#include "ks/units/unit_groups.h"

#include <array>
#include <cmath>
#include <gtest/gtest.h>

namespace {

constexpr double Refused = -12345;

double Read(UnitGroup group, const char* text)
{
    return KsReadTyped(QString::fromUtf8(text), CKsEditStyle(group)).value.value_or(Refused);
}

QString Complaint(UnitGroup group, const char* text)
{
    const auto typed = KsReadTyped(QString::fromUtf8(text), CKsEditStyle(group));
    EXPECT_FALSE(typed.value) << text;
    return typed.complaint;
}

class TypedNumber : public testing::Test
{
protected:
    void TearDown() override { KsUnits::Instance().SetSystem(KsUnitSystem::Metric); }
};

} // namespace

TEST_F(TypedNumber, AnAmountIsStoredInTheBaseUnitWithoutStrayDigits)
{
    using enum UnitGroup;
    struct Case
    {
        UnitGroup group;
        const char* text;
        double expected;
    };
    const Case cases[] = {
        {WaterLevel, "12 ft", 3.6576},
        {WaterLevel, "12ft", 3.6576},
        {WaterLevel, "12 FT", 3.6576},
        {Chainage, "1.5 km", 1500},
        {Chainage, "3 mi", 4828.032},
        {Chainage, "2.5e3 mm", 2.5},
        {Discharge, "350 l/s", 0.35},
        {Discharge, "3.5 m3/s", 3.5},
        {Discharge, "3.5 m³/s", 3.5},
        {Discharge, "45 cfs", 1.27425809664},
        {Discharge, "36 m3/h", 0.01},
        {Discharge, "-1 ft³/s", -0.028316846592},
        {Velocity, "36 km/h", 10},
        {Area, "2 ha", 20000},
        {Factor, "5 %", 0.05},
        {LightAttenuation, "2 1/cm", 200},
        {LightAttenuation, "2 /cm", 200},
        {Rotation, "30°", 30},
        {Viscosity, "1.3 mm2/s", 1.3e-6},
        {Discharge, "0.1 M3/S", 0.1},
        {Chainage, "5 NMI", 9260},
        {Volume, "2 hm3", 2e6},
        {Discharge, "100 gal/min", 0.00630901964},
        {Rotation, "2 deg", 2},
    };
    for (const Case& each : cases)
        EXPECT_DOUBLE_EQ(Read(each.group, each.text), each.expected) << each.text;
    EXPECT_EQ(Read(Discharge, "350 l/s"), 0.35) << "to the last bit";
    EXPECT_EQ(Read(WaterLevel, "12 ft"), 3.6576) << "to the last bit";
    EXPECT_EQ(Read(WaterLevel, "33.3 cm"), 0.333);

    // What stands without a unit is in the one that the page shows; with it, it is the same number.
    KsUnits::Instance().SetSystem(KsUnitSystem::UsCustomary);
    for (const char* text : {"0.1", "7", "1234.567"}) {
        const std::string amount = std::string(text) + " ft";
        EXPECT_EQ(Read(WaterLevel, text), Read(WaterLevel, amount.c_str()));
        EXPECT_NE(Read(WaterLevel, text), std::stod(text));
    }
    EXPECT_EQ(Read(WaterLevel, "2 m"), 2);
    for (const char* text : {"45 cfs", "45 ft3/s", "=45", "=40+5"})
        EXPECT_EQ(Read(Discharge, text), Read(Discharge, "45")) << text << " reads as 45 in the table, and is 45";
    EXPECT_EQ(Read(Chainage, "3 yd"), Read(Chainage, "9"));
    EXPECT_EQ(Read(Chainage, "6 in"), Read(Chainage, "0.5"));
    EXPECT_DOUBLE_EQ(Read(WaterLevel, "=1+1"), 0.6096) << "a formula has the unit of the page";
}

TEST_F(TypedNumber, EveryUnitThatIsOfferedIsTaken)
{
    int offered = 0;
    for (int number = 100000; number < 101000; ++number) {
        const KsUnitGroupRow* row = KsFindUnitGroup(UnitGroup(number));
        if (!row || !row->base.spelling)
            continue;
        QStringList units = QString::fromUtf8(row->alsoTyped).split(", ", Qt::SkipEmptyParts);
        units << QString::fromUtf8(row->base.symbol) << QString::fromUtf8(row->usCustomary.symbol);
        units.removeAll(QString());
        for (const QString& unit : units) {
            EXPECT_TRUE(KsTypedUnitFactor(row->group, unit)) << row->quantity << ": " << unit.toStdString();
            ++offered;
        }
    }
    EXPECT_GT(offered, 50);
}

TEST_F(TypedNumber, TheUnitOfAFieldIsTakenAsAKeyboardWritesIt)
{
    const auto read = [](const char* text) {
        return KsReadTyped(QString::fromUtf8(text), CKsEditStyle(UnitGroup::None), QStringLiteral(u"m¹⁄³/s"));
    };
    for (const char* text : {"30 m¹⁄³/s", "30 m^(1/3)/s", "30 m^1/3/s", "30 m1/3/s"})
        EXPECT_EQ(read(text).value, 30) << text;
    for (const char* text : {"30 m/s", "30 s/m^(1/3)", "30 m^(1/2)/s", "30 ft^(1/3)/s", "30 m^0.5/s"}) {
        EXPECT_FALSE(read(text).value) << text;
        EXPECT_NE(read(text).complaint, QString()) << text << " is a unit of something else";
    }
}

TEST_F(TypedNumber, WhatIsNoAmountIsRefused)
{
    using enum UnitGroup;
    EXPECT_EQ(Complaint(Discharge, "3 kg"),
              "\"kg\" is no unit of this quantity. Possible are m³/s, ft³/s, l/s, m3/h, m3/d, cfs, gpm, mgd.");
    EXPECT_EQ(Complaint(None, "3 m"), "This number has no unit; \"m\" cannot stand here.");
    EXPECT_NE(Complaint(WaterLevel, "5 1/m"), "") << "not a fifth of a metre";
    EXPECT_NE(Complaint(Slope, "5°"), "") << "the tangent was meant";
    EXPECT_NE(Complaint(GeoAngle, "5 %"), "");
    for (const char* text : {"5 kmi", "5 din", "5 Mm"}) // with prefixes that nobody means
        EXPECT_EQ(Complaint(WaterLevel, text), "") << text;
    EXPECT_EQ(Complaint(Volume, "5 Mm3"), "");
    // What is no unit at all has the words of the field.
    for (const char* text : {"12 5",  "12 -5",  "12 m 5",    "12 m.5", "12 m @ 5", "12 m from 1", "12 (m)",
                             " 12 m", "12,5 m", "12 abcdef", "12e",    "12e m",    "1.e5 m",      "m",
                             "ft 12", "",       "12 ",       "1.",     "1_m",      "0x10",        "12 m5x"})
        EXPECT_EQ(Complaint(WaterLevel, text), "") << text;
    EXPECT_EQ(Complaint(WaterLevel, "1e308 km"), "") << "too large for a number";
}

TEST_F(TypedNumber, AFormulaIsOneNumber)
{
    using enum UnitGroup;
    EXPECT_EQ(Read(Discharge, "=10+5"), 15);
    EXPECT_EQ(Read(Discharge, "=_pi"), 3.14159265358979);
    EXPECT_EQ(Read(Discharge, "= 2 * max(1.5, 3) ^ 2"), 18);
    EXPECT_EQ(Read(Discharge, "=-1e-3"), -0.001);
    EXPECT_EQ(Read(Discharge, "=0.1+0.2"), 0.3) << "without stray digits";
    EXPECT_EQ(Complaint(Discharge, "=1,5"),
              "The formula has a comma outside of brackets; the decimal separator is the point.");
    EXPECT_EQ(Complaint(Discharge, "=width*2"), "\"width\" is no name or function known here.");
    EXPECT_EQ(Complaint(Discharge, "=(1+2"), "The brackets of \"(1+2\" do not match.");
    EXPECT_EQ(Complaint(Discharge, "=1/0"), "The result of \"1/0\" is no number.");
    for (const char* text : {"=", "=1+", "=1 2", "=a=5", "=pi=3", "=\"x\"", "=1+é", "=max()", "==1", "=1;2"})
        EXPECT_NE(Complaint(Discharge, text), "") << text;
    EXPECT_NE(Complaint(Discharge, ("=" + std::string(100000, '(')).c_str()), "");
    EXPECT_EQ(KsReadTypedInteger("=7-2").value, 5);
    EXPECT_FALSE(KsReadTypedInteger("=1e10").value);
    EXPECT_FALSE(KsReadTypedInteger("5 m").value);
}

TEST_F(TypedNumber, NamesOfAFormulaStandForTheNumbersGiven)
{
    const CKsFormula formula("max(value, 2) * factor", {"value", "factor"});
    ASSERT_EQ(formula.Fault(), "");
    formula.Number(0) = 1;
    formula.Number(1) = 10;
    EXPECT_EQ(formula.Value(), 20);
    formula.Number(0) = 3;
    EXPECT_EQ(formula.Value(), 30);
    EXPECT_NE(CKsFormula("valu*2", {"value"}).Fault(), "");
    EXPECT_EQ(CKsFormula(QString("1").leftJustified(1000)).Fault(), "");
    EXPECT_NE(CKsFormula(QString("1").leftJustified(1001)).Fault(), "");
}
