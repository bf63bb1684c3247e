// The host runtime as the module sees it: programs, named variables, events,
// calls, tables, expressions, screens, dialogs, files.
//
// This header and host_services.h are the module's only window on the world.
// Everything declared here is implemented by the host (host/runtime/). Host
// failures arrive as a thrown `Exception*`; every branch catches them (see
// frame/branche.h), so none crosses a branch boundary.
#pragma once

#include <cstddef>
#include <functional>
#include <initializer_list>
#include <memory>
#include <new>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

class Automate;
class Evt;
class Table;

// ---------------------------------------------------------------------------
// Host allocator
// ---------------------------------------------------------------------------

/// Raw memory from the host; nullptr when the host refuses (out of memory, or a
/// test that makes the Nth allocation fail).
void* hoteAllouer(std::size_t taille) noexcept;
/// Gives back memory obtained from hoteAllouer (nullptr is accepted).
void hoteLiberer(void* memoire) noexcept;

/// Builds a T in host memory; nullptr when the memory is refused or the
/// constructor throws. Pair with hoteDetruire.
template <class T, class... A>
T* hoteCreer(A&&... args) noexcept {
  void* p = hoteAllouer(sizeof(T));
  if (p == nullptr) return nullptr;
  try {
    return ::new (p) T(std::forward<A>(args)...);
  } catch (...) {
    hoteLiberer(p);
    return nullptr;
  }
}

/// Destroys an object made by hoteCreer (nullptr is accepted).
template <class T>
void hoteDetruire(T* objet) noexcept {
  if (objet == nullptr) return;
  objet->~T();
  hoteLiberer(objet);
}

// ---------------------------------------------------------------------------
// Failures
// ---------------------------------------------------------------------------

/// A host failure. The host throws it as a pointer made with hoteCreer; the
/// catching branch names it and hands it to `Automate::exception` through an
/// event, which then owns it.
class Exception {
 public:
  Exception(std::string categorie, std::string message, std::string detail = {});
  const std::string& categorie() const { return categorie_; }  ///< "variable", "table", "procedure", "expression"...
  const std::string& message() const { return message_; }      ///< French text for users
  const std::string& detail() const { return detail_; }        ///< technical detail for the log
  const std::string& branche() const { return branche_; }      ///< catching branch, upper case
  void nomBranche(std::string_view nom);                        ///< set by the catching branch

 private:
  std::string categorie_;  // kind of failure
  std::string message_;    // French text
  std::string detail_;     // technical detail
  std::string branche_;    // name of the branch that caught it
};

/// Throws a host failure (as `Exception*`). Used by the host itself.
[[noreturn]] void leverException(std::string categorie, std::string message, std::string detail = {});

// ---------------------------------------------------------------------------
// Named variables
// ---------------------------------------------------------------------------

enum class TypeDonnee { Chaine, Entier, Double, Date };

/// Access kinds of a named variable.
enum AccesDonnee : int {
  ACCES_PROGRAMME = 0,  ///< variable of the program
  ACCES_GLOBAL = 2,     ///< global variable, no owner program
  ACCES_LOCAL = 4,      ///< local to one run of a branch (parameters, working variables)
};

/// A value of any of the four kinds; dates are held as yyyymmdd (0 = empty).
struct Valeur {
  TypeDonnee type = TypeDonnee::Chaine;  // kind of the value
  std::string texte;                     // Chaine: valid UTF-8
  long long entier = 0;                  // Entier; Date as yyyymmdd
  double decimal = 0;                    // Double
};

/// A named variable (or an unnamed value). Text has character semantics over
/// UTF-8; any text that enters is made valid UTF-8 (invalid bytes are read as
/// Windows-1252). A named variable is registered with its owner program (or as
/// a global) for expressions and screens, and unregistered when destroyed.
class Donnee {
 public:
  /// An unnamed value of the given kind.
  explicit Donnee(TypeDonnee type = TypeDonnee::Chaine);
  /// A named variable. `nom` is upper-cased; `proprio` may be null only for globals.
  Donnee(TypeDonnee type, std::string_view nom, Automate* proprio, int acces,
         std::string_view libelle = {}, std::string_view format = {});
  /// Copies give unnamed values; the name and registration stay with the original.
  Donnee(const Donnee& autre);
  Donnee& operator=(const Donnee& autre);
  virtual ~Donnee();

