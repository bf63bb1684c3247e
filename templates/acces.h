// Program ACCES: branches registered, bodies not built yet.
#pragma once

#include "branche.h"

class VNTEMAILAcces : public ProgrammeNonConstruit<Bseacc> {
 public:
  explicit VNTEMAILAcces(Evt* evt);
};
