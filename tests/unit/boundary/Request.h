// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <memory>
#include <string>
#include <utility>
#include <vector>

#include <olvane/boundary/LayoutPieces.h>
#include <support/CaseRun.h>

namespace unit {

// The frame of a request around a family, with the calls that reach its data source. The negative ids start
// at -1. Persons are named by the host's ids; key and idText translate.
class Request {
public:
    explicit Request(support::CaseFile family)
        : manager(std::make_shared<support::CaseManager>(std::move(family), true)),
          source(manager),
          callbacks(glue, source) {
        olvane::resetAddParentId();
    }

    int key(support::PersonId id) { return glue.getKeyFromPerson(std::to_string(id)); }
    std::string idText(int key) const { return glue.personOfKey(key); }

    // The calls since the last time this was asked, each "<operation> <arguments>".
    std::vector<std::string> newCalls() {
        std::vector<std::string> calls;
        const std::vector<std::string>& lines = manager->host.trace();
        for (; input < lines.size(); ++input)
            calls.push_back(lines[input].substr(std::string("call ").size()));
        return calls;
    }

    std::shared_ptr<support::CaseManager> manager;
    std::shared_ptr<OlvaneViewerManagerWrapProtocol> source;
    ViewerGlue glue;
    olvane::HostCallbacks callbacks;

private:
    std::size_t input = 0;
};

typedef std::vector<std::string> Calls;

// What the work throws, as text; empty when it throws nothing. Only the named kind of exception is taken.
template <class Exception, class Work>
std::string failureOf(Work work) {
    try {
        work();
    } catch (const Exception& failure) {
        return failure.what();
    }
    return std::string();
}

inline constexpr char kUnknownKeyFailure[] = "Unable to find key in unordered_map.";
inline constexpr char kEmptyFunctionFailure[] = "call to empty boost::function";

}  // namespace unit
