#include "ks/fc/messages.h"

#include <map>
#include <string>

namespace {
CKsWindow* g_mainWindow = nullptr;
} // namespace

LRESULT CKsWindow::WindowProc(unsigned, WPARAM, LPARAM)
{
    return 0;
}

unsigned KsRegisterMessage(const char* name)
{
    constexpr unsigned FirstRegistered = 0xC000; // below it stand the numbers that a platform may use itself
    static std::map<std::string, unsigned, std::less<>> numbers;
    if (const auto known = numbers.find(name); known != numbers.end())
        return known->second;
    const unsigned number = FirstRegistered + unsigned(numbers.size());
    numbers.emplace(name, number);
    return number;
}

LRESULT KsSendMessage(CKsWindow* window, unsigned message, WPARAM wParam, LPARAM lParam)
{
    return window ? window->WindowProc(message, wParam, lParam) : 0;
}

CKsWindow* KsMainWindow()
{
    return g_mainWindow;
}

void KsSetMainWindow(CKsWindow* window)
{
    g_mainWindow = window;
}

namespace KsMessage {

unsigned SwitchBoard()
{
    static const unsigned number = KsRegisterMessage("KavoShellSwitchBoardSevice");
    return number;
}

unsigned BetweenEditors()
{
    static const unsigned number = KsRegisterMessage("KavoShellCommunicationBetweenEditors");
    return number;
}

unsigned ProjectManagement()
{
    static const unsigned number = KsRegisterMessage("KavoShellProjectManagement");
    return number;
}

unsigned ShowToolbar()
{
    static const unsigned number = KsRegisterMessage("KavoShellShowToolbar");
    return number;
}

unsigned HideToolbar()
{
    static const unsigned number = KsRegisterMessage("KavoShellHideToolbar");
    return number;
}

unsigned ProjectMapChanged()
{
    static const unsigned number = KsRegisterMessage("KSM_VISUAL_PROJECT_MAP_CHANGED");
    return number;
}

} // namespace KsMessage
