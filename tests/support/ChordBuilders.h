// Building chords for tests and reading them back as plain values.
#ifndef TONVEX_TESTS_CHORDBUILDERS_H
#define TONVEX_TESTS_CHORDBUILDERS_H

#include "support/TestPrelude.h"

namespace chordtest {

using Intvls = std::set<int>;

inline Intvls Members(CIntvlSet const& set) { return Intvls(set.begin(), set.end()); }

inline CNote Nat(long noteNr) { return CNote(noteNr, Enh_Natural); }

/// Notes added to a new chord (wrap 24) without a root: the root is the lowest note
/// and the cache is stale until the first query.
inline CChord ChordOf(std::vector<long> const& noteNrs) {
  CChord chord(24);
  for (long n : noteNrs) chord.AddNote(Nat(n));
  return chord;
}

/// The root specified first, then the notes: the cache holds the notes' unfolded
/// differences to the root (wrap 24) and is not stale.
inline CChord RootedChord(long root, std::vector<long> const& noteNrs) {
  CChord chord(24);
  chord.SetRootNote(Nat(root));
  for (long n : noteNrs) chord.AddNote(Nat(n));
  return chord;
}

/// The notes first, then the root specified: the next query rebuilds the cache from
/// the notes, folded into one octave, with its lonely-lowest-note mark.
inline CChord NotesThenRoot(CNote const& root, std::vector<long> const& noteNrs) {
  CChord chord = ChordOf(noteNrs);
  chord.SetRootNote(root);
  return chord;
}

/// Notes 60 + i for each interval, then root C.
inline CChord OverC(std::vector<int> const& intvls) {
  std::vector<long> noteNrs(intvls.begin(), intvls.end());
  for (long& n : noteNrs) n += 60;
  return NotesThenRoot(Nat(60), noteNrs);
}

/// "prefix v1 v2 ..." for failure messages.
template <class T>
std::string ListLabel(char const* prefix, std::vector<T> const& values) {
  std::string label = prefix;
  for (T v : values) label += " " + std::to_string(v);
  return label;
}

inline std::vector<long> NoteNrs(CChord const& chord) {
  std::vector<long> nrs;
  for (CNote const& n : chord.Notes()) nrs.push_back(n.NoteNr());
  return nrs;
}

} // namespace chordtest

#endif
