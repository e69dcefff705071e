#include "module/page_table.h"

#include "pages/init_page.h"

namespace {

template <typename Page>
std::unique_ptr<CGenPropertyPage> Make(CKavo0_hdDoc* document)
{
    return std::make_unique<Page>(document);
}

constexpr PageEntry Pages[] = {
    {&Make<CInitPage>, 1, true},
};

} // namespace

std::span<const PageEntry> PageTable()
{
    return Pages;
}
