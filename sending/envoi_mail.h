// Program ENVOI_MAIL: branches registered, bodies not built yet.
#pragma once

#include "branche.h"

class VNTEMAILEnvoi_mail : public ProgrammeNonConstruit<Traitmnt> {
 public:
  explicit VNTEMAILEnvoi_mail(Evt* evt);
};
