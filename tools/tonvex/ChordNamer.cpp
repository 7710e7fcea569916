#include "ChordNamer.h"

#include "JsonWriter.h"
#include "NoteToken.h"
#include "SignsText.h"

#include <tonvex/ChordSymbol.h>
#include <tonvex/ChordnamePref.h>

namespace {

const char* const BasicChordKinds[] = {"none", "major", "minor", "augmented", "diminished", "sus4", "sus2", "drone"};

const char* BasicChordKind(CChord::TBasicChord bc) {
  return bc >= CChord::bc_none && bc <= CChord::bc_drone ? BasicChordKinds[bc] : BasicChordKinds[0];
}

bool IsSeparator(char c) { return c == ' ' || c == '\t' || c == ',' || c == '\r' || c == '\v' || c == '\f'; }

// The harmonic function name under the given naming (0 Roman, 1 functional).
std::string HarmFuncNameAs(CChord const& chord, CSignKey const& key, int naming) {
  int const saved = CChordnamePref::HarmFuncNaming;
  CChordnamePref::HarmFuncNaming = naming;
  std::string name = chord.HarmFuncName(key, DefaultChordnamePref);
  CChordnamePref::HarmFuncNaming = saved;
  return name;
}

void AppendLine(std::string& out, const char* label, std::string const& value) {
  out += label;
  out += ": ";
  out += value;
  out += '\n';
}

} // namespace

void AppendJsonNote(CJsonWriter& json, char const* key, CNote const& note, bool defined) {
  json.Key(key);
  if (!defined) return json.Null();
  json.BeginObject();
  json.Key("name");
  json.String(note.KeyName(DefaultChordnamePref));
  json.Key("key_number");
  json.Int(note.NoteNr() % 12);
  json.EndObject();
}

void CChordNamer::Clear() {
  Notes_.clear();
  KeyNrs_.clear();
}

bool CChordNamer::Empty() const { return Notes_.empty() && KeyNrs_.empty(); }

std::string CChordNamer::Read(std::string_view text, std::string_view& token) {
  std::size_t pos = 0;
  while (pos < text.size()) {
    if (IsSeparator(text[pos])) {
      ++pos;
      continue;
    }
    if (text[pos] == '#') break;
    std::size_t end = pos;
    while (end < text.size() && !IsSeparator(text[end])) ++end;
    token = text.substr(pos, end - pos);
    pos = end;
    if (Settings_.KeyNumbers) {
      int keyNr = 0;
      TTokenProblem problem = ReadKeyNumber(token, keyNr);
      if (problem != Token_Ok) return TokenProblemText(problem, Kind_KeyNumber, token);
      KeyNrs_.insert(keyNr);
    } else {
      CNote note;
      TTokenProblem problem = ReadNote(token, note);
      if (problem != Token_Ok) return TokenProblemText(problem, Kind_Note, token);
      Notes_.insert(note);
    }
  }
  return std::string();
}

void CChordNamer::Analyse() {
  // A fresh start for every chord: the rules break ties by the root the chord had.
  Chord_.Clear();
  if (Settings_.KeyNumbers)
    Chord_.SetFromKeyNrSet(KeyNrs_);
  else
    Chord_.SetFromNoteSet(Notes_);
  if (Settings_.HasRoot) {
    Name_ = Chord_.NameWithLeastSignsForThisRootNote(Settings_.Root, DefaultChordnamePref);
    Chord_.SetRootNote(Settings_.Root);
    Chord_.AdjustEnhOfChordNotesToRootScale(nullptr);
  } else {
    Chord_.SetRootNoteAndEnh_ToLikeliestRegardingNoteSet(Settings_.Algo);
    Name_ = Chord_.Name(DefaultChordnamePref);
  }
  if (Settings_.Style == Style_LeadSheet) Shown_ = LeadSheetSymbol(Chord_);
  if (Settings_.Style == Style_Harte) Shown_ = HarteLabel(Chord_);
}

std::string CChordNamer::NoteName(CNote const& note) const {
  // Key numbers stand for pitch classes; an octave would only mislead.
  if (Settings_.KeyNumbers) return note.KeyName(DefaultChordnamePref);
  return note.KeyName(DefaultChordnamePref) + note.OctName(DefaultChordnamePref);
}

std::vector<CNote> CChordNamer::NotesOutsideKey() const {
  CScale const& scale = Settings_.Key.Scale();
  bool inKey[12] = {};
  for (int d = 0; d < scale.DegreesPerOctave(); ++d) inKey[scale.DegreeNrToKeyNr(d)] = true;
  std::vector<CNote> outside;
  for (CNote const& note : Chord_.Notes())
    if (!inKey[note.NoteNr() % 12]) outside.push_back(note);
  return outside;
}

