// What nearly every test includes: GoogleTest, the public headers, and the standard
// containers, algorithms and numerics.
#ifndef TONVEX_TESTS_TESTPRELUDE_H
#define TONVEX_TESTS_TESTPRELUDE_H

#include <tonvex/Tonvex.h>

#include <gtest/gtest.h>

#include <algorithm>
#include <climits>
#include <cmath>
#include <cstdint>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <map>
#include <memory>
#include <random>
#include <set>
#include <sstream>
#include <string>
#include <tuple>
#include <vector>

#endif
