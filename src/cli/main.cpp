#include "cli/hdkv.h"
#include "cli/open_file.h"
#include "files/platform_process.h"

#include <cstdlib>
#include <exception>
#include <new>

namespace {

[[noreturn]] void Terminate()
{
    try {
        if (const std::exception_ptr thrown = std::current_exception())
            std::rethrow_exception(thrown);
    } catch (const std::bad_alloc&) {
        std::_Exit(ComplainNoMemory());
    } catch (...) {
    }
    std::abort();
}

// Memory may also end before main, where nothing catches.
[[maybe_unused]] const std::terminate_handler usual = std::set_terminate(Terminate);

} // namespace

int main(int argc, char** argv)
{
    argv = SpeakUtf8(argc, argv);
    IgnoreFileSizeSignal();
    return Hdkv(argc, argv);
}
