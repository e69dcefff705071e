// The tables beside the map: models, editing with units and undo, and what is refused.
#include "ks/language/language.h"
#include "network_fixture.h"

#include <QAbstractItemModelTester>
#include <QLineEdit>
#include <QTableView>

namespace {

QString Text(const QTableView* table, int row, int column, int role = Qt::DisplayRole)
{
    return table->model()->index(row, column).data(role).toString();
}

bool Edit(QTableView* table, int row, int column, const QString& text)
{
    return table->model()->setData(table->model()->index(row, column), text);
}

TEST_F(NetworkTest, TablesShowTheNetworkInTheUsersUnits)
{
    CNetworkView* view = Open();
    const QAbstractItemModelTester branches(view->Branches()->model(),
                                            QAbstractItemModelTester::FailureReportingMode::Fatal);
    const QAbstractItemModelTester channel(view->Channel()->model(),
                                           QAbstractItemModelTester::FailureReportingMode::Fatal);
    using B = CBranchTable;
    EXPECT_EQ(Text(view->Branches(), 0, B::Name), "MAIN");
    EXPECT_EQ(Text(view->Branches(), 0, B::To), "8000");
    EXPECT_EQ(Text(view->Branches(), 0, B::Vertices), "3");
    EXPECT_EQ(view->Channel()->model()->rowCount(), 3);
    EXPECT_EQ(Text(view->Channel(), 1, CChannelTable::Radius), "");
    const auto header = [&] { return view->Channel()->model()->headerData(2, Qt::Horizontal).toString(); };
    EXPECT_EQ(header(), "Width [m]");
    KsUnits::Instance().SetSystem(KsUnitSystem::UsCustomary);
    EXPECT_EQ(header(), "Width [ft]");
    EXPECT_EQ(Text(view->Branches(), 0, B::To), "26246.719");
    view->Branches()->setCurrentIndex(view->Branches()->model()->index(1, 0));
    EXPECT_EQ(view->Channel()->model()->rowCount(), 0);
    view->Document()->RemoveBranches({0, 1}, "x");
    EXPECT_EQ(view->Branches()->model()->rowCount(), 0);
    EXPECT_EQ(static_cast<CChannelTable*>(view->Channel()->model())->InsertLine(0), -1);
    view->Document()->UndoStack().undo();
}

TEST_F(NetworkTest, EditsGoToTheDocumentAndCanBeUndone)
{
    CNetworkView* view = Open();
    const auto main = [&]() -> const CNetworkBranch& { return view->Document()->Network().branches[0]; };
    KsUnits::Instance().SetSystem(KsUnitSystem::UsCustomary);
    for (const int column : {CBranchTable::Name, CBranchTable::From, CBranchTable::To}) // what was there
        EXPECT_FALSE(Edit(view->Branches(), 0, column, Text(view->Branches(), 0, column, Qt::EditRole)));
    EXPECT_EQ(view->Document()->UndoStack().count(), 0);
    EXPECT_TRUE(Edit(view->Channel(), 0, CChannelTable::Width, "100"));
    EXPECT_DOUBLE_EQ(main().channel[0].width, 30.48);
    EXPECT_TRUE(Edit(view->Channel(), 0, CChannelTable::Width, "")); // not known after all
    EXPECT_TRUE(std::isnan(main().channel[0].width));
    KsUnits::Instance().SetSystem(KsUnitSystem::Metric);
    EXPECT_TRUE(Edit(view->Branches(), 0, CBranchTable::From, " 1.5e3 "));
    EXPECT_EQ(main().start, 1500);
    EXPECT_TRUE(Edit(view->Branches(), 0, CBranchTable::Name, "MAIN RIVER"));
    EXPECT_TRUE(view->Branches()->model()->setData(view->Branches()->model()->index(0, CBranchTable::Flow),
                                                   Qt::Unchecked, Qt::CheckStateRole));
    EXPECT_FALSE(main().downstream);
    while (view->Document()->UndoStack().canUndo())
        view->Document()->UndoStack().undo();
    EXPECT_EQ(main().name, "MAIN");
    EXPECT_EQ(main().start, 1000);
    EXPECT_EQ(main().channel[0].width, 30);
    EXPECT_TRUE(main().downstream);
    EXPECT_FALSE(view->Document()->IsModified());
}

TEST_F(NetworkTest, WhatCannotBeIsRefusedWithAMessage)
{
    CNetworkView* view = Open();
    struct Case
    {
        bool branches;
        int column;
        const char *text, *message;
    };
    const Case cases[] = {
        {true, CBranchTable::Name, "  ", "Line 1, Branch: A branch needs a name."},
        {true, CBranchTable::Name, "SIDE", "Line 1, Branch: There is a branch \"SIDE\" already."},
        {true, CBranchTable::From, "8000",
         "Line 1, From [m]: The chainages of the two ends of a branch have to differ."},
        {true, CBranchTable::To, "1,000", "Line 1, To [m]: expected a number, found \"1,000\"."},
        {false, CChannelTable::Chainage, "", "Line 1, Chainage [m]: expected a number, found \"\"."},
        {false, CChannelTable::Chainage, "4000", "Line 1, Chainage [m]: there is a line at this chainage already."},
        {false, CChannelTable::Width, "wide", "Line 1, Width [m]: expected a number, found \"wide\"."},
        {false, CChannelTable::Radius, "inf", "Line 1, Radius [m]: expected a number, found \"inf\"."},
    };
    for (const Case& each : cases) {
        boxes.clear();
        EXPECT_FALSE(Edit(each.branches ? view->Branches() : view->Channel(), 0, each.column, each.text));
        QCoreApplication::processEvents();
        ASSERT_EQ(boxes.size(), 1) << each.message;
        EXPECT_EQ(boxes[0].toStdString(), each.message);
    }
    EXPECT_EQ(view->Document()->UndoStack().count(), 0);
}

TEST_F(NetworkTest, LinesAreInsertedSortedAndDeletedWithKeys)
{
    CNetworkView* view = Open();
    QTableView* channel = view->Channel();
    const auto chainages = [&] {
        QStringList texts;
        for (int row = 0; row < channel->model()->rowCount(); ++row)
            texts << Text(channel, row, CChannelTable::Chainage);
        return texts.join(' ').toStdString();
    };
    channel->setFocus();
    channel->setCurrentIndex(channel->model()->index(0, 0));
    QTest::keyClick(channel, Qt::Key_Insert);
    EXPECT_EQ(chainages(), "2000 3000 4000 6000");
    EXPECT_EQ(channel->currentIndex().row(), 1);
    // Typed through an editor: the current cell goes with its line.
    QTest::keyClick(channel, Qt::Key_F2);
    auto* editor = channel->findChild<QLineEdit*>();
    ASSERT_NE(editor, nullptr);
    editor->selectAll();
    QTest::keyClicks(editor, "7000");
    QTest::keyClick(editor, Qt::Key_Enter);
    QCoreApplication::processEvents(); // the editor commits later
    EXPECT_EQ(chainages(), "2000 4000 6000 7000");
    EXPECT_TRUE(QTest::qWaitFor([&] { return channel->currentIndex().row() == 3; }));
    EXPECT_TRUE(boxes.isEmpty()) << boxes.join(';').toStdString();
    QTest::keyClick(channel, Qt::Key_Insert); // towards the branch's end
    EXPECT_EQ(chainages(), "2000 4000 6000 7000 7500");
    channel->selectRow(0);
    channel->selectionModel()->select(channel->model()->index(2, 0),
                                      QItemSelectionModel::Select | QItemSelectionModel::Rows);
    QTest::keyClick(channel, Qt::Key_Delete);
    EXPECT_EQ(chainages(), "4000 7000 7500");
    view->Branches()->setFocus();
    view->Branches()->selectRow(1);
    QTest::keyClick(view->Branches(), Qt::Key_Delete);
    EXPECT_EQ(view->Document()->Network().branches.size(), 1u);
    while (view->Document()->UndoStack().canUndo())
        view->Document()->UndoStack().undo();
    EXPECT_EQ(view->Document()->Network().branches.size(), 2u);
    view->Branches()->selectRow(0);
    EXPECT_EQ(chainages(), "2000 4000 6000");
}

TEST_F(NetworkTest, WhatIsBeingTypedIsStoredBeforeASave)
{
    CNetworkView* view = Open();
    QTableView* channel = view->Channel();
    channel->setFocus();
    channel->setCurrentIndex(channel->model()->index(0, CChannelTable::Width));
    QTest::keyClick(channel, Qt::Key_F2);
    auto* editor = channel->findChild<QLineEdit*>();
    ASSERT_NE(editor, nullptr);
    editor->selectAll();
    QTest::keyClicks(editor, "31.5");
    EXPECT_TRUE(view->Document()->DoSave(folder.filePath("river.kvnw")));
    EXPECT_THAT(Read(folder.filePath("river.kvnw")).toStdString(), testing::HasSubstr("DATA = 2000, 400, 31.5"));
    EXPECT_FALSE(view->Document()->IsModified());
}

TEST_F(NetworkTest, WhatCannotBeStoredStaysInItsEditorAndIsToldOnce)
{
    CNetworkView* view = Open();
    CLinesView* channel = view->Channel();
    const auto type = [&](const char* text) {
        channel->setFocus();
        channel->GoTo(0, CChannelTable::Width);
        QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete); // the editor before
        QTest::keyClick(channel, Qt::Key_F2);
        auto* editor = channel->findChild<QLineEdit*>();
        EXPECT_NE(editor, nullptr);
        editor->selectAll();
        QTest::keyClicks(editor, text);
        return editor;
    };
    QLineEdit* editor = type("wide");
    const auto isKept = [&](const char* after) {
        QTest::qWait(1); // what comes later comes, too
        ASSERT_EQ(boxes.size(), 1) << after;
        EXPECT_EQ(boxes.takeFirst(), "Line 1, Width [m]: expected a number, found \"wide\".");
        EXPECT_TRUE(channel->IsEditing()) << after;
        EXPECT_EQ(editor->text(), "wide") << after;
        EXPECT_EQ(QApplication::focusWidget(), editor) << after;
        EXPECT_EQ(view->Document()->UndoStack().count(), 0) << after;
    };
    EXPECT_FALSE(view->MayLeave(KsLeave::Page));
    isKept("asked");
    QTest::keyClick(editor, Qt::Key_Enter);
    isKept("Enter");
    QTest::mouseClick(channel->viewport(), Qt::LeftButton, {},
                      channel->visualRect(channel->model()->index(1, CChannelTable::Radius)).center());
    isKept("another cell");
    view->Map()->setFocus();
    isKept("the map");
    EXPECT_TRUE(view->OnCommand(NetworkCommand::DeleteLine)); // carried out, and refused
    isKept("a command");
    view->Document()->ReplaceBranch(1, view->Document()->Network().branches[1], "another change");
    EXPECT_EQ(editor->text(), "wide") << "a change of the document is no change of what is being typed";
    view->Document()->UndoStack().undo();
    QTest::keyClick(editor, Qt::Key_Escape);
    EXPECT_FALSE(channel->IsEditing());
    EXPECT_EQ(Text(channel, 0, CChannelTable::Width), "30");

