#pragma once

#include <string>
#include <vector>

namespace marlowbeck {

// Names as people type them, in code page 1252: with blanks round them, too long, in other
// capitals, with all that a keyboard has, some of which no file can be named for.

inline const std::vector<std::string> kTeamReplies = {
    "Rovers",
    "ROVERS",
    "  Hawks ",
    "O'Hara's \"Best\", II",
    "Caf\xe9 & Bar",
    "CAF\xc9 & BAR",
    "123456789012345678901234567890",
    "123456789012345678901234567890 more",
    "      ",
    "",
    "Lions/2\\3:*?",
    "Foxes",
    "Bears",
    "Oxen",
};
inline const std::vector<std::string> kGradeReplies = {
    "Premier",    "PREMIER", " A Grade  ", "A/B", "\"First\", Caf\xe9",   "Twenty-one characters",
    "  Reserves", "",        "   ",        "C",   "Twenty-one character",
};
inline const std::vector<std::string> kSurnames = {"Archer",
                                                   "Cole",
                                                   " Cole ",
                                                   "O'Hara, \"Flo\"",
                                                   "de la M\xfclle",
                                                   "x/y",
                                                   "Anderson-Featherstonehaugh-Wychwood"};
inline const std::vector<std::string> kFirstNames = {"Jo", "Di", "D, J", "Al \"Ace\""};

}  // namespace marlowbeck
