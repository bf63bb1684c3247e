// A second process reads while the first writes, without "database is locked".
#include <gtest/gtest.h>
#include <poll.h>
#include <sys/wait.h>
#include <unistd.h>

#include <chrono>
#include <string>

#include "storage_fixture.h"

namespace storage_test {
namespace {

constexpr int initial_records = 200;

std::string message_of(int n) { return "Message fixe n° " + std::to_string(n) + " ; « é »"; }

// Child process: reads, counts and walks until `stop` is closed; one byte on `progress` per
// round; on a failure, its message on `progress` and exit status 1.
[[noreturn]] void read_until_stopped(const std::filesystem::path& folder, int stop, int progress) {
  auto fail = [&](const std::string& what) {
    std::string text = "!" + what;
    (void)!write(progress, text.data(), text.size());
    _exit(1);
  };
  auto db = Database::open(folder, test_catalog());
  if (!db) fail("open: " + db.error().message + " " + db.error().detail);
  auto templates = db->table("GESCOM", "VNTEMAIL");
  for (int round = 0;; ++round) {
    pollfd stopped{stop, POLLIN, 0};
    if (poll(&stopped, 1, 0) > 0) _exit(0);
    int n = 1 + round % initial_records;
    auto record = templates->read("R" + std::to_string(n));
    if (!record) fail("read: " + record.error().message + " " + record.error().detail);
    if (record->get("MESSAGE_EMAIL") != message_of(n)) fail("read a wrong record");
    auto count = templates->count();
    if (!count) fail("count: " + count.error().message + " " + count.error().detail);
    if (*count < initial_records) fail("count too small");
    auto cursor = templates->select({{{"CODE", 1, Operator::BeginsWith, "R"}}, {}});
    if (!cursor) fail("select: " + cursor.error().message);
    int walked = 0;
    for (;;) {
      auto more = cursor->next();
      if (!more) fail("walk: " + more.error().message + " " + more.error().detail);
      if (!*more) break;
      ++walked;
    }
    if (walked != initial_records) fail("walk saw " + std::to_string(walked));
    if (write(progress, ".", 1) != 1) _exit(2);
  }
}

TEST(Readers, ASecondProcessReadsWhileTheFirstWrites) {
  TempFolder folder;
  {
    Database db = open_or_fail(folder.path());
    StoredTable templates = table_or_fail(db, "GESCOM", "VNTEMAIL");
    auto transaction = db.begin();
    for (int n = 1; n <= initial_records; ++n) {
      ASSERT_TRUE(templates.insert(make_record(templates, {{"CODE", "R" + std::to_string(n)},
                                                           {"DESIG", "v0"},
                                                           {"MESSAGE_EMAIL", message_of(n)}}))
                      .ok());
    }
    ASSERT_TRUE(transaction->commit().ok());
  }  // closed before the fork

  int stop[2], progress[2];
  ASSERT_EQ(pipe(stop), 0);
  ASSERT_EQ(pipe(progress), 0);
  pid_t child = fork();
  ASSERT_GE(child, 0);
  if (child == 0) {
    close(stop[1]);
    close(progress[0]);
    read_until_stopped(folder.path(), stop[0], progress[1]);
  }
  close(stop[0]);
  close(progress[1]);

  Database db = open_or_fail(folder.path());
  StoredTable templates = table_or_fail(db, "GESCOM", "VNTEMAIL");
  std::string reports;
  int written = 0;
  auto deadline = std::chrono::steady_clock::now() + std::chrono::seconds(20);
  // Write until the reader has done enough rounds alongside, each write its own transaction.
  while ((written < 150 || std::count(reports.begin(), reports.end(), '.') < 30) &&
         reports.find('!') == std::string::npos && std::chrono::steady_clock::now() < deadline) {
    ++written;
    Status status = templates.insert(make_record(templates, {{"CODE", "W" + std::to_string(written)}}));
    ASSERT_TRUE(status.ok()) << status.error().message << " " << status.error().detail;
    Record updated = *templates.read("R" + std::to_string(1 + written % initial_records));
    ASSERT_TRUE(updated.set("DESIG", "v" + std::to_string(written)).ok());
    status = templates.update(updated);
    ASSERT_TRUE(status.ok()) << status.error().message << " " << status.error().detail;
    pollfd ready{progress[0], POLLIN, 0};
    while (poll(&ready, 1, 0) > 0) {
      char buffer[256];
      ssize_t got = read(progress[0], buffer, sizeof buffer);
      if (got <= 0) break;
      reports.append(buffer, static_cast<std::size_t>(got));
    }
  }
  close(stop[1]);
  int status = 0;
  waitpid(child, &status, 0);
  char buffer[256];
  ssize_t got;
  while ((got = read(progress[0], buffer, sizeof buffer)) > 0) reports.append(buffer, static_cast<std::size_t>(got));
  close(progress[0]);

  auto failure = reports.find('!');
  EXPECT_EQ(failure, std::string::npos) << reports.substr(failure == std::string::npos ? 0 : failure);
  ASSERT_TRUE(WIFEXITED(status));
  EXPECT_EQ(WEXITSTATUS(status), 0);
  EXPECT_GE(std::count(reports.begin(), reports.end(), '.'), 30);
  EXPECT_EQ(*templates.count(), initial_records + written);
}

}  // namespace
}  // namespace storage_test
