// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <memory>

#include <olvane/Export.h>
#include <olvane/boundary/CheckedLayout.h>
#include <olvane/boundary/OlvaneViewerManagerWrapProtocol.h>
#include <olvane/charts/ViewRequest.h>
#include <olvane/charts/Views.h>
#include <olvane/picture/Picture.h>

namespace olvane::charts {

// A picture, and how its making ended. After a failure the picture is empty.
struct CheckedPicture : CheckedOutcome {
    picture::Picture picture;
};

// The picture of any view of a host, as pictureOfHost makes it, with a failure reported instead of thrown. Answers are
// checked and nested calls refused as by checkedLayout; options that a view has no use for are checked as well.
//
//     olvane::charts::ViewRequest request;
//     request.chart.view = olvane::charts::View::hourglass;
//     const auto hourglass = olvane::charts::checkedPicture(source, 17, request);
//     if (!hourglass.isOk()) std::cerr << hourglass.reason.text() << '\n';
//
// other is asked for by the kinship view only: one who is not connected with the focus is an invalidPerson.
// Fails: never with an exception.
// Threads: as checkedLayout.
OLVANE_API CheckedPicture checkedPicture(const std::shared_ptr<OlvaneViewerManagerWrapProtocol>& host,
                                         std::int64_t focus, const ViewRequest& request,
                                         std::int64_t other = 0) noexcept;

}  // namespace olvane::charts
