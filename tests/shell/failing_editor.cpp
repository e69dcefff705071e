// An editor that fails as it is loaded (FAILS_AT_LOAD: how), or at every question.
#include "ks/fc/plugin.h"

#include <chrono>
#include <cstdlib>
#include <stdexcept>
#include <thread>

#ifdef FAILS_AT_LOAD
namespace {

const bool failed = [] {
    FAILS_AT_LOAD;
    return true;
}();

} // namespace
#endif

#pragma GCC diagnostic ignored "-Wunused-parameter"
#define KS_PLUGIN_FAILS(result, name, arguments)                                                                       \
    result name arguments                                                                                              \
    {                                                                                                                  \
        throw 42;                                                                                                      \
    }
extern "C" {
KS_PLUGIN_FUNCTIONS(KS_PLUGIN_FAILS)
}
