#pragma once
// The job schema's SQL, one text per version, compiled in from data/schema/NNN_*.sql.

namespace nedit {

extern const char kJobSchemaV1[];
extern const char kJobSchemaV2[];

}  // namespace nedit
