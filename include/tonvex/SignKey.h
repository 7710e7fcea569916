// Keys: a key signature with its tonic, major or minor.
//
// A CSignKey is a CScale that can only be major or minor; it holds one privately,
// so no other scale type can be given to it, and hands it out with Scale(). Its
// spelling table and sign count are those of that scale.
#ifndef TONVEX_SIGNKEY_H
#define TONVEX_SIGNKEY_H

#include "ChordnamePref.h"
#include "Note.h"
#include "Scale.h"
#include "TonvexExport.h"

#include <string>

class TONVEX_API CSignKey {
public:
  /// 1 major, 2 minor. Every other value given to a constructor or setter means
  /// minor.
  enum TType : int { SignKey_Major = 1, SignKey_Minor = 2 };

  /// C major.
  CSignKey();
  /// The root is reduced to its key number (a negative note number gives key
  /// number 0), keeps its spelling and is checked with CheckEnh; the spelling
  /// table is that of the major or minor scale on it.
  CSignKey(CNote const& root, TType const& type);

  /// As the constructor.
  void SetRootNoteAndSignKeyType(CNote root, TType type);
  /// Root as in the constructor; the type is kept.
  void SetRootNote(CNote const& root);
  /// Switches between major (1) and minor (any other value); the spelling table is
  /// recomputed only when the type changes.
  void SetSignKeyType(TType type);

  /// SignKey_Major or SignKey_Minor.
  TType SignKeyType() const;
  /// The tonic: note number 0..11, spelled.
  CNote RootNote() const { return Scale_.RootNote(); }
  /// The key as a scale of type major or minor.
  CScale const& Scale() const { return Scale_; }
  /// Sharps positive, flats negative (CScale::SignsCount).
  int SignsCount() const { return Scale_.SignsCount(); }

  /// The tonic's name under the naming preferences (no octave), followed by "m"
  /// for a minor key in every naming system: "C", "Am", "F#m", "Eb"; German "Es",
  /// "Fism"; solmisation "Do", "Lam".
  std::string Name(CChordnamePref& pref) const;

private:
  CScale Scale_;
};

#endif
