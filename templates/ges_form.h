// Program GES_FORM: branches registered, bodies not built yet.
#pragma once

#include "branche.h"

class VNTEMAILGes_form : public ProgrammeNonConstruit<Bsegestion> {
 public:
  explicit VNTEMAILGes_form(Evt* evt);
};
