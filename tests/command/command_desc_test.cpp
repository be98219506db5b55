#include <gtest/gtest.h>

#include <list>
#include <memory>
#include <stdexcept>
#include <string>

#include "vantorbase/command_desc.h"

namespace {
const std::wstring kRule(45, L'-');
}

TEST(CommandDesc, StartsEmptyAndKeepsThreeIndependentLists) {
    CommandDesc desc;
    EXPECT_EQ(desc.GetCommandNameW(), L"unknown");
    EXPECT_EQ(desc.GetCommandDescW(), L"");
    EXPECT_EQ(desc.GetParamCount() + desc.GetResultCount() + desc.GetEventCount(), 0);
    EXPECT_EQ(desc.GetParamAt(0), nullptr);

    desc.AddParam(L"level", 0, L"new level");
    desc.AddParam(std::string("level"), 5, L"same name");
    desc.AddResult(L"state", 3, L"outcome");
    desc.AddEvent(L"tick", -1, L"");
    EXPECT_EQ(desc.GetParamCount(), 2);
    EXPECT_EQ(desc.GetResultCount(), 1);
    EXPECT_EQ(desc.GetEventCount(), 1);
    EXPECT_EQ(desc.GetParamNameW(1), L"level");
    EXPECT_EQ(desc.GetParamType(0), 0);
    EXPECT_EQ(desc.GetParamType(1), 5);
    EXPECT_EQ(desc.GetParamTypeNameW(1), L"UNKNOWN");
    EXPECT_EQ(desc.GetEventType(0), -1);
    EXPECT_EQ(desc.GetEventTypeName(0), "UNKNOWN");
    EXPECT_EQ(desc.GetResultTypeName(0), "STRING ARRAY");
    EXPECT_EQ(desc.GetResultNameW(0), L"state");
    EXPECT_EQ(desc.GetResultDesc(0), "outcome");
    EXPECT_EQ(desc.GetParamAt(-1), nullptr);
    EXPECT_EQ(desc.GetParamAt(2), nullptr);
    ASSERT_NE(desc.GetEventAt(0), nullptr);
    EXPECT_EQ(desc.GetEventAt(0)->GetNameW(), L"tick");

    // Out-of-range indexes read no entry.
    EXPECT_EQ(desc.GetParamNameW(2), L"");
    EXPECT_EQ(desc.GetResultDesc(-1), "");
    EXPECT_EQ(desc.GetEventTypeNameW(7), L"UNKNOWN");
    EXPECT_EQ(desc.GetParamType(-1), -1);

    // GetAt walks whichever list it is given.
    std::list<CommandParamDesc*> foreign;
    CommandParamDesc mine(L"x", 1, L"d");
    foreign.push_back(&mine);
    EXPECT_EQ(desc.GetAt(&foreign, 0), &mine);
    EXPECT_EQ(desc.GetAt(&foreign, 1), nullptr);
    EXPECT_EQ(desc.GetAt(nullptr, 0), nullptr);
}

TEST(CommandDesc, ConvertsNarrowNamesThroughTheCodePage) {
    CommandDesc desc;
    desc.SetDesc(std::string("Caf\xE9"), L"d");
    EXPECT_EQ(desc.GetCommandNameW(), L"Caf\u00E9");
    desc.AddParam(std::string("n\xE9"), 0, L"");
    EXPECT_EQ(desc.GetParamNameW(0), L"n\u00E9");
    EXPECT_EQ(desc.GetParamName(0), "n\xE9");
    CommandParamDesc entry(std::string("\x80"), 4, L"euro");
    EXPECT_EQ(entry.GetNameW(), L"\u20AC");
    EXPECT_EQ(entry.GetTypeNameW(), L"OBSERVER");
    CommandParamDesc other(L"other", 1, L"o");
    other = entry;
    EXPECT_EQ(other.GetNameW(), L"\u20AC");
    EXPECT_EQ(other.GetType(), 4);
    EXPECT_EQ(other.GetDesc(), "euro");
}

