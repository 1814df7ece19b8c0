// SPDX-License-Identifier: Apache-2.0
//
// The Japanese texts, in the order of the keys. Columns count a Japanese character as two. Each
// text has the conversions of its English one, in another order where the sentence wants it
// ("%2$s"); a test compares the two, and the compiler checks the rest.

#include "messages/src/catalogues.h"

#include "messages/interface/message_keys.h"
#include "messages/src/compiled_catalogue.h"

namespace messages {

namespace {

// clang-format off
constexpr CatalogueRow Rows[] = {
    {OutOfMemory,                  "メモリが不足しています"},
    {NotInArchiveFormat,           "'%s' はアーカイブ形式ではありません"},
    {MalformedArchive,             "'%s': アーカイブの形式が不正です: %s"},
    {WritingArchive,               "ファイル '%s' への書き込みに失敗しました : %s"},
    {NotPresentInArchive,          "'%s' はアーカイブ '%s' に存在しません"},
    {ArchiveNotFound,              "アーカイブ '%s' が見つかりません : %s"},
    {FileDoesNotExist,             "ファイル '%s' が存在しません"},
    {ReadingFile,                  "ファイル '%s' の読み込みに失敗しました : %s"},
    {AlreadyExists,                "'%s' は既に存在するため、抽出しません"},
    {NoArchiveSpecified,           "アーカイブが指定されていません"},
    {NoActionSpecified,            "操作 -[%s] のいずれかを指定する必要があります"},
    {OnlyOneAction,                "操作オプションは 1 つしか指定できません"},
    {PositionNotFound,             "位置 '%s' が見つかりません"},
    {FilenameTooLong,              "ファイル名 '%s' はこのファイルシステムには長すぎます"},
    {WritingExtractedFile,         "ファイル '%s' への書き込みに失敗しました : %s"},
    {NoSymbolTable,                "アーカイブ '%s' にはシンボルテーブルがありません"},
    {CreatingArchive,              "アーカイブ '%s' を作成しています"},
    {NoBaseVariant,                "アーカイブメンバ '%s' のマイナーバリアントに基本バリアントが含まれていません"},
    {AddingNonElfObject,           "ELF ではないオブジェクト '%s' をアーカイブ '%s' に追加しています"},
    {MultipleBaseVariants,         "アーカイブメンバ '%s' のマイナーバリアントに複数の基本バリアントが含まれています"},
    {UndecoratableDifference,      "'%2$s' で始まるマイナーバリアントグループのアーカイブメンバ '%1$s' の属性の差異に、シンボル装飾で表現できない属性が含まれています"},
    {CommonAttributesIncompatible, "'%s' で始まるマイナーバリアントグループの共通属性は、ライブラリの属性と互換性がありません。"},
    {MemberAttributesIncompatible, "マイナーバリアントのメンバオブジェクト '%s' の属性は、ライブラリの属性と互換性がありません。"},
    {HelpCommandFormat,            "\n"
                                   "アーカイブ作成・保守ツール\n"
                                   "\n"
                                   "コマンド形式:\n"
                                   "\n"
                                   "%s options archive [ file_list ]\n"
                                   "\n"},
    {HelpWildcards,                "file_list ではワイルドカード '%c' と '*' を使用できます\n"
                                   "\n"},
    {HelpEditOptions,              "オプション:\n"
                                   "\n"
                                   " -r         <file_list> のファイルを挿入し、同名の既存メンバを置き換えます。\n"
                                   " -d         <file_list> のメンバを削除します。\n"
                                   " -x         <file_list> のメンバを抽出し、同名のファイルに保存します。\n"
                                   " -m         <file_list> のファイルを移動します。\n"
                                   " -p         ファイルを標準出力に出力します。\n"
                                   " -a pos     ファイルを <pos> という名前のファイルの後ろに挿入または移動します。\n"
                                   " -b pos     ファイルを <pos> という名前のファイルの前に挿入または移動します。\n"
                                   " -u         古いファイルだけを更新します。-r と共に使用します。\n"
                                   "\n"},
    {HelpOtherOptions,             " -n         オブジェクトアーカイブにシンボルテーブルを追加しません。\n"
                                   " -s         アーカイブのシンボルテーブルを強制的に再生成します。\n"
                                   " -t         アーカイブの内容一覧を表示します。\n"
                                   "--zs        シンボルテーブルを表示します。\n"
                                   "--zt        アーカイブの内容を要約します (サイズ + エントリ)。\n"
                                   " -c         新しいアーカイブを作成するときの警告を抑制します。\n"
                                   " -C         抽出時に既存のファイルを上書きしません。\n"
                                   " -T         ファイル名をシステムの最大長に切り詰めます。\n"
                                   " -v         詳細な情報を出力します。\n"
                                   "--create    新しいアーカイブを強制的に作成します。\n"
                                   "--via file  via ファイルから追加の引数を読み込みます。\n"
                                   "--sizes     各メンバのサイズとライブラリの合計を一覧表示します。\n"
                                   "--entries   ENTRY ポイントを含むセクションを一覧表示します。\n"
                                   "--vsn       Quarn の現在のバージョンを表示します。\n"
                                   "--help      このメッセージを表示します。\n"
                                   "\n"},
    {HelpExamples,                 "例:\n"
                                   "\n"
                                   "        %s -r  mylib.a obj1 obj2 obj3...\n"
                                   "        %s -x  mylib.a %csort*\n"
                                   "        %s -d  mylib.a hash.o\n"
                                   "        %s -tv ansilib.a\n"
                                   "\n"},
    {ListedMember,                 "%s\n"},
    {ListedMemberLong,             "%s%6d/%6d%7u %s %s (オフセット %6d)\n"},
    {AddedMember,                  "a - %s\n"},
    {ReplacedMember,               "r - %s\n"},
    {DeletedMember,                "d - %s\n"},
    {MovedMember,                  "m - %s\n"},
    {ExtractedMember,              "x - %s\n"},
    {PrintedMember,                "\n<%s>\n\n"},
    {SizesHeader,                  "\n    コード   ROデータ   RWデータ   ZIデータ   デバッグ   オブジェクト名\n"},
    {SizesRow,                     "%10u %10u %10u %10u %10u   %s\n"},
    {EntryPoint,                   "ENTRY: %3$s のセクション %2$s のオフセット %1$d\n"},
    {NoEntryPoints,                "ENTRY ポイントが見つかりません。\n"},
    {ListedSymbol,                 "%-20s 定義元 %-10s オフセット %6d\n"},
    {CommandLineEcho,              "[%s %s]"},
    {VariantGroupMember,           " * %s [%u] : %s"},
    {AttributeClash,               " * %s は %s と競合しています\n"},
    {MalformedArchiveWarning,      "'%s': アーカイブの形式が不正です: %s"},
    {SeekingFile,                  "ファイル '%s' のシークに失敗しました : %s"},
    {ClosingFile,                  "ファイル '%s' のクローズに失敗しました : %s"},
    {DeletingFile,                 "ファイル '%s' の削除に失敗しました : %s"},
    {OutputReadOnly,               "出力ファイル '%s' は読み取り専用です"},
    {NoMembersForCreate,           "--create にアーカイブメンバが指定されていません"},
    {UnrecognizedOption,           "オプション '%s%s' を認識できません。"},
    {MissingArgument,              "オプション '%s' の引数がありません。"},
    {RecursiveViaFile,             "via ファイルの再帰的な取り込みが、ファイル '%2$s' で深さ %1$d に達しました。"},
    {ArgumentNotPermitted,         "引数 '%s' はオプション '%s' では使用できません。"},
    {ViaFileNotOpened,             "via ファイル '%s' を開けませんでした。"},
    {ViaFileReadError,             "via ファイル '%s' の読み込み中にエラーが発生しました。"},
    {MalformedViaFile,             "via ファイル '%s' の形式が不正です。"},
    {ViaFileCommandTooLong,        "via ファイル '%s' のコマンドが長すぎてバッファに収まりません。"},
    {IntegerOverflow,              "オーバーフロー: '%s' は整数に収まりません。"},
    {OldSyntax,                    "古い構文です。'%s%s%s%s' を使用してください。"},
    {DeprecatedOption,             "オプション '%s' は非推奨です。"},
    {ViaFileNotClosed,             "via ファイル '%s' を閉じられませんでした。"},
    {SelectableArguments,          "オプション '%s' には次の引数を指定できます:\n %s"},
    {DeprecatedArgument,           "オプション '%2$s' の引数 '%1$s' は非推奨です"},
    {UnexpectedArgument,           "オプション '%s%s' に予期しない引数があります"},
    {ConcatenatedOptionArgument,   "連結されたオプションには引数を指定できません: -%s %s"},
    {NulInViaFile,                 "via ファイル '%s' に文字 '\\0' が見つかりました。バイナリファイルの可能性があります。via ファイルの解析を中止します。"},
    {PossibleMatches,              "'%s' に一致する可能性があるのは '%s' や '%s' などです。"},
    {RepeatedOption,               "連結されたオプション '-%2$s%3$s%4$s' でオプション '-%1$s' が繰り返されています。"},
    {LocaleNotInitialised,         "メッセージロケール %s を初期化できませんでした"},
    {UnknownDiagnosticNumber,      "不明な診断番号です: %s"},
};
// clang-format on

static_assert(isSortedAndUnique(Rows));

constexpr auto Compiled = compileRows<Rows>();
static_assert(!Compiled.hasFault());

constexpr BuiltInCatalogue Catalogue = {Rows, Compiled.pieces, Compiled.ends};

} // namespace

const BuiltInCatalogue& getJapaneseCatalogue() {
  return Catalogue;
}

} // namespace messages
