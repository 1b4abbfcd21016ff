#include <Zandor/sql/Expression.h>

namespace zandor::model::sql {

namespace {

template <class Joint>
Node joined(std::vector<Node> terms) {
    Joint joint;
    for (auto& term : terms) {
        if (const auto* same = std::get_if<Joint>(&term->node))
            joint.terms.insert(joint.terms.end(), same->terms.begin(), same->terms.end());
        else
            joint.terms.push_back(std::move(term));
    }
    if (joint.terms.empty()) return {};
    if (joint.terms.size() == 1) return joint.terms.front();
    return make(std::move(joint));
}

} // namespace

Node allOf(std::vector<Node> terms) { return joined<And>(std::move(terms)); }
Node anyOf(std::vector<Node> terms) { return joined<Or>(std::move(terms)); }

} // namespace zandor::model::sql
