// Program SENDEFAC: branches registered, bodies not built yet.
#pragma once

#include "branche.h"

class VNTEMAILSendefac : public ProgrammeNonConstruit<Traitecr> {
 public:
  explicit VNTEMAILSendefac(Evt* evt);
};
