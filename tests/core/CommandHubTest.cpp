// Button codes in process: what the scenarios cannot reach (the anchor cycle,
// the plug-in's mode) and an edit group left open.
#include <gtest/gtest.h>

#include "PluginTestBase.h"
#include "core/EditGroup.h"
#include "res/resource.h"

namespace {

constexpr LONG kFinished = 4;

using CommandHubTest = AttachedTest;

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
        Impl()->m_Contour.Add({1, 1});
        Impl()->OnButtonChange(Impl()->*cases[i].handle, cases[i].code);
        EXPECT_EQ(Impl()->m_Contour.GetCount() == 0, cases[i].cleared) << "case " << i;
    }
    EXPECT_TRUE(TakeTrace().empty());
}

TEST_F(CommandHubTest, FinishingALineEndsAPendingPlacement) {
    // Confirmed, cancelled, and with no point (any handle, no question).
    static const struct {
        int points;
        int answer;
    } cases[] = {{1, IDOK}, {1, IDCANCEL}, {0, 0}};
    for (size_t i = 0; i < std::size(cases); ++i) {
        Impl()->m_Contour.Clear();
        if (cases[i].points) {
            Impl()->m_Contour.Add({1, 1});
            Answers().push_back(cases[i].answer);
        }
        Impl()->m_nMode = kModePlacementPending;
        Impl()->OnButtonChange(cases[i].points ? Impl()->m_lPolylineEntry : 0, kFinished);
        EXPECT_EQ(Impl()->m_nMode, kModeIdle) << "case " << i;
    }
    EXPECT_EQ(Boxes().size(), 2u);
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

TEST_F(CommandHubTest, EditGroupLeftOpenIsCancelled) {
    { CEditGroup group(Impl()->m_pHost, IDS_EDIT_GROUP_CONTOUR); }
    EXPECT_EQ(TakeTrace(),
              (Calls{"app.GetModeFlags() -> 127", "app.SetModeFlags(96)", "app.SetBatchMode(-1)",
                     "app.BeginEditGroup(\"H\xc3\xb6henlinienpunkte "
                     "einf\xc3\xbcgen\") -> 1",
                     "app.ActivateEditGroup(1)", "app.EndEditGroup(1, 0)", "app.SetBatchMode(0)",
                     "app.SetModeFlags(127)"}));
    ASSERT_EQ(Project().editGroups.size(), 1u);
    EXPECT_EQ(Project().editGroups[0].eState, EGroupState::Cancelled);
}

}  // namespace
