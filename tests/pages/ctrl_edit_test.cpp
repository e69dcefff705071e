#include "page_fixture.h"

#include "pages/framework/ctrl_edit.h"

class CtrlEditTest : public PageTest
{
protected:
    CtrlEditTest()
    {
        auto* layout = new QVBoxLayout(&window);
        layout->addWidget(&field);
        layout->addWidget(&other);
        Setup({.name = "level", .unit = UnitGroup::WaterLevel});
        window.show();
        window.activateWindow();
        EXPECT_TRUE(QTest::qWaitForWindowActive(&window));
    }
    void Setup(const Field& declared)
    {
        field.Setup(value, declared, [this](double number) { value = number; });
    }
    void Type(const char* text)
    {
        field.setFocus();
        field.selectAll();
        QTest::keyClick(&field, Qt::Key_Backspace);
        QTest::keyClicks(&field, text);
    }
    void Leave()
    {
        other.setFocus(Qt::OtherFocusReason); // nobody asked the field
        QTest::qWait(1);
    }

    double value = 1.23456789;
    QWidget window;
    CCtrlEdit field;
    QLineEdit other;
};

TEST_F(CtrlEditTest, ShowsTheDeclaredDigits)
{
    EXPECT_EQ(field.text(), "1.23457");
    Setup({.name = "level", .unit = UnitGroup::WaterLevel, .digits = 3});
    EXPECT_EQ(field.text(), "1.23");
    value = 12345678;
    field.Show();
    EXPECT_EQ(field.text(), "1.23e+07");
}

TEST_F(CtrlEditTest, APastedLineEndIsNoPartOfTheNumber)
{
    for (const auto& [pasted, expected] : {std::pair("2.5\n", 2.5), std::pair("7\r\n\n", 7.0)}) {
        Type("");
        QGuiApplication::clipboard()->setText(pasted);
        field.paste();
        EXPECT_TRUE(field.Typing().Take()) << pasted;
        EXPECT_EQ(value, expected);
    }
}

TEST_F(CtrlEditTest, AnUntouchedTextChangesNothing)
{
    const double before = value;
    field.setFocus();
    Leave();
    field.setFocus();
    QTest::keyClick(&field, Qt::Key_End);
    QTest::keyClicks(&field, "9");
    QTest::keyClick(&field, Qt::Key_Backspace); // every character shown still stands
    Leave();
    EXPECT_EQ(value, before);
    Type("");
    Leave();
    EXPECT_EQ(value, before);
    EXPECT_EQ(field.text(), "1.23457");
    EXPECT_EQ(boxes, QStringList());
}

TEST_F(CtrlEditTest, TypingWhatIsShownIsTyping)
{
    const auto retype = [&](const char* what, const std::function<void()>& type) {
        value = 1.23456789;
        field.Show();
        field.setFocus();
        type();
        EXPECT_EQ(field.text(), "1.23457") << what;
        Leave();
        EXPECT_EQ(value, 1.23457) << what;
    };
    retype("all anew", [&] { Type("1.23457"); });
    retype("over the selection", [&] {
        field.selectAll();
        QTest::keyClicks(&field, "1.23457");
    });
    retype("the last digit", [&] {
        QTest::keyClick(&field, Qt::Key_End);
        QTest::keyClick(&field, Qt::Key_Backspace);
        QTest::keyClicks(&field, "7");
    });
    retype("a digit in the middle, marked", [&] {
        field.setSelection(3, 1);
        QTest::keyClicks(&field, "3");
    });
    retype("the last digit, and one before the first that is taken out again", [&] {
        QTest::keyClick(&field, Qt::Key_End);
        QTest::keyClick(&field, Qt::Key_Backspace);
        QTest::keyClicks(&field, "7");
        QTest::keyClick(&field, Qt::Key_Home);
        QTest::keyClicks(&field, "9");
        QTest::keyClick(&field, Qt::Key_Backspace);
    });
    // One single character, whose replacement looks like itself.
    Setup({.name = "level", .unit = UnitGroup::WaterLevel, .digits = 1});
    value = 2.4;
    field.Show();
    field.setFocus();
    field.selectAll();
    QTest::keyClicks(&field, "2");
    Leave();
    EXPECT_EQ(value, 2);
}

