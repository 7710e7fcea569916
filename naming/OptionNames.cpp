// Chord options: which intervals above the root make options, their order and
// their texts.
#include "naming/ChordOptions.h"

#include "pitch/NoteNrs.h"

#include <cstdint>
#include <initializer_list>

namespace {

// Texts by option value 0..19.
constexpr char const* OptionTexts[] = {"b9", "add b9", "9",   "add 9", "#9", "b3", "3", "11",  "add 11", "#11",
                                       "b5", "5",      "b13", "#5",    "13", "7",  "6", "ma7", "j7",     "maj7"};
constexpr int OptionCount = sizeof OptionTexts / sizeof OptionTexts[0];

// Whether the basic chord is one of the listed ones.
bool IsOneOf(CChord::TBasicChord bc, std::initializer_list<CChord::TBasicChord> list) {
  for (CChord::TBasicChord b : list)
    if (bc == b) return true;
  return false;
}

CChord::TChordOption Maj7Option() {
  switch (CChordnamePref::Maj7ShownAs) {
  case 1: return CChord::co_j7;
  case 2: return CChord::co_maj7;
  default: return CChord::co_ma7; // 0, 3 and every other value
  }
}

// The members of an interval cache for the membership tests of the option rules: as
// bits when they all lie below 32 (as they do after a rebuild), else the set itself.
class CMembers {
public:
  explicit CMembers(CIntvlSet const& set) : Set_(set) {
    for (int m : set) {
      if (m > 31) Fits_ = false;
      Bits_ |= Fits_ ? std::uint32_t{1} << m : 0;
    }
  }
  bool Has(int n) const { return Fits_ ? n >= 0 && n < 32 && (Bits_ >> n & 1u) != 0 : Set_.HasIntvl(n); }
  // CIntvlSet::HasOtherStackedThirdsOptionThan.
  bool HasOtherThan(int intvl) const {
    if (!Fits_) return Set_.HasOtherStackedThirdsOptionThan(intvl);
    std::uint32_t others = Bits_ & ~std::uint32_t{1u << 0 | 1u << 3 | 1u << 4 | 1u << 7};
    if (intvl >= 0 && intvl < 32) others &= ~(std::uint32_t{1} << intvl);
    return others != 0;
  }

private:
  CIntvlSet const& Set_;
  std::uint32_t Bits_ = 0;
  bool Fits_ = true;
};

// The option that the interval `intvl` (a member of the cache, its row chosen by its
// pitch class) gives in a chord of basic chord bc. "has n" is exact membership in
// the cache; "other thirds" asks for a member other than 0, 3, 4, 7 and the interval
// itself as it is cached (so a ninth cached as 14 is "add 9" over a triad).
void AddOptionOfIntvl(CChordOptions& options, CMembers const& members, int intvl, CChord::TBasicChord bc) {
  using C = CChord;
  auto has = [&members](int n) { return members.Has(n); };
  auto otherThirds = [&members, intvl] { return members.HasOtherThan(intvl); };
  // The major sixth: a diminished seventh in a diminished chord.
  auto addSixth = [&] { options.Add(9, bc == C::bc_dim ? C::co_7 : C::co_6); };

  switch (PitchClass(intvl)) {
  case 1: options.Add(13, otherThirds() ? C::co_b9 : C::co_add_b9); break;
  case 2:
    if (bc != C::bc_sus2) options.Add(14, otherThirds() ? C::co_9 : C::co_add_9);
    break;
  case 3:
    if (has(4))
      options.Add(15, C::co_sharp9);
    else if (!IsOneOf(bc, {C::bc_min, C::bc_dim}))
      options.Add(3, C::co_b3);
    break;
  case 4:
    if (!IsOneOf(bc, {C::bc_maj, C::bc_aug})) options.Add(4, C::co_3);
    break;
  case 5:
    if (bc != C::bc_sus4) options.Add(17, otherThirds() ? C::co_11 : C::co_add_11);
    break;
  case 6:
    if (bc != C::bc_dim) {
      if (has(7) || has(8))
        options.Add(18, C::co_sharp11);
      else
        options.Add(99, C::co_b5);
    }
    break;
  case 7:
    if (IsOneOf(bc, {C::bc_dim, C::bc_aug, C::bc_none})) options.Add(7, C::co_5);
    break;
  case 8:
    if (bc != C::bc_aug) {
      if (has(7))
        options.Add(20, C::co_b13);
      else
        options.Add(99, C::co_sharp5);
    }
    break;
  case 9:
    if (!has(8) && (has(10) || has(11)))
      options.Add(21, C::co_13);
    else
      addSixth();
    break;
  case 10:
    if (bc == C::bc_dim) options.Add(99, C::co_b5);
    options.Add(10, C::co_7);
    break;
  case 11: options.Add(11, Maj7Option()); break;
  default: break; // 0: the root
  }
}

// The slot of each rank 0..99 in CChordOptions, -1 for ranks without one.
constexpr int MaxRank = 99;
constexpr struct CSlotOfRank {
  signed char Of[MaxRank + 1] = {};
  constexpr CSlotOfRank() {
    for (signed char& slot : Of) slot = -1;
    for (int slot = 0; slot < CChordOptions::SlotCount; ++slot)
      Of[CChordOptions::Ranks[slot]] = static_cast<signed char>(slot);
  }
} SlotOfRank;

} // namespace

