#include "text/names.h"

#include "clientkit/callbackid.h"

namespace deskplayer
{

std::vector<std::string_view> CallbackNames()
{
    std::vector<std::string_view> names;
    names.reserve(bdmv::Callback__sizeof);
    for (int id = 0; id < bdmv::Callback__sizeof; ++id) {
        names.emplace_back(NameOf(static_cast<bdmv::CallbackId>(id)));
    }
    return names;
}

std::vector<std::string> NamesOf(const bdmv::UOMaskTable& mask)
{
    std::vector<std::string> names;
    for (int bit = 0; bit < 8 * bdmv::UOMaskTable::UO_MASK_TABLE_SIZE; ++bit) {
        const auto operation = static_cast<bd::UserOperationMaskDef>(bit);
        if (mask.IsSet(operation)) {
            names.push_back(NameOrNumber(operation));
        }
    }
    return names;
}

std::string HexOf(const bdmv::Bytes& bytes)
{
    static const char digits[] = "0123456789abcdef";
    const auto* const data = static_cast<const bd::UInt8*>(bytes.data);
    std::string text;
    for (bd::UInt32 i = 0; data != nullptr && i < bytes.size; ++i) {
        text += digits[data[i] >> 4];
        text += digits[data[i] & 0x0F];
    }
    return text;
}

} // namespace deskplayer
