// Requests of other editors that are not met.
#include "exchange_fixture.h"

namespace {

TEST_F(ExchangeTest, WhatCannotBeMetDoesNothing)
{
    auto* view = Open(WriteFile("river.hdkv"));
    auto* sibling = Open(WriteFile("sibling.hdkv"));
    const auto before = FileText(*view);
    const int tab = view->Sheet()->currentIndex();
    const ExchangeLog log;
    const auto nothing = [&](const char* what, int lines) {
        EXPECT_TRUE(FileText(*view) == before) << what;
        EXPECT_EQ(view->Sheet()->currentIndex(), tab) << what;
        EXPECT_EQ(frame.GetActiveView(), sibling) << what;
        EXPECT_TRUE(boxes.isEmpty()) << what;
        EXPECT_EQ(log.Take(), lines) << what;
    };
    CObList empty, wrong, holed(1), fine = Items(1, "MAIN", 5);
    wrong.push_back(std::make_unique<CKvrCBEText>());
    CObList negative = Items(-1, "MAIN", 5), seven = Items(7, "MAIN", 5), unnamed = Items(1, "", 5),
            nowhere = Items(1, "MAIN", KsUnset);
    for (const WPARAM request : {KsRequest::InsertData, KsRequest::DeleteData}) {
        for (CObList* objects :
             {static_cast<CObList*>(nullptr), &empty, &wrong, &holed, &negative, &seven, &unnamed, &nowhere}) {
            EXPECT_EQ(Send(view, request, objects), 0);
            nothing("objects", 1);
        }
    }
    for (CObList* objects : {static_cast<CObList*>(nullptr), &empty, &wrong, &holed, &negative, &seven, &nowhere}) {
        KvrMSGSelectData({}, view, objects);
        nothing("select", 1);
    }
    for (const WPARAM request : {KsRequest::GetData, KsRequest::InsertData, KsRequest::DeleteData}) {
        EXPECT_EQ(view->WindowProc(KsMessage::BetweenEditors(), request, 0), 0);
        nothing("no package", 1);
        CKSComm_Package package;
        package.objects = &fine;
        for (CView* sender : {static_cast<CView*>(nullptr), static_cast<CView*>(view), static_cast<CView*>(sibling)}) {
            package.view = sender;
            EXPECT_EQ(view->WindowProc(KsMessage::BetweenEditors(), request, reinterpret_cast<LPARAM>(&package)), 0);
            nothing("sender", 1);
        }
        EXPECT_EQ(fine.size(), 1u);
    }
    for (const WPARAM request : {0, 40, 49, 60, 200, 201, 522, 523}) {
        EXPECT_EQ(Send(view, request, &fine), 0);
        nothing("code", 0);
    }
    KvrMSGInsertData({}, &other, &fine);
    nothing("a view of another editor", 1);
    CKavo0_hd::ChangeData({}, view, &fine);
    nothing("change", 0);
}

TEST_F(ExchangeTest, NoChangeIsMadeInsideAnotherAndNothingIsMetWhileTheDocumentSavesOrCloses)
{
    auto* view = Open(WriteFile("river.hdkv"));
    Open({});
    CObList items = Items(1, "MAIN", 5), inner = Items(0, "INNER", 5);
    const ExchangeLog log;
    int calls = 0;
    answerShell = [&](unsigned message, WPARAM, CKSComm_Package&, LRESULT joined) {
        if (message == KsMessage::ShowToolbar() && ++calls) { // the window comes to the front
            KvrMSGInsertData({}, view, &inner);
            EXPECT_EQ(Summary(Owned(KvrMSGGetData({}, view->GetDocument())).get()), AllItems) << "reading may go on";
        }
        return joined;
    };
    KvrMSGInsertData({}, view, &items);
    answerShell = {};
    EXPECT_EQ(calls, 1);
    EXPECT_EQ(log.Take(), 1);
    EXPECT_EQ(List(*view, 1).GetCount(), 3u);
    EXPECT_EQ(List(*view, 0).GetCount(), 2u);

    // Whoever hears that the data changed may ask at once.
    view->GetDocument()->JoinProject(nullptr);
    projectHandle = 5;
    view->GetDocument()->JoinProject(view);
    std::string heard;
    answerShell = [&](unsigned, WPARAM request, CKSComm_Package&, LRESULT joined) {
        if (request == KsRequest::DataChanged)
            heard = Summary(Owned(KvrMSGGetData({}, view->GetDocument())).get());
        return joined;
    };
    KvrMSGDeleteData({}, view, &items);
    answerShell = {};
    EXPECT_EQ(heard, AllItems);

    struct Asker : CView
    {
        void OnUpdate(CView*, int, CHint*) override
        {
            if (GetDocument()->IsExecuting()) {
                EXPECT_EQ(KvrMSGGetData({}, GetDocument()), nullptr);
                ++asked;
            }
        }
        int asked = 0;
    };
    {
        Asker asker;
        view->GetDocument()->AddView(&asker);
        EXPECT_TRUE(view->GetDocument()->DoSave(view->GetDocument()->GetPathName()));
        EXPECT_GE(asker.asked, 1);
        EXPECT_EQ(log.Take(), asker.asked);
    }
    const auto saved = FileText(*view);
    CKsMDIChildWnd::Of(view)->close();
    KvrMSGInsertData({}, view, &inner);
    EXPECT_EQ(KvrMSGGetData({}, view->GetDocument()), nullptr);
    EXPECT_EQ(log.Take(), 2);
    EXPECT_TRUE(FileText(*view) == saved);
    EXPECT_TRUE(boxes.isEmpty());
}

} // namespace
