// The UI driver answering modal UI from the queue, and the failures it reports.
#include <gtest/gtest.h>

#include "host/UiDriver.h"

namespace {

class UiDriver : public ::testing::Test {
protected:
    void Queue(EUiAction eKind, int nCtrl = 0, int nValue = 0, std::string text = "") {
        m_driver.Queue().Push({eKind, ++m_nLine, nCtrl, nValue, std::move(text)});
    }

    CHostState m_state;
    CUiDriver m_driver{m_state};
    int m_nLine = 0;
};

TEST_F(UiDriver, AnswersMessageBoxesAndRecordsThem) {
    Queue(EUiAction::Cancel);
    Queue(EUiAction::Cancel);
    EXPECT_EQ(MessageBoxA(nullptr, "Weiter?", "Kalmoret", MB_OKCANCEL | MB_ICONQUESTION), IDCANCEL);
    EXPECT_EQ(MessageBoxA(nullptr, "Fehler \xFC", "Kalmoret", MB_OK), IDOK);
    ASSERT_EQ(m_state.project.messages.size(), 2u);
    EXPECT_EQ(m_state.project.messages[0].strAnswer, "cancel");
    EXPECT_EQ(m_state.project.messages[0].uStyle, UINT(MB_OKCANCEL | MB_ICONQUESTION));
    EXPECT_EQ(m_state.project.messages[1].strText, "Fehler \xC3\xBC");  // 1252 to UTF-8
    EXPECT_EQ(m_state.project.messages[1].strAnswer, "ok");
    EXPECT_EQ(m_driver.Failure(), "");
}

TEST_F(UiDriver, FailsOnceWithTheFirstReasonAndAnswersCancel) {
    m_state.currentLine = 7;
    EXPECT_EQ(MessageBoxA(nullptr, "Eins?", "K", MB_OKCANCEL), IDCANCEL);
    EXPECT_EQ(MessageBoxA(nullptr, "Zwei?", "K", MB_OKCANCEL), IDCANCEL);
    EXPECT_EQ(m_driver.Failure(), "line 7: message box \"Eins?\" with no queued UI action");
    EXPECT_EQ(m_state.project.messages.size(), 2u);
}

TEST_F(UiDriver, RecordsHelpCalls) {
    WinHelpA(nullptr, "C:\\Osrik\\Osrik.hlp", HELP_CONTEXT, 50042);
    ASSERT_EQ(m_state.project.help.size(), 1u);
    EXPECT_EQ(m_state.project.help[0].strPath, "C:\\Osrik\\Osrik.hlp");
    EXPECT_EQ(m_state.project.help[0].context, 50042u);
}

TEST_F(UiDriver, ChoosesFilesInTheAnsiCodePage) {
    Queue(EUiAction::File, 0, 0, "Gel\xC3\xA4nde.asc");
    Queue(EUiAction::FileCancel);
    EXPECT_EQ(m_driver.OnFileDialog("C:\\"), "Gel\xE4nde.asc");
    EXPECT_EQ(m_driver.OnFileDialog("C:\\"), std::nullopt);
    EXPECT_EQ(m_driver.Failure(), "");
    EXPECT_EQ(m_driver.OnFileDialog("C:\\"), std::nullopt);
    EXPECT_EQ(m_driver.Failure(), "a file dialog with no queued UI action");
}

TEST_F(UiDriver, DrivesDialogsAndChecksTheExpectedTemplate) {
    Queue(EUiAction::Dialog, 0, 1067);
    Queue(EUiAction::Type, 1001, 0, "12,5");
    Queue(EUiAction::Click, 1);
    m_driver.OnDialogOpened(1067);
    const auto type = m_driver.NextDialogAction(1067);
    ASSERT_TRUE(type);
    EXPECT_EQ(type->eKind, EUiAction::Type);
    EXPECT_EQ(type->strText, "12,5");
    EXPECT_EQ(m_driver.NextDialogAction(1067)->nCtrl, 1);
    EXPECT_EQ(m_driver.Failure(), "");
}

TEST_F(UiDriver, FailsWhenADialogIsNotTheOneExpectedOrRunsOutOfActions) {
    static const struct {
        std::vector<EUiAction> queued;
        const char* pszFailure;
    } kCases[] = {
        {{EUiAction::Dialog},
         "dialog 101 opened, but the scenario expects ui dialog 1067 (line 1)"},
        {{}, "dialog 101 with no queued UI action"},
        {{EUiAction::Ok}, "dialog 101 but the next UI action is ui ok (line 1)"},
    };
    for (size_t i = 0; i < std::size(kCases); ++i) {
        CHostState state;
        CUiDriver driver(state);
        for (const EUiAction eKind : kCases[i].queued) {
            driver.Queue().Push({eKind, 1, 0, 1067, ""});
        }
        driver.OnDialogOpened(101);
        if (driver.Failure().empty()) {
            EXPECT_FALSE(driver.NextDialogAction(101)) << "case " << i;
        }
        EXPECT_EQ(driver.Failure(), kCases[i].pszFailure) << "case " << i;
    }
}

TEST_F(UiDriver, ADialogStillOpenDoesNotTakeTheNextDialogsActions) {
    Queue(EUiAction::Dialog, 0, 101);
    Queue(EUiAction::Dialog, 0, 1061);
    m_driver.OnDialogOpened(101);
    EXPECT_FALSE(m_driver.NextDialogAction(101));
    EXPECT_EQ(m_driver.Failure(),
              "dialog 101 is still open, but the next UI action is ui dialog 1061 (line 2)");
    EXPECT_EQ(m_driver.Queue().Size(), 1u);
}

}  // namespace
