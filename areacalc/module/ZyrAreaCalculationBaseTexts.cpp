#include "areacalc/module/ZyrAreaCalculationBaseTexts.h"

#include <iterator>

namespace {

struct Text {
    unsigned int id;
    const wchar_t* wording;
};

constexpr Text kTexts[] = {
    // Class display names and their descriptions.
    {29007, L"Area"},
    {28957, L"A named closed outline, with holes, whose area and perimeter are calculated"},
    {28987, L"Area Group"},
    {28958, L"A group of areas and other groups whose values are added up"},
    {28988, L"Area Group Definition"},
    {28959, L"A template tree from which area groups are made"},
    {29008, L"Area Group Style"},
    {28960, L"Settings shared by the area groups of one kind"},
    {28990, L"Area Modifier"},
    {28961, L"A formula applied to an area value, such as 50% under a sloping roof"},
    {28992, L"Area Proposal Names"},
    {28962, L"A list of names proposed for areas and area groups"},
    {29010, L"Area Style"},
    {28963, L"Settings shared by the areas of one kind"},
    {28989, L"Area Group Definitions"},
    {29009, L"Area Group Styles"},
    {28991, L"Area Modifiers"},
    {28993, L"Area Proposal Name Lists"},
    {29011, L"Area Styles"},
    {28994, L"Area Display Properties"},
    {28995, L"Area Proof Display Properties"},
    {28996, L"Area Group Display Properties"},
    {28997, L"Outline Display Properties"},
    {28998, L"Area"},
    {28999, L"Area Proof"},
    {29000, L"Area Group"},
    {29001, L"Outline"},
    {29818, L"Area 1:50"},
    {29817, L"Area 1:100"},
    {29820, L"Area Group 1:50"},
    {29819, L"Area Group 1:100"},
    {29004, L"Triangles and circular segments"},
    {29055, L"Area proof: the outline divided into numbered triangles and circular segments"},
    {29058, L"Area Calculation"},

    // Calculations.
    {29005, L"Area"},
    {28964, L"Calculates the area of each outline"},
    {29006, L"Perimeter"},
    {28965, L"Calculates the perimeter of each outline"},
    {28982, L"The area enclosed by the outline, holes subtracted"},
    {28983, L"The length of all rings of the outline, holes included"},
    {28975, L"Calculations"},
    {28984, L"Area proof"},
    {29017, L"Area"},
    {29027, L"Net area"},
    {29018, L"Perimeter"},
    {29028, L"Net perimeter"},

    // Default names.
    {29015, L"Area"},
    {28973, L"Area Group"},
    {28972, L"Group"},

    // Summary rows.
    {29026, L"Name"},
    {28986, L"Description"},
    {28974, L"Modifiers"},
    {28977, L"Proposal names"},
    {28978, L"Groups directly below"},
    {28979, L"Groups at all levels below"},
    {28980, L"Areas directly in the group"},
    {28981, L"Areas at all levels below"},
    {29029, L"Members"},
    {29048, L"Net area"},
    {29049, L"Net perimeter"},
    {29052, L"Invalid outline"},
    {29014, L"Formula"},
    {29025, L"Parameters"},
    {29050, L"AREA"},
    {29051, L"Proposed name"},
    {29057, L"No members"},

    // Schedule columns.
    {29038, L"Style"},
    {29034, L"Name"},
    {29030, L"Gross Area"},
    {29035, L"Net Area"},
    {29031, L"Gross Perimeter"},
    {29036, L"Net Perimeter"},
    {29033, L"Modifiers"},
    {29041, L"Style Notes"},
    {29039, L"Style Description"},
    {29040, L"Style Documents"},

    // Display components.
    {28985, L"Error symbol"},
    {28966, L"Outer boundary"},
    {29044, L"Inner boundary"},
    {28968, L"Area hatch"},
    {29045, L"Hole hatch"},
    {28967, L"Edges of added pieces"},
    {29043, L"Edges of subtracted pieces"},
    {28970, L"Labels of added pieces"},
    {29047, L"Labels of subtracted pieces"},
    {28969, L"Heights of added pieces"},
    {29046, L"Heights of subtracted pieces"},
    {29012, L"Side lengths"},
    {29023, L"Height lengths"},
    {29013, L"Boundary"},
    {29022, L"Hatch"},
    {29024, L"Marker"},
    {29021, L"Links to groups"},
    {28976, L"Links to areas"},

    // Migration: the new name of a style whose name was taken, from its name and old class.
    {29059, L"%1 (from %2)"},
};

} // namespace

size_t ZyrAreaCalculationBaseTexts::entryCount() { return std::size(kTexts); }

const ZyrTextResources::Table& ZyrAreaCalculationBaseTexts::table() {
    static const ZyrTextResources::Table texts = [] {
        ZyrTextResources::Table table;
        for (const Text& text : kTexts)
            table.emplace(text.id, text.wording);
        return table;
    }();
    return texts;
}

void ZyrAreaCalculationBaseTexts::registerTexts() { ZyrTextResources::registerTable(kAppName, table()); }

void ZyrAreaCalculationBaseTexts::unregisterTexts() { ZyrTextResources::unregisterTable(kAppName); }
