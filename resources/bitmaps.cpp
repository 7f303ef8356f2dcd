#include "resources/bitmaps.h"

#include "resources/ids.h"

namespace {

// clang-format off
constexpr const char* toolBarRows[] = {
    "32 15 5 1",
    ". c None",
    "k c #37474f",
    "b c #1565c0",
    "g c #2e7d32",
    "w c #ffffff",
    "................................",
    "......k...............k...gg....",
    "...kkkkkkk.........kkkkkkkgggg..",
    "..kkkwwwkkk.......kkkwwwkkggggg.",
    "..kkwwwwwkk.......kkwwwwwkgggg..",
    "..kwwwwwwwk.......kwwwwwwwgg....",
    ".kkwwwwwwwkk.....kkwwwwwwwkk....",
    "..kwwwwwwwk.......kwwwwwwwk.....",
    "..kkwwwwwkk.......kkwwwwwkk.....",
    "..kkkwwwkbb.......kkkwwwkbb.....",
    "...kkkkkkbbb.......kkkkkkbbb....",
    "......k...bbb.........k...bbb...",
    "...........bbb.............bbb..",
    "............bb..............bb..",
    "................................",
};

constexpr const char* editorRows[] = {
    "16 15 5 1",
    ". c None",
    "k c #37474f",
    "b c #1565c0",
    "g c #2e7d32",
    "w c #ffffff",
    "................",
    ".......gg.......",
    ".......gg.......",
    "......gggg......",
    "......gggg......",
    "......gwgg......",
    "......gggg......",
    ".......gg.......",
    "......bb.......b",
    "b....bbbbb....bb",
    "bbbbbb...bbbbbb.",
    ".bbbkk....bbbkk.",
    "...kkkkk....kkkk",
    "kkkk...kkkkkk...",
    "kk......kkk.....",
};

constexpr const char* documentRows[] = {
    "32 32 5 1",
    ". c None",
    "k c #37474f",
    "b c #1565c0",
    "g c #2e7d32",
    "w c #ffffff",
    "................................",
    ".....kkkkkkkkkkkkkkkk...........",
    ".....kwwwwwwwwwwwwwwwk..........",
    ".....kwwwwwwwwwwwwwwkwk.........",
    ".....kwwwwwwwwwwwwwwkkwk........",
    ".....kwwwwwwwwwwwwwwkkkwk.......",
    ".....kwwwwwwwwwggwwwkkkkwk......",
    ".....kwwwwwwwwwggwwwkkkkkwk.....",
    ".....kwwwwwwwwggggwwwwwwwwk.....",
    ".....kwwwwwwwwggggwwwwwwwwk.....",
    ".....kwwwwwwwwggggwwwwwwwwk.....",
    ".....kwwwwwwwggggggwwwwwwwk.....",
    ".....kwwwwwwwggggggwwwwwwwk.....",
    ".....kwwwwwwggggggggwwwwwwk.....",
    ".....kwwwwwwggwgggggwwwwwwk.....",
    ".....kwwwwwwgwwwggggwwwwwwk.....",
    ".....kwwwwwwggwgggggwwwwwwk.....",
    ".....kwwwwwwwggggggwwwwwwwk.....",
    ".....kwwwwwwwwggggwwwwwwwwk.....",
    ".....kwwwwwwwwwwwwwwwwwwwwk.....",
    ".....kwbwwwwwwwbbwwwwwwwbwk.....",
    ".....kwbbwwwwwbbbbwwwwwbbwk.....",
    ".....kwwbbbwwbbwwbbbwwbbwwk.....",
    ".....kwwwbbbbbwwwwbbbbbwwwk.....",
    ".....kwbwwwbbwwbbwwwbbwwbwk.....",
    ".....kwbbwwwwwbbbbwwwwwbbwk.....",
    ".....kwwbbbwwbbwwbbbwwbbwwk.....",
    ".....kwwwbbbbbwwwwbbbbbwwwk.....",
    ".....kwwwwwbbwwwwwwwbbwwwwk.....",
    ".....kwwwwwwwwwwwwwwwwwwwwk.....",
    ".....kkkkkkkkkkkkkkkkkkkkkk.....",
    "................................",
};

constexpr const char* applicationRows[] = {
    "32 32 4 1",
    ". c None",
    "b c #1565c0",
    "g c #2e7d32",
    "w c #ffffff",
    "................................",
    "............bbbbbbbb............",
    ".........bbbbwwwwwwbbbb.........",
    "........bbwwwwwggwwwwwbb........",
    "......bbwwwwwwwggwwwwwwwbb......",
    ".....bbwwwwwwwwggwwwwwwwwbb.....",
    "....bbwwwwwwwwggggwwwwwwwwbb....",
    "....bwwwwwwwwwggggwwwwwwwwwb....",
    "...bwwwwwwwwwggggggwwwwwwwwwb...",
    "..bbwwwwwwwwwggggggwwwwwwwwwbb..",
    "..bwwwwwwwwwwggggggwwwwwwwwwwb..",
    "..bwwwwwwwwwggggggggwwwwwwwwwb..",
    ".bbwwwwwwwwwggggggggwwwwwwwwwbb.",
    ".bwwwwwwwwwggwwggggggwwwwwwwwwb.",
    ".bwwwwwwwwwggwwwgggggwwwwwwwwwb.",
    ".bwwwwwwwwwwgwwgggggwwwwwwwwwwb.",
    ".bwwwwwwwwwwggggggggwwwwwwwwwwb.",
    ".bwwwwwwwwwwwggggggwwwwwwwwwwwb.",
    ".bwwwwwwwwwwwwwggwwwwwwwwwwwwwb.",
    ".bbwwwwbbbwwwwwwwwbbbwwwwwwwwbb.",
    "..bwwwbbbbbwwwwwwbbbbbbwwwwwbb..",
    "..bwwbbwwwbbbwwwbbwwwbbbwwwbwb..",
    "..bbbbwwwwwbbbbbbwwwwwwbbbbbbb..",
    "...bwwwbbbwwwbbbwwbbbwwwbbbwb...",
    "....bwbbbbbwwwwwwbbbbbbwwwwb....",
    "....bbwwwwbbbwwwbbwwwbbbwwbb....",
    ".....bbwwwwbbbbbbwwwwwwbwbb.....",
    "......bbwwwwwbbbwwwwwwwwbb......",
    "........bbwwwwwwwwwwwwbb........",
    ".........bbbbwwwwwwbbbb.........",
    "............bbbbbbbb............",
    "................................",
};
// clang-format on

constexpr kota::BitmapResource allBitmaps[] = {{MenuId::Document, toolBarRows},
                                               {MenuId::EditorBitmap, editorRows}};
constexpr kota::BitmapResource allIcons[] = {{MenuId::Document, documentRows},
                                             {MenuId::Accelerators, applicationRows}};

} // namespace

std::span<const kota::BitmapResource> bitmaps() {
    return allBitmaps;
}
std::span<const kota::BitmapResource> icons() {
    return allIcons;
}
