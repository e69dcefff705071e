// What a document or a file tells other editors, as exchange items. Nothing is changed by it.
#pragma once

#include "data/hd_parameters.h"
#include "ks/fc/exchange.h"

#include <memory>

/// The lines of the exchanged tables, incomplete ones included, in the order of the type codes and of the lists.
std::unique_ptr<CObList> DataItems(HD_Parameters& parameters);
/// Titles and locations of the user-defined marks.
std::unique_ptr<CObList> MarkItems(HD_Parameters& parameters);
/// The maps to be written.
std::unique_ptr<CObList> MapItems(HD_Parameters& parameters);
