#include "host/runtime/components.h"

#include "host/runtime/program_state.h"
#include "host/runtime/value_text.h"

namespace host {

std::string ComponentCall::text(int i) const { return evt ? to_text(evt->valeurParam(i)) : std::string(); }
long long ComponentCall::integer(int i) const { return evt ? to_integer(evt->valeurParam(i)) : 0; }
double ComponentCall::decimal(int i) const { return evt ? to_decimal(evt->valeurParam(i)) : 0; }
void ComponentCall::set_text(int i, std::string_view v) const {
  if (evt && i < evt->nbParams()) evt->ecrireParam(i, text_value(v));
}
void ComponentCall::set_integer(int i, long long v) const {
  if (evt && i < evt->nbParams()) evt->ecrireParam(i, integer_value(v));
}
void ComponentCall::set_decimal(int i, double v) const {
  if (evt && i < evt->nbParams()) evt->ecrireParam(i, decimal_value(v));
}

void Components::add(std::string_view component, std::string_view procedure, Procedure p) {
  procedures_[upper_name(component)][upper_name(procedure)] = std::move(p);
}

const Procedure* Components::find(std::string_view component, std::string_view procedure) const {
  auto c = procedures_.find(upper_name(component));
  if (c == procedures_.end()) return nullptr;
  auto p = c->second.find(upper_name(procedure));
  return p == c->second.end() ? nullptr : &p->second;
}

bool Components::has_component(std::string_view component) const {
  return procedures_.count(upper_name(component)) != 0;
}

}  // namespace host