TEST(CommandDesc, CopiesShareEverythingAndOutliveEachOther) {
    CommandDesc target;
    CommandParamDesc* entry = nullptr;
    {
        auto source = std::make_unique<CommandDesc>();
        source->AddParam(L"a", 0, L"first");
        target = *source;
        source->AddParam(L"b", 1, L"second");
        source->SetDesc(L"Shared", L"both see it");
        EXPECT_EQ(target.GetParamCount(), 2);
        entry = target.GetParamAt(1);
        CommandDesc copy(target);
        copy.AddResult(L"r", 0, L"");
        EXPECT_EQ(source->GetResultCount(), 1);
    }
    EXPECT_EQ(target.GetCommandNameW(), L"Shared");
    EXPECT_EQ(target.GetCommandDescW(), L"both see it");
    ASSERT_EQ(target.GetParamAt(1), entry);
    EXPECT_EQ(entry->GetNameW(), L"b");
    EXPECT_EQ(target.GetResultCount(), 1);
}

TEST(CommandDesc, RendersTheWorkedExampleCharacterForCharacter) {
    CommandDesc desc;
    desc.SetDesc(L"Volume", L"Sets the level");
    desc.AddParam(L"level", 0, L"new level");
    desc.AddResult(L"state", 1, L"outcome");
    desc.AddEvent(L"changed", 0, L"never shown");
    EXPECT_EQ(desc.GetDescW(), L"Volume (Sets the level)\n"
                               L"\n"
                               L"Param\tkey\ttype\tdescription\n" +
                                   kRule +
                                   L"\n"
                                   L"[PARAM]\tlevel\t{VALUE}\tnew level\n"
                                   L"[RESULT]\tstate\t{STRING}\toutcome");
    EXPECT_EQ(desc.GetDesc(), "Volume (Sets the level)\n\nParam\tkey\ttype\tdescription\n" +
                                  std::string(45, '-') +
                                  "\n[PARAM]\tlevel\t{VALUE}\tnew level\n"
                                  "[RESULT]\tstate\t{STRING}\toutcome");
}

TEST(CommandDesc, RendersOnlyWhatItHas) {
    CommandDesc fresh;
    EXPECT_EQ(fresh.GetDescW(), L"unknown ()\n");
    EXPECT_EQ(fresh.GetDescW().size(), 11u);

    CommandDesc eventsOnly;
    for (int i = 0; i < 3; ++i) eventsOnly.AddEvent(L"e", 0, L"");
    EXPECT_EQ(eventsOnly.GetDescW(), L"unknown ()\n");

    CommandDesc resultsOnly;
    resultsOnly.SetDesc(L"R", L"");
    resultsOnly.AddResult(L"b", 9, L"odd\tcode");
    resultsOnly.AddResult(L"a", 2, L"");
    resultsOnly.AddParam(L"p", 3, L"last added, first shown");
    EXPECT_EQ(resultsOnly.GetDescW(), L"R ()\n\nParam\tkey\ttype\tdescription\n" + kRule +
                                          L"\n[PARAM]\tp\t{STRING ARRAY}\tlast added, first shown"
                                          L"\n[RESULT]\tb\t{UNKNOWN}\todd\tcode"
                                          L"\n[RESULT]\ta\t{VALUE ARRAY}\t");

    CommandDesc narrow;
    narrow.SetDesc(L"N\u4E2D", L"\u00E9");
    EXPECT_EQ(narrow.GetDesc(), "N? (\xE9)\n");
}

TEST(CommandDescException, CarriesItsCompleteMessageInEveryCopy) {
    EXPECT_EQ(CommandDescException("op", 12).getMessage(), "op, idx= 12");
    EXPECT_EQ(CommandDescException("op", -1).getMessage(), "op, idx= -1");
    EXPECT_EQ(CommandDescException("op", 0).getMessageW(), L"op, idx= 0");
    EXPECT_THROW(CommandDescException(nullptr, 0), std::invalid_argument);
    CommandDescException first("first", 1);
    CommandDescException copy(first);
    {
        CommandDescException other("other", 2);
        copy = other;
    }
    EXPECT_EQ(copy.getMessage(), "other, idx= 2");
    EXPECT_EQ(first.getMessage(), "first, idx= 1");
}
