// The options of a chord without a map, for the naming hot path (internal).
#ifndef TONVEX_NAMING_CHORDOPTIONS_H
#define TONVEX_NAMING_CHORDOPTIONS_H

#include "Chord.h"
#include "naming/NameParts.h"

/// The options of a chord by rank. The ranks are a fixed small set, so the options
/// sit in one slot per rank, in print order, and finding them allocates nothing.
struct CChordOptions {
  static constexpr int SlotCount = 14;
  /// The rank of each slot, ascending: the key of the slot's option in OptionsMap.
  static constexpr int Ranks[SlotCount] = {3, 4, 7, 9, 10, 11, 13, 14, 15, 17, 18, 20, 21, 99};
  static constexpr int NoOption = -1;

  /// The option in each slot, or NoOption.
  int Option[SlotCount] = {NoOption, NoOption, NoOption, NoOption, NoOption, NoOption, NoOption,
                           NoOption, NoOption, NoOption, NoOption, NoOption, NoOption, NoOption};
  /// Bit s set when slot s holds an option.
  unsigned Filled = 0;

  /// Fills the slot of the rank unless an option is there already: the first found
  /// stays, as map insertion keeps an existing key.
  void Add(int rank, CChord::TChordOption option);
};

/// Text of an option ("b9", "add 9", ...); "" for a value outside 0..19.
char const* OptionText(int option);

/// The options of the chord whose basic chord is bc (computed by the caller once per
/// name). Brings the chord's interval cache up to date.
CChordOptions FindChordOptions(CChord const& chord, CChord::TBasicChord bc);

/// Adds the options, joined in rank order under CChordnamePref::ChordOptionSep
/// ("7/9", or "7(9)" with ChordOptionSep 1), to the name.
void JoinOptions(CChordOptions const& options, CNameParts& name);

#endif
