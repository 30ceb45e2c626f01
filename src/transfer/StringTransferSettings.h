#pragma once
// The user's choices for a transfer to the job, kept between runs as the last used values:
// what goes into a point's code, whether points are locked in the job, and which of their
// attachments go with them.
//
// Decision: the last used values live in the program's profile (sxnedit.ini in the
// configuration directory, section "String Transfer Settings"), as other choices of the user
// do; a new user starts from the defaults below.

struct StringTransferSettings {
    int IncludeStringNumbers = 1;  // "Include String Numbers"
    int IncludeComments = 0;       // "Include Comments"
    int IncludeCommands = 0;       // "Include Commands"
    int SaveDescription = 0;       // "Description": the code's description is the point code
    int SaveFeatureCode = 1;       // "Feature Code"
    int Locked = 0;                // "Locked": the points are locked in the job
    int TransferImages = 1;
    int TransferAttributes = 1;
    int UseCodeFlags = 1;  // the four point flags come from the survey code
    int TransferNotes = 1;

    bool operator==(const StringTransferSettings& other) const;
};

/// The last used values, or the defaults.
StringTransferSettings GetStringTransferSettings();
/// Keeps `settings` as the last used values; false when the profile cannot be written.
bool SetStringTransferSettings(const StringTransferSettings& settings);
