#include <Zandor/Interface.h>

// The whole of the control's library and nothing beside it: the link fails when a part of the core
// needs a symbol from elsewhere, and the test reads which shared libraries the program asks for.
int main() { return TalvikDBxZandor::automation::members().empty() ? 1 : 0; }
