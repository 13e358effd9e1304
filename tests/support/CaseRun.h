// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <functional>
#include <memory>
#include <string>
#include <vector>

#include <olvane/boundary/LayoutPieces.h>
#include <olvane/boundary/OlvaneViewerManagerWrapProtocol.h>
#include <olvane/boundary/TypedLayout.h>
#include <support/CaseFile.h>

namespace support {

// A case's data source under the engine's protocol.
class CaseManager : public OlvaneViewerManagerWrapProtocol {
public:
    explicit CaseManager(CaseFile family, bool recordTrace = false);
    explicit CaseManager(std::shared_ptr<const CaseFile> family, bool recordTrace = false);

    std::int64_t fatherForPersonWithID(std::int64_t personId) override;
    std::int64_t motherForPersonWithID(std::int64_t personId) override;
    std::vector<std::int64_t> spousesForPersonWithID(std::int64_t personId) override;
    std::vector<std::int64_t> childrenForPersonWithID(std::int64_t personId) override;
    bool isPreferredSpouse(std::int64_t personId, std::int64_t spouseId) override;
    bool isPersonDead(std::int64_t personId) override;
    std::string dateForPersonWithID(std::int64_t personId, bool isBirth) override;
    std::int32_t sexOfPersonWithID(std::int64_t personId) override;

    CaseHost host;
};

// The getParents of the bare adapter: a parent whom the host does not know stays at what the caller set.
DataAdapter::ParentsCallback bareParents(ViewerGlue& glue, OlvaneViewerManagerWrapProtocol& manager);

TreeSize treeSizeOf(const CaseFile& request);

// Lays a case out with the engine, and gives the lines that layout-case prints for it.
std::vector<std::string> runCase(const CaseFile& request, bool graph, bool trace);

// The result text alone.
std::string layoutText(const CaseFile& request);

// The same request with a typed layout out, its text included.
struct TypedRun {
    olvane::TypedLayout layout;
    std::vector<std::string> trace;  // the calls, as runCase prints them
    bool failed = false;             // the layout holds what came before
};
// look is called with the finished graph, if it is set.
TypedRun runTypedCase(const CaseFile& request,
                      const std::function<void(SharedTreeViewer::TreeViewLayouter&)>& look = {});

// Lines with their ends, as they are printed.
std::string joinLines(const std::vector<std::string>& lines);

}  // namespace support
