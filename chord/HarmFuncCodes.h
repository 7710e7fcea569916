// Harmonic function codes of chords in a key (internal).
#ifndef TONVEX_CHORD_HARMFUNCCODES_H
#define TONVEX_CHORD_HARMFUNCCODES_H

/// The code by the degree of the root in the key (0..6) and the basic chord (0..7);
/// 0 where the pair has no function.
inline constexpr int HarmFuncCodes[7][8] = {
    // none maj min aug dim sus4 sus2 drone
    {0, 1, 2, 0, 0, 0, 0, 0},     // I
    {0, 3, 4, 0, 5, 0, 0, 0},     // II
    {0, 6, 7, 0, 0, 0, 0, 0},     // III
    {0, 8, 9, 0, 0, 0, 0, 0},     // IV
    {0, 10, 11, 0, 0, 10, 10, 0}, // V
    {0, 12, 13, 0, 0, 0, 0, 0},   // VI
    {0, 0, 0, 0, 15, 0, 0, 0}};   // VII

#endif
