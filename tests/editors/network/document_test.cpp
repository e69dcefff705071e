// The document: undo of every change, and what the project hears.
#include "editors/network/document.h"
#include "network_fixture.h"

namespace {

QStringList Names(const CNetworkDoc& document)
{
    QStringList names;
    for (const CNetworkBranch& branch : document.Network().branches)
        names << branch.Name();
    return names;
}

TEST_F(NetworkTest, EveryChangeIsUndoneRedoneAndTold)
{
    CNetworkView* view = Open();
    CNetworkDoc& document = *view->Document();
    QUndoStack& undo = document.UndoStack();
    std::vector<CNetworkBranch> more(3);
    more[0].name = "A", more[1].name = "B", more[2].name = "C";
    more[0].channel = {{300, 1, 2}, {100, 3, 4}};

    const QStringList states[] = {
        {"MAIN", "SIDE"}, {"MAIN", "SIDE", "A", "B", "C"}, {"MAIN", "LEFT", "A", "B", "C"}, {"LEFT", "A", "B", "C"}};
    const std::function<void()> changes[] = {[&] { document.AppendBranches(more, "EPSG:25832", "append"); },
                                             [&] { Edit(view->Branches(), 1, BranchName, " LEFT "); },
                                             [&] { Remove(document, view->Branches()->Model()->Rows(), 0, 1); }};
    for (int i = 0; i < 3; ++i) {
        log.clear();
        changes[i]();
        QCoreApplication::processEvents(); // news wait for the end of the event
        EXPECT_EQ(Names(document), states[i + 1]);
        EXPECT_EQ(log.count("others 522"), 1) << i;
        EXPECT_TRUE(document.IsModified());
    }
    EXPECT_EQ(document.Network().branches[1].channel[0].chainage, 100); // sorted
    EXPECT_EQ(document.Network().system, "EPSG:25832");
    for (int round = 0; round < 2; ++round) {
        for (int i = 2; i >= 0; --i) {
            undo.undo();
            EXPECT_EQ(Names(document), states[i]);
        }
        EXPECT_FALSE(document.IsModified());
        EXPECT_EQ(document.Network().system, "");
        EXPECT_EQ(document.Network().branches[0].line.size(), 3u);
        for (int i = 0; i < 3; ++i) {
            undo.redo();
            EXPECT_EQ(Names(document), states[i + 1]);
        }
    }
    document.AppendBranches({}, "EPSG:4326", "nothing");
    EXPECT_EQ(undo.count(), 3);
}

TEST_F(NetworkTest, TheReferenceFollowsTheNetwork)
{
    CNetworkView* view = Open();
    EXPECT_EQ(view->Document()->Reference().PointAt(0, 4000), QPointF(3000, 0));
    EXPECT_TRUE(Edit(view->Branches(), 0, BranchFrom, "2750"));
    EXPECT_EQ(view->Document()->Reference().PointAt(0, 5000), QPointF(3000, 0));
    view->Document()->UndoStack().undo();
    EXPECT_EQ(view->Document()->Reference().PointAt(0, 4000), QPointF(3000, 0));
}

} // namespace
