// Outcome of every storage operation: success, a value, or an error that
// carries a French message for the user and a technical detail for the log.
// Nothing in this library throws to its callers.
#pragma once

#include <optional>
#include <string>
#include <utility>
#include <variant>

namespace host::storage {

/// What went wrong, for callers that react differently (a missing record is not a broken file).
enum class ErrorKind {
  NotFound,      ///< no record with that key
  Duplicate,     ///< a record with that key already exists
  TooLong,       ///< a value longer than its field's width
  InvalidValue,  ///< a value that is not of its field's kind, or text that is not valid UTF-8
  UnknownName,   ///< a table, field, entry or operator that the definitions do not have
  Busy,          ///< another process kept the file locked longer than the busy timeout
  NewerFile,     ///< the file was written by a later release of the host
  Failure,       ///< anything else that SQLite or the file system reported
};

/// One failure: the category, what the user reads, what the developer reads.
struct Error {
  ErrorKind kind = ErrorKind::Failure;  ///< category, for the caller's decisions
  std::string message;                  ///< French, shown to the user as it stands
  std::string detail;                   ///< technical: SQLite's message, the statement, the path
};

/// Success, or one Error.
class [[nodiscard]] Status {
 public:
  /// Success.
  Status() = default;
  /// Failure; implicit so that `return Error{...};` reads naturally.
  Status(Error error) : error_(std::move(error)) {}

  /// True on success.
  bool ok() const noexcept { return !error_.has_value(); }
  explicit operator bool() const noexcept { return ok(); }
  /// The failure; only when !ok() (otherwise std::bad_optional_access: a programming error).
  const Error& error() const { return error_.value(); }

 private:
  std::optional<Error> error_;  // empty on success
};

/// A value of type T, or one Error.
template <class T>
class [[nodiscard]] Result {
 public:
  /// Success with a value.
  Result(T value) : state_(std::in_place_index<0>, std::move(value)) {}
  /// Failure.
  Result(Error error) : state_(std::in_place_index<1>, std::move(error)) {}

  /// True when a value is held.
  bool ok() const noexcept { return state_.index() == 0; }
  explicit operator bool() const noexcept { return ok(); }

  /// The value; only when ok() (otherwise std::bad_variant_access: a programming error).
  T& value() & { return std::get<0>(state_); }
  const T& value() const& { return std::get<0>(state_); }
  T&& value() && { return std::get<0>(std::move(state_)); }
  T* operator->() { return &value(); }
  const T* operator->() const { return &value(); }
  T& operator*() & { return value(); }
  const T& operator*() const& { return value(); }

  /// The failure; only when !ok() (otherwise std::bad_variant_access).
  const Error& error() const { return std::get<1>(state_); }
  /// The outcome without the value.
  Status status() const { return ok() ? Status() : Status(error()); }

 private:
  std::variant<T, Error> state_;  // index 0: value, 1: error
};

}  // namespace host::storage
