// The default scale type is major, and default scales use it.
#include "scale/DefaultScaleType.h"

#include <gtest/gtest.h>

namespace {

TEST(DefaultScaleType, IsMajorAndUsedByDefaultScales) {
  EXPECT_EQ(CScale_DefaultScaleType, CScale::Scale_Major);
  EXPECT_EQ(CScale().ScaleType(), CScale_DefaultScaleType);
}

} // namespace
