#pragma once

/// A host that is compiled without Qt's keywords and without its conversions between texts.
namespace strict {

/// Hands a widget no model, and returns how often the widget said so.
int errorsHeard();

} // namespace strict
