// A plugin for clang-tidy 14: checks look at the declarations of the project, and not at those in headers of the system. These
// are most of every translation unit, and what is found in them is never shown. clangd narrows the checks in the same way.
#include <clang/AST/ASTConsumer.h>
#include <clang/AST/ASTContext.h>
#include <clang/Basic/SourceManager.h>
#include <clang/Frontend/CompilerInstance.h>
#include <clang/Frontend/FrontendPluginRegistry.h>

namespace
{

class ProjectScope : public clang::ASTConsumer
{
public:
    void HandleTranslationUnit(clang::ASTContext &context) override
    {
        const clang::SourceManager &sources = context.getSourceManager();
        std::vector<clang::Decl *> declarations;
        for (clang::Decl *declaration : context.getTranslationUnitDecl()->decls()) {
            const clang::SourceLocation place = sources.getExpansionLoc(declaration->getBeginLoc());
            if (place.isValid() && !sources.isInSystemHeader(place)) {
                declarations.push_back(declaration);
            }
        }
        context.setTraversalScope(declarations);
    }
};

class ProjectScopeAction : public clang::PluginASTAction
{
public:
    std::unique_ptr<clang::ASTConsumer> CreateASTConsumer(clang::CompilerInstance & /*compiler*/,
                                                          llvm::StringRef /*file*/) override
    {
        return std::make_unique<ProjectScope>();
    }
    bool ParseArgs(const clang::CompilerInstance & /*compiler*/,
                   const std::vector<std::string> & /*arguments*/) override
    {
        return true;
    }
    ActionType getActionType() override { return AddBeforeMainAction; }
};

const clang::FrontendPluginRegistry::Add<ProjectScopeAction> registered("project-scope",
                                                                        "Checks the project's declarations");

} // namespace
