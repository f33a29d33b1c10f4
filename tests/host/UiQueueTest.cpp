// The UI driver's queue: each modal UI takes only its own kind of action, in order.
#include <gtest/gtest.h>

#include "host/UiQueue.h"

namespace {

CUiAction Action(EUiAction eKind, int nLine) {
    return {eKind, nLine, 0, 0, ""};
}

TEST(CUiQueue, GivesEachConsumerOnlyItsOwnActions) {
    static const struct {
        EUiConsumer eConsumer;
        EUiAction eNext;
        bool bTaken;
    } kCases[] = {
        {EUiConsumer::MessageBox, EUiAction::Ok, true},
        {EUiConsumer::MessageBox, EUiAction::Cancel, true},
        {EUiConsumer::MessageBox, EUiAction::File, false},
        {EUiConsumer::MessageBox, EUiAction::Click, false},
        {EUiConsumer::FileDialog, EUiAction::File, true},
        {EUiConsumer::FileDialog, EUiAction::FileCancel, true},
        {EUiConsumer::FileDialog, EUiAction::Ok, false},
        {EUiConsumer::Dialog, EUiAction::Dialog, true},
        {EUiConsumer::Dialog, EUiAction::Type, true},
        {EUiConsumer::Dialog, EUiAction::Key, true},
        {EUiConsumer::Dialog, EUiAction::Cancel, false},
        {EUiConsumer::Dialog, EUiAction::FileCancel, false},
    };
    for (size_t i = 0; i < std::size(kCases); ++i) {
        CUiQueue queue;
        queue.Push(Action(kCases[i].eNext, 3));
        std::string error;
        const auto action = queue.Take(kCases[i].eConsumer, "the box", error);
        EXPECT_EQ(action.has_value(), kCases[i].bTaken) << "case " << i;
        EXPECT_EQ(queue.IsEmpty(), kCases[i].bTaken) << "case " << i;  // a refusal takes nothing
        EXPECT_EQ(error.empty(), kCases[i].bTaken) << "case " << i;
    }
}

TEST(CUiQueue, TakesInOrderAndNamesWhatIsMissing) {
    CUiQueue queue;
    queue.Push(Action(EUiAction::Cancel, 4));
    queue.Push(Action(EUiAction::Ok, 5));
    std::string error;
    EXPECT_EQ(queue.Take(EUiConsumer::MessageBox, "box", error)->nLine, 4);
    EXPECT_EQ(queue.Take(EUiConsumer::MessageBox, "box", error)->nLine, 5);
    EXPECT_FALSE(queue.Take(EUiConsumer::MessageBox, "message box \"Weiter?\"", error));
    EXPECT_EQ(error, "message box \"Weiter?\" with no queued UI action");

    queue.Push({EUiAction::File, 8, 0, 0, "a.asc"});
    EXPECT_FALSE(queue.Take(EUiConsumer::MessageBox, "box", error));
    EXPECT_EQ(error, "box but the next UI action is ui file \"a.asc\" (line 8)");
}

TEST(CUiQueue, DescribesLeftovers) {
    CUiQueue queue;
    EXPECT_EQ(queue.DescribeLeftovers(), "");
    queue.Push(Action(EUiAction::Ok, 2));
    EXPECT_EQ(queue.DescribeLeftovers(), "1 UI action left unused: ui ok (line 2)");
    queue.Push(Action(EUiAction::Cancel, 3));
    EXPECT_EQ(queue.DescribeLeftovers(), "2 UI actions left unused, the first: ui ok (line 2)");
}

TEST(MessageBoxAnswer, CancelsOnlyBoxesWithACancelButton) {
    static const struct {
        UINT uType;
        EUiAction eAction;
        int nAnswer;
    } kCases[] = {
        {MB_OKCANCEL | MB_ICONQUESTION, EUiAction::Ok, IDOK},
        {MB_OKCANCEL | MB_ICONQUESTION, EUiAction::Cancel, IDCANCEL},
        {MB_OK, EUiAction::Ok, IDOK},
        {MB_OK, EUiAction::Cancel, IDOK},  // Esc on an OK-only box answers OK
        {MB_OK | MB_ICONEXCLAMATION, EUiAction::Cancel, IDOK},
    };
    for (size_t i = 0; i < std::size(kCases); ++i) {
        EXPECT_EQ(MessageBoxAnswer(kCases[i].uType, kCases[i].eAction), kCases[i].nAnswer)
            << "case " << i;
    }
}

}  // namespace
