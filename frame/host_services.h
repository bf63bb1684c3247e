// The host's and the suite's components, as the module calls them.
//
// Every component procedure is reached with Automate::appelerProcedure(base,
// component, "INTERFACE", procedure, event, -1): base "*" for ordinary calls,
// "*1" for reads into the interface table "I_" + component. Parameters travel
// by reference (EvtParamRef) in the order given below; success is a method
// error code of 0.
#pragma once

#include <string_view>

namespace services {

inline constexpr std::string_view BASE_APPEL = "*";     ///< ordinary calls
inline constexpr std::string_view BASE_LECTURE = "*1";  ///< reads into an interface table
inline constexpr std::string_view PROGRAMME = "INTERFACE";
inline constexpr int DRAPEAU = -1;

/// Host mail component.
namespace sysmail {
inline constexpr std::string_view COMPOSANT = "SYSMAIL";
inline constexpr std::string_view MUET = "MUET";                          ///< (Entier 1: silent)
inline constexpr std::string_view NOUVELLE_SESSION = "NOUVELLE_SESSION";  ///< (Double session out, Entier modifier)
inline constexpr std::string_view NOUVEAU_MESSAGE = "NOUVEAU_MESSAGE";    ///< (Double message out, Chaine subject)
inline constexpr std::string_view AJOUTER_ADRESSE = "AJOUTER_ADRESSE";    ///< (message, kind "From"/"To"/"Cc"/"Bcc", address, display name)
inline constexpr std::string_view AJOUTER_ADRESSES = "AJOUTER_ADRESSES";  ///< (message, kind, ";"-separated list)
inline constexpr std::string_view MESSAGE_TEXTE = "MESSAGE_TEXTE";        ///< (message, body [, Entier 1 = HTML])
inline constexpr std::string_view AJOUTER_FICHIER = "AJOUTER_FICHIER";    ///< (message, full path)
inline constexpr std::string_view ENVOYER_MESSAGE = "ENVOYER_MESSAGE";    ///< (session, message)
inline constexpr std::string_view EFFACER_MESSAGE = "EFFACER_MESSAGE";    ///< (message)
inline constexpr std::string_view TERMINER_SESSION = "TERMINER_SESSION";  ///< (session)
inline constexpr std::string_view TEXTE_ERREUR = "TEXTE_ERREUR";          ///< (Chaine text out, Entier code)
}  // namespace sysmail

/// Whole text files.
namespace sysascii {
inline constexpr std::string_view COMPOSANT = "SYSASCII";
inline constexpr std::string_view LIRE_FICHIER = "LIRE_FICHIER";      ///< (path, Chaine content out)
inline constexpr std::string_view ECRIRE_FICHIER = "ECRIRE_FICHIER";  ///< (path, content)
}  // namespace sysascii

/// Users.
namespace sysutil {
inline constexpr std::string_view COMPOSANT = "SYSUTIL";
inline constexpr std::string_view LECTURE_CODE = "LECTURE_CODE";  ///< (user code) into I_SYSUTIL
}  // namespace sysutil

/// Rights.
namespace sysdroit {
inline constexpr std::string_view COMPOSANT = "SYSDROIT";
inline constexpr std::string_view LECTURE_DROITS_COURANTS_CODES = "LECTURE_DROITS_COURANTS_CODES";  ///< (domain, right) into I_SYSDROIT.DROITS
}  // namespace sysdroit

/// Document store.
namespace sysged {
inline constexpr std::string_view COMPOSANT = "SYSGED";
inline constexpr std::string_view AJOUTER = "AJOUTER";  ///< (component, document identifier, file path)
}  // namespace sysged

/// Field picker, component and application catalogue.
namespace syschamp {
inline constexpr std::string_view COMPOSANT = "SYSCHAMP";
inline constexpr std::string_view CHOIX_CHAMPS_MONO = "CHOIX_CHAMPS_MONO";
}  // namespace syschamp
namespace syscompo {
inline constexpr std::string_view COMPOSANT = "SYSCOMPO";
}
namespace sysappli {
inline constexpr std::string_view COMPOSANT = "SYSAPPLI";
}

/// Procedures every document or party component answers.
inline constexpr std::string_view LECTURE = "LECTURE";            ///< (identifier) into "I_" + component; none for VNTSTE
inline constexpr std::string_view LECTURE_CODE = "LECTURE_CODE";  ///< (code) into "I_" + component

/// Party pickers: cancel gives 1; the address pickers give 2 for replace mode.
inline constexpr std::string_view CHOIX_CLIENT_EI = "CHOIX_CLIENT_EI";  ///< (address out, Entier replace, Entier e-invoice)
inline constexpr std::string_view CHOIX_FOUR_EI = "CHOIX_FOUR_EI";      ///< (address out, Entier replace)
inline constexpr std::string_view CHOIX_CONTA = "CHOIX_CONTA";          ///< (identifier out, Entier replace [, Entier e-invoice])
inline constexpr std::string_view CHOIX_REPR = "CHOIX_REPR";            ///< (identifier out, Entier replace)
inline constexpr std::string_view CHOIX_APPOR = "CHOIX_APPOR";          ///< (identifier out, Entier replace)

/// Suite components.
namespace vntste {
inline constexpr std::string_view COMPOSANT = "VNTSTE";  ///< company record: RSOC, MAPIMODIF, SAUVEPDF
}
namespace vntutil {
inline constexpr std::string_view COMPOSANT = "VNTUTIL";
inline constexpr std::string_view LIT_PREF = "LIT_PREF";      ///< ("", preference name, value out)
inline constexpr std::string_view ECRIT_PREF = "ECRIT_PREF";  ///< ("", preference name, value)
}  // namespace vntutil
namespace vntparam {
inline constexpr std::string_view COMPOSANT = "VNTPARAM";
inline constexpr std::string_view PARAMETRER_SMTP = "PARAMETRER_SMTP";  ///< () the user edits the mail settings
}  // namespace vntparam
namespace vntefac {
inline constexpr std::string_view COMPOSANT = "VNTEFAC";
inline constexpr std::string_view ENVOYER_EFACTURE = "ENVOYER_EFACTURE";
}  // namespace vntefac

}  // namespace services
