// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <functional>
#include <memory>
#include <string>

#include <olvane/Export.h>
#include <olvane/boundary/OlvaneViewerManagerWrapProtocol.h>
#include <olvane/boundary/TypedLayout.h>

namespace olvane {

enum class CheckedStatus : std::uint8_t {
    ok,
    invalidArgument,  // no data source, or an option out of its range
    invalidPerson,    // the focus, or another person who was named, cannot be asked about
    hostFailed,       // an operation of the data source threw
    invalidId,        // an operation answered a number that is not 1 to 2147483647
    layoutFailed,     // the data leave no picture
    outOfMemory,
    nestedCall  // asked within an operation of a checked call that is running on this thread
};

// The data source's operations, in the order of their declaration.
enum class HostOperation : std::uint8_t {
    none,
    father,
    mother,
    spouses,
    children,
    isPreferredSpouse,
    isPersonDead,
    date,
    sex
};

// The operation's name in the data source: "fatherForPersonWithID". Empty for none.
OLVANE_API const char* nameOf(HostOperation operation);

// What went wrong, where, and why.
//
// Holds: operation and person are set where a data source failed or answered a wrong number; person alone where an id
//        that the caller passed in is refused, else 0. cause is in English, without a full stop; it is empty after ok, and
//        may be after outOfMemory.
struct FailureReason {
    HostOperation operation = HostOperation::none;
    std::int64_t person = 0;
    std::string cause;

    // "childrenForPersonWithID(17): the database is closed".
    OLVANE_API std::string text() const;
};

struct CheckedOutcome {
    CheckedStatus status = CheckedStatus::ok;
    FailureReason reason;

    bool isOk() const { return status == CheckedStatus::ok; }
};

// A layout, and how its making ended. After a failure the layout holds what was laid out so far: whole boxes, and a text
// whose last record may be cut.
struct CheckedLayout : CheckedOutcome {
    TypedLayout layout;
};

// Lays out one view around one person, as layOut does, and reports a failure instead of throwing it. The text of the
// family view is that of FamilyViewLayout for the same answers.
//
//     const olvane::CheckedLayout family = olvane::checkedLayout(olvane::TypedLayout::View::family, 17, source);
//     if (!family.isOk()) std::cerr << family.reason.text() << '\n';
//
// The two lists of relatives are read whole before the first question about an entry.
// Fails: never with an exception.
// Nested: refused within an operation of another checked call. A call of the C library is not: it has an engine of its own,
//         so that neither disturbs the other.
// Threads: several calls may run at once, each with a data source of its own or one that is safe to share.
OLVANE_API CheckedLayout checkedLayout(TypedLayout::View view, std::int64_t focusId,
                                       const std::shared_ptr<OlvaneViewerManagerWrapProtocol>& source,
                                       const LayoutOptions& options = LayoutOptions()) noexcept;

// The guard by itself, for other work with a data source: hands it the source with each answer checked, and makes an
// outcome of whatever it throws. An std::invalid_argument of the work itself becomes invalidArgument.
typedef std::function<void(const std::shared_ptr<OlvaneViewerManagerWrapProtocol>&)> CheckedWork;
OLVANE_API CheckedOutcome checkedRun(const std::shared_ptr<OlvaneViewerManagerWrapProtocol>& source,
                                     std::int64_t focusId, const CheckedWork& work) noexcept;

}  // namespace olvane
