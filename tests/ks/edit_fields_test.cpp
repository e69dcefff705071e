#include "ks/units/edit_fields.h"
#include "ks_fixture.h"

TEST_F(KsTest, AnIntegerFieldTakesIntegersOfItsRangeAndNothingElse)
{
    CKsEditLong edit;
    for (const auto& [text, value] : {std::pair("12", 12), {"-7", -7}, {"2147483647", 2147483647}, {"+3", 3}}) {
        edit.setText(text);
        EXPECT_EQ(edit.CheckedValue(), value);
    }
    EXPECT_TRUE(asked.isEmpty());
    for (const char* text : {"", "1.0", "2147483648", " 1", "one"}) {
        edit.setText(text);
        EXPECT_FALSE(edit.CheckedValue()) << text;
        EXPECT_EQ(asked.takeLast(), "Enter an integer.");
    }
    edit.SetRange({1, 10});
    edit.SetValue(11);
    EXPECT_FALSE(edit.CheckedValue());
    EXPECT_EQ(asked.takeLast(), "Enter an integer from 1 to 10.");
    EXPECT_EQ(edit.selectedText(), "11") << "ready to be typed over";
    edit.setText("=20/2");
    EXPECT_EQ(edit.CheckedValue(), 10);
    edit.setText("=20/3");
    EXPECT_FALSE(edit.CheckedValue());
    EXPECT_EQ(asked.takeLast(), "The result of \"20/3\" is no integer.");
}

TEST_F(KsTest, DDXMovesANumberBetweenFieldAndVariable)
{
    QLineEdit edit;
    const CKsEditStyle style(UnitGroup::Chainage, "%.2lf");
    double value = 1500.5;
    EXPECT_TRUE(DDX_KSedit(false, edit, value, style));
    EXPECT_EQ(edit.text(), "1500.50");
    EXPECT_EQ(edit.toolTip(), "Unit: m");
    edit.setText("-2.5e1");
    EXPECT_TRUE(DDX_KSedit(true, edit, value, style));
    EXPECT_EQ(value, -25);
    edit.clear();
    EXPECT_TRUE(DDX_KSedit(true, edit, value, style)) << "an empty field changes nothing";
    for (const char* text : {"1,5", "1,500", "abc", "1e999", "nan", "1 2", "=1,5", "3 kg"}) {
        edit.setText(text);
        EXPECT_FALSE(DDX_KSedit(true, edit, value, style)) << text;
    }
    EXPECT_EQ(asked.size(), 8);
    EXPECT_EQ(value, -25);
    edit.setText("1.2 km");
    EXPECT_TRUE(DDX_KSedit(true, edit, value, style));
    EXPECT_EQ(value, 1200);
}
