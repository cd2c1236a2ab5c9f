// make_demo_game <game folder>: builds a small game folder with a library of made-up add-ons, so
// that the selector can be tried without the game. Everything in it is invented here.
#include <QGuiApplication>
#include <QImage>
#include <QLinearGradient>
#include <QPainter>
#include <QPainterPath>
#include <QString>

#include <cctype>
#include <filesystem>
#include <fstream>
#include <iostream>
#include <string>
#include <system_error>
#include <utility>
#include <vector>

namespace fs = std::filesystem;

namespace {

// One add-on folder of the library.
struct Addon {
  std::string folder;
  std::vector<std::string> contents; // lines of contents.txt; none means no contents.txt
  std::string picture;               // "mypic", "*.jpg" or "*.bmp"; empty means no picture
  std::vector<std::string> files;    // made-up game files
};

// One plane-set folder inside the flight-model folder, described by its .zep file.
struct PlaneSet {
  std::string folder;
  std::string zepFile;
  std::string aircraft;
  std::string slot;
  std::string skinCode; // four letters, written as decimal character codes on lines 166 to 169
};

// A music set: its own folder name and its tracks.
struct MusicSet {
  std::string name;
  std::vector<std::string> tracks;
};

const char *const kFlightModels = "F-Demo Flight Models";

const std::vector<Addon> kAddons = {
    {"C-Channel Summer",
     {"Channel Summer", "A made-up campaign of twelve short missions over the coast.",
      "Load it, fly, and unload it to keep your saved games with it."},
     "summer.jpg",
     {"campaign.dat", "Opening Day.msn", "Second Day.msn", "Summer1.sve"}},
    {"C Northern Front",
     {"Northern Front", "A made-up winter campaign with long patrols."},
     "mypic",
     {"campaign.dat", "Coastal Patrol.msn", "North1.sve"}},
    {kFlightModels,
     {"Demo Flight Models", "Two made-up aircraft with their plane sets.",
      "Loading this folder shows the slot grid."},
     "models.bmp",
     {"fm_kestrel.dat", "fm_falcon.dat", "damage.dat"}},
    {"Q-Harbour Strike",
     {"Harbour Strike", "A single mission against a made-up harbour."},
     "",
     {"Harbour Strike.msn", "targets.txt"}},
    {"O-Ring and Bead", {"Ring and Bead", "A plain round gunsight."}, "mypic", {"gunsight.spt"}},
    {"U-Grass Airfields", {}, "", {"bases.dat"}},
    {"H-Evening Haze",
     {"Evening Haze", "Warm colours low on the horizon."},
     "haze.jpg",
     {"sky.spt", "horizon.spt"}},
    {"R-Thin Cirrus", {"Thin Cirrus", "High, thin cloud."}, "", {"clouds.spt"}},
    {"T-Green Fields",
     {"Green Fields", "Terrain of small green fields and hedges."},
     "mypic",
     {"terrain.dat", "fields.spt"}},
    {"N-Engine Hum", {"Engine Hum", "Quieter engine sounds."}, "", {"engine.wav"}},
    {"N-Gun Bursts", {"Gun Bursts", "Shorter gun sounds."}, "", {"guns.wav"}},
    {"N Radio Chatter", {"Radio Chatter", "More radio calls."}, "", {"radio.wav"}},
    {"B-Hangar Mainscreen",
     {"Hangar Mainscreen", "A main screen showing a hangar at dawn."},
     "hangar.bmp",
     {"mainscrn.spt"}},
    {"M-Paper Map", {"Paper Map", "An inflight map on old paper."}, "map.jpg", {"map.spt"}},
    {"S-Autumn Camouflage",
     {"Autumn Camouflage", "Brown and green skins for every aircraft."},
     "mypic",
     {"skin01.spt", "skin02.spt"}},
    {"Sunset Squadron Colours",
     {"Sunset Squadron Colours",
      "No hyphen or blank after the letter S:", "listed under Show ALL only."},
     "sunset.jpg",
     {"sunset.spt"}},
    {"X-Calm Voices", {"Calm Voices", "Calmer speech for the wingmen."}, "", {"speech.dat"}},
};

const std::vector<PlaneSet> kPlaneSets = {
    {"P-Kestrel", "kestrel.zep", "Kestrel Mk I", "3", "kst1"},
    {"P-Falcon", "falcon.zep", "Falcon A-2", "17", "fal2"},
};

// The last set is the active one: its folder is the one named "Music".
const std::vector<MusicSet> kMusicSets = {
    {"Brass Band", {"track01.bgm", "track02.bgm", "track03.bgm"}},
    {"Strings", {"track01.bgm", "track02.bgm"}},
    {"Old Radio", {"track01.bgm", "track02.bgm"}},
};

const std::vector<std::string> kEawIni = {
    "[Screen]",   "Width=1024",    "Height=768",       "Detail=3",     "",
    "[Game]",     "ExtraSquads=2", "PlaneSetNumber=1", "Difficulty=2", "",
    "[Calendar]", "Day=14",        "Month=6",
};

QString ToQString(const fs::path &path) { return QString::fromStdU16String(path.u16string()); }

// Writes the files of the demo and counts what could not be written, so one failure does not stop
// the rest.
class DemoWriter {
public:
  explicit DemoWriter(fs::path root) : root_(std::move(root)) {}