    editor = type("31.5");
    EXPECT_TRUE(view->OnCommand(NetworkCommand::InsertLine));
    EXPECT_EQ(view->Document()->Network().branches[0].channel[0].width, 31.5);
    EXPECT_EQ(channel->model()->rowCount(), 4);
    EXPECT_TRUE(boxes.isEmpty()) << boxes.join(';').toStdString();
}

TEST_F(NetworkTest, HeldKeysDoNotExtendASelectionThatTheMapMakes)
{
    CNetworkView* view = Open();
    const auto selected = [&] {
        QStringList rows;
        for (const QModelIndex& index : view->Branches()->selectionModel()->selectedRows())
            rows << QString::number(index.row());
        return rows.join(' ').toStdString();
    };
    for (const auto& [key, modifier] :
         {std::pair(Qt::Key_Control, Qt::ControlModifier), std::pair(Qt::Key_Shift, Qt::ShiftModifier)}) {
        view->Branches()->selectRow(0);
        QTest::keyPress(view->window()->windowHandle(), key, modifier);
        view->Map()->SetPicked(CNetworkMap::Place{"SIDE", 100});
        EXPECT_EQ(selected(), "1") << modifier;
        view->Map()->SetPicked(CNetworkMap::Place{"MAIN", 2000});
        EXPECT_EQ(selected(), "0") << modifier;
        QTest::keyRelease(view->window()->windowHandle(), key);
    }
}

