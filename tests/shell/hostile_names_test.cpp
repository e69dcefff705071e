// Names that look like something else: markup, letters to press, marks of windows, turned writing.
#include "ks/fc/difference_dialog.h"
#include "ks/fc/findings_dialog.h"
#include "shell/project_tree.h"
#include "shell/recovery_dialog.h"
#include "shell_fixture.h"
#include "shown_tips.h"

#include <QClipboard>
#include <QDialog>
#include <QLabel>
#include <QTabBar>
#include <QTabWidget>
#include <QTableView>
#include <QTableWidget>
#include <QTimer>
#include <QToolTip>
#include <QTreeWidget>

namespace {

const QString Name = "<img src=x> <b>R&amp;D</b> a&b [*]";

/// The labels of a window that a name could make rich.
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
    auto widgets = window.findChildren<const QWidget*>();
    widgets << &window;
    for (const QWidget* widget : widgets) {
        const auto* label = qobject_cast<const QLabel*>(widget);
        for (const QString& text : {label ? label->text() : QString(), widget->toolTip(), widget->statusTip(),
                                    widget->accessibleName(), widget->accessibleDescription(), widget->windowTitle()})
            if (text.contains(QChar(0x202E)))
                turned << widget->metaObject()->className() + (": " + text);
    }
    return turned.join(u'\n').toStdString();
}

/// The sample project with branches, surveys and marks of such names.
void WriteRiver(const QTemporaryDir& folder)
{
    const QByteArray name = '"' + Name.toUtf8() + "\u202E\"";
    for (const QString file : {"river.HDKV", "river.kvnw", "river.kvxs", "river.kvrp"}) {
        QFile example(QStringLiteral(KVR_SOURCE_DIR "/examples/river/") + file), copy(folder.filePath(file));
        ASSERT_TRUE(example.open(QIODevice::ReadOnly) && copy.open(QIODevice::WriteOnly));
        copy.write(example.readAll()
                       .replace("\"AELDER UPPER\"", name)
                       .replace("\"FLOOD WARNING\"", name)
                       .replace("\"SURVEY 2019\"", "\"<i>S&amp;</i>\""));
    }
}

/// A window, everything in it that has a tool tip, and what of them shows the name.
struct Looked
{
    ShownTips tips;
    QStringList titles;

    void At(QWidget& window)
    {
        EXPECT_EQ(RichTexts(window), QStringList());
        EXPECT_EQ(TurnedTexts(window), "");
        tips.RestOn(window);
    }
    void AtDialog(QWidget& dialog)
    {
        const qsizetype before = tips.all.size();
        At(dialog);
        titles << dialog.windowTitle();
        EXPECT_FALSE(tips.all.mid(before).filter(Name).isEmpty()) << dialog.windowTitle().toStdString();
        dialog.close();
    }
    void Expect(qsizetype most) const
    {
        EXPECT_EQ(tips.rich.join(u'\n').toStdString(), "");
        EXPECT_EQ(tips.turned.join(u'\n').toStdString(), "");
        EXPECT_GT(tips.all.size(), most);
        EXPECT_FALSE(tips.all.filter(Name).isEmpty());
    }
    /// The dialog that comes up by and by; it is closed.
    void AtNextDialog(QObject& context, const std::function<void(QWidget&)>& prepare = {})
    {
        QTimer::singleShot(0, &context, [this, prepare] {
            QWidget* dialog = QApplication::activeModalWidget();
            ASSERT_TRUE(dialog);
            if (prepare)
                prepare(*dialog);
            AtDialog(*dialog);
        });
    }
};

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
    WriteRiver(folder);
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
        Looked looked;
        for (QMdiSubWindow* window : frame.MdiArea().subWindowList()) {
            frame.MdiArea().setActiveSubWindow(window);
            auto* sheet = window->findChild<QTabWidget*>("sheet");
            for (int page = 0; page < (sheet ? sheet->count() : 1); ++page) {
                if (sheet)
                    sheet->setCurrentIndex(page);
                QCoreApplication::processEvents();
                looked.At(frame);
            }
            for (const QLabel* label : window->findChildren<QLabel*>())
                seen = seen || label->text().contains(QString(Name).replace("&", "&&"));
        }
        EXPECT_TRUE(seen);
        EXPECT_EQ(asked, QStringList());
        looked.Expect(1000);
    }
    KsSetMessageBoxHandler({});
}

TEST_F(ShellTest, DialogsTakeNamesForText)
{
    const QTemporaryDir river;
    WriteRiver(river);
    frame = std::make_unique<CMainFrame>();
    frame->LoadPlugins(QStringLiteral(KVR_BUILD_DIR "/bin/plugins"));
    frame->show();
    ASSERT_TRUE(frame->OpenFile(river.filePath("river.HDKV")));
    const QString turned = Name + QChar(0x202E);
    const std::string hostile = turned.toStdString();
    Looked looked;
    {
        Finding finding{.section = hostile, .keyword = hostile, .parameter = 1, .field = hostile};
        finding.found = finding.used = hostile;
        finding.rule = [&] { return hostile; };
        std::vector<Finding> findings;
        for (const Finding::Kind kind : {Finding::WrongType, Finding::Rule, Finding::Unknown, Finding::NotRead}) {
            finding.kind = kind;
            findings.push_back(finding);
        }
        auto* dialog = new CKsFindingsDialog(turned, findings, frame.get());
        dialog->show();
        looked.AtDialog(*dialog);
    }
    {
        const Difference difference{.section = hostile, .keyword = hostile, .before = hostile, .after = hostile};
        const Differences differences{.list = {difference}, .changed = 1, .sections = 1};
        auto* dialog = new CKsDifferenceDialog({turned, turned, turned}, differences, frame.get());
        dialog->show();
        looked.AtDialog(*dialog);
    }
    {
        CRecoverable item{.file = turned, .state = CRecoverable::Missing};
        item.header = {.path = "/" + turned + "/river.HDKV", .extension = turned, .title = turned};
        CRecoverable damaged{.file = turned, .state = CRecoverable::Damaged};
        auto* dialog = new CRecoveryDialog(frame->Recovery(), {item, damaged}, frame.get());
        dialog->show();
        QTest::qWait(200); // they are described one by one
        looked.AtDialog(*dialog);
    }
    // Over the first table of branches: what is replaced, and what is pasted with doubts.
    auto* sheet = frame->findChild<QTabWidget*>("sheet");
    ASSERT_TRUE(sheet);
    sheet->setCurrentIndex(0);
    auto* grid = sheet->currentWidget()->findChild<QTableView*>();
    ASSERT_TRUE(grid);
    grid->setFocus();
    grid->setCurrentIndex(grid->model()->index(0, 1));
    looked.AtNextDialog(*frame, [&](QWidget& dialog) {
        dialog.findChild<QLineEdit*>("find")->setText("src=x");
        dialog.findChild<QLineEdit*>("with")->setText(Name + "2");
        dialog.findChild<QAbstractButton*>("inDocument")->click();
        EXPECT_TRUE(QTest::qWaitFor([&] { return dialog.findChild<QTableWidget*>()->rowCount() > 0; }));
    });
    QTest::keyClick(grid, Qt::Key_H, Qt::ControlModifier);
    QApplication::clipboard()->setText(turned + "\t" + Name + "\t" + turned);
    looked.AtNextDialog(*frame);
    QTest::keyClick(grid, Qt::Key_V, Qt::ControlModifier | Qt::ShiftModifier);
    EXPECT_EQ(looked.titles.size(), 5) << looked.titles.join(u'\n').toStdString();
    looked.Expect(40);
}
