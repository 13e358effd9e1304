// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <memory>
#include <string>
#include <utility>
#include <vector>

#include <olvane.h>

#include <olvane/host/LayoutText.h>
#include <support/CaseFile.h>

namespace unit {

// The number with which the callbacks of a CallbackHost fail.
constexpr int kHostCode = 77;

// A case's data source behind eight C callbacks. Where the case says that a call throws, it returns
// kHostCode.
class CallbackHost {
public:
    explicit CallbackHost(support::CaseFile family, bool recordTrace = false);

    olvane_host callbacks();

    support::CaseHost source;
};

struct LayoutDeleter {
    void operator()(olvane_layout* layout) const { olvane_layout_free(layout); }
};
typedef std::unique_ptr<olvane_layout, LayoutDeleter> LayoutPointer;

// What one call gave.
struct Answer {
    olvane_status status;
    LayoutPointer layout;

    std::string text() const;
    std::vector<olvane_record> records() const;
    int hostCode() const;
};

Answer familyOf(const olvane_host& host, std::int64_t focus, const olvane_options* options = nullptr);
Answer pedigreeOf(const olvane_host& host, std::int64_t focus, const olvane_options* options = nullptr);

// The layout that a case asks for, through the C interface.
Answer layoutOf(const support::CaseFile& request);

// A C record as the reader of the result text states it.
olvane::LayoutRecord readerForm(const olvane_record& record);

}  // namespace unit
