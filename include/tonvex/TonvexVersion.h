// Version of the Tonvex library.
#ifndef TONVEX_VERSION_H
#define TONVEX_VERSION_H

#include "TonvexExport.h"

/// "@(#)PROGRAM:Tonvex  PROJECT:Tonvex-<version>" followed by a line end and a
/// terminating zero; the "@(#)" marker lets `what`-style tools find it in the binary.
extern TONVEX_API const unsigned char TonvexVersionString[];

/// The library version as a number, 103.4 for version 103.4.
extern TONVEX_API const double TonvexVersionNumber;

#endif
