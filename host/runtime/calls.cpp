// Procedure calls, whole-program runs, launches, and the program kinds' flows.
#include "host/runtime/calls.h"

#include <memory>

#include "host/runtime/host.h"
#include "host/runtime/program_state.h"
#include "host/runtime/registry.h"
#include "host/runtime/value_text.h"

namespace host {
namespace {

// Pops the call frame even when a host failure goes through.
class Frame {
 public:
  explicit Frame(Host& h) : host_(h) { host_.push_frame(); }
  ~Frame() {
    if (!popped_) host_.pop_frame();
  }
  int pop() {
    popped_ = true;
    return host_.pop_frame();
  }

 private:
  Host& host_;
  bool popped_ = false;
};

// Safety net around a hook or handler: a failure a branch did not catch
// itself is logged here and never reaches the caller.
template <class F>
void shielded(Automate& p, const char* what, F&& f) {
  try {
    f();
  } catch (Exception* e) {
    Host& h = *p.etat().host;
    h.log("erreur", "Échec non rattrapé dans " + std::string(what) + " de " + p.etat().program + " : " + e->message(),
          e->detail());
    if (h.frame_code() == 0) h.set_frame_code(-1);
    hoteDetruire(e);
  } catch (const std::exception& e) {
    p.etat().host->log("erreur", "Échec dans " + std::string(what) + " de " + p.etat().program, e.what());
    if (p.etat().host->frame_code() == 0) p.etat().host->set_frame_code(-1);
  }
}

std::string full_name(const std::string& module, const std::string& program) {
  return upper_name(module) + "-" + upper_name(program);
}

void event_loop(Automate& p, Evt* evt) {
  Host& h = *p.etat().host;
  auto& s = p.etat();
  while (!s.ended) {
    ScreenAction a = h.dialogs().next_action(h.screen(s.program));
    if (a.kind == ScreenAction::Close) {
      shielded(p, "ABANDON", [&] { p.abandon(evt); });
      if (!s.ended) {
        h.log("info", "Écran " + s.screen + " fermé par l'hôte", "no more user action");
        s.ended = true;
      }
      break;
    }
    if (a.kind == ScreenAction::Set) {
      if (Donnee* d = s.variable(upper_name(a.name))) {
        d->affecter(text_value(a.value));
      } else {
        h.log("erreur", "Champ inconnu à l'écran : " + a.name);
      }
      continue;
    }
    s.rejected = false;
    EvtParamVal press{InfoCode{}};
    try {
      run_branch(p, a.name, &press);
    } catch (Exception* e) {
      h.log("erreur", e->message(), e->detail());
      hoteDetruire(e);
    }
  }
}

}  // namespace

void run_branch(Automate& program, const std::string& name, Evt* evt) {
  auto& s = program.etat();
  int element = 0;
  const Automate::Etat::Branche* b = s.find(name, &element);
  if (b == nullptr) {
    if (auto* inter = dynamic_cast<Bseinter*>(&program); inter && inter->procedureDeBase(upper_name(name), evt)) return;
    leverException("procedure", "Procédure inconnue : " + upper_name(name) + " du programme " + s.program,
                   "no branch " + name);
  }
  int saved = s.element;
  s.element = element;
  auto handler = b->handler;  // the branch may register or end things
  shielded(program, b->name.c_str(), [&] { handler(evt); });
  s.element = saved;
}

Automate* create_program(const std::string& name, Evt* evt) {
  const Module* m = Registry::instance().find(name);
  if (m == nullptr) leverException("programme", "Programme inconnu : " + name);
  Automate* p = m->fabrique ? m->fabrique(evt) : nullptr;
  if (p == nullptr) leverException("programme", "Impossible de créer le programme " + m->nom, "factory returned null");
  p->etat().program = m->nom;
  return p;
}

void destroy_program(Automate* program) noexcept { hoteDetruire(program); }

void run_program(Automate& p, Evt* evt) {
  auto& s = p.etat();
  auto step = [&](const char* what, auto&& f) {
    if (!s.ended) shielded(p, what, f);
  };
  step("INIT", [&] { p.init(evt); });
  if (auto* g = dynamic_cast<Bsegestion*>(&p)) step("AVANT_DEBUT", [&] { g->avant_debut(evt); });
  step("DEBUT", [&] { p.debut(evt); });
  if (auto* walk = dynamic_cast<Parcours*>(&p)) {
    if (!s.ended) shielded(p, "PARCOURS", [&] { walk_records(*walk, evt); });
    shielded(p, "SORTIE", [&] { p.sortie(evt); });
  } else if (dynamic_cast<Traitmnt*>(&p)) {
    step("FAIRE", [&] { p.faire(evt); });
  } else if (dynamic_cast<Traitecr*>(&p)) {
    if (auto* g = dynamic_cast<Bsegestion*>(&p)) step("DEBUT_FICHE", [&] { g->debut_fiche(evt); });
    if (auto* a = dynamic_cast<Bseacc*>(&p)) step("DEBUT_ACTIVATION", [&] { a->debut_activation(evt); });
    if (!s.ended) event_loop(p, evt);
  }
  s.ended = true;
}

int call_procedure(Host& host, Automate* caller, const std::string& base, const std::string& module,
                   const std::string& program, const std::string& procedure, Evt* evt) {
  Frame frame(host);
  if (module.empty() && program.empty()) {
    if (caller == nullptr) leverException("procedure", "Procédure sans programme : " + procedure);
    run_branch(*caller, procedure, evt);
  } else if (Registry::instance().find(full_name(module, program)) != nullptr) {
    std::unique_ptr<Automate, void (*)(Automate*)> p(create_program(full_name(module, program), evt), destroy_program);
    run_branch(*p, procedure, evt);
  } else if (const Procedure* proc = host.components().find(module, procedure)) {
    ComponentCall call{host, caller, evt, base};
    int code = 0;
    try {
      code = (*proc)(call);
    } catch (Exception*) {
      throw;
    } catch (const std::exception& e) {
      leverException("composant", "Échec du composant " + upper_name(module), e.what());
    }
    host.set_frame_code(code);
  } else {
    leverException("procedure", "Procédure inconnue : " + upper_name(module) + "." + upper_name(program) + "." +
                                    upper_name(procedure));
  }
  int code = frame.pop();
  if (caller) caller->etat().last_code = code;
  host.run_launched();
  return code;
}

int run_module(Host& host, Automate* caller, const std::string& module, const std::string& program, Evt* evt) {
  Frame frame(host);
  {
    std::unique_ptr<Automate, void (*)(Automate*)> p(create_program(full_name(module, program), evt), destroy_program);
    run_program(*p, evt);
  }  // destroyed here: in-out program variables give their values back
  int code = frame.pop();
  if (caller) caller->etat().last_code = code;
  host.run_launched();
  return code;
}

}  // namespace host

