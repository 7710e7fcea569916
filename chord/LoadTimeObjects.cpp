// The library's process-wide objects, defined in one translation unit so that they
// are built in this order when the library is loaded: a later object may use the
// earlier ones.
#include "Chord.h"
#include "Note.h"
#include "chord/NetInputCount.h"

// The undefined note; see Note.h.
extern TONVEX_API const CNote CNote_Undef(255, Enh_Natural);

// The undefined chord; see Chord.h. Its wrap interval is the built-in net's input
// count.
extern TONVEX_API const CChord CChord_Undef(CNote(255, Enh_Natural), CChord::bc_none, NetInputCount);