  const std::string& nom() const { return nom_; }
  const std::string& libelle() const { return libelle_; }
  const std::string& format() const { return format_; }
  int acces() const { return acces_; }
  Automate* proprio() const { return proprio_; }
  TypeDonnee type() const { return type_; }

  /// Current value (fields of tables read their record).
  virtual Valeur valeur() const;
  /// Assigns with conversion to this variable's kind.
  virtual void affecter(const Valeur& v);

  std::string texte() const;   ///< text form: dates dd/mm/yyyy, decimals "12,5"
  long long entier() const;    ///< integer value (text parsed, 0 when not a number)
  double decimal() const;      ///< decimal value
  bool estVide() const;        ///< empty text, or zero

  /// True when the host's expression language accepts `expression`.
  static bool analyse(std::string_view expression);

  /// Binding made by Evt::param: an in-out variable gives its value back when it
  /// is destroyed (end of the branch or of the program).
  void lier(Evt* evt, int indice, bool sortie);

 protected:
  Valeur v_;  // own value (unused by table fields)

 private:
  void enregistrer();
  void desenregistrer() noexcept;
  void rendre() noexcept;

  TypeDonnee type_;            // kind
  std::string nom_;            // upper-case name, empty for a value
  std::string libelle_;        // label
  std::string format_;         // picture, "CX(765)"
  int acces_ = ACCES_LOCAL;    // access kind
  Automate* proprio_ = nullptr;  // owner program
  Evt* lienEvt_ = nullptr;     // event of an in-out binding
  int lienIndice_ = -1;        // parameter index of that binding
};

/// Text variable.
class Chaine : public Donnee {
 public:
  Chaine();
  Chaine(const char* texte);                // NOLINT: values read naturally
  Chaine(std::string_view texte);           // NOLINT
  Chaine(const std::string& texte);         // NOLINT
  explicit Chaine(const Donnee& autre);     ///< value converted to text
  Chaine(const Chaine& autre);
  /// Named text variable with an optional initial value.
  Chaine(std::string_view nom, Automate* proprio, int acces = ACCES_LOCAL,
         std::string_view initial = {}, std::string_view libelle = {}, std::string_view format = {});
  Chaine& operator=(const Chaine& autre);
  Chaine& operator=(const Donnee& autre);
  Chaine& operator=(std::string_view texte);
  Chaine& operator=(const char* texte) { return *this = std::string_view(texte); }
  Chaine& operator=(const std::string& texte) { return *this = std::string_view(texte); }

  const std::string& str() const { return v_.texte; }  ///< UTF-8 bytes of the value

  long longueur() const;                    ///< number of characters
  /// Characters debut..fin (from 1, inclusive); fin 0 = the rest. Never splits a character.
  Chaine sousChaine(long debut, long fin = 0) const;
  /// Position (from 1) of the first `motif` at or after character `depuis`; 0 when absent.
  long position(std::string_view motif, long depuis = 1) const;
  Chaine droite(long n) const;              ///< last n characters
  Chaine majuscules() const;                ///< upper case ("é" -> "É")
  Chaine minuscules() const;                ///< lower case
  bool contient(std::string_view motif) const { return position(motif) != 0; }

  Chaine& operator+=(std::string_view texte);
  Chaine& operator+=(const Donnee& autre) { return *this += std::string_view(autre.texte()); }
};

// Concatenation as soon as one side is text (numbers add as numbers).
Chaine operator+(const Chaine& a, const Chaine& b);
Chaine operator+(const Chaine& a, const Donnee& b);
Chaine operator+(const Donnee& a, const Chaine& b);
Chaine operator+(const Chaine& a, const char* b);
Chaine operator+(const char* a, const Chaine& b);
Chaine operator+(const Chaine& a, std::string_view b);
Chaine operator+(std::string_view a, const Chaine& b);
Chaine operator+(const Donnee& a, std::string_view b);
Chaine operator+(std::string_view a, const Donnee& b);
Chaine operator+(const Donnee& a, const char* b);
Chaine operator+(const char* a, const Donnee& b);
/// Host's text equality for texts, numeric equality when both are numbers.
bool operator==(const Donnee& a, const Donnee& b);
bool operator==(const Donnee& a, std::string_view b);
bool operator==(const Donnee& a, const char* b);
bool operator==(const Donnee& a, long long b);
bool operator==(const Donnee& a, int b);
bool operator<(const Donnee& a, const Donnee& b);

