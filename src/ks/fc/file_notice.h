// What there is to say of a document's file, as the bar above its views shows it.
#pragma once

#include "ks/fc/types.h"

#include <functional>
#include <vector>

class CKsFileBar;

/// A button of a notice.
struct KsNoticeAction
{
    CString label; // in the user's language
    /// The bar is where a dialog belongs to.
    std::function<void(CKsFileBar& bar)> run;
};

/// What the user should know, and what he may do about it. It is made anew whenever it is shown, so its texts are in
/// the language of that moment, and it is gone when whoever has made it no longer does.
struct KsFileNotice
{
    CString text; // plain, may have several lines
    std::vector<KsNoticeAction> actions{};
    /// The user has read it; null for what has to stay in sight.
    std::function<void()> close{};
};

/// Appends what somebody has to say at present.
using KsNoticeSource = std::function<void(std::vector<KsFileNotice>& notices)>;
