#pragma once
// Turns Nikon RAW v2.00 records into neutral records. The format, as its public documentation
// lays it out, is one record a line, its fields separated by commas:
//
//   CO,text                                       comment (the head says the units)
//   ST,stn,(stn id),bs,(bs id),hi,bsazim,bsha     station set-up
//   F1|F2,pt,ht,sd,ha,va,time                     back sight shot on face 1 or 2
//   SS,pt,ht,sd,ha,va,time,code                   side shot
//   CP,pt,(pt id),ht,sd,ha,va,time,code           shot to a control point
//   SO,pt,(sopt),ht,sd,ha,va,time                 stake-out shot
//   UP|MP|CC|RE,pt,(pt id),north,east,elev,code   uploaded, keyed-in, calculated, resected point
//
// What they become: ST is STN with the instrument height, and BKB with the back point, the
// back azimuth as bearing and the back reading as reading. F1 and F2 are BS records (to the
// set-up's back point when they name none); SS, CP and SO are SS records with the target
// height, the code as CO. UP, MP and RE give coordinates that the instrument was given or
// that place a station: XYZ, so that they position and orient set-ups. CC, coordinates the
// instrument worked out, give PT. CO records stand as comments, and so do UP, MP, RE, ST and
// SO records as a whole, for the code, the names and the staked point that their records
// leave out.
//
// The head's comments set the units: "Dist Units: Metres", "Feet" or "US Feet"; "Angle
// Units: Gons", "Degrees", "DDDMMSS" (written ddd.mmss) or "Mils"; "Zero VA: Horizontal"
// (vertical angles from the horizon, turned into zenith angles).
//
// Decisions:
// - Before the head has said otherwise, lengths are metres and angles ddd.mmss.
// - A record marked '*' in front was replaced in the instrument by a later one (a shot taken
//   again, a set-up redone): it stands as a comment, and takes no part in the means.
// - The (pt id) name is used where the point number is empty.
// - Time stamps are not mapped; the raw file keeps them.
// - A shot without a distance is angles only: slope distance 0. A shot without a horizontal
//   reading, a record whose numbers cannot be read, and a line that is no record are lines
//   not read. A record type that has no neutral counterpart stands as a comment.

#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "LineSession.h"

class NikonTranslator : public sxn::LineTranslator {
  public:
    static constexpr const char* kTag = "NIKON";
    static constexpr const char* kName = "Nikon RAW v2.00";

    using LineTranslator::LineTranslator;

    bool Line(const sxn::RawLine& line) override;

  private:
    using Fields = std::vector<std::string_view>;
    /// False when a record of a known type cannot be read.
    bool Record(const Fields& fields, std::string_view line);
    void Head(std::string_view text);
    bool Station(const Fields& fields);
    /// A shot whose fields run from `first`: ht, sd, ha, va.
    bool Shot(const Fields& fields, std::size_t first, const std::string& id, bool back_sight,
              std::string_view code);
    bool Coordinates(const Fields& fields, bool given, std::string_view code);

    sxn::LengthIn length_unit_ = sxn::LengthIn::Metres;
    sxn::AngleIn angle_unit_ = sxn::AngleIn::Dms;
    bool from_horizon_ = false;
    std::string back_point_;
};
