#pragma once
// The upload of the Leica GSI driver: a GSI-16 coordinate file, one block a point, as the
// instruments load it into a job:
//
//   *11nnnn+<name> 81...6+<East> 82...6+<North> 83...6+<Height> 71....+<code>
//
// nnnn counts the blocks from 0001 (after 9999 it starts again at 0000); names and codes are
// right-aligned in 16 characters padded with zeros; coordinates are whole numbers of
// 1/10,000 of the unit with their sign. Every block ends with CR LF.
//
// Decisions:
// - Metres are written with unit 6 (1/10 mm) and feet with unit 7 (1/10,000 ft): US survey
//   feet, as the format's feet are read; a job in international feet is converted to them.
// - A point without height has no word 83, and a point without code no word 71.
// - A name that GSI-16 cannot hold (more than 16 characters, blanks, letters beyond ASCII)
//   keeps the point out of the upload; a code it cannot hold is left out of the block. A
//   message names the point either way. Zeros at the start of a name or code are read back
//   as padding ("0012" comes back as "12", as the job keeps it anyway).

#include "UploadSession.h"

class GsiUploadSession : public UploadSession {
  public:
    GsiUploadSession(const sxn_host& host, unsigned mode, unsigned flags, bool link);

    int Point(const sxn::UploadPoint& point) override;

  private:
    long block_ = 0;
};