/// Integer variable.
class Entier : public Donnee {
 public:
  Entier(long long valeur = 0);  // NOLINT
  Entier(const Entier& autre);
  Entier(std::string_view nom, Automate* proprio, int acces = ACCES_LOCAL, long long initial = 0,
         std::string_view libelle = {}, std::string_view format = {});
  Entier& operator=(long long valeur);
  Entier& operator=(const Donnee& autre);
  Entier& operator=(const Entier& autre);
  operator long long() const { return entier(); }  // NOLINT
};

/// Decimal variable.
class Double : public Donnee {
 public:
  Double(double valeur = 0);  // NOLINT
  Double(const Double& autre);
  Double(std::string_view nom, Automate* proprio, int acces = ACCES_LOCAL, double initial = 0,
         std::string_view libelle = {}, std::string_view format = {});
  Double& operator=(double valeur);
  Double& operator=(const Donnee& autre);
  Double& operator=(const Double& autre);
  operator double() const { return decimal(); }  // NOLINT
};

/// Date variable; text form dd/mm/yyyy, empty when not set.
class Date : public Donnee {
 public:
  Date();
  Date(int annee, int mois, int jour);
  Date(const Date& autre);
  Date(std::string_view nom, Automate* proprio, int acces = ACCES_LOCAL,
       std::string_view libelle = {}, std::string_view format = {});
  Date& operator=(const Donnee& autre);
  Date& operator=(const Date& autre);
  int annee() const;
  int mois() const;
  int jour() const;
  static Date dateCourante();     ///< today (local time)
  static Chaine heureCourante();  ///< now, "HH:MM:SS"
};

// ---------------------------------------------------------------------------
// Events
// ---------------------------------------------------------------------------

/// Empty information block, used to build an event without parameters.
struct InfoCode {};

/// Direction of a bound parameter.
enum TypeParam : int { PARAM_ENTREE = 0, PARAM_ENTREE_SORTIE = 1 };

/// Carries a procedure's parameters, the call mode and a caught failure.
class Evt {
 public:
  virtual ~Evt();
  Evt(const Evt&) = delete;
  Evt& operator=(const Evt&) = delete;

  int nbParams() const { return static_cast<int>(params_.size()); }
  /// 0 when the program or procedure was called and waited for, non-zero when launched.
  int modeAppel() const { return modeAppel_; }
  void modeAppel(int mode) { modeAppel_ = mode; }

  /// Binds parameter `indice` (from 0) to `variable`: copies the value in, and
  /// for PARAM_ENTREE_SORTIE gives it back when the variable is destroyed. An
  /// index beyond the parameters binds nothing and leaves the variable empty.
  void param(int indice, Donnee& variable, int type = PARAM_ENTREE);

  /// Attaches a caught failure; the event owns it from then on.
  void adresseC(Exception* e);
  Exception* adresseC() const { return exception_.get(); }

  /// Value of parameter `indice` (empty text when absent).
  Valeur valeurParam(int indice) const;
  /// Writes parameter `indice` (to the caller's variable when passed by reference).
  void ecrireParam(int indice, const Valeur& v);

 protected:
  struct Param {
    Donnee* reference = nullptr;  // by reference: the caller's variable
    Valeur valeur;                // by value: the value itself
  };
  Evt() = default;
  std::vector<Param> params_;  // in order

 private:
  struct Liberer {
    void operator()(Exception* e) const noexcept { hoteDetruire(e); }
  };
  int modeAppel_ = 0;                              // 0 called, 1 launched
  std::unique_ptr<Exception, Liberer> exception_;  // caught failure
};

/// Parameters by reference: the callee reads and writes the caller's variables.
class EvtParamRef : public Evt {
 public:
  EvtParamRef(std::initializer_list<Donnee*> variables);
  explicit EvtParamRef(const std::vector<Donnee*>& variables);  ///< a list built at run time
};

/// Parameters by value: the event holds copies (events handed to lancerModule).
class EvtParamVal : public Evt {
 public:
  explicit EvtParamVal(const InfoCode&);
  EvtParamVal(std::initializer_list<const Donnee*> valeurs);
};

// ---------------------------------------------------------------------------
// Tables
// ---------------------------------------------------------------------------

