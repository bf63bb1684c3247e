// vntemail: the command people and scripts run.
#include <CLI/CLI.hpp>
#include <fmt/format.h>

#include <cstdlib>
#include <memory>

#include "cli/call_args.h"
#include "cli/session.h"
#include "host/runtime/calls.h"

int main(int argc, char** argv) {
  CLI::App app{"VNTEMAIL : envoi des documents par e-mail"};
  app.require_subcommand(1);
  cli::GlobalOptions global;
  app.add_option("--data", global.data_dir, "Dossier des données (variable VNTEMAIL_DATA)")->envname("VNTEMAIL_DATA");
  app.add_option("--user", global.user, "Utilisateur courant (variable VNTEMAIL_USER, défaut : le nom de connexion)")
      ->envname("VNTEMAIL_USER");
  app.add_flag("--verbose,-v", global.verbose, "Affiche le détail technique des erreurs");

  std::string module, program, procedure;
  std::vector<std::string> args;
  bool json = false;
  auto* call = app.add_subcommand("call", "Appelle une procédure : MODULE PROGRAMME PROCEDURE [ARG...]");
  call->add_option("module", module, "Module (VNTEMAIL, ou un composant comme SYSMAIL)")->required();
  call->add_option("program", program, "Programme (INTERFACE...)")->required();
  call->add_option("procedure", procedure, "Procédure")->required();
  call->add_option("args", args, "Paramètres par référence : texte, int:N, dec:N");
  call->add_flag("--json", json, "Résultat en JSON");

  auto* run = app.add_subcommand("run", "Exécute un programme jusqu'à sa fin : MODULE PROGRAMME [ARG...]");
  run->add_option("module", module, "Module")->required();
  run->add_option("program", program, "Programme")->required();
  run->add_option("args", args, "Paramètres par référence : texte, int:N, dec:N");
  run->add_flag("--json", json, "Résultat en JSON");

  try {
    app.parse(argc, argv);
  } catch (const CLI::ParseError& e) {
    int rc = app.exit(e);
    return rc == 0 ? 0 : 2;
  }

  cli::Session session(global);
  auto params = cli::make_arguments(args);
  std::vector<Donnee*> refs;
  for (auto& p : params) refs.push_back(p.get());
  return session.guarded([&]() -> int {
    auto evt = cli::make_event(refs);
    int code = 0;
    if (call->parsed()) {
      code = host::call_procedure(session.host(), nullptr, "*", module, program, procedure, evt.get());
    } else {
      code = host::run_module(session.host(), nullptr, module, program, evt.get());
    }
    std::fputs(cli::format_outcome(code, params, json).c_str(), stdout);
    return code == 0 ? 0 : 1;
  });
}
