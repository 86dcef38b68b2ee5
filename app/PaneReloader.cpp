#include "PaneReloader.h"

#include "OrvexPaneController.h"

#include "NavigationStack.h"

namespace orvex {

void reloadPanes(NavigationStack& stack, const OrvexModelNodeRef& root,
    const std::function<OrvexModelNodeRef(const std::string& path)>& nodeAtPath)
{
    for (int index = 0; index < stack.count(); ++index) {
        auto& pane = static_cast<OrvexPaneController&>(stack.screenAt(index)); // the stack has no others
        OrvexModelNodeRef node = index == 0 ? root : nodeAtPath(pane.path());
        if (!node && index > 0)
            return stack.popTo(index - 1, true);
        pane.reloadWithNode(std::move(node));
    }
}

} // namespace orvex
