#include "Report.h"

namespace report {

namespace {

std::string nameOf(const std::shared_ptr<Source>& source, int field) {
    if (!source || field < 0) return "nothing";
    return source->name + '.' + source->fields[static_cast<std::size_t>(field)].name;
}

} // namespace

std::string describe(const Report& report) {
    std::string text;
    for (const auto& source : report.sources) text += "source " + source->name + '\n';
    for (const auto& link : report.links)
        text += "link " + nameOf(link->from, link->fromField) + " to " +
                nameOf(link->to, link->toField) + '\n';
    for (const auto& output : report.outputs) {
        text += "output " + nameOf(output->source, output->field) + '\n';
        for (const auto& [row, condition] : output->conditions)
            text += "  where " + condition + '\n';
    }
    return text;
}

Report someReport() {
    Report report;
    const auto source = [&](const char* name, std::vector<Field> fields) {
        const int left = 600 + 4200 * static_cast<int>(report.sources.size());
        report.sources.push_back(std::make_shared<Source>(Source{.id = ++report.lastId,
                                                                 .name = name,
                                                                 .fields = std::move(fields),
                                                                 .left = left,
                                                                 .top = 600,
                                                                 .width = 2400,
                                                                 .height = 1500}));
        return report.sources.back();
    };
    const auto orders = source("orders", {{.name = "id", .key = true}, {.name = "customer"}});
    const auto customers = source("customers", {{.name = "id", .key = true}, {.name = "name"}});
    report.links.push_back(std::make_shared<Link>(Link{
        .id = ++report.lastId, .from = orders, .to = customers, .fromField = 1, .toField = 0}));
    report.outputs.push_back(std::make_shared<Output>(Output{
        .id = ++report.lastId, .source = customers, .field = 1, .conditions = {{4, "Like 'A*'"}}}));
    return report;
}

} // namespace report