/// A table of a base, or an interface table "I_" + component, with its current
/// record. Read operations return 0 on success and non-zero when no record is
/// found (the current record is then empty); host failures (unknown table,
/// refused write) are thrown.
class Table {
 public:
  Table(Automate* proprio, std::string_view base, std::string_view nom, std::string_view alias = {},
        int genre = 0, int drapeau = 1);
  ~Table();
  Table(const Table&) = delete;
  Table& operator=(const Table&) = delete;

  const std::string& nom() const;     ///< name used by expressions: the alias, or the table's name
  const std::string& nomReel() const; ///< the table's own name
  const std::string& base() const;
  void base(std::string_view designation);  ///< changes the base designation ("$$")

  int lireCle(std::string_view champ, const Donnee& valeur);  ///< keyed read, operator "="
  void effacerCriteres();
  /// Adds a criterion: "=" equal, "/" begins with, "#" differs, "<", "<=", ">", ">=".
  void critere(std::string_view champ, std::string_view operateur, const Donnee& valeur);
  void ordre(std::string_view champ);  ///< order of the walk
  int premier();                       ///< first record of the criteria; non-zero when none
  int suivant();                       ///< next record; non-zero at the end
  long nombre();                       ///< number of records matching the criteria
  void vider();                        ///< empties the current record
  void preparer();                     ///< prepares the current record for writing
  int creer();                         ///< writes the current record as new; non-zero when refused
  int modifier();                      ///< rewrites the current record; non-zero when refused
  int supprimer();                     ///< removes the current record; non-zero when absent

  /// Value of a field (entry 1..10 of a repeated field) of the current record.
  Valeur lire(std::string_view champ, int entree = 0) const;
  void ecrire(std::string_view champ, int entree, const Valeur& v);

  struct Etat;  // host side

 private:
  std::unique_ptr<Etat> etat_;
};

/// A field of a table's current record, usable as a variable.
class Champ : public Donnee {
 public:
  Champ(std::string_view nom, Table& table, int drapeau = 1, int entree = 0);
  Valeur valeur() const override;
  void affecter(const Valeur& v) override;
  Champ& operator=(const Donnee& autre);
  Champ& operator=(std::string_view texte);
  Champ& operator=(long long valeur);
  Chaine chaine() const { return Chaine(texte()); }

 private:
  Table* table_;  // owning table
  std::string champ_;  // field name
  int entree_;    // entry of a repeated field, 0 for a plain field
};

/// A repeated field of 10 entries: index 0..9 from the code, 1..10 from the screens.
class ChampT {
 public:
  ChampT(std::string_view nom, Table& table, Automate* proprio);
  Champ& operator[](int indice);  ///< 0..9; out of range is a host failure
  static constexpr int entrees = 10;

 private:
  std::vector<std::unique_ptr<Champ>> champs_;
};

// ---------------------------------------------------------------------------
// Expressions
// ---------------------------------------------------------------------------

class Execute {
 public:
  /// Evaluates `expression` with `programme` as context (its variables, its
  /// tables, the interface tables). Refused syntax and unknown names are host failures.
  static Donnee execute(Automate* programme, std::string_view expression);
  /// Same, without throwing: false and a French message in `erreur` on failure.
  static bool execute(Automate* programme, std::string_view expression, Donnee& resultat, std::string& erreur);
};

// ---------------------------------------------------------------------------
// Screens, messages, universe
// ---------------------------------------------------------------------------

/// The program's screen, as a model of named controls.
class Ecran {
 public:
  explicit Ecran(Automate& programme) : programme_(programme) {}
  void affiche(std::string_view controle = {});  ///< redisplays a control (all when empty)
  void autorise(std::string_view controle);
  void interdit(std::string_view controle);
  void cacher(std::string_view controle);
  void rendreVisible(std::string_view controle);
  void libelle(std::string_view controle, std::string_view texte);
  void attacheMenuC(std::string_view controle, std::string_view menu);
  void fonction(std::string_view controle, std::string_view branche);
  /// 1: busy cursor, 0: normal.
  static void curseur(int mode);

 private:
  Automate& programme_;
};

class Message {
 public:
  static void nettoie();  ///< clears pending messages
};

class Univers {
 public:
  static Chaine utilisateur();  ///< current user
  static Chaine memUrl();       ///< web base address of the host
};

// ---------------------------------------------------------------------------
// Programs
// ---------------------------------------------------------------------------

