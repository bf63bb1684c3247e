// A writer killed at a random point loses nothing it reported committed.
#include <gtest/gtest.h>
#include <signal.h>
#include <sys/wait.h>
#include <unistd.h>

#include <chrono>
#include <cstdint>
#include <random>
#include <thread>
#include <vector>

#include "storage_fixture.h"

namespace storage_test {
namespace {

// The record the writer writes as number n: long multi-byte texts, so that pages split.
Record numbered_template(const StoredTable& templates, std::int32_t n) {
  std::string number = std::to_string(n);
  Record record = make_record(templates, {{"CODE", "C" + number},
                                          {"DESIG", "Modèle n° " + number + " ; « enregistré »"},
                                          {"OBJET_EMAIL", "Objet |" + number + "| été"},
                                          {"MESSAGE_EMAIL", std::string(200, 'm') + "é" + number},
                                          {"MESSAGE_EMAIL2", "suite\r\n" + number},
                                          {"DATE_CREATION", "2024-03-15"}});
  EXPECT_TRUE(record.set("NOMTAG", 1 + n % 10, "TAG" + number).ok());
  return record;
}

// Child process: writes numbered records until killed, reporting each commit on `report`.
[[noreturn]] void write_until_killed(const std::filesystem::path& folder, int report) {
  auto db = Database::open(folder, test_catalog());
  if (!db) _exit(2);
  auto templates = db->table("GESCOM", "VNTEMAIL");
  if (!templates) _exit(3);
  for (std::int32_t n = 1;; ++n) {
    if (n % 7 == 0) {
      // Some commits carry two records at once.
      auto transaction = db->begin();
      if (!transaction || !templates->insert(numbered_template(*templates, n)).ok() ||
          !templates->insert(numbered_template(*templates, n + 1)).ok() || !transaction->commit().ok()) {
        _exit(4);
      }
      std::int32_t both[] = {n, n + 1};
      if (write(report, both, sizeof both) != sizeof both) _exit(5);
      ++n;
      continue;
    }
    if (!templates->insert(numbered_template(*templates, n)).ok()) _exit(4);
    if (write(report, &n, sizeof n) != sizeof n) _exit(5);
  }
}

TEST(Crash, RecordsReportedCommittedSurviveAKill) {
  std::random_device device;
  unsigned seed = device();
  std::mt19937 random(seed);
  SCOPED_TRACE("seed " + std::to_string(seed));
  for (int round = 0; round < 3; ++round) {
    TempFolder folder;
    { Database made = open_or_fail(folder.path()); }  // no connection is open across the fork

    int pipe_ends[2];
    ASSERT_EQ(pipe(pipe_ends), 0);
    pid_t child = fork();
    ASSERT_GE(child, 0);
    if (child == 0) {
      close(pipe_ends[0]);
      write_until_killed(folder.path(), pipe_ends[1]);
    }
    close(pipe_ends[1]);

    std::vector<std::int32_t> committed;
    std::int32_t n = 0;
    ASSERT_EQ(read(pipe_ends[0], &n, sizeof n), static_cast<ssize_t>(sizeof n)) << "the writer never committed";
    committed.push_back(n);
    std::this_thread::sleep_for(std::chrono::milliseconds(std::uniform_int_distribution<int>(20, 400)(random)));
    kill(child, SIGKILL);
    int status = 0;
    waitpid(child, &status, 0);
    ASSERT_TRUE(WIFSIGNALED(status)) << "writer ended on its own with " << WEXITSTATUS(status);
    // Everything written to the pipe before the kill is still there to read.
    while (read(pipe_ends[0], &n, sizeof n) == static_cast<ssize_t>(sizeof n)) committed.push_back(n);
    close(pipe_ends[0]);

    Database db = open_or_fail(folder.path());
    Status integrity = db.check_integrity();
    ASSERT_TRUE(integrity.ok()) << integrity.error().detail;
    StoredTable templates = table_or_fail(db, "GESCOM", "VNTEMAIL");
    for (std::int32_t k : committed) {
      auto record = templates.read("C" + std::to_string(k));
      ASSERT_TRUE(record.ok()) << "record " << k << " of " << committed.size() << " lost";
      EXPECT_EQ(record->values(), numbered_template(templates, k).values()) << k;
    }
    // At most the one commit under way when the kill came is there without having been reported.
    auto count = templates.count();
    EXPECT_GE(*count, static_cast<std::int64_t>(committed.size()));
    EXPECT_LE(*count, static_cast<std::int64_t>(committed.size()) + 2);
  }
}

}  // namespace
}  // namespace storage_test
