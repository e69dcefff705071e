// The tables beside the map: models, editing with units and undo, and what is refused.
#include "canceled_paste.h"
#include "grid/grid_commands.h"
#include "ks/language/language.h"
#include "network_fixture.h"

#include <QAbstractItemModelTester>
#include <QCheckBox>
#include <QClipboard>
#include <QDialogButtonBox>
#include <QLineEdit>
#include <QPushButton>

namespace {

TEST_F(NetworkTest, TablesShowTheNetworkInTheUsersUnits)
{
    CNetworkView* view = Open();
    const QAbstractItemModelTester branches(view->Branches()->model(),
                                            QAbstractItemModelTester::FailureReportingMode::Fatal);
    const QAbstractItemModelTester channel(view->Channel()->model(),
                                           QAbstractItemModelTester::FailureReportingMode::Fatal);
    EXPECT_EQ(Text(view->Branches(), 0, BranchName), "MAIN");
    EXPECT_EQ(Text(view->Branches(), 0, BranchTo), "8000");
    EXPECT_EQ(Text(view->Branches(), 0, BranchVertices), "3");
    EXPECT_EQ(view->Channel()->model()->rowCount(), 3);
    EXPECT_EQ(Text(view->Channel(), 1, ChannelRadius), "");
    const auto header = [&] { return view->Channel()->model()->headerData(2, Qt::Horizontal).toString(); };
    EXPECT_EQ(header(), "Width [m]");
    KsUnits::Instance().SetSystem(KsUnitSystem::UsCustomary);
    EXPECT_EQ(header(), "Width [ft]");
    EXPECT_EQ(Text(view->Branches(), 0, BranchTo), "26246.719");
    Select(view->Branches(), 1);
    EXPECT_EQ(view->Channel()->model()->rowCount(), 0);
    Remove(*view->Document(), view->Branches()->Model()->Rows(), 0, 2);
    EXPECT_EQ(view->Branches()->model()->rowCount(), 0);
    EXPECT_FALSE(view->OnCommand(Command::InsertLine)) << "no branch";
    view->Document()->UndoStack().undo();
    EXPECT_EQ(view->Channel()->model()->rowCount(), 3) << "undo shows the lines that are back";
}

TEST_F(NetworkTest, WhereLinesHaveAPlaceOfTheirOwnTheyDoNotMove)
{
    CNetworkView* view = Open();
    Select(view->Branches(), 0);
    view->Channel()->SetCurrentCell(2, 1);
    EXPECT_FALSE(CGridCommands::CanRun(GridAction::MoveUp, *view->Channel())) << "they stand by chainage";
    EXPECT_FALSE(CGridCommands::CanRun(GridAction::Duplicate, *view->Branches())) << "a branch has a line on the map";
    CGridCommands::Run(GridAction::Duplicate, *view->Channel());
    const auto& channel = view->Document()->Network().branches[0].channel;
    ASSERT_EQ(channel.size(), 4u);
    EXPECT_EQ(channel[2].chainage, 5000) << "between the one that it is of and the next";
    EXPECT_EQ(channel[2].width, 50);
    view->Branches()->SetCurrentCell(2, 1);
    CGridCommands::Run(GridAction::MoveUp, *view->Branches());
    EXPECT_EQ(view->Document()->Network().branches[0].name, "SIDE");
    EXPECT_EQ(view->Channel()->RowCount(), 0) << "that of the branch that moved";
    while (view->Document()->UndoStack().canUndo())
        view->Document()->UndoStack().undo();
    EXPECT_EQ(view->Document()->Network().branches[0].channel.size(), 3u);
}

TEST_F(NetworkTest, EditsGoToTheDocumentAndCanBeUndone)
{
    CNetworkView* view = Open();
    const auto main = [&]() -> const CNetworkBranch& { return view->Document()->Network().branches[0]; };
    KsUnits::Instance().SetSystem(KsUnitSystem::UsCustomary);
    for (const int column : {BranchName, BranchFrom, BranchTo}) // what was there
        EXPECT_TRUE(Edit(view->Branches(), 0, column, Text(view->Branches(), 0, column, Qt::EditRole)));
    EXPECT_EQ(view->Document()->UndoStack().count(), 0);
    EXPECT_TRUE(Edit(view->Channel(), 0, ChannelWidth, "100"));
    EXPECT_DOUBLE_EQ(main().channel[0].width, 30.48);
    EXPECT_TRUE(Edit(view->Channel(), 0, ChannelWidth, "")); // not known after all
    EXPECT_TRUE(std::isnan(main().channel[0].width));
    KsUnits::Instance().SetSystem(KsUnitSystem::Metric);
    EXPECT_TRUE(Edit(view->Branches(), 0, BranchFrom, "1.5e3"));
    EXPECT_EQ(main().start, 1500);
    EXPECT_TRUE(Edit(view->Branches(), 0, BranchName, "MAIN RIVER"));
    EXPECT_EQ(Text(view->Branches(), 0, BranchFlow), "increasing");
    EXPECT_TRUE(Edit(view->Branches(), 0, BranchFlow, "decreasing"));
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
    const char* const none = "Floating point number required";
    const Case cases[] = {
        {true, BranchName, "  ", "A branch needs a name."},
        {true, BranchName, "SIDE", "There is a branch \"SIDE\" already."},
        {true, BranchFrom, "8000", "The chainages of the two ends of a branch have to differ."},
        {true, BranchTo, "1,000", none},
        {false, ChannelChainage, "", none},
        {false, ChannelChainage, "4000", "There is a line at this chainage already."},
        {false, ChannelWidth, "wide", none},
        {false, ChannelRadius, "inf", none},
    };
    for (const Case& each : cases) {
        boxes.clear();
        EXPECT_FALSE(Edit(each.branches ? view->Branches() : view->Channel(), 0, each.column, each.text));
        ASSERT_EQ(boxes.size(), 1) << each.message;
        EXPECT_EQ(boxes[0].toStdString(), each.message);
    }
    EXPECT_EQ(Type(view->Branches(), 0, BranchVertices, "9"), nullptr) << "counted, not typed";
    EXPECT_EQ(view->Document()->UndoStack().count(), 0);
}

TEST_F(NetworkTest, LinesAreInsertedSortedAndDeletedWithKeys)
{
    CNetworkView* view = Open();
    CGenGrid* channel = view->Channel();
    const auto chainages = [&] {
        QStringList texts;
        for (int row = 0; row < channel->model()->rowCount(); ++row)
            texts << Text(channel, row, ChannelChainage);
        return texts.join(' ').toStdString();
    };
    channel->setFocus();
    channel->SetCurrentCell(1, 1);
    QTest::keyClick(channel, Qt::Key_Insert);
    EXPECT_EQ(chainages(), "2000 3000 4000 6000");
    EXPECT_EQ(channel->CurrentRow(), 2);
    // The current cell goes with its line.
    QTest::keyClick(Type(channel, 1, ChannelChainage, "7000"), Qt::Key_Enter);
    EXPECT_EQ(chainages(), "2000 4000 6000 7000");
    EXPECT_EQ(std::pair(channel->CurrentRow(), channel->CurrentColumn()), std::pair(4, 2));
    EXPECT_TRUE(boxes.isEmpty()) << boxes.join(';').toStdString();
    view->Document()->UndoStack().undo();
    EXPECT_EQ(chainages(), "2000 3000 4000 6000");
    EXPECT_EQ(channel->CurrentRow(), 2) << "undo shows the line";
    view->Document()->UndoStack().redo();
    EXPECT_EQ(channel->CurrentRow(), 4);
    const QString start = Text(view->Branches(), 0, 1);
    EXPECT_TRUE(Edit(channel, 0, ChannelChainage, start.toUtf8().constData()));
    channel->SetCurrentCell(1, 1);
    QTest::keyClick(channel, Qt::Key_Return, Qt::ControlModifier | Qt::ShiftModifier);
    EXPECT_EQ(chainages(), start.toStdString() + " 4000 6000 7000") << "none stands before the branch begins";
    view->Document()->UndoStack().undo();
    channel->SetCurrentCell(4, 1);
    QTest::keyClick(channel, Qt::Key_Insert); // towards the branch's end
    EXPECT_EQ(chainages(), "2000 4000 6000 7000 7500");
    EXPECT_TRUE(Edit(channel, 4, ChannelChainage, "8000"));
    channel->SetCurrentCell(5, 1);
    QTest::keyClick(channel, Qt::Key_Insert); // and back from there
    EXPECT_EQ(chainages(), "2000 4000 6000 7000 7500 8000");
    view->Document()->UndoStack().undo();
    view->Document()->UndoStack().undo();
    EXPECT_EQ(chainages(), "2000 4000 6000 7000 7500");
    channel->SetCurrentCell(1, 1);
    QTest::keyClick(channel, Qt::Key_Down, Qt::ShiftModifier);
    QTest::keyClick(channel, Qt::Key_Delete);
    EXPECT_EQ(chainages(), "6000 7000 7500");
    // Pasted lines find their places, and none may stand where one stands already.
    QGuiApplication::clipboard()->setText("6500\t1\n7000\t2\n");
    channel->SetCurrentCell(1, 1);
    QTest::keyClick(channel, Qt::Key_V, Qt::ControlModifier);
    EXPECT_EQ(chainages(), "6500 7000 7500");
    QGuiApplication::clipboard()->setText("6100\n7500\n7600\n100\n");
    QTest::keyClick(channel, Qt::Key_V, Qt::ControlModifier);
    EXPECT_EQ(chainages(), "100 6100 7500 7600");
    EXPECT_EQ(channel->CurrentRow(), 2) << "with its line";
    EXPECT_TRUE(boxes.isEmpty()) << boxes.join(';').toStdString();
    QGuiApplication::clipboard()->setText("7600");
    QStringList listed;
    CancelPaste(*view, listed);
    QTest::keyClick(channel, Qt::Key_V, Qt::ControlModifier);
    EXPECT_EQ(chainages(), "100 6100 7500 7600");
    EXPECT_FALSE(listed.isEmpty());
    listed.clear();
    view->Branches()->setFocus();
    Select(view->Branches(), 1);
    QGuiApplication::clipboard()->setText("LEFT");
    QTest::keyClick(view->Branches(), Qt::Key_V, Qt::ControlModifier);
    EXPECT_EQ(view->Document()->Network().branches[1].name, "LEFT");
    QGuiApplication::clipboard()->setText("LEFT\nRIGHT"); // there is no second line, and none can come
    CancelPaste(*view, listed);
    QTest::keyClick(view->Branches(), Qt::Key_V, Qt::ControlModifier);
    QCoreApplication::processEvents();
    ASSERT_EQ(listed.size(), 1);
    EXPECT_TRUE(listed[0].contains("The table ends with line 2 and takes no new ones")) << listed[0].toStdString();
    EXPECT_EQ(boxes, QStringList());
    view->activateWindow(); // no window manager gives the focus back
    EXPECT_TRUE(QTest::qWaitForWindowActive(view));
    view->Branches()->setFocus();
    QTest::keyClick(view->Branches(), Qt::Key_Delete);
    EXPECT_EQ(view->Document()->Network().branches.size(), 1u);
    while (view->Document()->UndoStack().canUndo())
        view->Document()->UndoStack().undo();
    EXPECT_EQ(view->Document()->Network().branches.size(), 2u);
    Select(view->Branches(), 0);
    EXPECT_EQ(chainages(), "2000 4000 6000");
}

TEST_F(NetworkTest, LinesThatDoNotFitWithOthersAreToldMendedOrLeftOut)
{
    CNetworkView* view = Open();
    CGenGrid* channel = view->Channel();
    channel->setFocus();
    const auto chainages = [channel] {
        QStringList texts;
        for (int row = 0; row < channel->model()->rowCount(); ++row)
            texts << Text(channel, row, ChannelChainage);
        return texts.join(' ').toStdString();
    };
    const std::string before = chainages();
    QStringList listed;
    QString asked;
    const auto paste = [&](const QString& text, const std::function<void(QDialog&)>& act) {
        QGuiApplication::clipboard()->setText(text);
        channel->SetCurrentCell(1, 1);
        QTimer::singleShot(0, view, [&listed, &asked, act] {
            auto* dialog = qobject_cast<QDialog*>(QApplication::activeModalWidget());
            ASSERT_TRUE(dialog);
            act(*dialog);
            auto* ok = dialog->findChild<QDialogButtonBox*>()->button(QDialogButtonBox::Ok);
            EXPECT_TRUE(ok->isEnabled());
            ok->click();
            if (dialog->isVisible())
                dialog->reject();
        });
        QTest::keyClick(channel, Qt::Key_V, Qt::ControlModifier);
        QCoreApplication::processEvents();
    };
    const auto list = [&](const QDialog& dialog) {
        listed.clear();
        for (auto* faults : dialog.findChildren<QTableView*>())
            for (int row = 0; faults->accessibleName() == "What does not fit" && row < faults->model()->rowCount();
                 ++row)
                listed << faults->model()->index(row, 0).data().toString() + ' ' +
                              faults->model()->index(row, 2).data().toString();
    };
    const auto leaveOut = [&](QDialog& dialog) {
        list(dialog);
        auto* box = dialog.findChild<QCheckBox*>("leaveOut");
        asked = box->text();
        box->click();
    };
    QString text = "100\n200\n300\n400\n"; // however many
    for (int line = 0; line < 50; ++line)
        text += "400\n";
    paste(text, leaveOut);
    EXPECT_EQ(asked.toStdString(), "&Leave out what does not fit: 50 lines");
    EXPECT_EQ(chainages(), "100 200 300 400");
    view->Document()->UndoStack().undo();

    // What is left out keeps its place, for which another one does not fit. Both can be mended.
    paste("100\n6000\n100", leaveOut);
    EXPECT_EQ(listed, QStringList({"2 6000", "3 100"}));
    EXPECT_EQ(chainages(), "100 4000 6000");
    view->Document()->UndoStack().undo();
    paste("100\n6000\n100", [&](QDialog& dialog) {
        for (auto* faults : dialog.findChildren<QTableView*>())
            if (faults->accessibleName() == "What does not fit") {
                EXPECT_TRUE(faults->model()->setData(faults->model()->index(1, 2), "7000"));
            }
        QCoreApplication::processEvents(); // the list is made anew when its editor has gone
    });
    EXPECT_EQ(chainages(), "100 6000 7000");
    view->Document()->UndoStack().undo();

    // So do many, one because of the other.
    text = "9000";
    for (int line = 29; line > 0; --line)
        text.prepend(QString("%1\n").arg(100 * line));
    QGuiApplication::clipboard()->setText(text);
    channel->SetCurrentCell(1, 1);
    QTest::keyClick(channel, Qt::Key_V, Qt::ControlModifier);
    const std::string thirty = chainages();
    text = text.section('\n', 1) + "\n200\n9999";
    paste(text, leaveOut);
    EXPECT_EQ(asked.toStdString(), "&Leave out what does not fit: 30 lines");
    EXPECT_EQ(chainages(), thirty + " 9999");
    while (view->Document()->UndoStack().canUndo())
        view->Document()->UndoStack().undo();
    EXPECT_EQ(chainages(), before);
}

TEST_F(NetworkTest, WhatCannotBeStoredStaysInItsEditorAndIsToldOnce)
{
    CNetworkView* view = Open();
    CGenGrid* channel = view->Channel();
    auto* editor = static_cast<QLineEdit*>(Type(channel, 0, ChannelWidth, "wide"));
    const auto isKept = [&](const char* after) {
        QTest::qWait(1); // what comes later comes, too
        ASSERT_EQ(boxes.size(), 1) << after;
        EXPECT_EQ(boxes.takeFirst(), "Floating point number required");
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
                      channel->visualRect(channel->model()->index(1, ChannelRadius)).center());
    isKept("another cell");
    view->Map()->setFocus();
    isKept("the map");
    EXPECT_TRUE(view->OnCommand(Command::DeleteLine)); // carried out, and refused
    isKept("a command");
    Remove(*view->Document(), view->Branches()->Model()->Rows(), 1, 1);
    EXPECT_EQ(editor->text(), "wide") << "a change of the document is no change of what is being typed";
    view->Document()->UndoStack().undo();
    QTest::keyClick(editor, Qt::Key_Escape);
    EXPECT_FALSE(channel->IsEditing());
    EXPECT_EQ(Text(channel, 0, ChannelWidth), "30");

    Type(channel, 0, ChannelWidth, "31.5");
    EXPECT_TRUE(view->OnCommand(Command::InsertLine));
    EXPECT_EQ(view->Document()->Network().branches[0].channel[0].width, 31.5);
    EXPECT_EQ(channel->model()->rowCount(), 4);

    // An undo by the keys of one table leaves the cell that is open in another one.
    editor = static_cast<QLineEdit*>(Type(channel, 0, ChannelWidth, "wide"));
    const int steps = view->Document()->UndoStack().index();
    view->Run(*view->Branches(), GridAction::Undo);
    EXPECT_EQ(boxes, QStringList("Floating point number required"));
    boxes.clear();
    EXPECT_EQ(view->Document()->UndoStack().index(), steps);
    QTest::keyClick(editor, Qt::Key_Escape);
    view->Run(*view->Branches(), GridAction::Undo);
    EXPECT_EQ(view->Document()->UndoStack().index(), steps - 1);
    EXPECT_TRUE(boxes.isEmpty()) << boxes.join(';').toStdString();
}

TEST_F(NetworkTest, HeldKeysDoNotExtendASelectionThatTheMapMakes)
{
    CNetworkView* view = Open();
    const auto selected = [&] {
        QStringList rows;
        for (const QModelIndex& index : view->Branches()->selectionModel()->selectedIndexes())
            rows << QString::number(index.row());
        return rows.join(' ').toStdString();
    };
    for (const auto& [key, modifier] :
         {std::pair(Qt::Key_Control, Qt::ControlModifier), std::pair(Qt::Key_Shift, Qt::ShiftModifier)}) {
        Select(view->Branches(), 0);
        QTest::keyPress(view->window()->windowHandle(), key, modifier);
        view->Map()->Marks().Pick(CMapPlace{"SIDE", 100});
        EXPECT_EQ(selected(), "1") << modifier;
        view->Map()->Marks().Pick(CMapPlace{"MAIN", 2000});
        EXPECT_EQ(selected(), "0") << modifier;
        QTest::keyRelease(view->window()->windowHandle(), key);
    }
}

TEST_F(NetworkTest, CommandsOfTheMenuDoWhatTheySay)
{
    CNetworkView* view = Open();
    for (const CKsMenuCommand& command : view->LinesMenu())
        EXPECT_EQ(command.id == 0, command.text.isEmpty());
    EXPECT_TRUE(view->IsCommandEnabled(Command::Search));
    EXPECT_FALSE(view->IsCommandEnabled(Command::DeleteLine)); // the map has the focus
    EXPECT_FALSE(view->OnCommand(12345));
    EXPECT_TRUE(view->OnCommand(Command::InsertLine));
    EXPECT_EQ(view->Channel()->model()->rowCount(), 4);
    EXPECT_TRUE(view->OnCommand(Command::DeleteLine)); // the new line is current
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
    EXPECT_EQ(view->Branches()->model()->headerData(BranchName, Qt::Horizontal).toString(), "河川名");
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
