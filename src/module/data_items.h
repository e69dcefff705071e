// What a document or a file tells other editors, as exchange items. Nothing is changed by it.
#pragma once

#include "data/hd_parameters.h"
#include "ks/fc/exchange.h"

#include <memory>

class CKavo0_hdDoc;

/// What is told, and the document that it belongs to: the lines which its pages only show are left out. The content of
/// a file belongs to none.
struct HDContent
{
    HD_Parameters& parameters;
    const CKavo0_hdDoc* document = nullptr;
};

/// The lines of the exchanged tables, incomplete ones included, in the order of the type codes and of the lists.
std::unique_ptr<CObList> DataItems(const HDContent& content);
/// Titles and locations of the user-defined marks.
std::unique_ptr<CObList> MarkItems(const HDContent& content);
/// The maps to be written.
std::unique_ptr<CObList> MapItems(const HDContent& content);
