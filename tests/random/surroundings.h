#pragma once

#include "tests/random/stage.h"

#include <array>
#include <map>

namespace kota::random_user {

// What the editor offers to a user, found out by looking at it, so that a new page is played with as soon as
// it is there.
struct Surroundings {
    // The captions of the tabs: those with a control of their own, and the others.
    std::vector<std::string> tabs;
    std::vector<std::string> emptyTabs;
    // By dialog and control number of a grid, its document's list (a place in listsOf), for grids whose lines
    // are the records of one.
    std::map<std::pair<UINT, UINT>, std::size_t> listOfGrid;

    // Which kinds of controls the pages have.
    bool hasButtons = false;
    bool hasComboBoxes = false;

    // Whether there is anything to take an action of that verb.
    bool mayBeTaken(Verb verb) const;
    // None where the lines of the grid are not known to be records.
    const CObList* listOf(const CPropertyPage& page, const CGXGridCore& grid,
                          const CKota0_adDoc& document) const;
};

// The lists of a document, in its order.
std::array<const CObList*, 12> listsOf(const CKota0_adDoc& document);

// Looks around in a new document.
Surroundings lookAround();

} // namespace kota::random_user
