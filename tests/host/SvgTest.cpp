// The plan drawing: what is drawn, and where, in the fitted frame (y up in the plan, down on
// screen).
#include <gtest/gtest.h>

#include "host/Svg.h"

namespace {

bool Contains(const std::string& svg, const std::string& part) {
    return svg.find(part) != std::string::npos;
}

TEST(DrawPlan, DrawsSitesPointsObjectsAndTheLastOverlay) {
    CProject project;
    project.sites.push_back({2, {{0, 0}, {10, 0}, {10, 10}, {0, 10}}, true, std::nullopt});
    project.heightPoints.push_back({10, 10, 101.5f, std::nullopt});
    CPlacedObject object;
    object.strFile = "a<b>.oqb";
    object.matrix = std::array<float, 16>{1, 0, 0, 0, 0, 1, 0, 0, 0, 0, 1, 0, 5, 5, 100, 1};
    project.objects.push_back(object);
    CGraphicSnapshot line{"line", {}};
    line.properties.Set("x1", 0.0f);
    project.overlays.push_back({line});  // replaced by the last snapshot
    CGraphicSnapshot rectangle{"rectangle", {}};
    rectangle.properties.Set("x", 0.0f);
    rectangle.properties.Set("y", 10.0f);
    rectangle.properties.Set("width", 5.0f);
    rectangle.properties.Set("height", 5.0f);
    project.overlays.push_back({rectangle});

    const std::string svg = DrawPlan(project);
    // The 10 m square fills 720 pixels from a 40 pixel margin.
    EXPECT_TRUE(Contains(svg, R"(<polygon points="40,760 760,760 760,40 40,40" fill="#d8ecd0")"));
    EXPECT_TRUE(Contains(svg, R"(<circle cx="760" cy="40")"));
    EXPECT_TRUE(Contains(svg, ">101.5</text>"));
    EXPECT_TRUE(Contains(svg, R"(<rect x="400" y="400" width="6")"));
    EXPECT_TRUE(Contains(svg, "<title>a&lt;b&gt;.oqb</title>"));
    EXPECT_TRUE(Contains(svg, R"(<rect x="40" y="40" width="360" height="360")"));
    EXPECT_FALSE(Contains(svg, "<line"));
    EXPECT_EQ(svg.substr(svg.size() - 7), "</svg>\n");
}

TEST(DrawPlan, DrawsAnEmptyProjectAsAnEmptyPicture) {
    const std::string svg = DrawPlan(CProject());
    EXPECT_TRUE(Contains(svg, "<svg"));
    EXPECT_FALSE(Contains(svg, "<circle"));
}

}  // namespace
