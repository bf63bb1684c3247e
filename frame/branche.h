// The failure handling every branch shares, in one place.
//
// A branch body runs under executerBranche: a host failure (a thrown
// Exception*) is named after the branch, attached to the branch's event (or
// to a new by-value event when there is none) and handed to the program's
// `exception` operation; the branch then ends normally. No branch throws.
#pragma once

#include <exception>
#include <initializer_list>
#include <string_view>

#include "host_runtime.h"

/// Reports a caught failure as the branch `nom` (upper-cased; "ACHETEUR__1__3"
/// for an array branch). Takes ownership of `e`.
void signalerEchec(Automate& programme, std::string_view nom, Evt* evt, Exception* e) noexcept;

/// Runs `corps` as the body of branch `nom`.
template <class Corps>
void executerBranche(Automate& programme, std::string_view nom, Evt* evt, Corps&& corps) noexcept {
  try {
    corps();
  } catch (Exception* e) {
    signalerEchec(programme, nom, evt, e);
  } catch (const std::exception& e) {
    signalerEchec(programme, nom, evt, hoteCreer<Exception>("interne", "Erreur interne", e.what()));
  } catch (...) {
    signalerEchec(programme, nom, evt, hoteCreer<Exception>("interne", "Erreur interne", "unknown exception"));
  }
}

/// Method error code of a branch whose body is not built yet.
inline constexpr int CODE_BRANCHE_NON_CONSTRUITE = 99;

/// Body of a branch not built yet: it reports CODE_BRANCHE_NON_CONSTRUITE, never success.
void brancheNonConstruite(Automate& programme, std::string_view nom, Evt* evt);

/// A program whose branches are registered but not built yet: each branch and
/// each hook the host calls reports CODE_BRANCHE_NON_CONSTRUITE, and the
/// program ends at its first hook.
template <class Base>
class ProgrammeNonConstruit : public Base {
 public:
  ProgrammeNonConstruit(Evt* evt, std::initializer_list<std::string_view> branches) : Base(evt) {
    for (std::string_view nom : branches)
      this->addBranch(nom, [this, nom](Evt* e) { brancheNonConstruite(*this, nom, e); });
  }
  void init(Evt* evt) override {
    brancheNonConstruite(*this, "INIT", evt);
    this->sortir(evt, 0);
  }
};
