// Names that look like something else: markup, letters to press, marks of windows, turned writing.
#include "shell/project_tree.h"
#include "shell_fixture.h"

#include <QDialog>
#include <QLabel>
#include <QTabBar>
#include <QTabWidget>
#include <QTimer>
#include <QToolTip>
#include <QTreeWidget>

namespace {

const QString Name = "<img src=x> <b>R&amp;D</b> a&b [*]";

/// What of a window a name could make rich: labels that were shown, and the tool tip of every widget that has one.
QStringList RichTexts(const QWidget& window)
{
    QStringList rich;
    for (QLabel* label : window.findChildren<QLabel*>()) {
        label->ensurePolished(); // as the first look at it does
        if (label->textFormat() != Qt::PlainText)
            rich << label->objectName() + ": " + label->text();
    }
    return rich;
}

/// What of a window turns the direction of writing.
std::string TurnedTexts(const QWidget& window)
{
    QStringList turned;
    for (const QWidget* widget : window.findChildren<QWidget*>()) {
        const auto* label = qobject_cast<const QLabel*>(widget);
        for (const QString& text : {label ? label->text() : QString(), widget->toolTip(), widget->statusTip(),
                                    widget->accessibleName(), widget->accessibleDescription(), widget->windowTitle()})
            if (text.contains(QChar(0x202E)))
                turned << widget->metaObject()->className() + (": " + text);
    }
    return turned.join(u'\n').toStdString();
}

/// The label of the tool tip that stands on the screen; null for none.
const QLabel* ToolTipLabel()
{
    for (const QWidget* widget : QApplication::topLevelWidgets())
        if (widget->inherits("QTipLabel") && widget->isVisible())
            return qobject_cast<const QLabel*>(widget);
    return nullptr;
}

} // namespace

TEST_F(ShellTest, NamesAreTextWhereverTheyStand)
{
    const QString file = Name.simplified().remove('/') + ".tst";
    Write(file);
    ASSERT_TRUE(frame->OpenFile(WriteProject(Name.simplified().remove('/') + ".kvrp",
                                             "File = <" + QString(file).replace(">", "\\>").toUtf8() + ">\n")));
    ASSERT_TRUE(ViewOf(file)) << asked.join("\n").toStdString();

    EXPECT_EQ(RichTexts(*frame), QStringList());
    QToolTip::showText({}, Name, frame.get());
    ASSERT_TRUE(ToolTipLabel());
    EXPECT_EQ(ToolTipLabel()->text(), Name);
    EXPECT_EQ(ToolTipLabel()->textFormat(), Qt::PlainText);
    QToolTip::hideText();

    auto* tabs = frame->MdiArea().findChild<QTabBar*>(QString(), Qt::FindDirectChildrenOnly);
    const QString shown = QString(file).replace("&", "&&");
    EXPECT_EQ(tabs->tabText(0), shown);
    ViewOf(file)->GetDocument()->SetModifiedFlag();
    EXPECT_EQ(tabs->tabText(0), shown + '*');
    Action("actionTabs")->trigger(); // windows, and tabs again
    Action("actionTabs")->trigger();
    tabs = frame->MdiArea().findChild<QTabBar*>(QString(), Qt::FindDirectChildrenOnly);
    EXPECT_EQ(tabs->tabText(0), shown + '*');
    emit Menu(4)->aboutToShow();
    EXPECT_EQ(Menu(4)->actions().back()->text(), shown + '*');
    ViewOf(file)->GetDocument()->SetModifiedFlag(false);
    EXPECT_TRUE(frame->windowTitle().contains(QString(file).replace("[*]", "[*][*]") + "[*]"))
        << "one mark of the window's";
    const auto* tree = frame->findChild<CProjectTree*>()->findChild<QTreeWidget*>();
    EXPECT_EQ(tree->topLevelItem(0)->child(0)->text(0), file);
}

TEST_F(ShellTest, AMessageIsTextThatFitsOnAScreen)
{
    KsSetMessageBoxHandler({});
    const auto shown = [this](const QString& text) {
        QString seen;
        QTimer::singleShot(0, frame.get(), [&] {
            QWidget* box = QApplication::activeModalWidget();
            EXPECT_EQ(RichTexts(*box), QStringList());
            seen = static_cast<QMessageBox*>(box)->text();
            box->close();
        });
        KsMessageBox(text, QMessageBox::Ok, frame.get(), Name);
        return seen;
    };
    EXPECT_EQ(shown(Name + "\nsecond\tline"), Name + "\nsecond\tline");
    EXPECT_EQ(shown("a\u202Eb\x1B\u2029.kvrp"), "a\uFFFDb\uFFFD\uFFFD.kvrp");
    QStringList lines;
    for (int i = 0; i < 10000; ++i)
        lines << QStringLiteral("%1: the file does not exist").arg(i);
    const QStringList cut = shown(lines.join('\n') + "\nGo on?").split('\n');
    EXPECT_EQ(cut.front(), lines.front());
    EXPECT_EQ(cut.at(30), "... and 9966 more lines");
    EXPECT_EQ(cut.back(), "Go on?");
    EXPECT_EQ(cut.size(), 36);
    EXPECT_LT(shown(QString(300000, 'x')).size(), 1001);
    EXPECT_LT(shown((QString(3000, 'x') + '\n').repeated(1000)).size(), 10001);
}

