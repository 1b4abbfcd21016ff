#include <Zandor/headless/Drawing.h>

#include <Zandor/Zandor.h>
#include <Zandor/headless/Toolkit.h>

#include <algorithm>
#include <charconv>
#include <cmath>
#include <limits>

namespace zandor::platform::headless {

namespace {

constexpr float twipsPerPixel = 15;
constexpr float margin = 20;
constexpr float character = 7; // nobody measures texts here, so they are taken to be wide
constexpr float beforeText = 22;
constexpr float behindText = 20;
constexpr float baseline = 4; // below the middle of a row

constexpr std::string_view style =
    "text{font:12px sans-serif;fill:#1a1a1a}"
    ".page{fill:#fff}.box{fill:#fff;stroke:#8c8c8c}.title{fill:#dcdcdc;stroke:#8c8c8c}"
    ".name{font-weight:bold}.more{fill:#707070}.join{stroke:#404040}.mark{fill:#fff;stroke:#404040}"
    ".key{fill:#404040;fill-rule:evenodd}.out{fill:none;stroke:#1a1a1a;stroke-width:2}";

std::string number(float value) {
    // Hundredths of a pixel are fine enough, and short.
    const double rounded = std::round(static_cast<double>(value) * 100) / 100;
    char digits[32];
    return {digits, std::to_chars(digits, std::end(digits), rounded).ptr};
}

std::string attribute(std::string_view name, float value) {
    return ' ' + std::string(name) + "=\"" + number(value) + '"';
}

/// As content of an element. XML has no way to write most control characters.
std::string escaped(StringView text) {
    std::string result;
    for (const char c : toUtf8(text)) {
        if (c == '&')
            result += "&amp;";
        else if (c == '<')
            result += "&lt;";
        else if (c == '>')
            result += "&gt;";
        else if (static_cast<unsigned char>(c) < ' ')
            result += ' ';
        else
            result += c;
    }
    // Nor those two that are no characters.
    for (const std::string_view none : {"\xEF\xBF\xBE", "\xEF\xBF\xBF"})
        for (auto at = result.find(none); at != std::string::npos; at = result.find(none, at))
            result.replace(at, none.size(), "\xEF\xBF\xBD");
    return result;
}

String elided(const String& text, float width) {
    const auto most = static_cast<std::size_t>(std::max(1.0F, width / character));
    if (text.size() <= most) return text;
    std::size_t kept = most - 1;
    if (kept > 0 && text[kept - 1] >= 0xD800 && text[kept - 1] < 0xDC00) --kept;
    return text.substr(0, kept) + u'…';
}

class Drawing {
public:
    void add(const Element& element) {
        if (!element.look().visible) return;
        if (const auto* line = dynamic_cast<const Line*>(&element)) addLine(*line);
        if (const auto* mark = dynamic_cast<const Shape*>(&element)) addMark(*mark);
        if (const auto* table = dynamic_cast<const Tabulet*>(&element)) addTable(*table);
    }

    std::string svg() const {
        const std::string width = number(mRight + margin), height = number(mBottom + margin);
        return R"(<svg xmlns="http://www.w3.org/2000/svg" width=")" + width + "\" height=\"" +
               height + "\" viewBox=\"0 0 " + width + ' ' + height + "\">\n<style>" +
               std::string(style) + "</style>\n<rect class=\"page\" width=\"" + width +
               "\" height=\"" + height + "\"/>\n" + mJoins + mTables + "</svg>\n";
    }

private:
    void addLine(const Line& line) {
        const auto [x1, y1, x2, y2] = line.ends();
        const float fromX = x1 / twipsPerPixel, fromY = y1 / twipsPerPixel;
        const float toX = x2 / twipsPerPixel, toY = y2 / twipsPerPixel;
        const LineNotes& notes = line.notes();
        mJoins += "<g>";
        if (!notes.Sentence.empty()) mJoins += "<title>" + escaped(notes.Sentence) + "</title>";
        mJoins += "<line class=\"join\"" + attribute("x1", fromX) + attribute("y1", fromY) +
                  attribute("x2", toX) + attribute("y2", toY) + "/>";
        // Above the line, a quarter of the way from its ends.
        constexpr float inwards = 0.25F;
        const auto note = [&](const String& text, float way) {
            if (text.empty()) return;
            mJoins += "<text text-anchor=\"middle\"" + attribute("x", fromX + way * (toX - fromX)) +
                      attribute("y", fromY + way * (toY - fromY) - baseline) + '>' + escaped(text) +
                      "</text>";
        };
        note(notes.First, inwards);
        note(notes.Middle, 0.5F);
        note(notes.Second, 1 - inwards);
        mJoins += "</g>\n";
    }

