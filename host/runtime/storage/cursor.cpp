#include "host/runtime/storage/cursor.h"

#include <sqlite3.h>

#include <utility>

#include "host/runtime/storage/table_state.h"

namespace host::storage {

Cursor::Cursor(std::shared_ptr<detail::Session> session, detail::TableState* state, std::string sql,
               detail::Statement statement, Record record)
    : session_(std::move(session)),
      state_(state),
      sql_(std::move(sql)),
      statement_(std::move(statement)),
      record_(std::move(record)) {}

Cursor& Cursor::operator=(Cursor&& other) noexcept {
  if (this != &other) {
    close();
    session_ = std::move(other.session_);
    state_ = other.state_;
    sql_ = std::move(other.sql_);
    statement_ = std::move(other.statement_);
    record_ = std::move(other.record_);
    position_ = other.position_;
  }
  return *this;
}

Cursor::~Cursor() { close(); }

void Cursor::close() noexcept {
  position_ = Position::End;
  if (statement_ && state_ != nullptr) detail::give_back_statement(*state_, sql_, std::move(statement_));
  statement_ = detail::Statement();
}

Result<bool> Cursor::first() {
  if (!statement_) return false;
  // Reset keeps the bound parameters: the same selection runs again from its start.
  sqlite3_reset(statement_.get());
  position_ = Position::Before;
  return step();
}

Result<bool> Cursor::next() {
  if (position_ == Position::End) return false;
  if (position_ == Position::Before) return first();
  return step();
}

Result<bool> Cursor::step() {
  int rc = sqlite3_step(statement_.get());
  if (rc == SQLITE_ROW) {
    detail::load_row(statement_.get(), record_);
    position_ = Position::On;
    return true;
  }
  position_ = Position::End;
  // Ending the run releases the read snapshot at once; first() may run it again.
  sqlite3_reset(statement_.get());
  if (rc == SQLITE_DONE) return false;
  return session_->connection->error(rc, "step " + sql_);
}

}  // namespace host::storage
