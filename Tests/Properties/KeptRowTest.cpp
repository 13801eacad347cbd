// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Decode/Rows/KeptRow.h"
#include "Fuzz/PropertyLists/SameValue.h"
#include "LogGenerator/Extra/ExtraPayload.h"
#include "LogGenerator/GSM/AssertionFailure.h"
#include "LogGenerator/Observations/Catalogue.h"
#include "Tests/LogGenerator/Observations/DecodedTechnology.h"
#include "Tests/LogGenerator/Observations/RandomMessages.h"

#include <gtest/gtest.h>

#include <rapidcheck/gtest.h>

#include <algorithm>
#include <cstdint>
#include <string>
#include <vector>

// Cells that are kept from row to row, of a display of which nothing but the selected paths is written, are
// those that the paths lead to in the whole display; and so is what a selection leaves of it.

namespace velmora {
namespace {

/// Paths of all kinds: to what any technology shows, to lists and groups, with row numbers or "*" in any
/// place, and to nothing.
rc::Gen<std::string> anyPath(const std::vector<std::string>& leaves) {
    return rc::gen::exec([&leaves] {
        std::string path = *rc::gen::elementOf(leaves);
        const auto parts = [&path] { return std::count(path.begin(), path.end(), '/'); };
        for (auto cut = *rc::gen::weightedElement<int>({{5, 0}, {2, 1}, {1, 2}}); cut > 0 && parts() > 1;
             --cut)
            path.resize(path.rfind('/'));
        std::string changed;
        for (std::size_t at = 0; at < path.size();) {
            const std::size_t end = std::min(path.find('/', at + 1), path.size());
            const std::string part = path.substr(at, end - at);
            const int choice = *rc::gen::inRange(0, 12);
            if (part == "/*" && choice < 9)
                changed += "/" + std::to_string(choice % 3);
            else
                changed += choice == 11 ? "/*" : part;
            at = end;
        }
        return *rc::gen::weightedElement<std::string>({{20, changed}, {1, changed + "/x"}, {1, "/"}});
    });
}

class KeptRows : public testing::TestWithParam<DecodedTechnology> {
protected:
    static constexpr int messages = 60;

    KeptRows() {
        const auto scenario = scenarioKindNamed(GetParam().scenario)->make(1);
        for (Data& each : drive)
            each = scenario->next().message;
    }

    /// False where the decoder refuses the message.
    static bool update(TechnologyUnderTest& tested, const Data& message) {
        try {
            tested.decoder().updateState(tested.state, message);
            return true;
        } catch (const LogCode_0xFF0000::UnknownDataException&) {
            return false;
        } catch (const AssertionFailure&) {
            return false;
        }
    }
    static std::vector<std::string> leaves() {
        TechnologyUnderTest tested(GetParam());
        std::vector<std::string> paths;
        for (const CatalogueField& leaf : tested.decoder().catalogue().fields())
            paths.push_back(leaf.path);
        return paths;
    }

    std::vector<Data> drive{500};
};

TEST_P(KeptRows, AreRowsMadeAfresh) {
    const std::vector<std::string> paths = leaves();
    rc::detail::checkGTest([this, &paths] {
        const NodeSelection selection(
            *rc::gen::nonEmpty(rc::gen::container<std::vector<std::string>>(anyPath(paths))));
        const CSVGuard guard = *rc::gen::element(CSVGuard::Off, CSVGuard::On);
        TechnologyUnderTest limited(GetParam());
        TechnologyUnderTest whole(GetParam());
        selection.limit(limited.decoder());
        KeptRow kept(selection, guard, limited.decoder());
        CellWriter afresh(guard);
        RandomMessages random(whole.decoder(), drive, *rc::gen::arbitrary<std::uint64_t>().as("seed"));
        std::size_t next = *rc::gen::inRange<std::size_t>(0, drive.size());
        for (int i = 0; i < messages; ++i) {
            // A drive's own messages fill the display, so that others have something to change.
            const Data message = i % 3 == 0 ? random.next() : drive[next++ % drive.size()];
            RC_ASSERT(update(whole, message) == update(limited, message));
            TextBuffer expected;
            afresh.appendAll(expected, whole.decoder().display(whole.state), selection);
            RC_ASSERT(kept.cells(limited.state) == expected.view());
        }
        RC_ASSERT(sameValue(selection.restricted(limited.decoder().display(limited.state)),
                            selection.restricted(whole.decoder().display(whole.state))));
    });
}

INSTANTIATE_TEST_SUITE_P(Technologies, KeptRows, testing::ValuesIn(decodedTechnologies),
                         [](const auto& decoded) { return std::string(decoded.param.scenario); });

} // namespace
} // namespace velmora
