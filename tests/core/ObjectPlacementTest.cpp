#include <gtest/gtest.h>

#include <algorithm>

#include "PluginTestBase.h"

namespace {

using Calls = std::vector<std::string>;

class ObjectPlacementTest : public PluginTest {
protected:
    void SetUp() override {
        PluginTest::SetUp();
        Attach();
        ClearCalls();
    }
    void AddPoint(const char* id, const char* file, float x, float y, float z) {
        CSurveyPoint p;
        p.m_fX = x;
        p.m_fY = y;
        p.m_fZ = z;
        p.m_Assignment.m_strObjectId = id;
        p.m_Assignment.m_strObjectFile = file;
        Impl()->m_PointSet.Add(p);
    }
    Calls Matching(const std::string& needle) const {
        Calls matching;
        std::copy_if(
            Host().m_calls.begin(), Host().m_calls.end(), std::back_inserter(matching),
            [&](const std::string& call) { return call.find(needle) != std::string::npos; });
        return matching;
    }
};

TEST_F(ObjectPlacementTest, ObjectsOfOneIdTogetherInPointOrder) {
    AddPoint("A", "a.oqb", 1, 0, 0);
    AddPoint("B", "b.oqb", 2, 0, 0);
    AddPoint("A", "other.oqb", 3, 0, 0);  // the first point's file counts for the ID
    AddPoint("", "", 4, 0, 0);            // no code and no file: nothing
    AddPoint("C", "missing.oqb", 5, 0, 0);
    AddPoint("a", "lower.oqb", 6, 0, 0);  // IDs are case-sensitive
    Host().m_unloadableFiles.insert("missing.oqb");
    Impl()->PlaceObjects(0, 0);
    EXPECT_EQ(Matching("LoadObjectFile"),
              (Calls{"LoadObjectFile a.oqb 1", "LoadObjectFile b.oqb 1", "LoadObjectFile  1",
                     "LoadObjectFile missing.oqb 1", "LoadObjectFile lower.oqb 1"}));
    const Calls matrices = Matching("SetTransformMatrix");
    ASSERT_EQ(matrices.size(), 4u);
    const char* xs[] = {" 1 0 1 1]", " 3 0 1 1]", " 2 0 1 1]", " 6 0 1 1]"};  // A1, A2, B1, a
    for (size_t i = 0; i < 4; ++i) {
        EXPECT_NE(matrices[i].find(xs[i]), std::string::npos) << matrices[i];
    }
}

TEST_F(ObjectPlacementTest, OneObjectsCallsAndItsMatrix) {
    AddPoint("T", "tree.oqb", 3, 4, 100);
    Impl()->PlaceObjects(10, -5);
    const Calls expected = {"LoadObjectFile tree.oqb 1",
                            "template1.CreateObjectInstance",
                            "object2.SetObjectMode 49",
                            "object2.SetObjectLevel -1",
                            "object2.GetObjectExtents",
                            "object2.SetTransformMatrix 4x4 [1 0 0 0 0 1 0 0 0 0 1 0 13 -1 101 1]",
                            "object2.InsertObject 0"};
    EXPECT_EQ(Host().m_calls, expected);  // 2 m high at z = 100 stands at 101
}

TEST_F(ObjectPlacementTest, EmptySetMakesNoCall) {
    Impl()->PlaceObjects(1, 1);
    EXPECT_TRUE(Host().m_calls.empty());
}

}  // namespace
