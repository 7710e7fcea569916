// Chord names: the basic chord text, the block after the root, names with and
// without a slash bass, and names for another root.
#include "chord/ChordScale.h"
#include "naming/ChordOptions.h"
#include "naming/NameParts.h"
#include "pitch/NoteNameText.h"

#include <cctype>

namespace {

// Texts by basic chord 0..7.
constexpr char const* BasicChordTexts[] = {"no 3", "", "m", "aug", "dim", "sus 4", "sus 2", "5"};

char const* BasicChordText(int bc) { return (bc >= 1 && bc <= 7) ? BasicChordTexts[bc] : BasicChordTexts[0]; }

bool IsSus(CChord::TBasicChord bc) { return bc == CChord::bc_sus4 || bc == CChord::bc_sus2; }

bool SeparateBlocks() { return CChordnamePref::SeparateBlocksInNames != 0; }

// A chord's name under construction. The pieces view texts of static storage and
// the two note names held here, so it lives on the stack of one naming call and is
// never copied or moved. The basic chord is classified at most once per name.
class CChordName {
public:
  explicit CChordName(CChord const& chord) : Chord(chord) {}
  CChordName(CChordName const&) = delete;
  CChordName& operator=(CChordName const&) = delete;

  CChord::TBasicChord BasicChord() {
    if (!HaveBasicChord_) {
      BasicChord_ = Chord.BasicChord();
      HaveBasicChord_ = true;
    }
    return BasicChord_;
  }

  CChord const& Chord;
  CNameParts Parts;
  CNoteNameText Root;
  CNoteNameText Bass;

private:
  CChord::TBasicChord BasicChord_ = CChord::bc_none;
  bool HaveBasicChord_ = false;
};

// The basic chord and options block. Both separators are written even when a block
// is empty ("C  ", "C m "): callers compare and show these exact strings.
void AddBlock(CChordName& name) {
  char const* sep = SeparateBlocks() ? "," : " ";
  CChord::TBasicChord bc = name.BasicChord();
  // An undefined root has no options name.
  CChordOptions options;
  if (name.Chord.RootNote().NoteNr() != 255) options = FindChordOptions(name.Chord, bc);
  name.Parts.Add(sep);
  if (IsSus(bc)) {
    JoinOptions(options, name.Parts);
    name.Parts.Add(sep);
    name.Parts.Add(BasicChordText(bc));
  } else {
    name.Parts.Add(BasicChordText(bc));
    name.Parts.Add(sep);
    JoinOptions(options, name.Parts);
  }
}

void AddNameWithoutSlash(CChordName& name) {
  CChord const& chord = name.Chord;
  if (chord.RootNote().NoteNr() == 255) {
    name.Parts.Add("No Chord");
    return;
  }
  name.Root = KeyNameText(chord.RootNote());
  // A small letter marks minor, and "m" is written all the same ("c m 7").
  if (CChordnamePref::MinorSmall != 0 && !name.Root.Empty() && name.BasicChord() == CChord::bc_min)
    name.Root.Front() = static_cast<char>(std::tolower(static_cast<unsigned char>(name.Root.Front())));
  name.Parts.Add(name.Root.View());
  if (chord.NoteCount() > 1) AddBlock(name);
}

// Spells the chord's stored lowest note as the scale does. The note is changed in
// the chord and stays so. Its spelling is part of the note set's order, so where
// the set holds the same pitch in a second spelling that the new one would reach
// or pass, the stored note is left as it is (the name still shows the bass as the
// scale spells it).
void RespellStoredLowestNote(CMySet<CNote> const& notes, CScale const& scale) {
  if (notes.empty()) return;
  auto lowest = notes.begin();
  auto next = lowest + 1;
  if (next != notes.end() && next->NoteNr() == lowest->NoteNr() && !(scale.EnhForNote(*lowest) < next->Enh())) return;
  lowest->AdjustEnhToScale(scale);
}

// The slash and the bass, when the bass's key number (the undefined note's for a
// chord without notes) differs from the root's; plain remainders are compared.
void AddSlashBass(CChordName& name) {
  CChord const& chord = name.Chord;
  CNote bass = chord.LowestNote();
  if (bass.KeyNr() == chord.RootNote().KeyNr()) return;
  CChord::TBasicChord bc = name.BasicChord();
  CScale scale = ChordScale(chord.RootNote(), bc, chord.HasIntvl(1));
  RespellStoredLowestNote(chord.Notes(), scale);
  bass.AdjustEnhToScale(scale);
  name.Bass = KeyNameText(bass);
  name.Parts.Add(SeparateBlocks() ? ",/ " : " / ");
  name.Parts.Add(name.Bass.View());
}

// The C major scale, whose spellings a root that is not senseful takes.
CScale const& DefaultCMajor() {
  static const CScale scale;
  return scale;
}

} // namespace

std::string BasicChordName(CChord::TBasicChord bc, CChordnamePref& /*pref*/) { return BasicChordText(bc); }

bool CChord::BasicChordNameAfterOptionsName() const { return IsSus(BasicChord()); }

std::string CChord::BasicChordAndOptionsName(CChordnamePref& /*pref*/) const {
  CChordName name(*this);
  AddBlock(name);
  return name.Parts.Join();
}

std::string CChord::NameWithoutSlash(CChordnamePref& /*pref*/) const {
  CChordName name(*this);
  AddNameWithoutSlash(name);
  return name.Parts.Join();
}

std::string CChord::NameWithSlash(CChordnamePref& /*pref*/) const {
  CChordName name(*this);
  AddNameWithoutSlash(name);
  AddSlashBass(name);
  return name.Parts.Join();
}

std::string CChord::Name(CChordnamePref& /*pref*/) const {
  // Names under the shared preferences, whatever object was passed.
  if (CChordnamePref::NarrowChordsWithoutSlash != 0 && IsNarrowChord()) return NameWithoutSlash(DefaultChordnamePref);
  return NameWithSlash(DefaultChordnamePref);
}

std::string CChord::NameForThisRootNote(CNote const& root, CChordnamePref& pref) const {
  // The caller's note receives the corrected spelling too (spellings are mutable).
  if (!root.HasSensefulEnh()) root.AdjustEnhToScale(DefaultCMajor());
  CChord chord(*this);
  chord.SetRootNote(root);
  return chord.Name(pref);
}

std::string CChord::NameWithLeastSignsForThisRootNote(CNote const& root, CChordnamePref& pref) const {
  root.CheckEnh();
  // The choice between the given spelling and its flat and sharp neighbours counts
  // the signs of this chord, not of the chord with the new root, so the three
  // counts agree and the given spelling stands. The count still runs for its one
  // effect: this chord's root is respelled when its spelling is not senseful.
  static_cast<void>(SignsCount());
  CChord chord(*this);
  chord.SetRootNote(root);
  return chord.Name(pref);
}
