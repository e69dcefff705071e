// Random edits on random pages with saves in between, against a model as simple as can be: the texts that the document
// had after each step, and what a typed value must change of them.
#include "module/exchange_fixture.h"
#include "random_user.h"

#include "data/hd_support.h"
#include "ks/fc/file_dialog.h"

#include <QRegularExpression>
#include <algorithm>

namespace {

std::pair<unsigned, unsigned> Seeds()
{
    const QStringList range = qEnvironmentVariable("KVR_MODEL_SEEDS", "1-8").split('-');
    return {range.front().toUInt(), range.back().toUInt()};
}

int Steps()
{
    const int steps = qEnvironmentVariableIntValue("KVR_MODEL_STEPS");
    return steps > 0 ? steps : 500;
}

QStringList Lines(const std::string& text)
{
    return QString::fromStdString(text).split('\n');
}

/// The lines of `now` that are others than before, between the first and the last difference.
QStringList Added(const std::string& before, const std::string& now)
{
    QStringList old = Lines(before), lines = Lines(now);
    while (!old.isEmpty() && !lines.isEmpty() && old.back() == lines.back())
        old.removeLast(), lines.removeLast();
    while (!old.isEmpty() && !lines.isEmpty() && old.front() == lines.front())
        old.removeFirst(), lines.removeFirst();
    return lines;
}

std::string FirstDifference(const std::string& a, const std::string& b)
{
    const QStringList x = Lines(a), y = Lines(b);
    for (qsizetype i = 0; i < std::max(x.size(), y.size()); ++i)
        if (x.value(i) != y.value(i))
            return QString("line %1: '%2' instead of '%3'").arg(i + 1).arg(x.value(i), y.value(i)).toStdString();
    return {};
}

class UndoModelTest : public ExchangeTest
{
protected:
    UndoModelTest()
    {
        KsSetFileDialogHandler([](const KsFileQuestion&) { return CString(); });
        frame.resize(1100, 800);
    }
    ~UndoModelTest() override { KsSetFileDialogHandler({}); }

    /// A file with something in every kind of table.
    CString WriteRiver() const
    {
        HD_Parameters parameters;
        parameters.EncroachList.Add();
        for (const ListEntry& entry : HDLists())
            for (int line = 0; line < 3; ++line) {
                CGenList& list = entry.list(parameters).ListAt(0);
                HD_RiverPos& record = list.AddTail(list.NewRecord());
                record.RiverName = line == 2 ? "SIDE" : "MAIN";
                record.Chainage = 100 * line + 0.125;
            }
        HD_Global_Var& globals = parameters.Global;
        globals.MarkTitles = {"BANK", "", "ALARM"};
        globals.MarkInterpolate = {true, false, false};
        parameters.WaterLevelMarkList.GetAt(0).MarkLevels = {1, 2, 3};
        parameters.WaterLevelMarkList.GetAt(1).MarkLevels = {4};
        globals.MapOutput.GenerateOutput = globals.MapOutput.ApplyDemGroundElevation = true;
        globals.MapOutput.MapOutputFiles.resize(2);
        globals.MapOutput.MapOutputFiles[0].FileName = "a.kvt2";
        globals.TextOutput.OutputItems.resize(1);
        globals.Leakage.IncludeLeakage = globals.CurveIncrement.Enabled = globals.SandBarIncrement.Enabled = true;
        EXPECT_TRUE(SaveHDFile(parameters, Path("river.HDKV").toStdString()));
        return Path("river.HDKV");
    }

    std::string Text() const { return HDFileText(document->Parameters(), true); }
    int Index() const { return document->UndoStack().index(); }

    /// The state after the present step, reached by undo, redo and edits alike.
    ::testing::AssertionResult IsAsRecorded() const
    {
        const std::string& known = states[std::size_t(Index())];
        if (Text() == known)
            return ::testing::AssertionSuccess();
        return ::testing::AssertionFailure() << "after step " << Index() << ": " << FirstDifference(Text(), known);
    }
    /// New steps are recorded on the way back and compared on the way forth.
    void CheckNewSteps(int before)
    {
        const int now = Index();
        states.resize(std::size_t(std::max(before, 0)) + 1);
        states.resize(std::size_t(now) + 1);
        states.back() = Text();
        for (int step = now - 1; step >= before; --step) {
            document->UndoStack().undo();
            if (step > before)
                states[std::size_t(step)] = Text();
            else
                ASSERT_TRUE(IsAsRecorded()) << "undone";
        }
        while (Index() < now) {
            document->UndoStack().redo();
            ASSERT_TRUE(IsAsRecorded()) << "redone";
        }
    }
    /// What was typed is what was stored: numbers in base units, which the metric fields show, and texts as they are or
    /// in capitals.
    static bool HoldsTyped(const QStringList& added, const QString& typed)
    {
        bool isNumber = false;
        const double number = typed.toDouble(&isNumber);
        for (const QString& line : added)
            for (QString parameter : line.section(" = ", 1).split(", ")) {
                bool alsoNumber = false;
                if (isNumber && std::abs(parameter.toDouble(&alsoNumber) - number) <= 1e-9 && alsoNumber)
                    return true;
                parameter.remove(QRegularExpression("[\"|'<>]|data = "));
                if (parameter.compare(typed, Qt::CaseInsensitive) == 0)
                    return true;
            }
        return false;
    }
    void Save(const char* name)
    {
        ASSERT_TRUE(document->DoSave(Path(name)));
        EXPECT_FALSE(document->IsModified());
        QCoreApplication::processEvents();
    }
    void OneUser(unsigned seed);
    void Step(RandomUser& user, QStringList& log);

