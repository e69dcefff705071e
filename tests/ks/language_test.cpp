#include "ks/fc/system_reason.h"
#include "ks/language/language.h"
#include "ks/units/edit_style.h"

#include <QCoreApplication>
#include <QDir>
#include <QFile>
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
    QFile missing(QDir::tempPath() + "/no such folder/x");
    EXPECT_FALSE(missing.open(QIODevice::WriteOnly));
    EXPECT_EQ(KsSystemReason(full), "no space is left on the device");
    EXPECT_EQ(KsSystemReason(missing), "There is no such file or folder.");

    KsLanguage::Instance().SetCurrent("ja");
    KsResourceHandle handle = nullptr;
    KsLangLoadResDll("ks", &handle, 0);
    EXPECT_EQ(KsSystemReason(full), "デバイスに空き領域がありません");
    EXPECT_EQ(KsSystemReason(quota), "ディスクの割り当て容量を使い切りました");
    EXPECT_FALSE(missing.open(QIODevice::WriteOnly));
    EXPECT_EQ(KsSystemReason(missing), "ファイルまたはフォルダがありません。");
    EXPECT_FALSE(KsSystemReason(std::make_error_code(std::errc::owner_dead)).isEmpty()) << "the system's own text";
    KsLangFreeResDll(handle);
}
