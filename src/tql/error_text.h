// Messages in English.
#pragma once

#include "tql/tql.h"

namespace tql {

std::string TermText(const TqlTerm& term);
/// Puts place, expected and found of a report together into its message.
void MakeMessage(TqlSyntaxError& report);
/// Why a file could not be read.
std::string ReasonText(std::error_code reason);

} // namespace tql
