#include "grid/line_dialogs.h"

#include "ks/fc/message_box.h"

#include <QRadioButton>
#include <QTest>
#include <gtest/gtest.h>

class DialogsTest : public testing::Test
{
protected:
    DialogsTest()
    {
        KsSetMessageBoxHandler([this](const CString& text, QMessageBox::StandardButtons) {
            boxes << text;
            return QMessageBox::Ok;
        });
    }
    ~DialogsTest() override
    {
        KsSetMessageBoxHandler({});
        KsUnits::Instance().SetSystem(KsUnitSystem::Metric);
    }
    QStringList boxes;
};

TEST_F(DialogsTest, GotoAsksUntilThereIsALine)
{
    CGotoDlg dialog;
    dialog.show();
    auto* line = dialog.findChild<QLineEdit*>("line_1057");
    EXPECT_EQ(line->text(), "0");
    EXPECT_EQ(dialog.windowTitle(), "Go to grid line");
    for (const char* text : {"0", "-3", "abc", ""}) {
        line->setText(text);
        boxes.clear();
        QTest::keyClick(&dialog, Qt::Key_Return);
        EXPECT_EQ(boxes.size(), 1) << text;
        EXPECT_TRUE(dialog.isVisible()) << text;
    }
    line->setText("-3");
    boxes.clear();
    dialog.accept();
    EXPECT_EQ(boxes, QStringList{"Line number must be greater than 0"});
    line->setText("12");
    QTest::keyClick(&dialog, Qt::Key_Return);
    EXPECT_EQ(dialog.result(), QDialog::Accepted);
    EXPECT_EQ(dialog.Line(), 12);
}

TEST_F(DialogsTest, SearchConvertsTheChainage)
{
    KsUnits::Instance().SetSystem(KsUnitSystem::UsCustomary);
    const double odd = 376.2756000000001;
    CSearchDlg same({"MAIN", odd, ChainageMatch::Equal, NameMatch::Whole});
    same.accept();
    EXPECT_EQ(same.Query().chainage, odd) << "not typed: not changed";
    EXPECT_EQ(same.Query().name, "MAIN");
    EXPECT_EQ(same.Query().chainageMatch, ChainageMatch::Equal);
    EXPECT_EQ(same.Query().nameMatch, NameMatch::Whole);

    CSearchDlg dialog({});
    dialog.show();
    auto* chainage = dialog.findChild<QLineEdit*>("chainage_1061");
    EXPECT_EQ(chainage->text(), "0");
    chainage->setText("x");
    dialog.accept();
    EXPECT_EQ(boxes.size(), 1);
    EXPECT_TRUE(dialog.isVisible());
    chainage->setText("1000");
    dialog.findChild<QLineEdit*>("riverName_1058")->setText("RIV");
    dialog.findChild<QRadioButton*>("greater_1064")->click();
    dialog.findChild<QRadioButton*>("fullMatch_1060")->click();
    dialog.accept();
    EXPECT_EQ(dialog.result(), QDialog::Accepted);
    EXPECT_NEAR(dialog.Query().chainage, 304.8, 0.001);
    EXPECT_EQ(dialog.Query().name, "RIV");
    EXPECT_EQ(dialog.Query().chainageMatch, ChainageMatch::Greater);
    EXPECT_EQ(dialog.Query().nameMatch, NameMatch::Whole);
}