using Fabrique = Automate* (*)(Evt*);

/// Base of every program. The host builds it through the program's factory,
/// calls its hooks and branches, and destroys it at the end.
class Automate {
 public:
  explicit Automate(Evt* evt);
  virtual ~Automate();
  Automate(const Automate&) = delete;
  Automate& operator=(const Automate&) = delete;

  // Hooks the host calls; programs override those they have as branches.
  virtual void init(Evt* evt);
  virtual void debut(Evt* evt);       ///< shows the screen when there is one
  virtual void faire(Evt* evt);
  virtual void selection(Evt* evt);
  virtual void pour_tout(Evt* evt);
  virtual void sortie(Evt* evt);
  virtual void abandon(Evt* evt);     ///< ends the program without validation
  virtual void validation(Evt* evt);

  /// Makes a handler callable by name. A name with a range, "CLIENT(1,3)",
  /// serves "CLIENT1".."CLIENT3" (or "CLIENT(2)"); the handler reads `indice()`.
  void addBranch(std::string_view nom, std::function<void(Evt*)> handler);
  template <class P>
  void addBranch(std::string_view nom, void (P::*handler)(Evt*)) {
    P* self = static_cast<P*>(this);
    addBranch(nom, std::function<void(Evt*)>([self, handler](Evt* e) { (self->*handler)(e); }));
  }
  /// Names of the branches in registration order.
  std::vector<std::string> branches() const;
  /// Element index (1..n) of the array-branch call in progress, 0 otherwise.
  int indice() const;

  void nomBase(std::string_view base);
  void nomTable(std::string_view table);
  void nomEcran(std::string_view ecran);
  const std::string& nomBase() const;
  const std::string& nomTable() const;
  const std::string& nomEcran() const;
  const std::string& nomProgramme() const;  ///< "VNTEMAIL-SENDMAIL"

  /// Sets the method error code of the call in progress (and of `evt`).
  void erreurMethode(int code, Evt* evt);
  /// Method error code of the last procedure call this program made.
  int erreurMethode() const;

  /// Reports a caught failure attached to `evt` (logged, never lost).
  void exception(Evt* evt);
  /// Refuses the current event, keeping the screen (`controle` gets the focus).
  void controler(std::string_view controle);
  void rejeter(Evt* evt = nullptr);
  /// Ends the program after the current branch.
  void sortir(Evt* evt = nullptr, int code = 0);
  bool estTermine() const;
  bool estRejete() const;

  /// Runs one procedure: own branch (empty module and program), a branch of
  /// another program of a module, or a host component. Returns the method error
  /// code (also kept for erreurMethode()). An unknown procedure is a host failure.
  int appelerProcedure(std::string_view base, std::string_view module, std::string_view programme,
                       std::string_view procedure, Evt* evt, int drapeau);
  /// Runs a whole program to its end; returns its method error code.
  int appelerModule(std::string_view base, std::string_view module, std::string_view programme, Evt* evt);
  /// Starts a program or procedure after the current call chain returns; the
  /// event (made with hoteCreer, or null) belongs to the host from then on.
  void lancerModule(std::string_view base, std::string_view module, std::string_view programme, Evt* evt);
  void lancerProcedure(std::string_view base, std::string_view module, std::string_view programme,
                       std::string_view procedure, Evt* evt);

  /// Reloads a component's interface table (the record its picker left).
  void lireInterface(std::string_view composant);
  /// Opens a second context of a component under `contexte` ("I_" + contexte).
  void creerContexteComposant(std::string_view composant, std::string_view contexte, std::string_view tiers);

  // Dialogs ("@" is a line break inside texts).
  int BoiteMessage(std::string_view texte, int type = 0, std::string_view titre = {});
  /// Question with choices "1~Oui", "$0~Non" ("$" marks the default); returns the chosen value.
  long BoiteDialogue(std::string_view titre, std::string_view texte, int icone,
                     std::initializer_list<std::string_view> choix);
  /// File-open dialog; 1 when a file was chosen (full path and its folder returned).
  int BoiteOuvrirFichier(std::string_view titre, Chaine& fichier, Chaine& repertoire,
                         std::initializer_list<std::pair<std::string_view, std::string_view>> filtres);
  /// File-save dialog; 1 when a file was chosen.
  int BoiteSauverFichier(std::string_view titre, Chaine& fichier, Chaine& dossier,
                         std::initializer_list<std::pair<std::string_view, std::string_view>> filtres);

