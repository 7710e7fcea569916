// Reading, analysing and reporting chords for the tonvex program.
//
// One CChordNamer serves a whole run: it keeps its chord, note sets and texts from
// one chord to the next, so that naming a long stream of chords allocates little.
#ifndef TONVEX_TOOLS_CHORDNAMER_H
#define TONVEX_TOOLS_CHORDNAMER_H

#include "LineLoop.h"

#include <tonvex/Chord.h>
#include <tonvex/SignKey.h>

#include <string>
#include <string_view>
#include <vector>

class CJsonWriter;

/// Writes the member key: the note as {"name", "key_number"}, or null when it is not
/// defined (no chord).
void AppendJsonNote(CJsonWriter& json, char const* key, CNote const& note, bool defined);

/// Which name of a chord is shown.
enum TNameStyle : int { Style_Native = 0, Style_LeadSheet = 1, Style_Harte = 2 };

/// How chords are read, analysed and shown.
struct ChordSettings {
  TSingleChordAnalysisAlgo Algo = SCA_NEURONAL_NET;
  /// Numbers are key numbers 0..11 (the chord is built by CChord::SetFromKeyNrSet)
  /// instead of note numbers; note names are not accepted then.
  bool KeyNumbers = false;
  bool HasKey = false;
  CSignKey Key;
  /// A root given by the user replaces root finding.
  bool HasRoot = false;
  CNote Root;
  /// The name shown by the report and the batch mode; JSON carries all three.
  TNameStyle Style = Style_Native;
};

class CChordNamer : public CLineHandler {
public:
  explicit CChordNamer(ChordSettings const& settings) : Settings_(settings) {}

  /// Forgets the notes read so far.
  void Clear();
  /// Reads the notes in text: tokens separated by blanks, tabs or commas; a token
  /// starting with '#' begins a comment that runs to the end of the text. Returns
  /// the empty string, or the problem with the first token that is not a note
  /// ("cannot read note 'X9'") and that token; the notes before it stay read.
  std::string Read(std::string_view text, std::string_view& token);
  /// Whether no note has been read since Clear.
  bool Empty() const;

  /// Builds the chord from the notes read, sets its root (the given one, or the
  /// likeliest) and names it.
  void Analyse();
  /// The name: exactly the library's text, trailing blanks included.
  std::string const& Name() const { return Name_; }
  /// The name in the settings' style: Name(), the lead-sheet symbol or the Harte
  /// label.
  std::string const& Shown() const { return Settings_.Style == Style_Native ? Name_ : Shown_; }
  /// The shown name and then one line per fact: notes, root, basic chord, options, XG
  /// chord type, signs and, with a key, the facts of the chord in the key.
  void AppendReport(std::string& out) const;
  /// One JSON object (no line end) with the same facts, the name, the lead-sheet
  /// symbol and the Harte label, the bass and the inversion; a line number above 0
  /// is written first as "line".
  void AppendJson(std::string& out, long lineNr) const;

  /// Names the chord of one line of input, as the batch mode does: reads it
  /// (forgetting the notes before), and unless it holds no notes appends the shown name,
  /// or with `json` the JSON object carrying lineNr, and a line end to out. Returns
  /// the empty string, or the problem with the line's first token that is not a
  /// note and that token; then nothing is appended.
  std::string Handle(std::string_view line, long lineNr, bool json, std::string& out, std::string_view& token) override;

private:
  std::string NoteName(CNote const& note) const;
  // The chord's notes whose pitch class is not among the key's degrees.
  std::vector<CNote> NotesOutsideKey() const;

  ChordSettings Settings_;
  CMySet<CNote> Notes_;
  CMySet<int> KeyNrs_;
  CChord Chord_;
  std::string Name_;
  std::string Shown_;
};

#endif
