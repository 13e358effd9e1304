// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Reads a result text: the whole one strictly, one that was cut by a failure up to where it was cut.

#include <olvane/host/LayoutText.h>

#include <iostream>

int main() {
    const std::string whole = "17:27:0:0:55,-15,55,-15|55,0,55,-15|;-1:-12:-110:0::M:17;";
    for (const olvane::LayoutRecord& record : olvane::readLayoutText(whole)) {
        std::cout << record.id << " at " << record.x << ", " << record.y;
        if (record.addNode) std::cout << ", the unknown parent of " << record.addNode->childId;
        std::cout << "\n";
    }

    const std::string cut = whole.substr(0, 45);
    const olvane::LayoutReading reading = olvane::readWholeRecords(cut);
    std::cout << reading.records.size() << " whole, then " << reading.cut->what() << "\n";
}