TEST_F(ShellTest, TurnedWritingIsSeenInTitles)
{
    const QString file = "a\u202Efdp\u2066\n.tst";
    Write("b\u202E.tst");
    ASSERT_TRUE(frame->OpenFile(WriteProject("p\u202Eprvk.kvrp", "File = <b\u202E.tst>\n")));
    EXPECT_EQ(TurnedTexts(*frame), "");
    ASSERT_TRUE(frame->OpenFile(Write(file)));
    EXPECT_EQ(TurnedTexts(*frame), "");
    EXPECT_TRUE(frame->windowTitle().contains("a\uFFFDfdp\uFFFD\uFFFD.tst")) << frame->windowTitle().toStdString();
    EXPECT_TRUE(ViewOf(file)->GetDocument()->DoSave(Path(file))) << "the name is what it was";
    EXPECT_TRUE(QFile::exists(Path(file)));
}

TEST_F(ShellTest, AFileOutsideTheProjectsFolderIsShownAsSuch)
{
    Write("in/a.tst");
    Write("in/sub/b.tst");
    Write("out/c.tst");
    QFile::link(Path("out"), Path("in/link"));
    frame->OpenFile(WriteProject("in/p.kvrp", "File = <a.tst>\nFile = <sub/b.tst>\nFile = <../out/c.tst>\n"
                                              "File = <link/c.tst>\nFile = <../gone.tst>\nFile = <sub/../gone.tst>\n"));
    QStringList shown, told;
    const QTreeWidgetItem* project = frame->findChild<CProjectTree*>()->findChild<QTreeWidget*>()->topLevelItem(0);
    for (int i = 0; i < project->childCount(); ++i) {
        shown << project->child(i)->text(0);
        told << project->child(i)->toolTip(0).section('\n', 1);
    }
    const QString outside = "This file is outside the project's folder.";
    EXPECT_EQ(shown.join(", ").toStdString(),
              "a.tst, b.tst, ../out/c.tst, ../out/c.tst, ../gone.tst (missing), gone.tst (missing)");
    EXPECT_EQ(told, QStringList({"", "", outside, outside, outside, ""}));
}

// Every page and every editor, with branches and surveys of such names.
TEST(HostileNames, NoEditorTakesThemForMarkup)
{
    const QTemporaryDir folder;
    const QStringList files = {"river.HDKV", "river.kvnw", "river.kvxs", "river.kvrp"};
    for (const QString& file : files) {
        QFile example(QStringLiteral(KVR_SOURCE_DIR "/examples/river/") + file), copy(folder.filePath(file));
        ASSERT_TRUE(example.open(QIODevice::ReadOnly) && copy.open(QIODevice::WriteOnly));
        copy.write(example.readAll()
                       .replace("\"AELDER UPPER\"", '"' + Name.toUtf8() + "\u202E\"")
                       .replace("\"SURVEY 2019\"", "\"<i>S&amp;</i>\""));
    }
    QSettings().clear();
    QStringList asked;
    KsSetMessageBoxHandler([&](const CString& text, QMessageBox::StandardButtons) {
        asked << text;
        return QMessageBox::Ok;
    });
    {
        CMainFrame frame;
        frame.LoadPlugins(QStringLiteral(KVR_BUILD_DIR "/bin/plugins"));
        frame.resize(1600, 1000);
        frame.show();
        ASSERT_TRUE(frame.OpenFile(folder.filePath("river.kvrp")));
        ASSERT_EQ(frame.MdiArea().subWindowList().size(), 3) << asked.join('\n').toStdString();
        bool seen = false; // in a label, so that the names got there at all
        for (QMdiSubWindow* window : frame.MdiArea().subWindowList()) {
            frame.MdiArea().setActiveSubWindow(window);
            auto* sheet = window->findChild<QTabWidget*>("sheet");
            for (int page = 0; page < (sheet ? sheet->count() : 1); ++page) {
                if (sheet)
                    sheet->setCurrentIndex(page);
                QCoreApplication::processEvents();
                EXPECT_EQ(RichTexts(frame), QStringList());
                EXPECT_EQ(TurnedTexts(frame), "");
            }
            for (const QLabel* label : window->findChildren<QLabel*>())
                seen = seen || label->text().contains(QString(Name).replace("&", "&&"));
        }
        EXPECT_TRUE(seen);
        EXPECT_EQ(asked, QStringList());
    }
    KsSetMessageBoxHandler({});
}
