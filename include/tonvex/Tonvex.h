// Tonvex: chord analysis and chord naming. Include this header to get the whole
// public interface.
#ifndef TONVEX_H
#define TONVEX_H

#include "Chord.h"
#include "ChordAnalysisNet.h"
#include "ChordSymbol.h"
#include "ChordTimeline.h"
#include "ChordTypes.h"
#include "ChordnamePref.h"
#include "IntvlSet.h"
#include "MidiFile.h"
#include "MySet.h"
#include "NetProperties.h"
#include "Neuron.h"
#include "NeuronalNet.h"
#include "Note.h"
#include "NoteNames.h"
#include "Scale.h"
#include "SignKey.h"
#include "TonvexExport.h"
#include "TonvexVersion.h"
#include "TrainingPattern.h"

#endif
