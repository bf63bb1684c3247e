#include "host/runtime/storage/selection.h"

namespace host::storage {

Result<Operator> parse_operator(std::string_view symbol) {
  if (symbol == "=") return Operator::Equal;
  if (symbol == "/") return Operator::BeginsWith;
  if (symbol == "#") return Operator::Differs;
  if (symbol == "<") return Operator::Less;
  if (symbol == "<=") return Operator::LessOrEqual;
  if (symbol == ">") return Operator::Greater;
  if (symbol == ">=") return Operator::GreaterOrEqual;
  return Error{ErrorKind::UnknownName,
               "L'opérateur \"" + std::string(symbol) + "\" est inconnu (opérateurs : =, /, #, <, <=, >, >=).",
               "unknown criterion operator"};
}

}  // namespace host::storage
