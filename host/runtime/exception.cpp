// Host failures: thrown as Exception* made in host memory.
#include <new>

#include "frame/host_runtime.h"
#include "host/runtime/program_state.h"

Exception::Exception(std::string categorie, std::string message, std::string detail)
    : categorie_(std::move(categorie)), message_(std::move(message)), detail_(std::move(detail)) {}

void Exception::nomBranche(std::string_view nom) { branche_ = host::upper_name(nom); }

void leverException(std::string categorie, std::string message, std::string detail) {
  Exception* e = hoteCreer<Exception>(std::move(categorie), std::move(message), std::move(detail));
  if (e == nullptr) throw std::bad_alloc();  // no memory even for the report
  throw e;
}
