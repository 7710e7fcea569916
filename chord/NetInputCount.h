// The input count of the built-in chord analysis net (internal), shared by the
// undefined chord's wrap interval and by root finding.
#ifndef TONVEX_CHORD_NETINPUTCOUNT_H
#define TONVEX_CHORD_NETINPUTCOUNT_H

/// The net's inputs are the intervals 0..23 above a chord's lowest note. A fixed
/// value while the net's record is not part of the library; then the record's input
/// count replaces it.
constexpr int NetInputCount = 24;

#endif