void CChordNamer::AppendReport(std::string& out) const {
  out += Shown();
  out += '\n';
  std::string list;
  for (CNote const& note : Chord_.Notes()) {
    if (!list.empty()) list += ' ';
    list += NoteName(note);
  }
  AppendLine(out, "notes", list);
  AppendLine(out, "root", Chord_.RootNote().KeyName(DefaultChordnamePref));
  CChord::TBasicChord const bc = Chord_.BasicChord();
  AppendLine(out, "basic chord", std::string(BasicChordKind(bc)) + " (" + std::to_string(static_cast<int>(bc)) + ")");
  list.clear();
  for (std::string const& option : Chord_.OptionsStringVector(DefaultChordnamePref)) {
    if (!list.empty()) list += ", ";
    list += option;
  }
  AppendLine(out, "options", list.empty() ? "none" : list);
  AppendLine(out, "XG chord type", std::to_string(Chord_.XGChordIx()));
  AppendLine(out, "signs", SignsText(Chord_.SignsCount()));
  if (!Settings_.HasKey) return;
  CSignKey const& key = Settings_.Key;
  AppendLine(out, "key", key.Name(DefaultChordnamePref) + ", signs " + SignsText(key.SignsCount()));
  AppendLine(out, "function", HarmFuncNameAs(Chord_, key, 0));
  AppendLine(out, "functional", HarmFuncNameAs(Chord_, key, 1));
  AppendLine(out, "closeness", std::to_string(Chord_.ClosenessToSignKey(key)));
  list = std::to_string(Chord_.CountNotesNotInSignKey(key));
  std::vector<CNote> const outside = NotesOutsideKey();
  for (std::size_t i = 0; i < outside.size(); ++i) {
    list += i == 0 ? " (" : " ";
    list += NoteName(outside[i]);
    if (i + 1 == outside.size()) list += ')';
  }
  AppendLine(out, "notes outside the key", list);
}

void CChordNamer::AppendJson(std::string& out, long lineNr) const {
  CJsonWriter json(out);
  json.BeginObject();
  if (lineNr > 0) {
    json.Key("line");
    json.Int(lineNr);
  }
  json.Key("name");
  json.String(Name_);
  json.Key("symbol");
  json.String(LeadSheetSymbol(Chord_));
  json.Key("harte");
  json.String(HarteLabel(Chord_));
  json.Key("notes");
  json.BeginArray();
  for (CNote const& note : Chord_.Notes()) {
    json.BeginObject();
    json.Key("name");
    json.String(NoteName(note));
    // Key numbers stand for pitch classes, not for the note numbers they also are.
    json.Key(Settings_.KeyNumbers ? "key_number" : "number");
    json.Int(note.NoteNr());
    json.EndObject();
  }
  json.EndArray();
  CNote const root = Chord_.RootNote(), bass = Chord_.LowestNote();
  AppendJsonNote(json, "root", root, true);
  AppendJsonNote(json, "bass", bass, true);
  // Root position has no inversion; else the bass's interval above the root.
  int const inversion = AbsKeyIntvlFromTo(root, bass);
  json.Key("inversion");
  if (inversion == 0)
    json.Null();
  else
    json.Int(inversion);
  CChord::TBasicChord const bc = Chord_.BasicChord();
  json.Key("basic_chord");
  json.BeginObject();
  json.Key("number");
  json.Int(bc);
  json.Key("name");
  json.String(BasicChordName(bc, DefaultChordnamePref));
  json.Key("kind");
  json.String(BasicChordKind(bc));
  json.EndObject();
  json.Key("options");
  json.BeginArray();
  for (std::string const& option : Chord_.OptionsStringVector(DefaultChordnamePref)) json.String(option);
  json.EndArray();
  json.Key("xg_chord_type");
  json.Int(Chord_.XGChordIx());
  json.Key("signs");
  json.Int(Chord_.SignsCount());
  if (Settings_.HasKey) {
    CSignKey const& key = Settings_.Key;
    json.Key("key");
    json.BeginObject();
    json.Key("name");
    json.String(key.Name(DefaultChordnamePref));
    json.Key("signs");
    json.Int(key.SignsCount());
    json.Key("function");
    json.String(HarmFuncNameAs(Chord_, key, 0));
    json.Key("functional");
    json.String(HarmFuncNameAs(Chord_, key, 1));
    json.Key("closeness");
    json.Int(Chord_.ClosenessToSignKey(key));
    json.Key("notes_outside");
    json.BeginObject();
    json.Key("count");
    json.Int(Chord_.CountNotesNotInSignKey(key));
    json.Key("notes");
    json.BeginArray();
    for (CNote const& note : NotesOutsideKey()) json.String(NoteName(note));
    json.EndArray();
    json.EndObject();
    json.EndObject();
  }
  json.EndObject();
}

std::string CChordNamer::Handle(std::string_view line, long lineNr, bool json, std::string& out,
                                std::string_view& token) {
  Clear();
  std::string problem = Read(line, token);
  if (!problem.empty() || Empty()) return problem;
  Analyse();
  if (json)
    AppendJson(out, lineNr);
  else
    out += Shown();
  out += '\n';
  return problem;
}
