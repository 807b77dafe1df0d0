#pragma once

#include <string>
#include <string_view>
#include <vector>

#include "data/records.h"

struct sqlite3;

namespace marlowbeck::bench {

/// A player file and results files as the tables of a database in a file of its own, to be asked
/// what the reports answer:
///
///     player(id, name, team, grade)
///     result(grade, id, team, opposition, day, forfeit, agg, shots, hs, c100, c180, p1 to p6)
class Database {
 public:
  struct Results {
    std::string grade;
    std::string path;
  };

  /// Fills the tables, then runs `indexes`: the indexes that the questions want.
  Database(const std::string& path, const std::string& player_file,
           const std::vector<Results>& results_files, const std::string& indexes);
  Database(const Database&) = delete;
  Database& operator=(const Database&) = delete;
  ~Database();

  /// Steps through all rows of a question, looking at every value; answers how many they are.
  int Ask(const std::string& question);

 private:
  void Run(const std::string& sql);
  void InsertPlayers(const std::string& path);
  void InsertResults(const Results& file);
  void Insert(std::string_view grade, const ResultView& result);

  sqlite3* database_ = nullptr;
};

}  // namespace marlowbeck::bench
