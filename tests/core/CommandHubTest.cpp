#include <gtest/gtest.h>

#include "PluginTestBase.h"
#include "core/EditGroup.h"
#include "res/resource.h"

namespace {

using Calls = std::vector<std::string>;

constexpr LONG kFinished = 4;

class CommandHubTest : public PluginTest {
protected:
    void SetUp() override {
        PluginTest::SetUp();
        Attach();
        ClearCalls();
    }
    void EnterContour(std::initializer_list<CPoint2D> points) {
        for (const CPoint2D& p : points) {
            Impl()->m_Contour.Add(p);
        }
    }
};

const Calls kGroupOpen = {"GetModeFlags", "SetModeFlags 0x12345660", "SetBatchMode -1",
                          "BeginEditGroup H\xf6henlinienpunkte einf\xfcgen",
                          "ActivateEditGroup 77"};
const Calls kGroupCommit = {"EndEditGroup 77 -1", "SetBatchMode 0", "SetModeFlags 0x1234567F"};

Calls Joined(std::initializer_list<Calls> parts) {
    Calls all;
    for (const Calls& part : parts) {
        all.insert(all.end(), part.begin(), part.end());
    }
    return all;
}

TEST_F(CommandHubTest, ConfirmedContourBecomesHeightPointsInOneGroup) {
    EnterContour({{1, 2}, {3.5, 4}});
    Impl()->m_fHeight = 12.5f;
    Impl()->m_nInterpol = 5;  // unknown rule: the points as entered
    Impl()->m_nMode = kModePlacementPending;
    Answers().push_back(IDOK);
    Impl()->OnButtonChange(Impl()->m_lPolygonEntry, kFinished);
    EXPECT_EQ(Host().m_calls,
              Joined({kGroupOpen,
                      {"CreateHeightPoint 1 2 12.5", "CreateHeightPoint 3.5 4 12.5"},
                      kGroupCommit}));
    ASSERT_EQ(Boxes().size(), 1u);
    EXPECT_EQ(Boxes()[0].text,
              "Soll jetzt die eingegebene H\xf6henlinie in H\xf6henpunkte umgewandelt werden?");
    EXPECT_EQ(Boxes()[0].type, MB_OKCANCEL | MB_ICONQUESTION);
    EXPECT_EQ(Impl()->m_Contour.GetCount(), 0u);
    EXPECT_TRUE(Impl()->m_Contour.closed);  // from the polygon entry
    EXPECT_EQ(Impl()->m_nMode, kModeIdle);
}

TEST_F(CommandHubTest, ClosedFlagFollowsTheHandleOfTheFinishedLine) {
    // A closed square with a 5 m limit gains the midpoint of its closing edge; open it does not.
    static const struct {
        bool polygon;
        size_t points;
    } cases[] = {{true, 8}, {false, 7}};
    for (size_t i = 0; i < std::size(cases); ++i) {
        ClearCalls();
        EnterContour({{0, 0}, {10, 0}, {10, 10}, {0, 10}});
        Impl()->m_nInterpol = 1;
        Impl()->m_fSegLen = 5.0f;
        Answers().push_back(IDOK);
        const CKalmoretImpl& impl = *Impl();
        Impl()->OnButtonChange(cases[i].polygon ? impl.m_lPolygonEntry : impl.m_lPolylineEntry,
                               kFinished);
        EXPECT_EQ(Host().m_calls.size(), kGroupOpen.size() + cases[i].points + kGroupCommit.size())
            << "case " << i;
    }
}

TEST_F(CommandHubTest, CancelledOrEmptyContourCreatesNothing) {
    EnterContour({{1, 1}});
    Impl()->m_nMode = kModePlacementPending;
    Answers().push_back(IDCANCEL);
    Impl()->OnButtonChange(Impl()->m_lPolylineEntry, kFinished);
    EXPECT_TRUE(Host().m_calls.empty());
    EXPECT_EQ(Impl()->m_Contour.GetCount(), 1u);  // kept for another try
    EXPECT_EQ(Impl()->m_nMode, kModeIdle);

    Impl()->m_Contour.Clear();
    Impl()->m_nMode = kModePlacementPending;
    Impl()->OnButtonChange(0, kFinished);  // empty: no question at all
    EXPECT_EQ(Boxes().size(), 1u);
    EXPECT_EQ(Impl()->m_nMode, kModeIdle);
}

TEST_F(CommandHubTest, StartClearsOnlyForContourEntries) {
    static const struct {
        LONG CKalmoretImpl::*handle;
        LONG code;
        bool cleared;
    } cases[] = {
        {&CKalmoretImpl::m_lPolylineEntry, 2, true},  {&CKalmoretImpl::m_lPolygonEntry, 2, true},
        {&CKalmoretImpl::m_lImportEntry, 2, false},   {&CKalmoretImpl::m_lContourButton, 2, false},
        {&CKalmoretImpl::m_lPolylineEntry, 1, false},
    };
    for (size_t i = 0; i < std::size(cases); ++i) {
        Impl()->m_Contour.Clear();
        EnterContour({{1, 1}});
        Impl()->OnButtonChange(Impl()->*cases[i].handle, cases[i].code);
        EXPECT_EQ(Impl()->m_Contour.GetCount() == 0, cases[i].cleared) << "case " << i;
    }
    EXPECT_TRUE(Host().m_calls.empty());
}

TEST_F(CommandHubTest, AnchorCyclesOnCodesWithBothBits) {
    Impl()->m_nAnchor = 6;
    static const struct {
        LONG code;
        int anchor;
    } steps[] = {{6, 7}, {6, 8}, {6, 0}, {7, 1}, {2, 1}, {3, 1}, {4, 1}, {14, 2}};
    for (size_t i = 0; i < std::size(steps); ++i) {
        Impl()->OnButtonChange(999, steps[i].code);
        EXPECT_EQ(Impl()->m_nAnchor, steps[i].anchor) << "step " << i;
    }
}

TEST_F(CommandHubTest, EndRequestShutsDownThroughTheTimerOnce) {
    Answers().push_back(IDCANCEL);
    Impl()->OnButtonChange(Impl()->m_lToolbar, 3);
    EXPECT_TRUE(Host().m_calls.empty());
    Impl()->OnButtonChange(Impl()->m_lContourButton, 3);  // not the toolbar: nothing
    EXPECT_EQ(Boxes().size(), 1u);

    Answers().insert(Answers().end(), {IDOK, IDOK});
    Impl()->OnButtonChange(Impl()->m_lToolbar, 3);
    EXPECT_EQ(Host().m_calls, Calls{"GetMainWindow"});
    DriverAdvanceClock(300);
    Impl()->OnButtonChange(Impl()->m_lToolbar, 3);  // again within 500 ms: the same timer restarts
    DriverAdvanceClock(300);
    MSG msg;
    EXPECT_FALSE(PeekMessageA(&msg, nullptr, 0, 0, PM_REMOVE));
    DriverAdvanceClock(200);
    ASSERT_TRUE(PeekMessageA(&msg, nullptr, 0, 0, PM_REMOVE));
    EXPECT_EQ(msg.wParam, kShutdownTimerId);
    ClearCalls();
    MacroMessageHook(&msg);
    EXPECT_EQ(Host().m_calls, (Calls{"DeleteToolbar 100", "RefreshToolbars", "Unadvise 9"}));
    EXPECT_EQ(Impl(), nullptr);
    DriverAdvanceClock(1000);
    EXPECT_FALSE(PeekMessageA(&msg, nullptr, 0, 0, PM_REMOVE));  // the timer was killed
    MacroMessageHook(&msg);  // later messages are only passed on
    EXPECT_EQ(Host().m_calls.size(), 3u);
}

TEST_F(CommandHubTest, EditGroupWithoutAGroupStillRestoresTheFlags) {
    Host().m_lGroup = 0;
    {
        CEditGroup group(&Host(), IDS_EDIT_GROUP_CONTOUR);
        group.Commit();
        group.Cancel();
    }
    EXPECT_EQ(Host().m_calls, (Calls{"GetModeFlags", "SetModeFlags 0x12345660", "SetBatchMode -1",
                                     "BeginEditGroup H\xf6henlinienpunkte einf\xfcgen",
                                     "SetModeFlags 0x1234567F"}));
}

TEST_F(CommandHubTest, EditGroupLeftOpenIsCancelled) {
    { CEditGroup group(&Host(), IDS_EDIT_GROUP_CONTOUR); }
    EXPECT_EQ(
        Host().m_calls,
        Joined({kGroupOpen, {"EndEditGroup 77 0", "SetBatchMode 0", "SetModeFlags 0x1234567F"}}));
}

}  // namespace
