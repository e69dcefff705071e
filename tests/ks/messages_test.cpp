#include "ks_fixture.h"

#include "ks/fc/exchange.h"

#include <cmath>
#include <set>

TEST(Messages, OneNumberForEachNameWhoeverAsks)
{
    const std::map<std::string, unsigned> names{
        {"KavoShellSwitchBoardSevice", KsMessage::SwitchBoard()},
        {"KavoShellCommunicationBetweenEditors", KsMessage::BetweenEditors()},
        {"KavoShellProjectManagement", KsMessage::ProjectManagement()},
        {"KavoShellShowToolbar", KsMessage::ShowToolbar()},
        {"KavoShellHideToolbar", KsMessage::HideToolbar()},
        {"KSM_VISUAL_PROJECT_MAP_CHANGED", KsMessage::ProjectMapChanged()},
    };
    std::set<unsigned> numbers;
    for (const auto& [name, number] : names) {
        EXPECT_EQ(KsRegisterMessage(std::string(name).c_str()), number) << name;
        numbers.insert(number);
    }
    EXPECT_EQ(numbers.size(), names.size());
    EXPECT_EQ(numbers.count(0), 0u);
    EXPECT_NE(KsRegisterMessage("kavoshellshowtoolbar"), KsMessage::ShowToolbar()) << "names differ in case";
}

TEST(Messages, AWindowAnswersSynchronouslyAndTheDefaultIsZero)
{
    struct Echo : CKsWindow
    {
        LRESULT WindowProc(unsigned message, WPARAM wParam, LPARAM lParam) override
        {
            return message == KsMessage::SwitchBoard() ? LRESULT(wParam) + lParam
                                                       : CKsWindow::WindowProc(message, wParam, lParam);
        }
    } echo;
    EXPECT_EQ(KsSendMessage(&echo, KsMessage::SwitchBoard(), 40, -2), 38);
    EXPECT_EQ(KsSendMessage(&echo, KsMessage::ShowToolbar(), 40, -2), 0);
    EXPECT_EQ(KsSendMessage(nullptr, KsMessage::SwitchBoard(), 40, -2), 0);
}

TEST(Messages, AFrameThatGoesIsNoLongerTheMainWindow)
{
    {
        CKsMDIFrameWnd frame;
        KsSetMainWindow(&frame);
        EXPECT_EQ(KsMainWindow(), &frame);
    }
    EXPECT_EQ(KsMainWindow(), nullptr);
}

TEST(ExchangeItems, ComeAndGoInAnyOrder)
{
    struct Larger : CKvr_CBE_ModelDataItem
    {
        double more = 5;
    };
    for (int round = 0; round < 2; ++round) { // all of them go, then all come again
        CObList items;
        for (int i = 0; i < 1000; ++i) {
            auto item = i % 7 == 0 ? std::make_unique<Larger>() : std::make_unique<CKvr_CBE_ModelDataItem>();
            item->type = i;
            item->branch = CString::number(i);
            items.push_back(std::move(item));
            if (i % 3 == 0)
                items[std::size_t(i / 2)] = nullptr;
        }
        int left = 0;
        for (const auto& object : items) {
            if (const auto* item = dynamic_cast<const CKvr_CBE_ModelDataItem*>(object.get())) {
                ++left;
                EXPECT_EQ(item->branch, CString::number(item->type));
                EXPECT_TRUE(std::isnan(item->second));
            }
        }
        EXPECT_EQ(left, 666);
    }
}
