#pragma once

#include "runtime/Text.h"

#include <sqlite3.h>

#include <cstdint>
#include <memory>
#include <span>
#include <string>
#include <vector>

namespace quendra::platform::linux_ {

/// One statement of a database, with its arguments bound in their order. Texts are bytes of the code page
/// here and UTF-8 in the file.
class Statement {
 public:
  Statement(sqlite3* database, const char* sql) {
    sqlite3_stmt* prepared = nullptr;
    result_ = ::sqlite3_prepare_v2(database, sql, -1, &prepared, nullptr);
    statement_.reset(prepared);
  }

  Statement& With(std::int64_t number) {
    if (statement_) Note(::sqlite3_bind_int64(statement_.get(), ++bound_, number));
    return *this;
  }
  Statement& With(const std::string& text) {
    const std::string bytes = ToUtf8(FromCodePage(text));
    if (statement_)
      Note(::sqlite3_bind_text64(statement_.get(), ++bound_, bytes.data(), bytes.size(), SQLITE_TRANSIENT,
                                 SQLITE_UTF8));
    return *this;
  }
  Statement& With(std::span<const std::uint8_t> data) {
    static constexpr std::uint8_t kNothing = 0; // no bytes are a value, too, and not a missing one
    const void* start = data.empty() ? &kNothing : data.data();
    if (statement_)
      Note(::sqlite3_bind_blob64(statement_.get(), ++bound_, start, data.size(), SQLITE_TRANSIENT));
    return *this;
  }

  /// SQLITE_ROW, SQLITE_DONE or what went wrong, also before.
  int Step() { return result_ == SQLITE_OK ? ::sqlite3_step(statement_.get()) : result_; }

  std::int64_t Number(int column) const { return ::sqlite3_column_int64(statement_.get(), column); }
  std::string Name(int column) const { return ToCodePage(FromUtf8(Bytes(column))); }
  std::vector<std::uint8_t> Data(int column) const {
    const std::string_view bytes = Bytes(column);
    return {bytes.begin(), bytes.end()};
  }

 private:
  struct Finish {
    void operator()(sqlite3_stmt* statement) const { ::sqlite3_finalize(statement); }
  };

  void Note(int result) {
    if (result_ == SQLITE_OK) result_ = result;
  }
  std::string_view Bytes(int column) const {
    const auto* start = static_cast<const char*>(::sqlite3_column_blob(statement_.get(), column));
    if (start == nullptr) return {};
    return {start, static_cast<std::size_t>(::sqlite3_column_bytes(statement_.get(), column))};
  }

  std::unique_ptr<sqlite3_stmt, Finish> statement_;
  int result_ = SQLITE_OK;
  int bound_ = 0;
};

/// A change that is made as a whole or not at all.
class Transaction {
 public:
  explicit Transaction(sqlite3* database) : database_(database) {
    result_ = ::sqlite3_exec(database_, "BEGIN IMMEDIATE", nullptr, nullptr, nullptr);
  }
  ~Transaction() { ::sqlite3_exec(database_, "ROLLBACK", nullptr, nullptr, nullptr); }
  Transaction(const Transaction&) = delete;

  int Begun() const { return result_; }
  int Commit() { return ::sqlite3_exec(database_, "COMMIT", nullptr, nullptr, nullptr); }

 private:
  sqlite3* database_;
  int result_;
};

} // namespace quendra::platform::linux_
