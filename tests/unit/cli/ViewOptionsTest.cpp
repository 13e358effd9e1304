// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The rows that the page and the bindings are tried with as well: the options of each view, and what is written into a
// page for them.

#include <gtest/gtest.h>

#include <cli/UsageError.h>
#include <cli/ViewOptions.h>
#include <CLI/CLI.hpp>
#include <algorithm>
#include <fstream>
#include <nlohmann/json.hpp>
#include <string>
#include <vector>

#include <olvane/charts/Charts.h>

namespace olvane::cli {
namespace {

using nlohmann::json;

json fixture(const std::string& name) {
    return json::parse(std::ifstream(OLVANE_FIXTURES "/" + name));
}

// Parses backwards, as CLI11 has it.
void parse(CLI::App& command, std::vector<std::string> arguments) {
    std::reverse(arguments.begin(), arguments.end());
    command.parse(arguments);
}

bool takes(const std::string& view, const std::vector<std::string>& arguments) {
    CLI::App command;
    LayoutRequest request;
    addViewOptions(command, request, "");
    std::vector<std::string> all{"--view", view};
    if (view == "kinship") all.insert(all.end(), {"--to", "1"});
    all.insert(all.end(), arguments.begin(), arguments.end());
    parse(command, all);
    try {
        completeViewOptions(command, request);
        return true;
    } catch (const UsageError&) {
        return false;
    }
}

TEST(ViewsFixture, viewsHaveTheNumbersAndNamesOfTheRows) {
    const json views = fixture("views.json")["views"];
    for (std::size_t i = 0; i < views.size(); ++i)
        EXPECT_EQ(charts::nameOf(static_cast<charts::View>(i)), views[i]["name"]);
    EXPECT_STREQ(charts::nameOf(static_cast<charts::View>(views.size())), "");
}

TEST(ViewsFixture, aViewTakesTheOptionsOfItsRowAndNoOthers) {
    const std::vector<std::pair<std::string, std::vector<std::string>>> options = {
        {"up", {"--up", "2"}},
        {"down", {"--down", "2"}},
        {"direction", {"--direction", "left"}},
        {"compact", {"--compact"}}};
    const json all = fixture("views.json");  // outlives the loop
    for (const json& row : all["views"]) {
        const std::vector<std::string> taken = row["command"];
        for (const auto& [name, arguments] : options) {
            const bool isTaken = std::find(taken.begin(), taken.end(), name) != taken.end();
            EXPECT_EQ(takes(row["name"], arguments), isTaken) << row["name"] << " " << name;
        }
    }
}

// As JavaScript and Python state it.
TEST(RefusalsFixture, whatAnOptionDoesNotTakeIsStatedWithItsNameAndBounds) {
    const json all = fixture("refusals.json");  // outlives the loop
    for (const json& row : all["rows"]) {
        const std::vector<std::string> arguments = row["command"];
        CLI::App command;
        LayoutRequest request;
        addViewOptions(command, request, "");
        try {
            parse(command, arguments);
            ADD_FAILURE() << row;
        } catch (const CLI::Error& error) {
            const std::string message = error.what();
            EXPECT_NE(message.find(arguments[0]), std::string::npos) << message;
            for (const std::string text : row["states"])
                EXPECT_NE(message.find(text), std::string::npos) << message;
        }
    }
}

TEST(AddressesFixture, aPageGetsTheAddressOfTheRow) {
    const json all = fixture("addresses.json");  // outlives the loop
    for (const json& row : all["rows"]) {
        CLI::App command;
        LayoutRequest request;
        addPageViewOptions(command, request);
        parse(command, row["arguments"]);
        completeViewOptions(command, request);
        EXPECT_EQ(pageAddressOf(command, request), row["address"]);
    }
}

}  // namespace
}  // namespace olvane::cli
