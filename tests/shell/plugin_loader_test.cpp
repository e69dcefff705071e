#include "shell_fixture.h"

#include <QElapsedTimer>
#include <QImage>
#include <QLabel>
#include <QLibrary>
#include <QTimer>
#include <QTreeWidget>
#include <algorithm>
#include <chrono>
#include <cmath>
#include <future>
#include <thread>

namespace {

const CPlugin* Named(const std::vector<std::unique_ptr<CPlugin>>& plugins, const QString& file)
{
    for (const auto& plugin : plugins) {
        if (QFileInfo(plugin->file).baseName() == file)
            return plugin.get();
    }
    return nullptr;
}

/// Between the lightest and the darkest of a picture.
double Contrast(const QImage& picture)
{
    double lightest = 0, darkest = 1;
    for (int y = 0; y < picture.height(); ++y)
        for (int x = 0; x < picture.width(); ++x) {
            const auto linear = [](float part) { return std::pow((part + 0.055) / 1.055, 2.4); };
            const QColor color = picture.pixelColor(x, y);
            const double light =
                0.2126 * linear(color.redF()) + 0.7152 * linear(color.greenF()) + 0.0722 * linear(color.blueF());
            lightest = std::max(lightest, light);
            darkest = std::min(darkest, light);
        }
    return (lightest + 0.05) / (darkest + 0.05);
}

} // namespace

TEST_F(ShellTest, WhatIsNoEditorIsNamedAndTheOthersWork)
{
    const CPlugin* good = Named(frame->Plugins().All(), "test_editor");
    const CPlugin* broken = Named(frame->Plugins().All(), "broken_editor");
    ASSERT_TRUE(good && broken);
    EXPECT_TRUE(good->IsUsable());
    EXPECT_EQ(good->name, "Test Editor");
    for (const char* missing : {"KsGetEditorString", "KsCreateToolbar"})
        EXPECT_TRUE(broken->error.contains(missing)) << broken->error.toStdString();
    EXPECT_FALSE(broken->error.contains("KsGetNumDocTemplates")) << "it has that one";
    EXPECT_TRUE(broken->templates.empty());

    EXPECT_TRUE(asked.isEmpty()) << "nobody is stopped";
    const auto* label = frame->findChild<QLabel*>("pluginLabel");
    EXPECT_TRUE(label->isVisible());
    EXPECT_TRUE(label->text().contains("broken_editor"));
    QTimer::singleShot(0, frame.get(), [] {
        QWidget* dialog = QApplication::activeModalWidget();
        EXPECT_EQ(dialog->findChild<QTreeWidget*>()->findItems("", Qt::MatchContains, 2).size(), 2);
        dialog->close();
    });
    Action("actionPlugins")->trigger();
    EXPECT_TRUE(frame->OpenFile(Write("a.tst")));
}

TEST_F(ShellTest, AFolderMayHoldAnything)
{
    Write("readme.txt", "no library by its name");
    Write("text.so", "no library by its content");
    Write("text.dll", "no library by its content");
    Write("text.dylib", "no library by its content");
    QFile::copy(TEST_EDITORS "/test_editor.so", Path("zz_editor.so"));
    CPlugins loaded;
    EXPECT_EQ(loaded.Load(folder.path()).size(), 1u);
    const auto& plugins = loaded.All();
    ASSERT_GE(plugins.size(), 2u);
    EXPECT_FALSE(Named(plugins, "text")->IsUsable());
    EXPECT_FALSE(Named(plugins, "text")->error.isEmpty());
    EXPECT_TRUE(Named(plugins, "zz_editor")->IsUsable()) << "the one before it did no harm";
    EXPECT_FALSE(Named(plugins, "readme"));
    EXPECT_TRUE(loaded.Load(Path("nowhere")).empty());
}

