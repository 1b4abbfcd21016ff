#include "frontends/windows/automation/keeping/StateStream.h"

#include "frontends/windows/automation/com/Failure.h"

#include <algorithm>
#include <array>
#include <span>

namespace zandor::automation {

namespace {

using TalvikDBxZandor::automation::Member;
using TalvikDBxZandor::automation::Type;
using Bytes = std::vector<std::uint8_t>;

constexpr std::array<std::uint8_t, 4> mark = {'Z', 'D', 'N', 'K'};
constexpr std::uint16_t version = 1;
constexpr std::size_t headerSize = mark.size() + 2 + 4 + 4;

[[noreturn]] void refuse(HRESULT code) { throw errorOf(code); }

/// CRC-32, as archives have it.
std::uint32_t checkSumOf(std::span<const std::uint8_t> bytes) {
    std::uint32_t sum = ~std::uint32_t{0};
    for (const std::uint8_t byte : bytes) {
        sum ^= byte;
        for (int bit = 0; bit < 8; ++bit) sum = (sum >> 1) ^ (sum & 1 ? 0xEDB88320 : 0);
    }
    return ~sum;
}

void append(Bytes& bytes, std::uint32_t number, int size) {
    for (int n = 0; n < size; ++n) bytes.push_back(static_cast<std::uint8_t>(number >> (8 * n)));
}

void append(Bytes& bytes, const platform::Variant& value) {
    if (const auto* text = std::get_if<platform::String>(&value)) {
        append(bytes, static_cast<std::uint32_t>(text->size()), 4);
        for (const char16_t letter : *text) append(bytes, letter, 2);
    } else if (const auto* flag = std::get_if<bool>(&value)) {
        append(bytes, *flag ? 1 : 0, 1);
    } else {
        append(bytes, static_cast<std::uint16_t>(std::get<std::int16_t>(value)), 2);
    }
}

class Reader {
public:
    explicit Reader(std::span<const std::uint8_t> bytes) : mLeft(bytes) {}

    std::uint32_t number(std::size_t size) {
        if (mLeft.size() < size) refuse(STG_E_DOCFILECORRUPT);
        std::uint32_t value = 0;
        for (std::size_t n = 0; n < size; ++n) value |= std::uint32_t{mLeft[n]} << (8 * n);
        mLeft = mLeft.subspan(size);
        return value;
    }
    platform::Variant value(Type type) {
        if (type == Type::Boolean) return number(1) != 0;
        if (type == Type::Integer) return static_cast<std::int16_t>(number(2));
        const std::size_t length = number(4);
        if (length > mLeft.size() / 2) refuse(STG_E_DOCFILECORRUPT);
        platform::String text;
        for (std::size_t n = 0; n < length; ++n) text += static_cast<char16_t>(number(2));
        return text;
    }
    bool isAtEnd() const { return mLeft.empty(); }

private:
    std::span<const std::uint8_t> mLeft;
};

/// So many bytes; a stream may give them in pieces. No room is taken for what does not come.
Bytes take(IStream& stream, std::size_t size, HRESULT cut) {
    Bytes bytes;
    while (bytes.size() < size) {
        const std::size_t before = bytes.size();
        const std::size_t piece = std::min<std::size_t>(size - before, 4096);
        bytes.resize(before + piece);
        ULONG got = 0;
        require(stream.Read(bytes.data() + before, static_cast<ULONG>(piece), &got));
        if (got == 0 || got > piece) refuse(cut);
        bytes.resize(before + got);
    }
    return bytes;
}

} // namespace

Bytes bytesOf(const State& state) {
    Bytes body;
    const auto& members = keptMembers();
    for (std::size_t n = 0; n < members.size(); ++n) {
        append(body, members[n]->dispatchId, 4);
        append(body, static_cast<std::uint32_t>(members[n]->type), 1);
        append(body, state[n]);
    }
    Bytes bytes(mark.begin(), mark.end());
    append(bytes, version, 2);
    append(bytes, static_cast<std::uint32_t>(body.size()), 4);
    append(bytes, checkSumOf(body), 4);
    bytes.insert(bytes.end(), body.begin(), body.end());
    return bytes;
}

State readState(IStream& stream) {
    const Bytes header = take(stream, headerSize, STG_E_INVALIDHEADER);
    if (!std::equal(mark.begin(), mark.end(), header.begin())) refuse(STG_E_INVALIDHEADER);
    Reader about({header.data() + mark.size(), headerSize - mark.size()});
    const std::uint32_t written = about.number(2);
    if (written > version) refuse(STG_E_OLDDLL);
    if (written != version) refuse(STG_E_INVALIDHEADER);
    const std::uint32_t size = about.number(4);
    const Bytes body = take(stream, size, STG_E_DOCFILECORRUPT);
    if (about.number(4) != checkSumOf(body)) refuse(STG_E_DOCFILECORRUPT);

    Reader reader(body);
    State state;
    for (const Member* const member : keptMembers()) {
        if (reader.number(4) != member->dispatchId ||
            reader.number(1) != static_cast<std::uint32_t>(member->type))
            refuse(STG_E_DOCFILECORRUPT);
        state.push_back(reader.value(member->type));
    }
    if (!reader.isAtEnd() || !isPossible(state)) refuse(STG_E_DOCFILECORRUPT);
    return state;
}

} // namespace zandor::automation
