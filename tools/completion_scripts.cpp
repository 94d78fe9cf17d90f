// SPDX-License-Identifier: MIT
// Writes completion scripts. Each script lists what every command accepts. Completing runs the tool
// only for the keys of the script that is on the line.
#include "tools/completion_scripts.hpp"

#include <set>
#include <utility>

namespace qz::tools {
namespace {

std::string joined(const std::vector<std::string>& words) {
  std::string line;
  for (const std::string& word : words) line += (line.empty() ? "" : " ") + word;
  return line;
}

/// Returns the text in single quotes; `quote` is how a quote within it is written.
std::string quoted(const std::string& text, std::string_view quote) {
  std::string result = "'";
  for (const char c : text) result += c == '\'' ? std::string(quote) : std::string(1, c);
  return result + "'";
}

std::string replaced(std::string text, std::string_view mark, const std::string& by) {
  return text.replace(text.find(mark), mark.size(), by);
}

/// Returns the options whose values are files. The script on the line is the first file that is not
/// the value of one.
std::vector<std::string> fileOptions(const std::vector<CommandOutline>& commands) {
  std::set<std::string> names;
  for (const CommandOutline& command : commands) {
    for (const OptionOutline& option : command.options) {
      if (option.value.isFile) names.insert(option.name);
    }
  }
  return {names.begin(), names.end()};
}

// --- bash ---

constexpr std::string_view bashScript =
    R"(# Completes qz-walkthrough:  source <(qz-walkthrough completion bash)
_qz_walkthrough_words() { mapfile -t COMPREPLY < <(compgen -W "$1" -- "$current"); }

_qz_walkthrough_paths() {  # -f for files, -d for directories
  compopt -o filenames 2>/dev/null
  mapfile -t COMPREPLY < <(compgen "$1" -- "$current")
}

_qz_walkthrough_keys() {  # of the script on the line
  local i word key
  for ((i = 2; i < COMP_CWORD; i++)); do
    [[ " @files@ " == *" ${COMP_WORDS[i - 1]} "* ]] && continue
    word=${COMP_WORDS[i]//\\/}
    word=${word/#"~/"/"$HOME/"}
    [[ -f $word ]] || continue
    while IFS= read -r key; do  # not compgen, which would run commands in a key
      [[ $key == "$current"* ]] && COMPREPLY+=("$key")
    done < <(qz-walkthrough keys "$word" 2>/dev/null)
    return
  done
}

_qz_walkthrough() {
  local current=${COMP_WORDS[COMP_CWORD]} previous=${COMP_WORDS[COMP_CWORD - 1]}
  COMPREPLY=()
  # Bash divides --option=value into three words.
  if [[ $current == "=" ]]; then
    current=
  elif [[ $previous == "=" ]]; then
    previous=${COMP_WORDS[COMP_CWORD - 2]}
  fi
  if ((COMP_CWORD == 1)); then
    _qz_walkthrough_words "@commands@ --help --version"
    return
  fi
  case "${COMP_WORDS[1]} $previous" in
@values@  esac
  case "${COMP_WORDS[1]}" in
@words@  esac
}
complete -F _qz_walkthrough qz-walkthrough
)";

std::string bashReply(const ValueHint& value) {
  if (!value.choices.empty()) return "_qz_walkthrough_words \"" + joined(value.choices) + "\"";
  if (value.isScriptKey) return "_qz_walkthrough_keys";
  if (value.isFile) return "_qz_walkthrough_paths -f";
  return value.isDirectory ? "_qz_walkthrough_paths -d" : ":";
}

std::string bash(const std::vector<CommandOutline>& commands) {
  std::vector<std::string> names;
  std::string values;
  std::string words;
  for (const CommandOutline& command : commands) {
    names.push_back(command.name);
    std::vector<std::string> options;
    for (const OptionOutline& option : command.options) {
      options.push_back(option.name);
      if (!option.takesValue) continue;
      values += "    \"" + command.name + " " + option.name + "\") " + bashReply(option.value) +
                "; return ;;\n";
    }
    words += "    " + command.name + ") if [[ $current == -* ]]; then _qz_walkthrough_words \"" +
             joined(options) + "\"; else " + bashReply(command.arguments) + "; fi ;;\n";
  }
  std::string script = replaced(std::string(bashScript), "@commands@", joined(names));
  script = replaced(std::move(script), "@files@", joined(fileOptions(commands)));
  script = replaced(std::move(script), "@values@", values);
  return replaced(std::move(script), "@words@", words);
}

// --- zsh ---

constexpr std::string_view zshScript =
    R"zsh(#compdef qz-walkthrough
# Completes qz-walkthrough:  source <(qz-walkthrough completion zsh), after compinit
_qz_walkthrough_keys() {  # of the script on the line
  local i word
  for ((i = 2; i < CURRENT; i++)); do
    word=${~${(Q)words[i]}}
    [[ " @files@ " == *" $words[i-1] "* || ! -f $word ]] && continue
    compadd -- ${(f)"$(qz-walkthrough keys $word 2>/dev/null)"}
    return
  done
}

_qz_walkthrough() {
  local -a commands=(
@commands@  )
  if ((CURRENT == 2)); then
    _describe command commands
    return
  fi
  shift words
  ((CURRENT -= 1))
  case $words[1] in
@words@  esac
}

if [[ $funcstack[1] == _qz-walkthrough ]]; then  # zsh loads the file to complete a line
  _qz_walkthrough "$@"
else
  compdef _qz_walkthrough qz-walkthrough
fi
)zsh";

std::string zshQuoted(const std::string& text) { return quoted(text, "'\\''"); }

std::string zshAction(const ValueHint& value) {
  if (!value.choices.empty()) return "(" + joined(value.choices) + ")";
  if (value.isScriptKey) return "_qz_walkthrough_keys";
  if (value.isFile) return "_files";
  return value.isDirectory ? "_files -/" : " ";
}

std::string zshOption(const OptionOutline& option) {
  std::string text = option.isRepeated ? "*" : "";
  text += option.name + (option.takesValue ? "=" : "") + "[" + option.help + "]";
  if (option.takesValue) text += ":value:" + zshAction(option.value);
  return zshQuoted(text);
}

std::string zsh(const std::vector<CommandOutline>& commands) {
  std::string names;
  std::string words;
  for (const CommandOutline& command : commands) {
    names += "    " + zshQuoted(command.name + ":" + command.summary) + "\n";
    words += "    " + command.name + ") _arguments";
    for (const OptionOutline& option : command.options) words += " " + zshOption(option);
    words += " " + zshQuoted("*:argument:" + zshAction(command.arguments)) + " ;;\n";
  }
  std::string script = replaced(std::string(zshScript), "@files@", joined(fileOptions(commands)));
  return replaced(replaced(std::move(script), "@commands@", names), "@words@", words);
}

// --- fish ---

constexpr std::string_view fishStart =
    R"(# Completes qz-walkthrough:  qz-walkthrough completion fish | source
function __qz_walkthrough_keys  # of the script on the line
  set -l previous
  for word in (commandline -opc)
    if test -f "$word"; and not contains -- "$previous" qz-walkthrough @files@
      qz-walkthrough keys $word 2>/dev/null
      return
    end
    set previous $word
  end
end
complete -c qz-walkthrough -f
complete -c qz-walkthrough -n __fish_use_subcommand -l help -d 'Print the help'
complete -c qz-walkthrough -n __fish_use_subcommand -l version -d 'Print the version'
)";

std::string fishQuoted(const std::string& text) { return quoted(text, "\\'"); }

std::string fishValue(const ValueHint& value) {
  if (!value.choices.empty()) return " -x -a " + fishQuoted(joined(value.choices));
  if (value.isScriptKey) return " -x -a '(__qz_walkthrough_keys)'";
  if (value.isFile) return " -r -F";
  return value.isDirectory ? " -x -a '(__fish_complete_directories)'" : " -x";
}

std::string fishArguments(const ValueHint& value) {
  if (!value.choices.empty()) return " -a " + fishQuoted(joined(value.choices));
  return value.isFile ? " -F" : "";
}

std::string fishOption(const OptionOutline& option) {
  return " -l " + option.name.substr(2) + (option.takesValue ? fishValue(option.value) : "") +
         " -d " + fishQuoted(option.help) + "\n";
}

std::string fish(const std::vector<CommandOutline>& commands) {
  const std::string complete = "complete -c qz-walkthrough";
  std::string script = replaced(std::string(fishStart), "@files@", joined(fileOptions(commands)));
  for (const CommandOutline& command : commands) {
    const std::string here = complete + " -n '__fish_seen_subcommand_from " + command.name + "'";
    script += complete + " -n __fish_use_subcommand -a " + command.name + " -d " +
              fishQuoted(command.summary) + "\n" + here + fishArguments(command.arguments) + "\n";
    for (const OptionOutline& option : command.options) script += here + fishOption(option);
  }
  return script;
}

constexpr CompletionShell shells[] = {
    {.name = "bash", .script = bash},
    {.name = "zsh", .script = zsh},
    {.name = "fish", .script = fish},
};

}  // namespace

std::span<const CompletionShell> completionShells() { return shells; }

}  // namespace qz::tools