  bool Failed() const { return failures_ > 0; }

  void Folder(const fs::path &relative) {
    std::error_code error;
    fs::create_directories(root_ / relative, error);
    if (error)
      Fail(relative, error.message());
  }

  // The game's text files end every line with CR LF.
  void Text(const fs::path &relative, const std::vector<std::string> &lines) {
    std::string bytes;
    for (const std::string &line : lines)
      bytes += line + "\r\n";
    Bytes(relative, bytes);
  }

  void Bytes(const fs::path &relative, const std::string &bytes) {
    std::ofstream out(root_ / relative, std::ios::binary | std::ios::trunc);
    out << bytes;
    out.close();
    if (!out)
      Fail(relative, "cannot write");
  }

  void Image(const fs::path &relative, const QImage &image, const char *format) {
    if (!image.save(ToQString(root_ / relative), format))
      Fail(relative, "cannot save picture");
  }

  void MakeExecutable(const fs::path &relative) {
    std::error_code error;
    fs::permissions(root_ / relative,
                    fs::perms::owner_exec | fs::perms::group_exec | fs::perms::others_exec,
                    fs::perm_options::add, error);
    if (error)
      Fail(relative, error.message());
  }

private:
  void Fail(const fs::path &relative, const std::string &why) {
    std::cerr << "make_demo_game: " << (root_ / relative).string() << ": " << why << "\n";
    ++failures_;
  }