TEST_F(ShellTest, AnEditorThatFailsIsNamedAndTheOthersWork)
{
    for (const char* name : {"fails_at_load", "ends_at_load", "leaves_at_load", "stays_at_load", "fails_when_asked"})
        QFile::copy(QStringLiteral(FAILING_EDITORS "/%1.so").arg(name), Path(QStringLiteral("%1.so").arg(name)));
    QFile whole(TEST_EDITORS "/test_editor.so");
    ASSERT_TRUE(whole.open(QIODevice::ReadOnly));
    const QByteArray bytes = whole.readAll();
    QStringList cut; // where the system would map what is not there, and near it
    for (const qsizetype size : {qsizetype(0), qsizetype(1), qsizetype(63), qsizetype(64), qsizetype(4096),
                                 bytes.size() / 3, bytes.size() / 2, bytes.size() - 4096, bytes.size() - 1}) {
        cut << QStringLiteral("cut_%1").arg(size);
        Write(cut.back() + ".so", bytes.first(size));
    }
    QByteArray far = bytes;
    far.replace(0x28, 8, QByteArray(8, '\xFF')); // the place of a table
    Write("cut_far.so", far);
    whole.copy(Path("zz_editor.so"));

    CPlugins loaded;
    EXPECT_EQ(loaded.Load(folder.path()).size(), 1u);
    const auto& plugins = loaded.All();
    EXPECT_EQ(Named(plugins, "fails_at_load")->error,
              "It could not be loaded: it failed with the error \"no map of the sea\". It is tried again when its file "
              "has changed");
    EXPECT_TRUE(Named(plugins, "ends_at_load")->error.contains("it ended the program that tried it ("));
    EXPECT_TRUE(Named(plugins, "leaves_at_load")->error.contains("it ended the program that tried it."));
    EXPECT_TRUE(Named(plugins, "stays_at_load")->error.contains("did not end within 5 seconds"));
    EXPECT_EQ(Named(plugins, "fails_when_asked")->error,
              "It could not be loaded: it failed with an error that it does not name");
    EXPECT_EQ(Named(plugins, "fails_when_asked")->name, "fails_when_asked");
    for (const QString& name : cut << "cut_far")
        EXPECT_TRUE(Named(plugins, name)->error.startsWith("It could not be loaded: ")) << name.toStdString();
    EXPECT_EQ(Named(plugins, "cut_4096")->error,
              "It could not be loaded: the file is cut off, it holds only 4096 bytes");
    EXPECT_TRUE(Named(plugins, "zz_editor")->IsUsable());

    // What failed is known at the next start, which does not wait for it, until there is another file.
    QElapsedTimer time;
    time.start();
    CPlugins again;
    EXPECT_EQ(again.Load(folder.path()).size(), 1u);
    EXPECT_LT(time.elapsed(), 3000);
    for (const char* name : {"fails_at_load", "ends_at_load", "leaves_at_load", "stays_at_load"})
        EXPECT_EQ(Named(again.All(), name)->error, Named(plugins, name)->error);
    QFile::remove(Path("stays_at_load.so"));
    whole.copy(Path("stays_at_load.so"));
    CPlugins mended;
    EXPECT_EQ(mended.Load(folder.path()).size(), 2u);

    // The system's loader still serves other threads.
    std::promise<bool> served;
    std::thread other([&served] { served.set_value(QLibrary(TEST_EDITORS "/test_editor.so").load()); });
    const bool done = served.get_future().wait_for(std::chrono::seconds(10)) == std::future_status::ready;
    done ? other.join() : other.detach();
    EXPECT_TRUE(done);
}

TEST_F(ShellTest, AShellWithoutEditorsSaysSo)
{
    frame.reset();
    CMainFrame empty;
    empty.LoadPlugins(Path("nowhere"));
    EXPECT_FALSE(empty.findChild<QAction*>("actionNew")->isEnabled());
    EXPECT_FALSE(empty.OpenFile(Write("a.tst")));
    EXPECT_TRUE(asked.takeLast().contains("a.tst"));
    // Its hint can be read on any ground.
    empty.show();
    for (const QRgb ground : {0xffeff0f1, 0xff2a2e32}) {
        QApplication::setPalette(QPalette(QColor(ground)));
        QCoreApplication::processEvents();
        EXPECT_GE(Contrast(empty.MdiArea().viewport()->grab().toImage()), 4.5) << std::hex << ground;
    }
    QApplication::setPalette(QPalette());
}
