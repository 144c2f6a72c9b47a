// The kelqln program: brings UML model files up to date with the code of
// their components through the add-in library libkelqln.so, playing the
// modelling tool's part (docs/cli.md).
#include <CLI/CLI.hpp>
#include <iostream>
#include <string>

#include "automation/error.h"
#include "host/cli/exit_code.h"
#include "host/cli/model_tree_printer.h"
#include "host/cli/new_model_command.h"
#include "host/cli/update_command.h"
#include "host/cli/usage_error.h"
#include "host/modeltool/model.h"

namespace {

using host::cli::DeletionPolicy;

void AddRegistryOption(CLI::App& command, std::string& registry) {
  command.add_option("--registry", registry,
                     "Registry file with the add-ins and settings (default: "
                     "$KELQLN_REGISTRY, the user's file, then the default "
                     "file of the installation)");
}

CLI::App* AddUpdate(CLI::App& app, host::cli::UpdateOptions& options,
                    std::string& deletion) {
  CLI::App* update = app.add_subcommand(
      "update", "Bring a model up to date with the code of its components");
  update->add_option("MODEL", options.model, "The model file")->required();
  update
      ->add_option("--select", options.selects,
                   "A component, or a class as COMPONENT\\CLASS; repeat for "
                   "more (default: every component)")
      ->allow_extra_args(false);
  update
      ->add_option("--delete", deletion,
                   "What becomes of elements that vanished from the code: "
                   "all (delete them), none (keep them) or ask (one by one)")
      ->check(CLI::IsMember({"all", "none", "ask"}))
      ->capture_default_str();
  update->add_flag("--dry-run", options.dry_run,
                   "Run the update without saving anything");
  update->add_flag("--check", options.check,
                   "Save nothing; exit 3 when the update would change the "
                   "model");
  update->add_option("--report", options.report,
                     "Write the run's errors, warnings, log, summary and "
                     "deleted elements to this JSON file");
  update->add_flag("--quiet,-q", options.quiet,
                   "Print only the warnings and errors");
  AddRegistryOption(*update, options.registry);
  return update;
}

CLI::App* AddNew(CLI::App& app, host::cli::NewModelOptions& options) {
  CLI::App* create = app.add_subcommand(
      "new", "Create a model file with a component bound to a code project");
  create->add_option("MODEL", options.model, "The model file to create")
      ->required();
  create->add_option("--component", options.component, "The component's name")
      ->required();
  create
      ->add_option("--language", options.language,
                   "The component's language (a language add-in, e.g. VC++)")
      ->required();
  create
      ->add_option("--project", options.project,
                   "The component's code project file")
      ->required();
  AddRegistryOption(*create, options.registry);
  return create;
}

DeletionPolicy::Mode ModeOf(const std::string& deletion) {
  if (deletion == "none") return DeletionPolicy::Mode::kNone;
  if (deletion == "ask") return DeletionPolicy::Mode::kAsk;
  return DeletionPolicy::Mode::kAll;
}

}  // namespace

int main(int argc, char** argv) {
  CLI::App app(
      "Brings UML model files up to date with the code of their components.",
      "kelqln");
  app.set_version_flag("--version", std::string("kelqln ") + KELQLN_VERSION);
  app.require_subcommand(1);

  host::cli::UpdateOptions update_options;
  std::string deletion = "all";
  CLI::App* update = AddUpdate(app, update_options, deletion);
  host::cli::NewModelOptions new_options;
  CLI::App* create = AddNew(app, new_options);
  std::string show_model;
  CLI::App* show = app.add_subcommand("show", "Print a model as a tree");
  show->add_option("MODEL", show_model, "The model file")->required();

  try {
    app.parse(argc, argv);
  } catch (const CLI::ParseError& error) {
    int code = app.exit(error);
    return code == 0 ? host::cli::kDone : host::cli::kBadInput;
  }

  try {
    if (update->parsed()) {
      update_options.deletion = ModeOf(deletion);
      return host::cli::UpdateCommand(update_options, std::cin, std::cout,
                                      std::cerr)
          .Run();
    }
    if (create->parsed()) return host::cli::RunNewModel(new_options, std::cout);
    host::cli::ModelTreePrinter(std::cout).Print(
        *host::modeltool::Model::Load(show_model));
    return host::cli::kDone;
  } catch (const host::cli::UsageError& error) {
    std::cerr << "kelqln: " << error.what() << '\n';
  } catch (const automation::Error& error) {
    std::cerr << "kelqln: " << error.Description() << '\n';
  }
  return host::cli::kBadInput;
}
