// Every key and every mnemonic of the shell with its real editors: none means two things.
#include "ks/language/language.h"
#include "shell/main_frame.h"

#include <QAction>
#include <QApplication>
#include <QMenu>
#include <QMenuBar>
#include <QSettings>
#include <QShortcut>
#include <QTableView>
#include <QTest>
#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <set>

using testing::IsEmpty;

namespace {

/// Meets every shortcut and key press before anybody acts on it, and remembers who would have.
class KeyWatcher : public QObject
{
public:
    KeyWatcher() { qApp->installEventFilter(this); }

    bool eventFilter(QObject* receiver, QEvent* event) override
    {
        if (event->type() == QEvent::Shortcut) {
            ambiguous = ambiguous || static_cast<QShortcutEvent*>(event)->isAmbiguous();
            receivers << receiver;
            return true;
        }
        return event->type() == QEvent::KeyPress || event->type() == QEvent::KeyRelease;
    }
    void Press(QKeyCombination key)
    {
        ambiguous = false;
        receivers.clear();
        QWidget* focus = QApplication::focusWidget();
        QTest::keyClick(focus ? focus : QApplication::activeWindow(), key.key(), key.keyboardModifiers());
    }

    bool ambiguous = false;
    QObjectList receivers;
};

std::string NameOf(QKeyCombination key)
{
    return QKeySequence(key).toString(QKeySequence::PortableText).toStdString();
}

} // namespace

class KeysTest : public testing::TestWithParam<const char*>
{
protected:
    KeysTest()
    {
        QSettings().clear();
        KsLanguage::Instance().SetCurrent(QString::fromLatin1(GetParam()));
        KsLangLoadResDll("ks", nullptr, 0);
        KsLangLoadResDll("kvrshell", nullptr, 0);
        frame = std::make_unique<CMainFrame>();
        frame->LoadPlugins(QStringLiteral(KVR_BUILD_DIR "/bin/plugins"));
        frame->resize(1600, 1000);
        frame->show();
        EXPECT_TRUE(QTest::qWaitForWindowActive(frame.get()));
        EXPECT_TRUE(frame->OpenFile(QStringLiteral(KVR_SOURCE_DIR "/examples/river/river.kvrp")));
    }
    ~KeysTest() override
    {
        frame.reset();
        KsLanguage::Instance().SetCurrent(QStringLiteral("en_US"));
    }

    /// Every key that somebody claims, and the keys of the usual commands besides.
    std::set<int> Keys() const
    {
        std::set<int> keys;
        for (const QAction* action : frame->findChildren<QAction*>()) {
            for (const QKeySequence& sequence : action->shortcuts())
                keys.insert(sequence[0].toCombined());
        }
        for (const QShortcut* shortcut : frame->findChildren<QShortcut*>())
            keys.insert(shortcut->key()[0].toCombined());
        for (int f = Qt::Key_F1; f <= Qt::Key_F12; ++f) {
            for (const Qt::KeyboardModifiers held :
                 {Qt::KeyboardModifiers(Qt::NoModifier), Qt::KeyboardModifiers(Qt::ShiftModifier),
                  Qt::KeyboardModifiers(Qt::ControlModifier)})
                keys.insert(QKeyCombination(held, Qt::Key(f)).toCombined());
        }
        for (int letter = Qt::Key_A; letter <= Qt::Key_Z; ++letter) {
            for (const Qt::KeyboardModifiers held :
                 {Qt::KeyboardModifiers(Qt::ControlModifier), Qt::ControlModifier | Qt::ShiftModifier})
                keys.insert(QKeyCombination(held, Qt::Key(letter)).toCombined());
        }
        return keys;
    }
    /// The keys that two would act on where the focus is now.
    std::vector<std::string> Ambiguous(const std::set<int>& keys)
    {
        std::vector<std::string> found;
        KeyWatcher watcher;
        for (const int key : keys) {
            watcher.Press(QKeyCombination::fromCombined(key));
            if (watcher.ambiguous)
                found.push_back(NameOf(QKeyCombination::fromCombined(key)));
        }
        return found;
    }
    QMdiSubWindow* Activate(const QString& extension) const
    {
        for (QMdiSubWindow* window : frame->MdiArea().subWindowList()) {
            if (window->windowTitle().contains(extension, Qt::CaseInsensitive)) {
                frame->MdiArea().setActiveSubWindow(window);
                return window;
            }
        }
        return nullptr;
    }
    static std::set<int> AltLetters()
    {
        std::set<int> keys;
        for (int letter = Qt::Key_A; letter <= Qt::Key_Z; ++letter)
            keys.insert((Qt::ALT | Qt::Key(letter)).toCombined());
        return keys;
    }

    std::unique_ptr<CMainFrame> frame;
};

TEST_P(KeysTest, NoKeyIsAmbiguousInAnyWindow)
{
    for (const char* extension : {".hdkv", ".kvnw", ".kvxs"}) {
        for (const bool tabs : {false, true}) {
            frame->MdiArea().setViewMode(tabs ? QMdiArea::TabbedView : QMdiArea::SubWindowView);
            QMdiSubWindow* window = Activate(QString::fromLatin1(extension));
            ASSERT_TRUE(window) << extension;
            const auto keys = Keys();
            for (QWidget* widget : window->findChildren<QTableView*>()) {
                if (!widget->isVisible())
                    continue;
                widget->setFocus();
                EXPECT_THAT(Ambiguous(keys), IsEmpty()) << extension << (tabs ? " in tabs" : " in windows");
            }
        }
    }
}

TEST_P(KeysTest, NoLetterOfTheSiblingEditorsIsAmbiguous)
{
    for (const char* extension : {".kvnw", ".kvxs"}) {
        ASSERT_TRUE(Activate(QString::fromLatin1(extension)));
        EXPECT_THAT(Ambiguous(AltLetters()), IsEmpty()) << extension;
    }
}

TEST_P(KeysTest, EveryEntryOfAMenuHasALetterOfItsOwn)
{
    for (const char* extension : {".hdkv", ".kvnw", ".kvxs"}) {
        ASSERT_TRUE(Activate(QString::fromLatin1(extension)));
        for (QMenu* menu : frame->findChildren<QMenu*>()) {
            emit menu->aboutToShow();
            std::map<int, QString> letters;
            for (const QAction* entry : menu->actions()) {
                const QKeySequence letter = QKeySequence::mnemonic(entry->text());
                if (!entry->isVisible() || letter.isEmpty())
                    continue;
                const auto [other, first] = letters.emplace(letter[0].toCombined(), entry->text());
                EXPECT_TRUE(first) << qPrintable(menu->title() + ": " + entry->text() + " and " + other->second);
            }
            emit menu->aboutToHide();
        }
    }
}

INSTANTIATE_TEST_SUITE_P(Languages, KeysTest, testing::Values("en_US", "ja"),
                         [](const auto& language) { return std::string(language.param); });
