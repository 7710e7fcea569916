// The process-wide naming preferences and their defaults.
#include "ChordnamePref.h"

int CChordnamePref::NoteNr_60_is = 0;
int CChordnamePref::HarmFuncNaming = 0;
int CChordnamePref::ChordOptionSep = 0;
int CChordnamePref::PreferSlashChordIfMoreNotesThan = 4;
int CChordnamePref::SeparateBlocksInNames = 0;
int CChordnamePref::PreferSlashChord = 0;
int CChordnamePref::InversionAsName = 0;
int CChordnamePref::ShowInversion = 0;
int CChordnamePref::NoDoubleSigns = 0;
int CChordnamePref::NarrowChordsWithoutSlash = 1;
int CChordnamePref::OmitOptionOfLonelyLowestNoteInWideChord = 1;
int CChordnamePref::Maj7ShownAs = 0;
int CChordnamePref::MinorSmall = 0;
int CChordnamePref::RomanNames = 0;
int CChordnamePref::AccidentalsAsLetters = 0;
int CChordnamePref::Bb_is_B = 0;
int CChordnamePref::B_is_H = 0;

CChordnamePref DefaultChordnamePref;
