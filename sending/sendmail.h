// Program SENDMAIL: branches registered, bodies not built yet.
#pragma once

#include "branche.h"

class VNTEMAILSendmail : public ProgrammeNonConstruit<Fenetre_simple> {
 public:
  explicit VNTEMAILSendmail(Evt* evt);
};
