// Program TRANSFORMER: branches registered, bodies not built yet.
#pragma once

#include "branche.h"

class VNTEMAILTransformer : public ProgrammeNonConstruit<Parcours> {
 public:
  explicit VNTEMAILTransformer(Evt* evt);
};
