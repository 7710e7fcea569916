// Lead-sheet symbols of chords: "C9", "Am7", "F#m7b5/C".
#include "ChordSymbol.h"
#include "naming/SymbolBody.h"

namespace {

// The type's text: its sign under the style's flag, "m7b5" with the unicode flat.
void AddTypeText(CSymbolText& text, CSymbolType const& type, int style) {
  bool const unicode = (style & Sym_UnicodeSigns) != 0;
  if (type.SignText != nullptr && (style & type.SignStyle) != 0) {
    if (type.SignStyle == Sym_DimSign && unicode) {
      text.Add("\xC2\xB0"); // °
      text.Add(type.SignText + 1);
    } else {
      text.Add(type.SignText);
    }
    return;
  }
  for (char const* c = type.Text; *c != '\0'; ++c)
    if (*c == 'b')
      text.AddAccidentals(-1, unicode);
    else
      text.Add(*c);
}

// An extra tone: an alteration where the chord has a seventh and not the tone's
// role ("C7b9", "C7#11"), else an addition ("Cadd9", "Caddb9", "C7add13").
void AddExtra(CSymbolText& text, CSymbolBody const& body, CSymbolTone tone, bool unicode) {
  if (!body.WritesAsAlteration(tone)) {
    text.Add("add");
    if (tone.Degree == 7 && tone.Intvl == 11) return text.Add("maj7");
  }
  text.AddDegree(tone, unicode);
}

} // namespace

std::string LeadSheetSymbol(CChord const& chord, int style) {
  CSymbolChord const symbol = SymbolChordOf(chord);
  if (!symbol.Defined) return "N.C.";
  bool const unicode = (style & Sym_UnicodeSigns) != 0;
  CSymbolBody body = FindSymbolBody(symbol.Intvls, style);
  // A bass that is only an added tone stands after the slash alone: "C/D", not
  // "Cadd9/D" (the reader adds the bass to the chord).
  if (symbol.BassIntvl != 0 && (symbol.Intvls & 1u) != 0 && body.IsExtra(symbol.BassIntvl))
    body = FindSymbolBody(symbol.Intvls & ~(1u << symbol.BassIntvl), style);

  CSymbolText text;
  text.AddPitch(symbol.Root, unicode);
  AddTypeText(text, *body.Type, style);
  // Right after the root an alteration would read as the root's accidental ("Cb5"
  // is C flat 5), so there it goes into the parentheses: "C(b5)".
  bool const afterType = body.Type->Text[0] != '\0';
  if (afterType)
    for (int i = 0; i < body.AlteredCount; ++i) text.AddDegree(body.Altered[i], unicode);
  for (int i = 0; i < body.ExtraCount; ++i) AddExtra(text, body, body.Extra[i], unicode);

  bool open = false;
  auto item = [&] {
    text.Add(open ? ',' : '(');
    open = true;
  };
  if (!afterType)
    for (int i = 0; i < body.AlteredCount; ++i) {
      item();
      text.AddDegree(body.Altered[i], unicode);
    }
  for (int role : {Role_Root, Role_Third, Role_Fifth})
    if ((body.Omitted & (1u << role)) != 0) {
      item();
      text.Add(role == Role_Root ? "no1" : role == Role_Third ? "no3" : "no5");
    }
  if (open) text.Add(')');

  if (symbol.BassIntvl != 0) {
    text.Add('/');
    text.AddPitch(symbol.Bass, unicode);
  }
  return text.Str();
}
