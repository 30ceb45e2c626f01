// sxnedit: the command line of SXNedit. Thin over the engine; errors are caught only here.

#include <cstdio>
#include <cstring>
#include <exception>
#include <string>
#include <vector>

#include "BuildInfo.h"
#include "Commands.h"

namespace {

const char* const kUsage =
    "Usage: sxnedit COMMAND [ARGUMENTS]\n"
    "\n"
    "Reads total-station observations held as neutral records.\n"
    "\n"
    "Commands:\n"
    "  rows FILE.neu   print the records of a neutral file, one per line, as the\n"
    "                  record list holds them (upper case, laid out, unknown keys\n"
    "                  as comments)\n"
    "  job new JOB     make a new job file, with the default survey codes\n"
    "  job points JOB [--json]\n"
    "                  list the job's points; --json gives objects with id, e, n,\n"
    "                  h (null: no height) and code\n"
    "  job import-points JOB FILE.csv\n"
    "                  add or update points from name,east,north,height,code rows\n"
    "                  (empty height: none; a later row of the same name wins)\n"
    "  job export-points JOB FILE.csv\n"
    "                  write the job's points as such rows\n"
    "  job info JOB    the job's settings and what it holds\n"
    "  doc list JOB    the raw-data documents stored in a job\n"
    "  doc import JOB FILE.neu [--name NAME]\n"
    "                  store a neutral file in the job as a raw-data document\n"
    "  doc export JOB NAME FILE.neu\n"
    "                  write a document's records as a neutral file\n"
    "  doc reduce JOB NAME [--report OUT.txt|-] [--json]\n"
    "                  reduce a stored document; coordinates that the run took from\n"
    "                  the job or the user are added to its records\n"
    "  doc rename JOB OLD NEW, doc delete JOB NAME\n"
    "  reduce FILE.neu [--job JOB] [--json] [--points OUT.csv] [--interactive]\n"
    "         [--report OUT.txt|-] [--angles dms|deg|gon] [--lengths m|ft|usft]\n"
    "         [--columns ID,LN,HA,VA,SD,HD,VD,HT,CO,EC,NC,HC]\n"
    "                  reduce the observations to East, North, Height and print the\n"
    "                  points; --job takes known points from a job, --json prints\n"
    "                  points, lines, arcs, circles, the error code and the messages,\n"
    "                  --points writes id,east,north,height,code rows. Questions are\n"
    "                  answered as \"Apply to All\" would (job, else field records,\n"
    "                  else entered values) unless --interactive asks on the terminal.\n"
    "                  --report writes the reduction report to a file, or prints it\n"
    "                  for -; --angles, --lengths and --columns set its output units\n"
    "                  and the columns of its side-shot tables for this run\n"
    "  instruments [--json]\n"
    "                  the instrument drivers found, with their descriptions and raw\n"
    "                  file extensions; drivers that were refused, and why\n"
    "  import RAWFILE --instrument NAME [-o OUT.neu | --job JOB [--name DOC]]\n"
    "         [--angles dms|deg|gon] [--lengths m|ft|usft]\n"
    "                  translate an instrument's raw file into neutral records, on\n"
    "                  standard output, into OUT.neu or into a new document of JOB;\n"
    "                  the units are the job's unless given\n"
    "  download --instrument NAME --port COM1..COM8|DEVICE [--baud N]\n"
    "         [--parity none|odd|even|mark|space] [--data-bits 5..8]\n"
    "         [--stop-bits 1|1.5|2] [--flow none|xon/xoff|hardware] [--raw OUT]\n"
    "         [--timeout SECONDS] [-o OUT.neu | --job JOB [--name DOC]]\n"
    "         [--angles dms|deg|gon] [--lengths m|ft|usft]\n"
    "                  receive records from an instrument on a serial port until its\n"
    "                  data end, the link closes, nothing comes for the time-out\n"
    "                  (10 s) or Ctrl-C; what arrived is kept, the raw data in OUT\n"
    "                  when --raw is given. Port values not given come from the\n"
    "                  port's stored settings\n"
    "\n"
    "Options:\n"
    "  -h, --help      show this help and exit\n"
    "  --version       show the version and exit\n"
    "\n"
    "Exit status: 0 done, 1 failed (for reduce: the run did not reach its end),\n"
    "2 an input file could not be read, "
    "64 the command line is wrong.\n"
    "Environment: SXNEDIT_DATA_DIR names the directory of the record definition,\n"
    "SXNEDIT_DRIVER_DIR the directory of the instrument drivers (else drivers/ beside\n"
    "the program).\n";

int Dispatch(const std::vector<std::string>& words) {
    if (words.empty()) {
        std::fputs(kUsage, stderr);
        return exit_status::Usage;
    }
    const std::string& command = words[0];
    if (command == "-h" || command == "--help" || command == "help") {
        std::fputs(kUsage, stdout);
        return exit_status::Ok;
    }
    if (command == "--version") {
        std::printf("sxnedit %s\n", SXNEDIT_VERSION);
        return exit_status::Ok;
    }
    const std::vector<std::string> args(words.begin() + 1, words.end());
    if (command == "rows") return RunRows(args);
    if (command == "job") return RunJob(args);
    if (command == "reduce") return RunReduce(args);
    if (command == "doc") return RunDoc(args);
    if (command == "instruments") return RunInstruments(args);
    if (command == "import") return RunImport(args);
    if (command == "download") return RunDownload(args);
    std::fprintf(stderr, "sxnedit: unknown command '%s' (see sxnedit --help)\n", command.c_str());
    return exit_status::Usage;
}

}  // namespace

int main(int argc, char** argv) {
    try {
        return Dispatch(std::vector<std::string>(argv + 1, argv + argc));
    } catch (const std::exception& error) {
        std::fprintf(stderr, "sxnedit: %s\n", error.what());
        return exit_status::Failed;
    }
}
