// Headless model of a program's screen: named controls with their state, the
// values shown the last time each was redisplayed. Tests and the terminal read it.
#pragma once

#include <map>
#include <string>
#include <vector>

namespace host {

struct ControlState {
  bool allowed = true;       // autorise / interdit
  bool visible = true;       // rendreVisible / cacher
  std::string label;         // libelle
  std::string shown;         // value at the last redisplay (for controls bound to a variable)
  int redisplays = 0;        // how many times it was redisplayed
};

class ScreenModel {
 public:
  std::string program;   // "VNTEMAIL-SENDMAIL"
  std::string screen;    // "SENDMAIL"
  bool opened = false;   // the screen was shown (Automate::debut)
  std::map<std::string, ControlState> controls;  // by upper-case name
  std::vector<std::string> branches;             // branches the screen can call

  /// The control, created on first use.
  ControlState& control(const std::string& name);
  /// State of a control; a default state when it was never touched.
  ControlState state(const std::string& name) const;
};

}  // namespace host
