// Program SMAIL_FOR: branches registered, bodies not built yet.
#pragma once

#include "branche.h"

class VNTEMAILSmail_for : public ProgrammeNonConstruit<Fenetre_simple> {
 public:
  explicit VNTEMAILSmail_for(Evt* evt);
};