  fs::path root_;
  int failures_ = 0;
};

// A colour tone that differs from picture to picture but stays the same from run to run.
int HueOf(const std::string &text) {
  unsigned sum = 0;
  for (unsigned char c : text)
    sum = sum * 31 + c;
  return static_cast<int>(sum % 360);
}

void DrawSky(QPainter &painter, const QSize &size, int hue) {
  QLinearGradient sky(0, 0, 0, size.height());
  sky.setColorAt(0, QColor::fromHsv(hue, 90, 250));
  sky.setColorAt(1, QColor::fromHsv((hue + 40) % 360, 190, 170));
  painter.fillRect(QRect(QPoint(0, 0), size), sky);
  painter.setPen(Qt::NoPen);
  painter.setBrush(QColor(255, 235, 140));
  const qreal radius = size.height() * 0.09;
  painter.drawEllipse(QPointF(size.width() * 0.8, size.height() * 0.22), radius, radius);
}

void DrawHills(QPainter &painter, const QSize &size, int hue) {
  const qreal w = size.width(), h = size.height();
  QPainterPath hills(QPointF(0, h * 0.75));
  hills.cubicTo(w * 0.25, h * 0.6, w * 0.45, h * 0.85, w * 0.7, h * 0.7);
  hills.cubicTo(w * 0.85, h * 0.62, w * 0.95, h * 0.7, w, h * 0.68);
  hills.lineTo(w, h);
  hills.lineTo(0, h);
  hills.closeSubpath();
  painter.setBrush(QColor::fromHsv((hue + 120) % 360, 140, 110));
  painter.drawPath(hills);
}

// A plain aircraft seen from above: fuselage, wings and tailplane.
void DrawAircraft(QPainter &painter, const QSize &size) {
  const qreal unit = size.height() / 20.0;
  const QPointF centre(size.width() * 0.35, size.height() * 0.35);
  painter.setBrush(QColor(60, 60, 70));
  painter.drawEllipse(centre, unit * 0.8, unit * 4);
  painter.drawRoundedRect(
      QRectF(centre.x() - unit * 5, centre.y() - unit * 1.2, unit * 10, unit * 1.4), unit * 0.5,
      unit * 0.5);
  painter.drawRect(QRectF(centre.x() - unit * 2, centre.y() + unit * 2.8, unit * 4, unit * 0.8));
}

void DrawCaption(QPainter &painter, const QSize &size, const QString &caption) {
  const QRectF band(0, size.height() * 0.82, size.width(), size.height() * 0.18);
  painter.fillRect(band, QColor(0, 0, 0, 120));
  QFont font = painter.font();
  font.setPixelSize(static_cast<int>(band.height() * 0.45));
  font.setBold(true);
  painter.setFont(font);
  painter.setPen(Qt::white);
  painter.drawText(band, Qt::AlignCenter, caption);
}

QImage DrawPicture(const std::string &caption, QSize size) {
  QImage image(size, QImage::Format_RGB32);
  QPainter painter(&image);
  painter.setRenderHint(QPainter::Antialiasing);
  const int hue = HueOf(caption);
  DrawSky(painter, size, hue);
  DrawHills(painter, size, hue);
  DrawAircraft(painter, size);
  DrawCaption(painter, size, QString::fromStdString(caption));
  return image;
}

// The folder name without its code letter and separator, for the picture's caption.
std::string CaptionOf(const std::string &folder) {
  const bool separated = folder.size() > 2 && (folder[1] == '-' || folder[1] == ' ');
  return separated ? folder.substr(2) : folder;
}

// "mypic" has no extension; the game's pictures are read by their contents, so it holds JPEG bytes.
const char *FormatOf(const std::string &pictureName) {
  return pictureName.ends_with(".bmp") ? "BMP" : "JPG";
}

std::vector<std::string> MadeUpGameFile(const std::string &file, const std::string &owner) {
  return {"; made-up demo data, not a real game file", "; " + file + " of " + owner, "value=1",
          "value=2"};
}

void MakeGameFolder(DemoWriter &out) {
  out.Folder("");
  out.Text("eaw.ini", kEawIni);
  out.Folder("Savedata");
  for (const char *file : {"Training Flight.msn", "Quick1.sve"})
    out.Text(fs::path("Savedata") / file, MadeUpGameFile(file, "the demo game"));
  out.Image("background", DrawPicture("Demo Background", QSize(425, 348)), "BMP");
  out.Image("newpic", DrawPicture("Demo Game", QSize(618, 446)), "JPG");
  out.Text("readme-demo.txt", {"A demo game folder made up for trying the add-on selector.",
                               "eaw.exe here is only a stand-in that prints a line."});
}

void MakeMusicSets(DemoWriter &out) {
  std::vector<std::string> names;
  for (const MusicSet &set : kMusicSets) {
    const bool active = &set == &kMusicSets.back();
    const fs::path folder = active ? "Music" : set.name;
    out.Folder(folder);
    for (const std::string &track : set.tracks)
      out.Text(folder / track, MadeUpGameFile(track, set.name));
    names.push_back(set.name);
  }
  out.Text("Music.ini", names);
}

// A .zep file of 169 lines: aircraft, slot, filler values, then the skin code's character codes.
std::vector<std::string> ZepLines(const PlaneSet &set) {
  std::vector<std::string> lines = {set.aircraft, set.slot};
  while (lines.size() < 165)
    lines.push_back(std::to_string(lines.size() % 7));
  for (unsigned char c : set.skinCode)
    lines.push_back(std::to_string(c));
  return lines;
}

void MakePlaneSets(DemoWriter &out, const fs::path &flightModels) {
  for (const PlaneSet &set : kPlaneSets) {
    const fs::path folder = flightModels / set.folder;
    out.Folder(folder);
    out.Text(folder / set.zepFile, ZepLines(set));
    out.Text(folder / "planeset.dat", MadeUpGameFile("planeset.dat", set.folder));
  }
}

void MakeAddon(DemoWriter &out, const fs::path &library, const Addon &addon) {
  const fs::path folder = library / addon.folder;
  out.Folder(folder);
  if (!addon.contents.empty())
    out.Text(folder / "contents.txt", addon.contents);
  if (!addon.picture.empty())
    out.Image(folder / addon.picture, DrawPicture(CaptionOf(addon.folder), QSize(400, 300)),
              FormatOf(addon.picture));
  for (const std::string &file : addon.files)
    out.Text(folder / file, MadeUpGameFile(file, addon.folder));
}

void MakeLibrary(DemoWriter &out) {
  const fs::path library = "ZEP128";
  out.Folder(library);
  for (const Addon &addon : kAddons)
    MakeAddon(out, library, addon);
  MakePlaneSets(out, library / kFlightModels);
  // A parked folder: the selector never lists what lies in "UNUSED".
  out.Folder(library / "UNUSED" / "T-Old Terrain");
  out.Text(library / "UNUSED" / "T-Old Terrain" / "terrain.dat",
           MadeUpGameFile("terrain.dat", "T-Old Terrain"));
}

// Written last, so that its presence tells that the folder is complete. A shell script with LF
// line ends, since it stands in for the game when "FLY" is pressed on Linux.
void MakeStandInProgram(DemoWriter &out) {
  out.Bytes("eaw.exe", "#!/bin/sh\necho \"Demo stand-in for the game: nothing to fly here.\"\n");
  out.MakeExecutable("eaw.exe");
}

// True when the folder already holds a game program, in any letter case: a finished demo folder
// or a real game, which must not be overwritten.
bool HoldsGame(const fs::path &folder) {
  std::error_code error;
  for (fs::directory_iterator it(folder, error), end; !error && it != end; it.increment(error)) {
    std::string name = it->path().filename().string();
    for (char &c : name)
      c = static_cast<char>(std::tolower(static_cast<unsigned char>(c)));
    if (name == "eaw.exe")
      return true;
  }
  return false;
}

} // namespace

int main(int argc, char *argv[]) {
  if (argc != 2) {
    std::cerr << "usage: make_demo_game <game folder>\n";
    return 2;
  }
  // Only draws into images, so it needs no display.
  qputenv("QT_QPA_PLATFORM", "offscreen");
  QGuiApplication app(argc, argv);
  std::error_code error;
  const fs::path game = fs::absolute(argv[1], error);
  if (error) {
    std::cerr << "make_demo_game: " << argv[1] << ": " << error.message() << "\n";
    return 1;
  }
  if (HoldsGame(game)) {
    std::cout << "make_demo_game: " << game.string() << " already holds eaw.exe; left as it is\n";
    return 0;
  }
  DemoWriter out(game);
  MakeGameFolder(out);
  MakeMusicSets(out);
  MakeLibrary(out);
  if (out.Failed())
    return 1;
  MakeStandInProgram(out);
  std::cout << "make_demo_game: demo game made in " << game.string() << "\n";
  return out.Failed() ? 1 : 0;
}
