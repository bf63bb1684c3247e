#include "transformer.h"

VNTEMAILTransformer::VNTEMAILTransformer(Evt* evt)
    : ProgrammeNonConstruit<Parcours>(evt, {
                                          "INIT",
                                          "DEBUT",
                                          "LIRE_LIENS",
                                          "SELECTION",
                                          "POUR_TOUT",
                                          "REMPLACER",
                                          "INTERPRETE",
                                          "SORTIE"}) {

}