int Automate::appelerProcedure(std::string_view base, std::string_view module, std::string_view programme,
                               std::string_view procedure, Evt* evt, int) {
  return host::call_procedure(*etat().host, this, std::string(base), std::string(module), std::string(programme),
                              std::string(procedure), evt);
}

int Automate::appelerModule(std::string_view, std::string_view module, std::string_view programme, Evt* evt) {
  return host::run_module(*etat().host, this, std::string(module), std::string(programme), evt);
}

namespace {
struct OwnedEvent {
  void operator()(Evt* e) const noexcept { hoteDetruire(e); }
};
}  // namespace

void Automate::lancerModule(std::string_view, std::string_view module, std::string_view programme, Evt* evt) {
  host::Host* h = etat().host;
  if (evt) evt->modeAppel(1);
  auto owned = std::shared_ptr<Evt>(evt, OwnedEvent{});
  std::string m(module), p(programme);
  h->queue_launch([h, owned, m, p] {
    try {
      host::run_module(*h, nullptr, m, p, owned.get());
    } catch (Exception* e) {
      h->log("erreur", e->message(), e->detail());
      hoteDetruire(e);
    }
  });
}

void Automate::lancerProcedure(std::string_view base, std::string_view module, std::string_view programme,
                               std::string_view procedure, Evt* evt) {
  host::Host* h = etat().host;
  if (evt) evt->modeAppel(1);
  auto owned = std::shared_ptr<Evt>(evt, OwnedEvent{});
  std::string b(base), m(module), p(programme), proc(procedure);
  h->queue_launch([h, owned, b, m, p, proc] {
    try {
      host::call_procedure(*h, nullptr, b, m, p, proc, owned.get());
    } catch (Exception* e) {
      h->log("erreur", e->message(), e->detail());
      hoteDetruire(e);
    }
  });
}
