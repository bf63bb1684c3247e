// Program INTERFACE: branches registered, bodies not built yet.
#pragma once

#include "branche.h"

class VNTEMAILInterface : public ProgrammeNonConstruit<Bseinter> {
 public:
  explicit VNTEMAILInterface(Evt* evt);
};
