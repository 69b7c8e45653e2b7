#include "CPropertyPane.h"

#include <algorithm>
#include <vector>

namespace
{

std::vector<CPropertyPane *> &propertyPanes()
{
    static std::vector<CPropertyPane *> panes;
    return panes;
}

} // namespace

CPropertyPane::CPropertyPane()
{
    propertyPanes().push_back(this);
}

CPropertyPane::~CPropertyPane()
{
    std::erase(propertyPanes(), this);
}

void CPropertyPane::OnUpdateProperties(UDocument * /*document*/) {}

void CPropertyPane::UpdateAllPropertyPane(UDocument *document)
{
    // A pane may close itself or another one while it is notified.
    const std::vector<CPropertyPane *> panes = propertyPanes();
    for (CPropertyPane *pane : panes) {
        if (std::find(propertyPanes().begin(), propertyPanes().end(), pane) != propertyPanes().end()) {
            pane->OnUpdateProperties(document);
        }
    }
}
