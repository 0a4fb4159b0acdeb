#include "robotconfig/host/PidSettings.h"

const TPidSettings emptyPidSettings = {0, 0, 0, 0, 0, 0, 0, 0};

void TPidSettings::copyPidSettings(const TPidSettings *pSource) { *this = pSource ? *pSource : emptyPidSettings; }

bool TPidSettings::bIdenticalPidSettings(const TPidSettings &other) const {
  return B1 == other.B1 && B2 == other.B2 && B3 == other.B3 && B4 == other.B4 && W1 == other.W1 && W2 == other.W2 &&
         W3 == other.W3 && W4 == other.W4;
}

void TPidSettings::clearPidSettings() { *this = emptyPidSettings; }
