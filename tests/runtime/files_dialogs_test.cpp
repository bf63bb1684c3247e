// Files, the desktop opener, the terminal dialogs and the command line.
#include <sys/wait.h>

#include <cstdio>
#include <cstdlib>
#include <fstream>

#include "fixture.h"
#include "host/runtime/terminal_dialogs.h"

namespace {

TEST(Files, BackslashPathsAndDesktopOpener) {
  TempDir d;
  std::string windows_style = d.path() + "\\facture.pdf";
  EXPECT_NE(Maccess(windows_style, 0), 0);
  std::ofstream(d.file("facture.pdf")) << "%PDF";
  EXPECT_EQ(Maccess(windows_style, 0), 0);

  setenv("VNTEMAIL_OPENER", "true", 1);
  EXPECT_GT(ShellExecuteA(nullptr, "open", windows_style, "", "", 5), 32);
  setenv("VNTEMAIL_OPENER", "false", 1);
  EXPECT_LE(ShellExecuteA(nullptr, "open", windows_style, "", "", 5), 32);
  setenv("VNTEMAIL_OPENER", "/nonexistent/opener", 1);
  EXPECT_LE(ShellExecuteA(nullptr, "open", windows_style, "", "", 5), 32);
  setenv("VNTEMAIL_OPENER", "true", 1);
  EXPECT_EQ(ShellExecuteA(nullptr, "open", d.file("absent.pdf"), "", "", 5), 2);
  // A file name with shell characters reaches the opener as one argument, never a shell.
  std::string odd = d.file("a;touch pwned'$(x).pdf");
  std::ofstream(odd) << "x";
  EXPECT_GT(ShellExecuteA(nullptr, "open", odd, "", "", 5), 32);
  EXPECT_NE(Maccess(d.file("pwned"), 0), 0);
  unsetenv("VNTEMAIL_OPENER");

  EXPECT_EQ(Munlink(windows_style), 0);
  EXPECT_NE(Maccess(windows_style, 0), 0);
  EXPECT_NE(Munlink(windows_style), 0);
}

TEST(TerminalDialogs, ClosedInputTakesTheDefaultAndSaysSo) {
  std::FILE* out = std::tmpfile();
  std::FILE* in = std::tmpfile();  // empty: end of input at once
  host::TerminalDialogs t({true, false, false}, out, in);
  auto choices = host::parse_choices({"1~Oui", "$0~Non", ""});
  EXPECT_EQ(t.question("Attention", "Confirmez-vous@l'opération ?", 2, choices), "0");
  EXPECT_FALSE(t.choose("Contacts", {"a", "b"}).has_value());
  EXPECT_EQ(t.next_action(host::ScreenModel{}).kind, host::ScreenAction::Close);
  std::rewind(out);
  std::string printed(4096, '\0');
  printed.resize(std::fread(printed.data(), 1, printed.size(), out));
  EXPECT_NE(printed.find("Confirmez-vous\nl'opération ?"), std::string::npos);
  EXPECT_NE(printed.find("choix par défaut « Non »"), std::string::npos);

  host::TerminalDialogs yes({false, true, false}, out, in);
  EXPECT_EQ(yes.question("Attention", "Envoyer ?", 2, choices), "1");
  std::fclose(out);
  std::fclose(in);
}

int run(const std::string& command, std::string* output) {
  std::FILE* p = popen(command.c_str(), "r");
  if (!p) return -1;
  char buf[512];
  output->clear();
  while (std::fgets(buf, sizeof buf, p)) *output += buf;
  int status = pclose(p);
  return WIFEXITED(status) ? WEXITSTATUS(status) : -1;
}

TEST(CommandLine, CallPrintsCodeAndParametersWithScriptableExitCodes) {
  TempDir d;
  std::string bin = std::string(VNTEMAIL_BINARY) + " --data " + d.path();
  std::string out;
  // A branch not built yet: non-zero code, exit 1, parameters printed as JSON.
  EXPECT_EQ(run(bin + " call VNTEMAIL INTERFACE INIT_PAR_1001 --json 2>/dev/null", &out), 1);
  EXPECT_EQ(out, "{\"code\": 99, \"params\": []}\n");
  EXPECT_EQ(run(bin + " call VNTEMAIL INTERFACE RETOURNE_TEXTE_INTERPRETABLE VNTEFAC 'n° \"1\"' int:3 2>/dev/null", &out), 1);
  EXPECT_EQ(out, "code : 99\n[0] VNTEFAC\n[1] n° \"1\"\n[2] 3\n");
  // Unknown procedure: a French message, exit 1; usage error: exit 2.
  EXPECT_EQ(run(bin + " call VNTEMAIL INTERFACE NEXISTE 2>&1", &out), 1);
  EXPECT_EQ(out, "Erreur : Procédure inconnue : NEXISTE du programme VNTEMAIL-INTERFACE\n");
  EXPECT_EQ(run(bin + " call 2>/dev/null", &out), 2);
}

}  // namespace
