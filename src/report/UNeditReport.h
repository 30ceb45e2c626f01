#pragma once
// The reduction report: the text a surveyor files with the job. It knows the labels and
// unit names of the report (from NEDIT.INI), converts stored values to the output units
// the user chose, and writes every block of the report in its fixed-width layout.
//
// Stored lengths are in the job's unit and angles in decimal degrees; the output units come
// from the report parameters of its context (the document) each time a head is printed.

#include <map>
#include <memory>
#include <string>
#include <utility>
#include <vector>

#include "platform/job/UJobSettings.h"
#include "platform/report/UReportDoc.h"

namespace nedit {
class ReportContext;
}

class UNeditReport : public UReportDoc {
  public:
    UNeditReport(const nedit::ReportContext* context, const std::wstring& title);
    ~UNeditReport() override;

    /// Binds the report to `context` (may be null) and takes its output units and order. The
    /// page length is PAGELENGTH of section REPORT of NEDIT.INI when set, else 66 lines.
    void Init(const nedit::ReportContext* context, const std::wstring& title);
    void Clear() override;
    /// Takes the output units and coordinate order from the context; nothing without one.
    void UpdateSettings();
    /// 0, 1, 2 give 'S', 'D', 'G' (angles) and 'M', 'F', 'U' (lengths); others change nothing.
    void SetOutUA(int unit);
    void SetOutUL(int unit);
    void SetXYFLAG(int flag) { XYFlag = flag; }
    bool GetHeaderOutputed() const { return HeaderOutputed; }
    void SetHeaderOutputed(bool printed) { HeaderOutputed = printed; }
    wchar_t GetOutUA() const { return OutUA; }
    wchar_t GetOutUL() const { return OutUL; }

    // ---- Texts and values -------------------------------------------------------------
    /// A label of section TITLE of NEDIT.INI, or its default; empty for a key without one.
    std::wstring GetTitleText(const std::wstring& key) const;
    /// The name of a unit or mode by its letter ('I' reads as 'F'); empty when there is none.
    std::wstring Unit_Text(const std::wstring& section, wchar_t letter) const;
    double ConvertToAngleDisplayUnit(double degrees) const;
    /// A vertical reading in the file's vertical mode as a zenith angle in the output unit.
    double ConvertToDisplayVA(double reading) const;
    double ConvertToAreaDisplayUnit(double area);
    std::wstring ConvertToDistDisplayUnit(double length, int decimals);
    /// Decimal degrees as ddd.mmss, seconds rounded with carries at 60.
    static double dms(double degrees);
    /// A value already in output form, written "ddd mm'ss"" for sexagesimal output, else
    /// "ddd.dddd" two digits and two.
    std::wstring dmsString(double value) const;
    /// Decimal degrees written " ddd mm'ss".
    static std::wstring deg2dmsString(double degrees);
    /// A horizontal angle or bearing in the output angle type: "123 45'30"" or "123.7583".
    /// In degrees, minutes and seconds whole turns are taken off as dms carries them, so a
    /// reading that rounds to a full turn prints as 0, never as 360.
    std::wstring FormatAngle(double degrees) const;
    /// The platform's nedit::geo_brgdst: bearing (degrees) and distance from (e1, n1) to
    /// (e2, n2).
    static void geo_brgdst(double e1, double n1, double e2, double n2, double* brg, double* dst);
    /// The platform's nedit::geo_zero: 1 when the size of `value` is 1e-5 or less.
    static int geo_zero(double value);

    // ---- Blocks -------------------------------------------------------------------------
    void PrintMainReportHead();
    void PrintHeadCtrlString(const std::wstring& key, const std::wstring& section, wchar_t letter);
    void PrintHeadDVal(const std::wstring& key, double value);
    void PrintHeadHDegree(const std::wstring& key, double value, bool titled);
    void PrintHeadVDegree(const std::wstring& key, double value);
    void PrintHeadInt(const std::wstring& key, int value);
    void PrintHeadString(const std::wstring& key, const std::wstring& value);
    void PrintHeadCoord(double e, double n, double h);
    void PrintEdmHead();
    /// The block of an occupied station. `backReadings` are the horizontal circle readings of
    /// its back sight, each round as read; they are printed only with a back station.
    void PrintOccStnBlk(const std::vector<double>& backReadings, const std::wstring& name, double e,
                        double n, double h, const std::wstring& code, double insHt, double scale,
                        const std::wstring& backStn, double backBearing, double backAngle);
    void PrintSSHead();
    void PrintSSLine(const std::wstring& id, double ha, double va, double sd, double ht, double e,
                     double n, double h, const std::wstring& code, int lineNo, bool full);
    int PrintOffset(double r, double t, double v);
    void PrintPTHeader();
    void PrintPTRecord(const std::wstring& name, double e, double n, double h,
                       const std::wstring& code);
    int PrintTravHead(const std::wstring& title, bool elevAdj);
    int PrintTravHead(int adjusted);
    int PrintCoord(const std::wstring& name, double e, double n, double h);
    int PrintCoord(const std::wstring& name, double e, double n);
    int PrintLine(const std::wstring& name, double ha, double brg, double dist, double e, double n,
                  double h, bool elevAdj, double adj);
    int PrintLine(const std::wstring& name, double ha, double brg, double dist, double e, double n);
    int PrintTraverseInfo(double dE, double dN, double dH, double brg, double dist, double area,
                          double length, int setups, const std::wstring& accuracy, bool elevError,
                          bool angle, double angErr, double perStn, double known, double observed);
    int PrintMisclose(double dist, double brg, double accuracy, double area, double total);
    int PrintAdjustedSideShotsHead(const std::wstring& text);
    void PrintChkStn(const std::wstring& id, double ha, double va, double sd, double ht,
                     const std::wstring& code, int lineNo);
    void PrintChkStnBlk(const std::wstring& stn, const std::wstring& target, double e, double n,
                        double h, double knownE, double knownN, double knownH, double brg,
                        double knownBrg, double brgDiff, double dist, double knownDist,
                        double distDiff);
    void PrintUndefinedCodeHead();
    void PrintUndefined(const std::wstring& text);
    void PrintPartOfArc(const std::wstring& name);
    void PrintEndFile();
    void PrintPageHead(const std::wstring& text, int page);

  private:
    /// OutUA and OutUL from the context's report parameters; needs a context.
    void TakeOutputUnits();
    /// W of the report's notation: line ends before, the text, line ends after.
    void W(const std::wstring& text, int before, int after) { WriteText(text, before, after, 0); }
    std::wstring Dist(double value) { return ConvertToDistDisplayUnit(value, 3); }
    std::wstring Height(double value);
    bool IsOn(int option) const;
    int AngleType() const;
    bool Sexagesimal() const;
    /// The context's job settings, as they are now; defaults without a context.
    const UJobSettings& Settings() const;
    /// Metres of a stored length in the job's unit.
    double ToMetres(double length) const;
    std::wstring IniValue(const std::wstring& section, const std::wstring& key) const;
    /// East and North texts in the order of XYFlag.
    std::pair<std::wstring, std::wstring> InOrder(std::wstring east, std::wstring north) const;

    const nedit::ReportContext* Context = nullptr;
    double EdmScale = 1.0;
    wchar_t EdmType = L'0';
    wchar_t OutUA = L'S';
    wchar_t OutUL = L'M';
    int XYFlag = 1;
    bool HeaderOutputed = false;
    // NEDIT.INI is read once per value and report run, not once per line.
    mutable std::map<std::pair<std::wstring, std::wstring>, std::wstring> IniCache;
};
