#include <Zandor/SqlReader.h>

namespace zandor::sql_reader {

Message Refusal::withPlace() const {
    return model::say<MessageCode::atPlace>(line, column, message);
}

String Refusal::text() const { return withPlace().text(); }

} // namespace zandor::sql_reader
