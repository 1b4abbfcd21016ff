#include <Zandor/Library.h>
#include <Zandor/QueryDocument.h>
#include <Zandor/headless/Drawing.h>
#include <Zandor/platform/RuntimeError.h>

#include <cstdio>

using namespace zandor;

/// Draws the query of a file as SVG, with no window, no display and no toolkit.
int main(int argc, char** argv) {
    if (argc != 2)
        return std::fputs("usage: svg_on_a_server QUERY.json > PICTURE.svg\n", stderr), 2;
    const auto document = files::loadQuery(argv[1]);
    if (!document) {
        std::fprintf(stderr, "%s\n", document.error().c_str());
        return 1;
    }
    try {
        model::Library library;
        const std::string svg = platform::headless::svgOf(library, document->query);
        std::fwrite(svg.data(), 1, svg.size(), stdout);
        return std::fflush(stdout) == 0 ? 0 : 1;
    } catch (const platform::RuntimeError& error) {
        std::fprintf(stderr, "%s\n", platform::toUtf8(error.Description).c_str());
        return 1;
    }
}