void CChordOptions::Add(int rank, CChord::TChordOption option) {
  int const slot = rank >= 0 && rank < MaxRank + 1 ? SlotOfRank.Of[rank] : -1;
  if (slot >= 0 && Option[slot] == NoOption) {
    Option[slot] = option;
    Filled |= 1u << slot;
  }
}

char const* OptionText(int option) { return (option >= 0 && option < OptionCount) ? OptionTexts[option] : ""; }

CChordOptions FindChordOptions(CChord const& chord, CChord::TBasicChord bc) {
  CChordOptions options;
  CIntvlSet const& intvls = chord.IntvlSet(); // the one refresh of the cache
  if (intvls.empty()) return options;

  // In a chord wider than an octave, a lowest note whose pitch class the chord's
  // mark calls lonely gives no option: it is the bass, not a colour of the chord.
  // An empty chord has the undefined note as its lowest and highest note.
  CNote lowest = chord.LowestNote();
  CNote highest = chord.HighestNote();
  bool omitLonely = CChordnamePref::OmitOptionOfLonelyLowestNoteInWideChord != 0 && chord.LowestNoteLonely() &&
                    highest.NoteNr() - lowest.NoteNr() > 12;
  int lowestIntvl = PitchClass(lowest.KeyNr() - chord.RootNote().KeyNr());

  CMembers const members(intvls);
  for (int intvl : intvls) {
    if (omitLonely && intvl == lowestIntvl) continue;
    AddOptionOfIntvl(options, members, intvl, bc);
  }
  return options;
}

void JoinOptions(CChordOptions const& options, CNameParts& name) {
  bool parentheses = CChordnamePref::ChordOptionSep == 1;
  bool first = true;
  for (unsigned filled = options.Filled; filled != 0; filled &= filled - 1) {
    int const option = options.Option[__builtin_ctz(filled)]; // the lowest filled slot
    if (!first) name.Add(parentheses ? "(" : "/");
    name.Add(OptionText(option));
    if (!first && parentheses) name.Add(")");
    first = false;
  }
}

std::string OptionName(CChord::TChordOption option, CChordnamePref& /*pref*/) { return OptionText(option); }

std::map<int, CChord::TChordOption> CChord::OptionsMap(CChordnamePref& /*pref*/) const {
  CChordOptions options = FindChordOptions(*this, BasicChord());
  std::map<int, TChordOption> map;
  for (int slot = 0; slot < CChordOptions::SlotCount; ++slot)
    if (options.Option[slot] != CChordOptions::NoOption)
      map.emplace(CChordOptions::Ranks[slot], static_cast<TChordOption>(options.Option[slot]));
  return map;
}

std::vector<std::string> CChord::OptionsStringVector(CChordnamePref& /*pref*/) const {
  CChordOptions options = FindChordOptions(*this, BasicChord());
  std::vector<std::string> texts;
  for (int option : options.Option)
    if (option != CChordOptions::NoOption) texts.emplace_back(OptionText(option));
  return texts;
}

std::string CChord::OptionsName(CChordnamePref& /*pref*/) const {
  if (RootNote_.NoteNr() == 255) return std::string();
  CNameParts name;
  JoinOptions(FindChordOptions(*this, BasicChord()), name);
  return name.Join();
}
