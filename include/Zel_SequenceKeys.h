// Zel_SequenceKeys: the server's names of the two special sequence kinds.
//
// Constant texts like those of Zel_PropertyKeys.h, initialised when the
// library is loaded and never changed; case and blanks are significant.
#ifndef ZEL_SEQUENCEKEYS_H
#define ZEL_SEQUENCEKEYS_H

#include "zel_export.h"

#include <QString>

extern ZEL_EXPORT const QString Zel_MasterAndSonarisSequence; // "Master and Sonaris Sequence"
extern ZEL_EXPORT const QString Zel_SonarisSequence;          // "Sonaris_Sequence"

#endif
