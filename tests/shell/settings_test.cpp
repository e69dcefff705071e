#include "ks/language/language.h"
#include "ks/units/edit_style.h"
#include "shell/appearance.h"
#include "shell/settings_keys.h"
#include "shell_fixture.h"

TEST_F(ShellTest, UnitsLanguageAndWindowComeBack)
{
    Action("actionUsCustomary")->trigger();
    Action("actionLanguage_en_GB")->trigger();
    EXPECT_FALSE(KsUnits::Instance().AllDigits());
    Action("actionAllDigits")->trigger();
    EXPECT_TRUE(KsUnits::Instance().AllDigits());
    Action("actionTabs")->trigger();
    frame->resize(640, 480);
    const QSize size = frame->size();
    EXPECT_TRUE(frame->close());
    KsUnits::Instance().SetSystem(KsUnitSystem::Metric);
    KsUnits::Instance().SetAllDigits(false);
    EXPECT_EQ(QSettings().value(Settings::Language), "en_GB");

    Start();
    EXPECT_EQ(KsUnits::Instance().System(), KsUnitSystem::UsCustomary);
    EXPECT_TRUE(Action("actionUsCustomary")->isChecked());
    EXPECT_TRUE(KsUnits::Instance().AllDigits());
    EXPECT_TRUE(Action("actionAllDigits")->isChecked());
    KsUnits::Instance().SetAllDigits(false);
    EXPECT_EQ(frame->MdiArea().viewMode(), QMdiArea::SubWindowView);
    EXPECT_EQ(frame->size(), size);
    KsUnits::Instance().SetSystem(KsUnitSystem::Metric);
    KsLanguage::Instance().SetCurrent("en_US");
}

TEST_F(ShellTest, MenusFollowTheLanguageAtOnce)
{
    KsLanguage::Instance().SetTranslationFolder(QStringLiteral(KVR_BUILD_DIR "/bin/translations"));
    KsLangLoadResDll("kvrshell", nullptr, 0);
    frame->OpenFile(Write("a.tst"));
    Action("actionLanguage_ja")->trigger();
    QCoreApplication::processEvents();
    EXPECT_EQ(Menu(0)->title(), "ファイル(&F)");
    EXPECT_EQ(Action("actionSave")->text(), "上書き保存(&S)");
    QString bar;
    for (int menu = 0; menu < 6; ++menu)
        bar += QKeySequence::mnemonic(Menu(menu)->title()).toString().right(1);
    EXPECT_EQ(bar, "FELVWH") << "the same keys in every language";
    EXPECT_FALSE(Menu(2)->isEmpty()) << "still the view's";
    EXPECT_TRUE(frame->findChild<CKsToolBarEx*>()->isVisible()) << "made anew, shown as before";
    Action("actionLanguage_en_US")->trigger();
    QCoreApplication::processEvents();
    EXPECT_EQ(Action("actionSave")->text(), "&Save");
}

TEST_F(ShellTest, TheAppearanceIsChosenAndKept)
{
    const auto window = [] { return QApplication::palette().color(QPalette::Window).lightness(); };
    const auto text = [] { return QApplication::palette().color(QPalette::Text).lightness(); };
    const int before = window();
    Action("actionAppearanceDark")->trigger();
    EXPECT_LT(window(), 80);
    EXPECT_GT(text(), 180);
    EXPECT_EQ(ChosenAppearance(), Appearance::Dark);
    Action("actionAppearanceLight")->trigger();
    EXPECT_GT(window(), 200);
    EXPECT_LT(text(), 80);
    Action("actionAppearanceSystem")->trigger();
    EXPECT_EQ(window(), before);
    EXPECT_EQ(ChosenAppearance(), Appearance::System);
}
