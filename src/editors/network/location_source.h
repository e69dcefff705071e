// The locations of the HD documents of the project, and requests about them. No address outlives a call: documents are
// known by their paths, and their views are asked for anew each time.
#pragma once

#include "editors/network/document.h"
#include "editors/network/location_kinds.h"

class CLocationSource
{
public:
    /// `view` asks in the name of `document`; both outlive this.
    CLocationSource(const CNetworkDoc& document, CView& view) : m_document(document), m_view(view) {}

    /// Copies the locations of every open HD document of the project, without lines that lack a branch or a chainage;
    /// of none when their editor is not there.
    std::vector<CMapLocation> Fetch() const;
    /// Paths of the open HD documents.
    QStringList Files() const;

    /// Asks the location's document to insert or to delete it (KsRequest); nothing when that has been closed.
    void Send(WPARAM request, const CMapLocation& location) const;
    /// Brings the location's line forward in its document, while that is open.
    void Show(const CMapLocation& location) const;

private:
    std::vector<CView*> HDViews() const;
    CView* FindView(const QString& file) const;

    const CNetworkDoc& m_document;
    CView& m_view;
};