TEST_F(CtrlEditTest, ARefusedTextGoesWithItsField)
{
    for (const bool hides : {false, true}) {
        Type("abc");
        other.setFocus(Qt::OtherFocusReason);
        if (hides)
            field.hide();
        else
            field.setEnabled(false);
        QTest::qWait(1);
        EXPECT_EQ(boxes, QStringList()) << hides;
        EXPECT_EQ(field.text(), "1.23457") << hides;
        EXPECT_TRUE(field.Typing().Take());
        field.setEnabled(true);
        field.show();
    }
    Type("abc");
    QTest::keyClick(&field, Qt::Key_Tab);
    EXPECT_EQ(boxes.size(), 1) << "asked before the focus goes";
    EXPECT_TRUE(field.hasFocus());
}

TEST_F(CtrlEditTest, ATextWhoseEndDoesNotFitIsRefused)
{
    Type("1.234567890123456e-10");
    Leave();
    EXPECT_EQ(value, 1.23456789);
    ASSERT_EQ(boxes.size(), 1);
    EXPECT_TRUE(boxes.front().startsWith("At most 20 characters fit")) << boxes.front().toStdString();
    field.setSelection(3, 1);
    QTest::keyClicks(&field, "3");
    Leave();
    EXPECT_EQ(boxes.size(), 2) << "the end is missing still";
    QTest::keyClick(&field, Qt::Key_End);
    QTest::keyClick(&field, Qt::Key_Backspace); // by somebody who sees what stands there
    QTest::keyClicks(&field, "9");
    Leave();
    EXPECT_EQ(value, 1.234567890123456e-9);
    EXPECT_EQ(boxes.size(), 2);
}

TEST_F(CtrlEditTest, AMenuInFrontLeavesTheTextAsItIs)
{
    Type("4");
    field.setCursorPosition(1);
    other.setFocus(Qt::MenuBarFocusReason);
    QTest::qWait(1);
    EXPECT_EQ(value, 1.23456789);
    field.setFocus(Qt::MenuBarFocusReason);
    QTest::keyClicks(&field, "5");
    EXPECT_EQ(field.text(), "45");
}

TEST_F(CtrlEditTest, ADisabledFieldShowsWhatIsStored)
{
    for (const char* typed : {"7", "7e"}) {
        Type(typed);
        field.setEnabled(false); // as a box beside it does
        QTest::qWait(1);
        EXPECT_EQ(field.text(), "1.23457") << typed;
        field.setEnabled(true);
    }
    EXPECT_EQ(boxes, QStringList());
}

TEST_F(CtrlEditTest, RefusesAndKeepsTheFocus)
{
    const double before = value;
    Setup({.name = "level", .unit = UnitGroup::WaterLevel, .bounds = {0.5, 1.5}});
    const struct
    {
        const char *text, *message;
    } cases[] = {{"abc", "Invalid floating point number!"},
                 {"1.", "Invalid floating point number!"},
                 {"0.49", "Floating-point value is out of range"},
                 {"1.51", "Floating-point value is out of range"},
                 {"1e999", "Floating-point value is out of range"}};
    for (const auto& c : cases) {
        Type(c.text);
        Leave();
        EXPECT_EQ(boxes, QStringList{c.message}) << c.text;
        boxes.clear();
        EXPECT_TRUE(field.hasFocus()) << c.text;
        EXPECT_EQ(field.text(), c.text);
        EXPECT_EQ(value, before);
    }
    for (const char* text : {"0.5", "1.5"}) { // the bounds belong to the range
        Type(text);
        Leave();
        EXPECT_EQ(value, QString(text).toDouble());
        EXPECT_TRUE(other.hasFocus());
    }
    Type("7");
    QTest::keyClick(&field, Qt::Key_Escape);
    EXPECT_EQ(field.text(), "1.5");
}

TEST_F(CtrlEditTest, StoresInBaseUnits)
{
    KsUnits::Instance().SetSystem(KsUnitSystem::UsCustomary);
    field.Show();
    EXPECT_EQ(field.text(), "4.05042");
    EXPECT_TRUE(field.toolTip().endsWith("\nUnit: ft")) << field.toolTip().toStdString();
    Setup({.name = "level", .unit = UnitGroup::WaterLevel, .bounds = {0, 4}}); // metres
    Type("10");
    QTest::keyClick(&field, Qt::Key_Return);
    EXPECT_NEAR(value, 3.048, 1e-5);
    EXPECT_EQ(field.text(), "10");
    Type("14");
    Leave();
    EXPECT_EQ(boxes.size(), 1) << "more than 4 m";
}
