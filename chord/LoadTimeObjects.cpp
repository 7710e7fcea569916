// The library's process-wide objects, defined in one translation unit so that they
// are built in this order when the library is loaded: a later object may use the
// earlier ones.
#include "Chord.h"
#include "ChordAnalysisNet.h"
#include "Note.h"
#include "chord/NetForSingleChordAnalysis.h"
#include "chord/NetRootWinners.h"
#include "chord/RootSpellings.h"

// The undefined note; see Note.h.
extern TONVEX_API const CNote CNote_Undef(255, Enh_Natural);

// The undefined chord; see Chord.h. Its wrap interval is the built-in net's input
// count, read from the net's record (constant-initialised, so ready before any
// object here is built).
extern TONVEX_API const CChord CChord_Undef(CNote(255, Enh_Natural), CChord::bc_none,
                                            ChordAnalysisNeuronalNet.fixed.input_count);

// The built-in chord analysis net; see chord/NetForSingleChordAnalysis.h. The
// weights come from the record's own pointer, the second argument is ignored.
NeuronalNet NetForSingleChordAnalysis(ChordAnalysisNeuronalNet, weight_definitions);

// Root finding's answers from that net, found while the Neuron parameters are the
// ones its construction has just set; see chord/NetRootWinners.h.
const CNetRootWinners NetRootWinners(NetForSingleChordAnalysis);

// The spellings root finding gives; see chord/RootSpellings.h.
const CRootSpellings RootSpellings;
