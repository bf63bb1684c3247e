// Program GESTION: branches registered, bodies not built yet.
#pragma once

#include "branche.h"

class VNTEMAILGestion : public ProgrammeNonConstruit<Bsegestion> {
 public:
  explicit VNTEMAILGestion(Evt* evt);
};
