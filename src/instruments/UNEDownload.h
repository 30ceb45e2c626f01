#pragma once
// "Download Parameters" (dialog 8006): the instrument, the port and the link's values for a
// download, with the choice to keep the raw file. One object serves one run of the command;
// afterwards the caller reads Comm, Instrument, SaveRaw and AckNak.
//
// The values come from the profile's "Download Settings" (the last choice, and the port
// settings stored for each instrument) or, without them, from the port's [Ports] entry; on
// OK they are written back to both stores and to the port.
//
// Decisions: the controls' link texts give the starting values, as they did when the dialog
// bound its controls: instrument "KVR-6:", port "COM2", "Save Raw Data File" ticked, no
// acknowledgements. A port that cannot be opened on OK is passed over silently; the download
// that follows says why it cannot open it.

#include <string>
#include <vector>

#include "platform/messages/DialogHost.h"

class UDeviceManager;

class UNEDownload : public nedit::UDialogLogic {
  public:
    static constexpr int kResourceId = 8006;
    static constexpr int kInstrumentList = 3001;
    static constexpr int kPortList = 3002;
    static constexpr int kBaudList = 1009;
    static constexpr int kDataBitList = 1003;
    static constexpr int kStopBitList = 1011;
    static constexpr int kParityList = 1006;
    static constexpr int kFlowList = 1012;
    static constexpr int kSaveRawCheck = 1007;
    static constexpr int kAckNakCheck = 1008;
    static constexpr int kDriverDetailButton = 1005;

    /// `manager` gives the instruments; not owned, may be null (no instruments).
    UNEDownload(nedit::DialogHost* host, UDeviceManager* manager);

    std::wstring DialogName() const override { return L"Download Parameters"; }
    /// Fills the instrument list, applies the Ack/Nak rule, reads the stores and selects the
    /// instrument and the port (the first items when they are not in the lists).
    void OnInitDialog() override;
    /// Refuses a baud rate of more than 5 characters with "No more than 5 characters please";
    /// else writes the values to the port, [Ports] and the profile.
    bool OnOK() override;

    /// Another instrument was chosen: the old one's port settings are stored, the new one's
    /// are read.
    void OnSelchangeInstrument(const std::wstring& instrument);
    /// "Driver Detail".
    void OnDriverDetail();

    /// The Ack/Nak rule on an instrument's name: may set `ackNak`, and gives whether the
    /// "Download with Ack/Nak" box is enabled.
    static bool ApplyAckNakRule(const std::wstring& instrument, int& ackNak);
    /// The items of list `id`.
    std::vector<std::wstring> GetItems(int id) const;
    bool IsAckNakEnabled() const { return AckNakEnabled; }
    /// The control that takes the focus after a refused OK; 0 when none.
    int GetFocusId() const { return FocusId; }
    /// "%s,%d,%c,%d,%s,%c" of the values: the "Port Settings" value of the instrument.
    std::wstring PortSettingsText() const;

    std::wstring Comm = L"COM2";
    std::wstring Instrument = L"KVR-6:";
    int SaveRaw = 1;
    int AckNak = 0;
    std::wstring Parity = L"NONE";
    std::wstring StopBits;
    std::wstring Baud;
    std::wstring DataBits;
    std::wstring Flow;

  private:
    /// The values of a "Port Settings" value, or of the port's [Ports] entry without one.
    void LoadPortSettings();

    nedit::DialogHost* Host;
    UDeviceManager* DeviceManager;
    std::vector<std::wstring> Instruments;
    bool AckNakEnabled = false;
    int FocusId = 0;
};
