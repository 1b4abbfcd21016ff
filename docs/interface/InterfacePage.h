#pragma once

#include <string>
#include <string_view>

/// The reference page of the control's public interface, made from the interface's own table.
namespace docs {

/// The page as Markdown in UTF-8, ending with a line break. Defaults are read from a new control.
std::string interfacePage();

/// What a member or an event is for, in one sentence; empty for a name without one.
std::string_view descriptionOf(std::string_view name);

/// How many names have a description.
std::size_t descriptionCount();

} // namespace docs
