// What must hold for every text whatsoever that a reader of the product is given. Each of these reads from memory,
// keeps nothing behind, and answers with what does not hold; empty when all does.
#pragma once

#include <string>

/// After an error the structure is empty and the report is complete; a text that loads is written, loaded and written
/// again without any change of content.
std::string CheckTql(const std::string& text);

// Files: what is read can be written and read again, loses nothing on that way, and becomes the same text. A value of
// the first text that does not stand in it was reported.
std::string CheckHDFile(const std::string& text);
std::string CheckNetworkFile(const std::string& text);
std::string CheckSectionFile(const std::string& text);
std::string CheckProjectFile(const std::string& text);

/// A recovery file is what was written to the last byte, or none.
std::string CheckRecovery(const std::string& text);
/// A pasted table can be copied and pasted again.
std::string CheckTable(const std::string& text);