TEST_F(NetworkTest, CommandsOfTheMenuDoWhatTheySay)
{
    CNetworkView* view = Open();
    for (const CKsMenuCommand& command : view->LinesMenu())
        EXPECT_EQ(command.id == 0, command.text.isEmpty());
    EXPECT_FALSE(view->IsCommandEnabled(NetworkCommand::DeleteLine)); // the map has the focus
    EXPECT_FALSE(view->OnCommand(12345));
    EXPECT_TRUE(view->OnCommand(NetworkCommand::InsertLine));
    EXPECT_EQ(view->Channel()->model()->rowCount(), 4);
    EXPECT_TRUE(view->OnCommand(NetworkCommand::DeleteLine)); // the new line is current
    EXPECT_EQ(view->Channel()->model()->rowCount(), 3);
    const QPointF before = PointOf(view->Map(), "MAIN", 1000);
    EXPECT_TRUE(view->OnCommand(NetworkCommand::ZoomIn));
    EXPECT_NE(PointOf(view->Map(), "MAIN", 1000), before);
    EXPECT_TRUE(view->OnCommand(NetworkCommand::FitAll));
    EXPECT_EQ(PointOf(view->Map(), "MAIN", 1000), before);
}

TEST_F(NetworkTest, TheWindowFollowsTheLanguage)
{
    auto& language = KsLanguage::Instance();
    const QString translations = language.TranslationFolder();
    language.SetTranslationFolder(QStringLiteral(KVR_BUILD_DIR "/bin/translations"));
    KsResourceHandle texts = nullptr;
    KsLangLoadResDll("Kavo0_nw", &texts, 0);
    CNetworkView* view = Open();
    const QImage english = view->Map()->grab().toImage();
    language.SetCurrent("ja");
    QCoreApplication::sendPostedEvents();
    EXPECT_EQ(view->Branches()->model()->headerData(CBranchTable::Name, Qt::Horizontal).toString(), "河川名");
    EXPECT_EQ(view->Map()->accessibleName(), "河道網の地図");
    EXPECT_EQ(LocationKindName(HDBedData), "河床抵抗");
    EXPECT_NE(view->Map()->grab().toImage(), english); // the legend
    language.SetCurrent("en_GB");
    QCoreApplication::sendPostedEvents();
    EXPECT_EQ(view->Map()->grab().toImage(), english);
    language.SetCurrent("en_US");
    KsLangFreeResDll(KsLangLoadResDll("Kavo0_nw", nullptr, 0));
    language.SetTranslationFolder(translations);
}

} // namespace
