// A layer's colour from the host's current drawing, as the colour swatch takes it, and the
// host's layer table as --layers fills it.
#include "runtime/TestApi.h"
#include "settings/StaticColor.h"

#include <gtest/gtest.h>

TEST(LayerColor, LookedUpInTheCurrentDrawingWithoutRegardToCase) {
  devhostOpenDrawing();
  AcCmColor color;
  EXPECT_TRUE(CStaticColor::GetLayerColor("0", color));
  EXPECT_EQ(color.colorIndex(), 7) << "a new drawing has layer 0 in colour 7";
  EXPECT_FALSE(devhostSetLayers(L"0=7;WALLS=256"));
  EXPECT_FALSE(devhostSetLayers(L"=3"));
  ASSERT_TRUE(devhostSetLayers(L"0=7;WALLS=1;Doors=30"));

  struct Case {
    const char *layer;
    bool found;
    int index;
    COLORREF rgb;
  };
  for (const Case &c : {Case{"walls", true, 1, RGB(255, 0, 0)}, Case{"DOORS", true, 30, RGB(255, 127, 0)},
                        Case{"Windows", false, 5, RGB(0, 0, 255)}}) {
    CStaticColor swatch;
    swatch.SetColorIndex(5);
    swatch.SetColorFromLayer(c.layer);
    EXPECT_EQ(CStaticColor::GetLayerColor(c.layer, color), c.found) << c.layer;
    EXPECT_EQ(swatch.GetColorIndex(), c.index) << c.layer;
    EXPECT_EQ(swatch.m_rgb, c.rgb) << c.layer;
  }
  devhostCloseDrawing(0);
  EXPECT_FALSE(CStaticColor::GetLayerColor("0", color)) << "no drawing, no layers";
}
