// A host with scripted dialogs and a small test library of programs.
#pragma once

#include <gtest/gtest.h>

#include <filesystem>
#include <memory>
#include <string>

#include "host/runtime/calls.h"
#include "host/runtime/host.h"
#include "host/runtime/registry.h"
#include "host/runtime/scripted_dialogs.h"

class TempDir {
 public:
  TempDir() {
    char tmpl[] = "/tmp/vntemail-test-XXXXXX";
    path_ = mkdtemp(tmpl);
  }
  ~TempDir() {
    std::error_code ec;
    std::filesystem::remove_all(path_, ec);
  }
  const std::string& path() const { return path_; }
  std::string file(const std::string& name) const { return path_ + "/" + name; }

 private:
  std::string path_;
};

class HostTest : public ::testing::Test {
 protected:
  void SetUp() override {
    host::HostOptions o;
    o.data_dir = dir.path();
    o.user = "marie";
    o.log_to_stderr = false;
    host = std::make_unique<host::Host>(o, &dialogs);
  }
  void TearDown() override { host.reset(); }

  TempDir dir;
  host::ScriptedDialogs dialogs;
  std::unique_ptr<host::Host> host;
};
