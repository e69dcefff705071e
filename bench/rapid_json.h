// The same records through a general JSON library, for comparison.
#pragma once

#include "hand_coded.h"

void WriteJson(const std::vector<PlainRecord>& records, const std::string& path);
std::vector<PlainRecord> ReadJsonDom(const std::string& path);
std::vector<PlainRecord> ReadJsonSax(const std::string& path);
