// Program AJOUT_VAR_PRED: branches registered, bodies not built yet.
#pragma once

#include "branche.h"

class VNTEMAILAjout_var_pred : public ProgrammeNonConstruit<Traitecr> {
 public:
  explicit VNTEMAILAjout_var_pred(Evt* evt);
};