    void addMark(const Shape& mark) {
        const Bounds& at = mark.placement();
        const float size = at.Width / twipsPerPixel;
        const float x = at.Left / twipsPerPixel, y = at.Top / twipsPerPixel;
        if (mark.style() == shapeCircle)
            mJoins += "<circle class=\"mark\"" + attribute("cx", x + size / 2) +
                      attribute("cy", y + size / 2) + attribute("r", size / 2) + "/>\n";
        else
            mJoins += "<rect class=\"mark\"" + attribute("x", x) + attribute("y", y) +
                      attribute("width", size) + attribute("height", size) + "/>\n";
    }

    void addTable(const Tabulet& table) {
        const Bounds& at = table.placement();
        const float left = at.Left / twipsPerPixel, top = at.Top / twipsPerPixel;
        const float width = at.Width / twipsPerPixel;
        const auto entries = static_cast<std::int32_t>(table.entries().size());
        // The frame ends with the last entry, where there is more room than entries.
        const float end = table.rowMiddle(entries) + tabuletRowHeight / 2 + tabuletBorder;
        const float height = std::min(at.Height, end) / twipsPerPixel;
        constexpr float title = tabuletTitleHeight / twipsPerPixel;
        mRight = std::max(mRight, left + width);
        mBottom = std::max(mBottom, top + height);
        mTables += "<g transform=\"translate(" + number(left) + ' ' + number(top) + ")\">";
        mTables += "<rect class=\"box\"" + attribute("width", width) + attribute("height", height) +
                   "/><rect class=\"title\"" + attribute("width", width) +
                   attribute("height", title) + "/>";
        addText("name", elided(table.look().text, width - 2 * baseline), 2 * baseline, title / 2);

        std::int32_t position = table.firstVisible();
        for (; position <= entries && table.inView(position); ++position) {
            // The last one in view makes room for the number of those that are not.
            if (position < entries && !table.inView(position + 1)) break;
            addEntry(table.entry(position), width, table.rowMiddle(position) / twipsPerPixel);
        }
        if (position <= entries)
            addText("more", u"… " + decimal(entries - position + 1), beforeText,
                    table.rowMiddle(position) / twipsPerPixel);
        mTables += "</g>\n";
    }

    void addEntry(const ColumnItem& entry, float width, float middle) {
        if (entry.picture() == Picture::key)
            mTables +=
                R"(<path class="key" transform="translate(7 )" + number(middle - 6) +
                R"x() scale(.75)" d="M8.7 6.9a4.3 4.3 0 1 0 0 2.2H10v2h2v-2h1.3v3.3h2.2V6.9z)x"
                R"(M4.2 6.3a1.7 1.7 0 1 1 0 3.4 1.7 1.7 0 0 1 0-3.4z"/>)";
        addText({}, elided(entry.text(), width - beforeText - behindText), beforeText, middle);
        if (entry.comesOut())
            mTables += R"(<path class="out" d="M)" + number(width - 15) + ' ' + number(middle) +
                       "l3 3 6-7\"/>";
    }

    void addText(std::string_view kind, const String& text, float x, float middle) {
        mTables += "<text";
        if (!kind.empty()) mTables += " class=\"" + std::string(kind) + '"';
        mTables +=
            attribute("x", x) + attribute("y", middle + baseline) + '>' + escaped(text) + "</text>";
    }

    std::string mJoins;
    std::string mTables;
    float mRight = 0;
    float mBottom = 0;
};

/// The host of a control that is only looked at.
class Onlooker final : public TalvikDBxZandor::ZandorEvents {
public:
    explicit Onlooker(Toolkit& toolkit) : mToolkit(toolkit) {}
    void Raise(TalvikDBxZandor::Event event,
               const TalvikDBxZandor::EventArguments& arguments) override {
        mToolkit.comforts.raised(event, arguments);
    }

private:
    Toolkit& mToolkit;
};

} // namespace

std::string svgOf(const Toolkit& toolkit) {
    Drawing drawing;
    for (const Element* element : toolkit.find<Frame>("fraTable").children()) drawing.add(*element);
    return drawing.svg();
}

std::string svgOf(TalvikZandorLib::Library& library, const Ref<TalvikZandorLib::Zandor>& query) {
    if (!query) throw errors::objectNotSet();
    constexpr std::int16_t largest = std::numeric_limits<std::int16_t>::max();
    Toolkit toolkit;
    toolkit.surface().resize(largest, largest);
    Onlooker onlooker(toolkit);
    TalvikDBxZandor::Zandor control(toolkit, library, onlooker);
    control.DebugSwitch(0);
    control.MXHorzFrameSize = largest;
    control.MXVertFrameSize = largest;
    toolkit.comforts.setFlags(comforts::Flags::all()); // what they show is part of the drawing
    toolkit.comforts.attach(control);
    control.UserControl_Resize();
    control.P_SET_Zandor(query);
    std::string result = svgOf(toolkit);
    control.End();
    toolkit.close();
    toolkit.comforts.detach();
    if (!toolkit.boxes().empty()) throw errors::automation(toolkit.boxes().front().prompt);
    return result;
}

} // namespace zandor::platform::headless
