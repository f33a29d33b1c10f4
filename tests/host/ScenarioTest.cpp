// The scenario parser: words and quotes, every command's arguments, and faults named by line.
#include <gtest/gtest.h>

#include "host/Scenario.h"

namespace {

TEST(SplitScenarioWords, SplitsAtBlanksAndKeepsQuotedWordsWhole) {
    static const struct {
        const char* pszLine;
        std::vector<std::string> words;
    } kCases[] = {
        {"", {}},
        {"   \t\r", {}},
        {"button polyline 2", {"button", "polyline", "2"}},
        {"  idle\t500\r", {"idle", "500"}},
        {R"(ui type 1001 "12,5 m")", {"ui", "type", "1001", "12,5 m"}},
        {R"(ui type 1001 "")", {"ui", "type", "1001", ""}},
        {R"(ui file "a#b.asc" # chosen)", {"ui", "file", "a#b.asc"}},
        {"# only a comment", {}},
        {"exit # the end", {"exit"}},
        {"C#", {"C#"}},  // a comment starts a word, not inside one
    };
    for (size_t i = 0; i < std::size(kCases); ++i) {
        std::vector<std::string> words;
        std::string error;
        EXPECT_TRUE(SplitScenarioWords(kCases[i].pszLine, words, error)) << "case " << i;
        EXPECT_EQ(words, kCases[i].words) << "case " << i;
    }
}

TEST(SplitScenarioWords, RefusesBrokenQuotes) {
    for (const char* pszLine : {R"(ui file "open)", R"(ui file a"b")", R"(ui file "a"b)"}) {
        std::vector<std::string> words;
        std::string error;
        EXPECT_FALSE(SplitScenarioWords(pszLine, words, error)) << pszLine;
        EXPECT_FALSE(error.empty()) << pszLine;
    }
}

TEST(ParseScenario, ReadsEveryCommand) {
    const CScenario scenario = ParseScenario(
        "\xEF\xBB\xBF"  // byte order mark
        "button polyline 2\n"
        "click 17 1.5 -2e3\r\n"
        "click import 0.000001 3 8\n"
        "\n"
        "move polygon 10 20\n"
        "event 52\n"
        "idle 600\n"
        "noview\nview\nexit\n"
        "ui ok\n"
        "ui file \"Gel\xC3\xA4nde 1.asc\"\n"
        "ui select 1005 -1\n"
        "button 0x10 6");
    ASSERT_EQ(scenario.strError, "");
    const std::vector<CScenarioCommand>& c = scenario.commands;
    ASSERT_EQ(c.size(), 13u);
    EXPECT_EQ(c[0].eKind, ECommand::Button);
    EXPECT_EQ(c[0].strElement, "polyline");
    EXPECT_FALSE(c[0].handle.has_value());
    EXPECT_EQ(c[0].nValue, 2);
    EXPECT_EQ(c[1].eKind, ECommand::Click);
    EXPECT_EQ(c[1].handle, 17);
    EXPECT_EQ(c[1].fX, 1.5f);
    EXPECT_EQ(c[1].fY, -2000.0f);
    EXPECT_EQ(c[1].nValue, 0);  // flags default to 0
    EXPECT_EQ(c[2].fX, 0.000001f);
    EXPECT_EQ(c[2].nValue, 8);
    EXPECT_EQ(c[3].eKind, ECommand::Move);
    EXPECT_EQ(c[3].nLine, 5);
    EXPECT_EQ(c[4].eKind, ECommand::Event);
    EXPECT_EQ(c[4].nValue, 52);
    EXPECT_EQ(c[5].eKind, ECommand::Idle);
    EXPECT_EQ(c[5].nValue, 600);
    EXPECT_EQ(c[6].eKind, ECommand::NoView);
    EXPECT_EQ(c[7].eKind, ECommand::View);
    EXPECT_EQ(c[8].eKind, ECommand::Exit);
    EXPECT_EQ(c[9].ui.eKind, EUiAction::Ok);
    EXPECT_EQ(c[10].ui.eKind, EUiAction::File);
    EXPECT_EQ(c[10].ui.strText, "Gel\xC3\xA4nde 1.asc");
    EXPECT_EQ(c[10].ui.nLine, 12);
    EXPECT_EQ(c[11].ui.eKind, EUiAction::Select);
    EXPECT_EQ(c[11].ui.nCtrl, 1005);
    EXPECT_EQ(c[11].ui.nValue, -1);
    EXPECT_EQ(c[12].handle, 16);
}

TEST(ParseScenario, NamesTheFirstFaultWithItsLine) {
    static const struct {
        const char* pszText;
        const char* pszError;
    } kCases[] = {
        {"jump 1", "line 1: unknown command 'jump'"},
        {"exit\nbutton polyline", "line 2: 'button' takes 2 arguments, not 1"},
        {"button polyline 2 3", "line 1: 'button' takes 2 arguments, not 3"},
        {"button ladder 2", "line 1: 'ladder' is neither a toolbar element nor a handle"},
        {"button polyline two", "line 1: 'two' is not an integer from -2147483648 to 2147483647"},
        {"button polyline 2147483648",
         "line 1: '2147483648' is not an integer from -2147483648 to 2147483647"},
        {"click polyline 1,5 2", "line 1: '1,5' is not a number"},
        {"move polyline 1 2 0", "line 1: 'move' takes 3 arguments, not 4"},
        {"event 1", "line 1: '1' is not an integer from 2 to 52"},
        {"event 53", "line 1: '53' is not an integer from 2 to 52"},
        {"idle -5", "line 1: '-5' is not an integer from 0 to 86400000"},
        {"exit now", "line 1: 'exit' takes 0 arguments, not 1"},
        {"ui", "line 1: 'ui' needs an action"},
        {"ui yes", "line 1: unknown UI action 'yes'"},
        {"ui type 1001", "line 1: 'ui type' takes 2 arguments, not 1"},
        {"ui file \"x", "line 1: unterminated quote"},
    };
    for (size_t i = 0; i < std::size(kCases); ++i) {
        const CScenario scenario = ParseScenario(kCases[i].pszText);
        EXPECT_EQ(scenario.strError, kCases[i].pszError) << "case " << i;
    }
}

TEST(DescribeUiAction, WritesTheActionAsTheScenarioDoes) {
    CUiAction type{EUiAction::Type, 7, 1001, 0, "12,5"};
    EXPECT_EQ(DescribeUiAction(type), "ui type 1001 \"12,5\" (line 7)");
    CUiAction mark{EUiAction::Mark, 9, 1003, 2, ""};
    EXPECT_EQ(DescribeUiAction(mark), "ui mark 1003 2 (line 9)");
}

}  // namespace
