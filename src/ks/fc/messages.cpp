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
    static std::map<std::string, unsigned> numbers;
    return numbers.try_emplace(name, FirstRegistered + unsigned(numbers.size())).first->second;
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
