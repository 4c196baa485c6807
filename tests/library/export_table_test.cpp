// What the DLL offers and what it needs.
#include "pe_image.h"
#include "support/import_spy.h"

#include <gtest/gtest.h>

#include <cstdio>
#include <cstring>
#include <fstream>
#include <sstream>

namespace kortest {
namespace {

using Ordinals = std::map<std::string, int>;

// The names and ordinals of the module definition file; lines that begin with ";" do not exist.
Ordinals DefinedExports() {
    Ordinals ordinals;
    std::ifstream file(KORCONTROLS_DEF_FILE);
    EXPECT_TRUE(file.is_open()) << KORCONTROLS_DEF_FILE;
    bool isInExports = false;
    for (std::string line; std::getline(file, line);) {
        std::istringstream words(line.substr(0, line.find(';')));
        std::string name, ordinal;
        words >> name >> ordinal;
        if (name == "EXPORTS") {
            isInExports = true;
        } else if (isInExports && !name.empty()) {
            EXPECT_EQ(ordinal.substr(0, 1), "@") << line;
            ordinals[name] = std::stoi(ordinal.substr(1));
        }
    }
    return ordinals;
}

TEST(ExportTable, HoldsWhatTheDefinitionFileSays) {
    const Ordinals defined = DefinedExports();
    ASSERT_GE(defined.size(), 28u);
    EXPECT_EQ(ExportOrdinals(LibraryModule()), defined);
}

TEST(ExportTable, HasUndecoratedNamesAndFixedOrdinals) {
    const Ordinals exported = ExportOrdinals(LibraryModule());
    for (const auto& [name, ordinal] : exported) {
        EXPECT_EQ(name.find_first_of("@#?"), std::string::npos) << name;
        EXPECT_EQ(GetProcAddress(LibraryModule(), name.c_str()),
                  GetProcAddress(LibraryModule(), MAKEINTRESOURCEA(ordinal)))
            << name;
    }
    EXPECT_EQ(exported.at("KORCONTROLS_Version"), 1);
    EXPECT_EQ(exported.at("RegisterGridControl"), 2);
    EXPECT_EQ(exported.at("ResetGrid"), 5);
    EXPECT_EQ(exported.at("PressOKButton"), 30);
    EXPECT_EQ(exported.at("InitFunkyControl"), 4);
    EXPECT_EQ(exported.at("KorListView_UpdateItem"), 34);
    EXPECT_EQ(exported.at("KorListView_GetIndexFromCurrentPosition"), 35);
    EXPECT_EQ(exported.at("KorListView_DeleteAll"), 36);
    EXPECT_EQ(exported.at("KorListView_GetSelection"), 37);
    EXPECT_EQ(exported.at("KorTreeView_AddItem"), 38);
}

TEST(ImportTable, NamesThePlatformsLibrariesOnly) {
    EXPECT_EQ(ImportedLibraries(LibraryModule()),
              (std::set<std::string>{"comctl32.dll", "gdi32.dll", "kernel32.dll", "msvcrt.dll",
                                     "user32.dll"}));
}

// A BITMAPINFOHEADER, then sixteen colours: the platform's standard ones, which every display has.
TEST(Resources, HoldTheFunctionBarsArrow) {
    const std::string bytes = ResourceBytes(LibraryModule(), 107, 2);
    ASSERT_GE(bytes.size(), sizeof(BITMAPINFOHEADER));
    BITMAPINFOHEADER header{};
    memcpy(&header, bytes.data(), sizeof header);
    EXPECT_EQ(header.biWidth, 13);
    EXPECT_EQ(header.biHeight, 8);
    EXPECT_EQ(header.biBitCount, 4);
    EXPECT_EQ(bytes.size(), sizeof header + 16 * sizeof(RGBQUAD) + 8 * 8);
}

}  // namespace
}  // namespace kortest
