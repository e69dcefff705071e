#include "ks/fc/syntax_error.h"
#include "ks/fc/system_reason.h"
#include "ks/language/language.h"
#include "ks/units/edit_style.h"
#include "tql/tql.h"

#include <QCoreApplication>
#include <QLabel>
#include <QSignalSpy>
#include <cerrno>
#include <gtest/gtest.h>

namespace {

class Language : public testing::Test
{
protected:
    void SetUp() override
    {
        KsLanguage::Instance().SetTranslationFolder(QStringLiteral(KVR_BUILD_DIR "/bin/translations"));
    }
    void TearDown() override { KsLanguage::Instance().SetCurrent("en_US"); }
    static QString Tip() { return CKsEditStyle(UnitGroup::WaterLevel).GetEumToolTipText(); }
};

/// Counts the changes of language that a window hears of.
struct Listener : QWidget
{
    int heard = 0;
    void changeEvent(QEvent* event) override
    {
        heard += event->type() == QEvent::LanguageChange;
        QWidget::changeEvent(event);
    }
};

} // namespace

TEST_F(Language, ModulesFollowTheLanguageAndWindowsHearOfIt)
{
    Listener window;
    window.show();
    KsResourceHandle handle = reinterpret_cast<KsResourceHandle>(1);
    EXPECT_EQ(KsLangLoadResDll("ks", &handle, 0), nullptr) << "American texts stand in the sources";
    EXPECT_EQ(handle, nullptr);
    EXPECT_EQ(Tip(), "Unit: m");

    QSignalSpy changed(&KsLanguage::Instance(), &KsLanguage::Changed);
    KsLanguage::Instance().SetCurrent("ja");
    QCoreApplication::processEvents();
    EXPECT_EQ(Tip(), "単位: m");
    EXPECT_EQ(QCoreApplication::translate("QPlatformTheme", "Cancel"), "キャンセル") << "Qt's own texts too";
    EXPECT_EQ(QCoreApplication::translate("QShortcut", "Backspace"), "Backspace") << "which Qt's misspell";
    EXPECT_EQ(changed.count(), 1);
    EXPECT_GE(window.heard, 1);
    EXPECT_TRUE(KsLangLoadResDll("ks", &handle, 0)) << "loading again gives the one that is there";
    KsLangFreeResDll(handle);
    EXPECT_EQ(Tip(), "Unit: m") << "a module that is gone translates nothing";

    EXPECT_EQ(KsLangLoadResDll("no_such_module", &handle, 0), nullptr);
    KsLangFreeResDll(nullptr);
    KsLanguage::Instance().SetCurrent("xx");
    EXPECT_EQ(KsLanguage::Instance().Current(), "ja") << "an unknown language changes nothing";
}

TEST_F(Language, WhyTheSystemRefusesIsSaidInTheUsersLanguage)
{
    const auto full = std::make_error_code(std::errc::no_space_on_device);
    const std::error_code quota(EDQUOT, std::generic_category());
    const auto missing = std::make_error_code(std::errc::no_such_file_or_directory);
    EXPECT_EQ(KsSystemReason(full), "no space is left on the device");
    EXPECT_EQ(KsSystemSentence(missing), "There is no such file or folder.");

    KsLanguage::Instance().SetCurrent("ja");
    KsResourceHandle handle = nullptr;
    KsLangLoadResDll("ks", &handle, 0);
    EXPECT_EQ(KsSystemReason(full), "デバイスに空き領域がありません");
    EXPECT_EQ(KsSystemReason(quota), "ディスクの割り当て容量を使い切りました");
    EXPECT_EQ(KsSystemSentence(missing), "ファイルまたはフォルダがありません。");
    EXPECT_FALSE(KsSystemReason(std::make_error_code(std::errc::owner_dead)).isEmpty()) << "the system's own text";
    KsLangFreeResDll(handle);
}

TEST_F(Language, WhatIsWrongWithAFileIsSaidInTheUsersLanguage)
{
    const auto said = [](const char* text) {
        tqlHandle file = tqlLoadText(text, "%1 river.hdkv");
        TqlSyntaxError error;
        tqlGetSyntaxErr(file, &error);
        tqlClose(&file);
        return KsSyntaxErrorText(error);
    };
    EXPECT_EQ(said("[T]\n[/T]\n"), "");
    EXPECT_EQ(said("[T]\nK = %2\n"),
              "%1 river.hdkv, line 2, column 5: expected a parameter (a number, true, false, \"text\" or <file name>), "
              "found %2");
    KsLanguage::Instance().SetCurrent("ja");
    KsResourceHandle handle = nullptr;
    KsLangLoadResDll("ks", &handle, 0);
    EXPECT_EQ(said("[T]\nK = \"%2\a\"\n"),
              "%1 river.hdkv、2 行 8 文字目: 制御文字以外の文字(制御文字は \\u{...} と書きます) が必要ですが、"
              "制御文字 U+0007 があります");
    for (auto phrase = int(TqlPhrase::Text) + 1; phrase <= int(TqlPhrase::ControlCharacter); ++phrase) {
        const char* const english = tqlPhraseText(TqlPhrase(phrase));
        EXPECT_NE(QCoreApplication::translate("SyntaxError", english), QString::fromUtf8(english));
    }
    TqlSyntaxError unreadable;
    unreadable.code = TqlError::Unreadable;
    unreadable.file = "river.hdkv";
    unreadable.reason = std::make_error_code(std::errc::permission_denied);
    EXPECT_EQ(KsSyntaxErrorText(unreadable), "river.hdkv を読み込めません: アクセスが許可されていません");
    KsLangFreeResDll(handle);
}
