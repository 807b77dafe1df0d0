#include "bench/database.h"

#include <sstream>
#include <stdexcept>

#include <benchmark/benchmark.h>
#include <sqlite3.h>

#include "data/channels.h"
#include "data/real_file_system.h"

namespace marlowbeck::bench {
namespace {

void Check(int code) {
  if (code != SQLITE_OK) throw std::runtime_error(sqlite3_errstr(code));
}

std::string Quoted(std::string_view text) {
  std::ostringstream quoted;
  quoted << '\'' << text << '\'';
  return quoted.str();
}

}  // namespace

Database::Database(const std::string& path, const std::string& player_file,
                   const std::vector<Results>& results_files, const std::string& indexes) {
  Check(sqlite3_open(path.c_str(), &database_));
  Run("CREATE TABLE player(id INTEGER, name TEXT, team TEXT, grade TEXT);"
      "CREATE TABLE result(grade TEXT, id INTEGER, team TEXT, opposition TEXT, day REAL,"
      " forfeit TEXT, agg INTEGER, shots INTEGER, hs INTEGER, c100 INTEGER, c180 INTEGER,"
      " p1 INTEGER, p2 INTEGER, p3 INTEGER, p4 INTEGER, p5 INTEGER, p6 INTEGER);"
      "BEGIN;");
  InsertPlayers(player_file);
  for (const Results& file : results_files) InsertResults(file);
  Run("COMMIT;" + indexes + "ANALYZE;");
}

Database::~Database() { sqlite3_close(database_); }

int Database::Ask(const std::string& question) {
  sqlite3_stmt* statement = nullptr;
  Check(sqlite3_prepare_v2(database_, question.c_str(), -1, &statement, nullptr));
  int rows = 0;
  while (sqlite3_step(statement) == SQLITE_ROW) {
    for (int column = 0; column < sqlite3_column_count(statement); ++column) {
      benchmark::DoNotOptimize(sqlite3_column_text(statement, column));
    }
    ++rows;
  }
  Check(sqlite3_finalize(statement));
  return rows;
}

void Database::Run(const std::string& sql) {
  Check(sqlite3_exec(database_, sql.c_str(), nullptr, nullptr, nullptr));
}

void Database::InsertPlayers(const std::string& path) {
  RealFileSystem files;
  Channels channels(files);
  channels.OpenRandom(Channel::Players, path, kPlayerLength);
  channels.ForEachRecord(Channel::Players, [&](Bytes bytes, int) {
    const PlayerView player(bytes);
    std::ostringstream sql;
    sql << "INSERT INTO player VALUES(" << player.ID() << ',' << Quoted(player.FullName(", "))
        << ',' << Quoted(player.Team()) << ',' << Quoted(player.Grade()) << ')';
    Run(sql.str());
  });
  channels.CloseAll();
}

void Database::InsertResults(const Results& file) {
  RealFileSystem files;
  Channels channels(files);
  channels.OpenRandom(Channel::Results, file.path, kResultLength);
  channels.ForEachRecord(Channel::Results,
                         [&](Bytes bytes, int) { Insert(file.grade, ResultView(bytes)); });
  channels.CloseAll();
}

void Database::Insert(std::string_view grade, const ResultView& result) {
  std::ostringstream sql;
  sql << "INSERT INTO result VALUES(" << Quoted(grade) << ',' << result.ID() << ','
      << Quoted(result.Team()) << ',' << Quoted(result.Opposition()) << ','
      << result.GameDate().days << ',' << Quoted(result.IsForfeit() ? "F" : "");
  for (const int figure :
       {int{result.Aggregate()}, int{result.Shots()}, int{result.HighScore()},
        int{result.Centuries()}, int{result.Scores180()}, int{result.Peg(0)}, int{result.Peg(1)},
        int{result.Peg(2)}, int{result.Peg(3)}, int{result.Peg(4)}, int{result.Peg(5)}}) {
    sql << ',' << figure;
  }
  sql << ')';
  Run(sql.str());
}

}  // namespace marlowbeck::bench