  Ecran& ecran() { return ecran_; }

  struct Etat;  // host side
  Etat& etat() { return *etat_; }

 private:
  std::unique_ptr<Etat> etat_;
  Ecran ecran_;
};

/// Program with a screen, processing events until it ends.
class Traitecr : public Automate {
 public:
  explicit Traitecr(Evt* evt) : Automate(evt) {}
};

/// Processing program: init, debut, faire, then it ends.
class Traitmnt : public Automate {
 public:
  explicit Traitmnt(Evt* evt) : Automate(evt) {}
};

/// Table walk: init, debut, then selection and pour_tout per record of the
/// program's table (a `rejeter` in selection skips the record), sortie at the end.
class Parcours : public Automate {
 public:
  explicit Parcours(Evt* evt) : Automate(evt) {}
};

/// Simple window: a screen program.
class Fenetre_simple : public Traitecr {
 public:
  explicit Fenetre_simple(Evt* evt) : Traitecr(evt) {}
};

/// Record editor on the program's table.
class Bsegestion : public Traitecr {
 public:
  explicit Bsegestion(Evt* evt) : Traitecr(evt) {}
  virtual void avant_debut(Evt* evt);
  virtual void debut_fiche(Evt* evt);
  virtual void debut_modification(Evt* evt);
  virtual void debut_visualisation(Evt* evt);
  virtual void debut_creation(Evt* evt);
};

/// List access screen on the program's table.
class Bseacc : public Traitecr {
 public:
  explicit Bseacc(Evt* evt) : Traitecr(evt) {}
  virtual void debut_activation(Evt* evt);
  virtual void gerer(Evt* evt);
  virtual void modifier(Evt* evt);
  virtual void creer(Evt* evt);
};

/// Interface program of a base: besides its own branches it answers
/// "INIT_INTERFACE" (clear the interface record), "ECRITURE" (write it),
/// "LECTURE_CODE" (read a record by code; non-zero when absent) and "GESTION"
/// (open the editor). Its interface table is "I_" + the module's name.
class Bseinter : public Automate {
 public:
  explicit Bseinter(Evt* evt) : Automate(evt) {}
  /// The base procedures above; false when `procedure` is not one of them.
  virtual bool procedureDeBase(std::string_view procedure, Evt* evt);
  Table& interfaceTable();  ///< the base's interface table of this program's module
};

// ---------------------------------------------------------------------------
// Registration
// ---------------------------------------------------------------------------

/// Registration records of a module library, kept by the host's registry.
struct Module {
  std::string description;  // shown by the host; may be empty
  std::string nom;          // "VNTEMAIL-SENDMAIL"
  Fabrique fabrique;        // builds the program, or returns null
  bool drapeau;             // host flag
  std::string texte;        // free text
};
struct Global {
  std::string contexte;  // "VNTEMAIL", "GESCOM"
  std::string module;    // "VNTEMAIL"
};
struct Source {
  std::string module;  // "VNTEMAIL"
  int drapeau;         // 0
};

/// The host's registry of programs. Records are added in load order and
/// removed in reverse order; a program name registered twice is refused.
class Registre {
 public:
  /// False (and logged) when the name is already registered.
  static bool enregistrer(const Module& m);
  static void enregistrer(const Global& g);
  static void enregistrer(const Source& s);
  /// A global variable with no owner; the registry owns it until unload.
  static void enregistrerGlobale(Donnee* variable);
};

/// Entry points of the VNTEMAIL library: the host calls the first when it loads
/// the library (false when it is already loaded) and the second when it unloads it.
bool VNTEMAILChargement();
void VNTEMAILDechargement();

// ---------------------------------------------------------------------------
// Files and shell
// ---------------------------------------------------------------------------

/// 0 when `chemin` exists (mode 0) or is readable (4) / writable (2); non-zero otherwise.
/// Paths may use "\" as separator.
int Maccess(std::string_view chemin, int mode);
/// Removes a file; 0 on success.
int Munlink(std::string_view chemin);
/// Opens `fichier` with the desktop for verb "open"; returns a value above 32
/// on success, 32 or less on failure (2: file not found, 31: no program).
long ShellExecuteA(void* fenetre, std::string_view verbe, std::string_view fichier,
                   std::string_view parametres, std::string_view repertoire, int affichage);
