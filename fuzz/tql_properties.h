// What must hold for every text whatsoever.
#pragma once

#include <string>

/// Loads `text` and checks: after an error the structure is empty and the report is complete; a text that loads is
/// written, loaded and written again without any change of content. Empty when all holds, otherwise what does not.
std::string CheckTextProperties(const std::string& text);