    CKavo0_hdDoc* document = nullptr;
    int base = 0;                    // index after the first save
    std::vector<std::string> states; // by the undo stack's index
};

void UndoModelTest::Step(RandomUser& user, QStringList& log)
{
    boxes.clear();
    const int before = Index();
    const std::string was = Text();
    QString typed;
    switch (user.Pick(14)) {
    case 0:
    case 1:
        for (int times = 1 + user.Pick(4); times > 0 && Index() > base; --times)
            user.UndoRedo(true);
        break;
    case 2:
        for (int times = 1 + user.Pick(3); times > 0; --times)
            user.UndoRedo(false);
        break;
    case 3:
        log << "save";
        if (!document->DoSave(Path("saved.HDKV"))) { // a field of the page holds what is no value
            ASSERT_EQ(boxes.size(), 1);
            ASSERT_EQ(Text(), was);
            break;
        }
        EXPECT_FALSE(document->IsModified());
        QCoreApplication::processEvents();
        if (Index() == before) {
            ASSERT_EQ(Text(), was) << "a save changes nothing that it does not say";
        }
        break;
    default:
        user.DoSomething();
        typed = user.Typed();
    }
    log << user.Done();
    document->UpdateAllViews(nullptr, CKsDoc::StoreHint); // what is still being typed belongs to this step
    if (!boxes.isEmpty()) {                               // refused, and told; the user takes it back
        log << "box: " + boxes.join('|');
        for (int i = 0; i < 2 && QApplication::focusWidget(); ++i)
            QTest::keyClick(QApplication::focusWidget(), Qt::Key_Escape);
    }
    const bool isEdit =
        Index() > before && (std::size_t(Index()) >= states.size() || Text() != states[std::size_t(Index())]);
    if (isEdit || (Index() > before && document->UndoStack().count() == Index()))
        CheckNewSteps(before);
    ASSERT_TRUE(IsAsRecorded());
    if (Index() == before + 1 && !typed.isEmpty() && boxes.isEmpty()) {
        ASSERT_TRUE(HoldsTyped(Added(was, Text()), typed)) << Added(was, Text()).join('\n').toStdString();
    }
    ASSERT_EQ(document->IsModified(), !document->UndoStack().isClean());
}

void UndoModelTest::OneUser(unsigned seed)
{
    SCOPED_TRACE("seed " + std::to_string(seed));
    auto* view = Open(seed % 3 == 0 ? CString() : WriteRiver());
    ASSERT_NE(view, nullptr);
    document = view->GetDocument();
    QTest::qWait(20); // the other pages are made
    RandomUser user(*view, other, seed);
    user.VisitEveryPage();
    EXPECT_FALSE(document->IsModified());
    EXPECT_EQ(Index(), 0);
    states.assign(1, Text());
    Save("first.HDKV");
    base = Index(); // the rows without a file, and the untitled marks, are gone
    CheckNewSteps(0);

    QStringList log;
    for (int step = 0; step < Steps(); ++step) {
        Step(user, log);
        log = log.mid(std::max<qsizetype>(0, log.size() - 12));
        while (Index() < base) // the first save stays
            user.UndoRedo(false);
        ASSERT_FALSE(HasFatalFailure()) << "seed " << seed << ", step " << step << "\n" << log.join('\n').toStdString();
    }
    if (!view->MayLeave(KsLeave::Page)) // told, and taken back
        QTest::keyClick(QApplication::focusWidget(), Qt::Key_Escape);
    ASSERT_TRUE(view->MayLeave(KsLeave::Page));
    states.resize(std::size_t(document->UndoStack().count()) + 1);
    if (Index() == document->UndoStack().count())
        states.back() = Text();
    while (document->UndoStack().canRedo())
        document->UndoStack().redo();
    const std::string last = Text();
    while (document->UndoStack().canUndo()) {
        document->UndoStack().undo();
        ASSERT_TRUE(states[std::size_t(Index())].empty() || IsAsRecorded()) << "seed " << seed;
    }
    while (Index() < base)
        document->UndoStack().redo();
    ASSERT_TRUE(IsAsRecorded());
    Save("undone.HDKV");
    ASSERT_EQ(Index(), base) << document->UndoStack().undoText().toStdString() << ": "
                             << FirstDifference(Text(), states[std::size_t(base)]);
    EXPECT_EQ(Read(Path("undone.HDKV")), Read(Path("first.HDKV"))) << "seed " << seed;
    while (document->UndoStack().canRedo())
        document->UndoStack().redo();
    EXPECT_EQ(FirstDifference(Text(), last), "") << "seed " << seed;
    document->SetModifiedFlag(false);
    CKsMDIChildWnd::Of(view)->close();
    QTest::qWait(5);
}

TEST_F(UndoModelTest, EveryStepIsUndoneAndRedoneExactly)
{
    const auto [first, last] = Seeds();
    for (unsigned seed = first; seed <= last; ++seed) {
        OneUser(seed);
        if (HasFailure())
            return;
    }
}

} // namespace
