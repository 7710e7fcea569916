// The scale type of default-constructed scales (internal).
#ifndef TONVEX_SCALE_DEFAULTSCALETYPE_H
#define TONVEX_SCALE_DEFAULTSCALETYPE_H

#include "Scale.h"

/// Major. Default-constructed scales use it, and so does the spelling a natural
/// black key falls back to (CNote::CheckEnh spells it as the default scale on C
/// does). Nothing changes it.
extern const CScale::TType CScale_DefaultScaleType;

#endif
