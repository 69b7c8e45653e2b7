#include "Completion.h"

namespace kareport
{

std::optional<Shell> shellFromName(const QString &name)
{
    if (name == u"bash") {
        return Shell::Bash;
    }
    if (name == u"zsh") {
        return Shell::Zsh;
    }
    return name == u"fish" ? std::optional(Shell::Fish) : std::nullopt;
}

QString completionScript(Shell shell, const std::vector<CommandWords> &commands)
{
    switch (shell) {
    case Shell::Bash: return bashCompletion(commands);
    case Shell::Zsh: return zshCompletion(commands);
    case Shell::Fish: return fishCompletion(commands);
    }
    return {};
}

} // namespace kareport
