#include "ks/fc/exports.h"

#include <vector>

namespace {

std::vector<std::function<QFunctionPointer(const char*)>>& Resolvers()
{
    static std::vector<std::function<QFunctionPointer(const char*)>> resolvers;
    return resolvers;
}

} // namespace

void KsAddExports(std::function<QFunctionPointer(const char*)> resolver)
{
    Resolvers().push_back(std::move(resolver));
}

void KsClearExports()
{
    Resolvers().clear();
}

QFunctionPointer KsFindExport(const char* name)
{
    for (const auto& resolve : Resolvers()) {
        if (const QFunctionPointer function = resolve(name))
            return function;
    }
    return nullptr;
}
