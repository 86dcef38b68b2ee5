#include "TreeSearch.h"

namespace orvex {

namespace {

class Search {
public:
    Search(const QString& text, std::size_t most)
        : _text(text)
        , _most(most)
    {
    }

    void visit(const OrvexModelNode& node)
    {
        const auto* const children = node.childNodes();
        if (!children)
            return;
        for (const OrvexModelNodeRef& child : *children) {
            if (found.size() >= _most)
                return;
            _names.push_back(child->displayName());
            if (has(child->displayName()) || (child->value() && has(*child->value())))
                found.push_back({_names, child});
            visit(*child);
            _names.pop_back();
        }
    }

    std::vector<FoundRow> found;

private:
    bool has(const std::string& text) const
    {
        return QString::fromStdString(text).contains(_text, Qt::CaseInsensitive);
    }

    QString _text;
    std::size_t _most;
    std::vector<std::string> _names; // on the way to the node
};

} // namespace

std::vector<FoundRow> searchTree(const OrvexModelNode& root, const QString& text, std::size_t most)
{
    Search search(text, most);
    if (!text.isEmpty())
        search.visit(root);
    return std::move(search.found);
}

} // namespace orvex
