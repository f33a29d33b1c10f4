// The project model's edit groups and the object file format.
#include <gtest/gtest.h>

#include "host/ObjectFile.h"
#include "host/Project.h"

namespace {

TEST(CProject, PutsObjectsIntoTheActiveOpenGroup) {
    CProject project;
    EXPECT_FALSE(project.ActiveGroup());
    const LONG lFirst = project.BeginEditGroup("eins");
    EXPECT_EQ(lFirst, 1);
    EXPECT_FALSE(project.ActiveGroup());  // begun, not yet activated
    EXPECT_TRUE(project.ActivateEditGroup(lFirst));
    EXPECT_EQ(project.ActiveGroup(), 0u);

    const LONG lSecond = project.BeginEditGroup("zwei");
    EXPECT_TRUE(project.ActivateEditGroup(lSecond));
    EXPECT_EQ(project.ActiveGroup(), 1u);
    EXPECT_TRUE(project.EndEditGroup(lSecond, false));
    EXPECT_EQ(project.ActiveGroup(), 0u);  // back to the outer group
    EXPECT_TRUE(project.EndEditGroup(lFirst, true));
    EXPECT_FALSE(project.ActiveGroup());

    EXPECT_EQ(project.editGroups[0].eState, EGroupState::Committed);
    EXPECT_EQ(project.editGroups[1].eState, EGroupState::Cancelled);
    EXPECT_EQ(project.editGroups[1].strName, "zwei");
}

TEST(CProject, RefusesUnknownAndClosedGroups) {
    CProject project;
    const LONG lGroup = project.BeginEditGroup("g");
    static const LONG kBad[] = {0, -1, 2, 0x7FFFFFFF};
    for (const LONG lBad : kBad) {
        EXPECT_FALSE(project.ActivateEditGroup(lBad)) << lBad;
        EXPECT_FALSE(project.EndEditGroup(lBad, true)) << lBad;
    }
    EXPECT_TRUE(project.EndEditGroup(lGroup, true));
    EXPECT_FALSE(project.EndEditGroup(lGroup, true));  // a second commit is a fault
    EXPECT_FALSE(project.ActivateEditGroup(lGroup));
    EXPECT_EQ(project.editGroups[0].eState, EGroupState::Committed);
}

TEST(ParseObjectFile, ReadsNameAndExtents) {
    const auto info = ParseObjectFile(
        "# Baum\nosrik-object 1\n\nname   Fichte, 6 m  \ncolour green\nextents 2.5 2.5\t6\n");
    ASSERT_TRUE(info);
    EXPECT_EQ(info->strName, "Fichte, 6 m");
    EXPECT_EQ(info->fSizeX, 2.5f);
    EXPECT_EQ(info->fSizeY, 2.5f);
    EXPECT_EQ(info->fSizeZ, 6.0f);
}

TEST(ParseObjectFile, RefusesBrokenFiles) {
    static const char* const kCases[] = {
        "",
        "name a\nextents 1 1 1\n",                    // no header
        "osrik-object 2\nname a\nextents 1 1 1\n",    // unknown version
        "osrik-object 1\nextents 1 1 1\n",            // no name
        "osrik-object 1\nname a\n",                   // no extents
        "osrik-object 1\nname a\nextents 1 1\n",      // too few
        "osrik-object 1\nname a\nextents 1 1 1 1\n",  // too many
        "osrik-object 1\nname a\nextents 1 -1 1\n",   // negative
        "osrik-object 1\nname a\nextents 1 1 nan\n",  // not a size
        "osrik-object 1\nname a\nextents 1 1 2m\n",   // unit glued on
    };
    for (size_t i = 0; i < std::size(kCases); ++i) {
        EXPECT_FALSE(ParseObjectFile(kCases[i])) << "case " << i;
    }
    EXPECT_FALSE(ReadObjectFile(""));
    EXPECT_FALSE(ReadObjectFile("/no/such/folder/tree.oqb"));
}

}  // namespace
