// No key of a page is ambiguous, in any language.
#include "page_fixture.h"

#include "ks/language/language.h"
#include "pages/page_table.h"

#include <QAbstractButton>
#include <QGroupBox>
#include <QLabel>
#include <map>

namespace {

/// Those of the menu bar, in every language; Alt with one of them opens a menu.
const QString MenuBar = QStringLiteral("FELVWH");

QString TextOf(const QWidget* widget)
{
    if (const auto* label = qobject_cast<const QLabel*>(widget))
        return label->buddy() ? label->text() : QString();
    if (const auto* button = qobject_cast<const QAbstractButton*>(widget))
        return button->text();
    if (const auto* box = qobject_cast<const QGroupBox*>(widget))
        return box->title();
    return {};
}

/// All that a page says.
QStringList TextsOf(const QWidget& page)
{
    QStringList texts;
    for (const QWidget* widget : page.findChildren<QWidget*>()) {
        const auto* label = qobject_cast<const QLabel*>(widget);
        texts << widget->objectName() + ": " + (label ? label->text() : TextOf(widget)) + '|' +
                     widget->accessibleName();
        if (const auto* list = qobject_cast<const QComboBox*>(widget))
            for (int entry = 0; entry < list->count(); ++entry)
                texts << list->itemText(entry);
        if (const auto* table = qobject_cast<const QAbstractItemView*>(widget); table && table->model())
            for (int column = 0; column < table->model()->columnCount(); ++column)
                texts << table->model()->headerData(column, Qt::Horizontal).toString();
    }
    return texts;
}

} // namespace

class MnemonicsTest : public PageTest, public testing::WithParamInterface<const char*>
{
protected:
    MnemonicsTest()
    {
        KsLanguage::Instance().SetTranslationFolder(QStringLiteral(KVR_BUILD_DIR "/bin/translations"));
        KsLanguage::Instance().SetCurrent(GetParam());
        KsLangLoadResDll("Kavo0_hd", &texts, 0);
    }
    ~MnemonicsTest() override
    {
        KsLangFreeResDll(texts);
        KsLanguage::Instance().SetCurrent("en_US");
    }
    KsResourceHandle texts = nullptr;
};

INSTANTIATE_TEST_SUITE_P(Languages, MnemonicsTest, testing::Values("en_US", "en_GB", "ja"));

TEST_P(MnemonicsTest, NoLetterTwiceOnAPageAndNoneOfTheMenuBar)
{
    int found = 0;
    for (const PageEntry& entry : PageTable()) {
        const auto page = entry.make(&document);
        std::map<QChar, QString> letters;
        for (const QWidget* widget : page->findChildren<QWidget*>()) {
            const QString text = TextOf(widget);
            const QKeySequence key = QKeySequence::mnemonic(text);
            if (key.isEmpty())
                continue;
            ++found;
            const QChar letter = QChar(key[0].key());
            const QString place = page->metaObject()->className() + QStringLiteral(": ") + text;
            EXPECT_FALSE(MenuBar.contains(letter)) << place.toStdString();
            const auto [other, isNew] = letters.emplace(letter, text);
            EXPECT_TRUE(isNew) << place.toStdString() << " and " << other->second.toStdString();
        }
    }
    EXPECT_GT(found, 100);
}

TEST_P(MnemonicsTest, APageThatIsOpenSaysItAsANewOne)
{
    for (const PageEntry& entry : PageTable()) {
        KsLanguage::Instance().SetCurrent("en_US");
        const auto page = entry.make(&document);
        KsLanguage::Instance().SetCurrent(GetParam());
        QEvent change(QEvent::LanguageChange);
        for (QWidget* widget : page->findChildren<QWidget*>())
            QApplication::sendEvent(widget, &change);
        QApplication::sendEvent(page.get(), &change);
        EXPECT_EQ(TextsOf(*page).join('\n').toStdString(), TextsOf(*entry.make(&document)).join('\n').toStdString());
    }
}

TEST_P(MnemonicsTest, EveryTabIsInTheLanguage)
{
    if (GetParam() != std::string("ja"))
        GTEST_SKIP() << "the captions are English";
    for (const PageEntry& entry : PageTable()) {
        const QString caption = LoadString(entry.caption);
        EXPECT_TRUE(std::any_of(caption.begin(), caption.end(), [](QChar c) { return c.unicode() > 0x2e7f; }))
            << caption.toStdString();
    }
}
