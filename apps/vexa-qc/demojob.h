#pragma once

#include "storesession.h"

namespace vexa {

// Grows a loaded job to `trials` trials for demonstrations and measurements: its own trials
// repeated in turn, each copy with a small deterministic change of lightness and hue, named
// "<original> #n". A job already that large, or without trials, stays as it is. The copies
// live in memory only; nothing is written to the store.
void enlargeJob(LoadedJob &job, int trials);

} // namespace vexa
