// Values for the fuzz targets, drawn from the fuzzer's input.
//
// Integers come either from a short list of values that sit on the edges of the
// library's tables and arithmetic (note numbers just outside 0..127, the undefined
// note 255, spellings -1 and 5, basic chord 8, INT_MIN, INT_MAX ...) or as any
// 32-bit value, so that the fuzzer reaches both the edges and everything else.
#ifndef TONVEX_FUZZ_FUZZINPUT_H
#define TONVEX_FUZZ_FUZZINPUT_H

#include <tonvex/ChordnamePref.h>
#include <tonvex/Note.h>
#include <tonvex/Scale.h>

#include <fuzzer/FuzzedDataProvider.h>

#include <array>
#include <climits>
#include <cstdlib>
#include <string>

class CFuzzInput {
public:
  CFuzzInput(const std::uint8_t* data, std::size_t size) : Data_(data, size) {}

  bool Empty() { return Data_.remaining_bytes() == 0; }

  /// An edge value or any int.
  int AnyInt() {
    static constexpr std::array<int, 30> Edges = {INT_MIN, INT_MIN + 1, -256, -255, -129, -128, -13, -12, -11, -2,
                                                  -1,      0,           1,    2,    4,    5,    7,   8,   11,  12,
                                                  13,      24,          127,  128,  131,  253,  255, 256, 300, INT_MAX};
    if (Data_.ConsumeBool()) return Edges[Data_.ConsumeIntegralInRange<std::size_t>(0, Edges.size() - 1)];
    return Data_.ConsumeIntegral<int>();
  }
  /// A value in lo..hi, or now and then any int.
  int IntMostlyIn(int lo, int hi) {
    if (Data_.ConsumeIntegralInRange<int>(0, 7) == 0) return AnyInt();
    return Data_.ConsumeIntegralInRange<int>(lo, hi);
  }
  /// A count in 0..most.
  std::size_t Count(std::size_t most) { return Data_.ConsumeIntegralInRange<std::size_t>(0, most); }
  /// One of `choices` operations.
  int Pick(int choices) { return Data_.ConsumeIntegralInRange<int>(0, choices - 1); }
  bool Bool() { return Data_.ConsumeBool(); }
  float Float() { return Data_.ConsumeFloatingPoint<float>(); }
  float Probability() { return Data_.ConsumeProbability<float>(); }
  std::string Text(std::size_t most) { return Data_.ConsumeRandomLengthString(most); }
  std::string Rest() { return Data_.ConsumeRemainingBytesAsString(); }

  /// Any spelling, senseful or not (0..4 mostly, anything now and then).
  TEnh Enh() { return static_cast<TEnh>(IntMostlyIn(-1, 5)); }

  /// A note as a host can make one: through the constructor (clamped), or moved by
  /// the octave and key number setters and the parser to the numbers that the
  /// setters let through (negative after SetOct below octave -1, 128..131 in octave
  /// 9, 253 from the undefined note, 255 itself); now and then spelled by a scale
  /// whose table holds any value, which leaves the spelling unchecked.
  CNote Note() {
    CNote note(AnyInt(), Enh());
    switch (Pick(5)) {
    case 0: note.SetOct(AnyInt()); break;
    case 1: note.SetKeyNr(AnyInt()); break;
    case 2: note.SetFromString(Text(8), DefaultChordnamePref); break;
    case 3: note.SetNoteNr(255); break;
    default: break;
    }
    if (Bool()) note.SetKeyNr(AnyInt());
    if (Pick(8) == 0) {
      CScale scale;
      scale.SetEnhForKeyNr(note.KeyNr(), static_cast<TEnh>(AnyInt()));
      note.AdjustEnhToScale(scale);
    }
    return note;
  }

  /// Sets every naming preference, each now and then to a value outside its
  /// documented range.
  void SetPreferences() {
    for (int* member :
         {&CChordnamePref::NoteNr_60_is, &CChordnamePref::HarmFuncNaming, &CChordnamePref::ChordOptionSep,
          &CChordnamePref::PreferSlashChordIfMoreNotesThan, &CChordnamePref::SeparateBlocksInNames,
          &CChordnamePref::PreferSlashChord, &CChordnamePref::InversionAsName, &CChordnamePref::ShowInversion,
          &CChordnamePref::NoDoubleSigns, &CChordnamePref::NarrowChordsWithoutSlash,
          &CChordnamePref::OmitOptionOfLonelyLowestNoteInWideChord, &CChordnamePref::Maj7ShownAs,
          &CChordnamePref::MinorSmall, &CChordnamePref::RomanNames, &CChordnamePref::AccidentalsAsLetters,
          &CChordnamePref::Bb_is_B, &CChordnamePref::B_is_H})
      *member = IntMostlyIn(0, 3);
  }

private:
  FuzzedDataProvider Data_;
};

/// Stops the fuzzer on a broken documented property, as a crash would.
inline void Require(bool condition) {
  if (!condition) std::abort();
}

#endif
