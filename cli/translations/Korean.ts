<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="ko_KR" sourcelanguage="en_US">
<context>
    <name>KvCliHost</name>
    <message>
        <source>%1: the image %2 is missing</source>
        <translation>%1: 이미지 %2이(가) 없습니다</translation>
    </message>
</context>
<context>
    <name>KvCliOutput</name>
    <message>
        <source>cannot be written: %1</source>
        <translation>쓸 수 없습니다: %1</translation>
    </message>
    <message>
        <source>note: %1</source>
        <translation>참고: %1</translation>
    </message>
    <message>
        <source>&lt;standard output&gt;</source>
        <translation>&lt;표준 출력&gt;</translation>
    </message>
</context>
<context>
    <name>KvCliParser</name>
    <message>
        <source>Language of messages and reports, such as German or de; otherwise the system&apos;s.</source>
        <translation>메시지와 보고서의 언어(예: German 또는 de). 지정하지 않으면 시스템 언어.</translation>
    </message>
    <message>
        <source>Prints a report: template and measurements in, PDF out.</source>
        <translation>보고서를 출력합니다. 템플릿과 측정 데이터로 PDF를 만듭니다.</translation>
    </message>
    <message>
        <source>Prints the statistics of every measured value, in the table&apos;s own units.</source>
        <translation>모든 측정값의 통계를 표의 단위로 출력합니다.</translation>
    </message>
    <message>
        <source>Says what a template holds and what would be skipped or refused.</source>
        <translation>템플릿의 내용과 건너뛰거나 거부할 항목을 알려 줍니다.</translation>
    </message>
    <message>
        <source>Lists the block types and their settings with defaults.</source>
        <translation>블록 유형과 설정의 기본값을 나열합니다.</translation>
    </message>
    <message>
        <source>Turns measurements and a report template into a PDF report, without a display.</source>
        <translation>측정 데이터와 보고서 템플릿으로 화면 없이 PDF 보고서를 만듭니다.</translation>
    </message>
    <message>
        <source>Commands:</source>
        <translation>명령:</translation>
    </message>
    <message>
        <source>Options everywhere:</source>
        <translation>공통 옵션:</translation>
    </message>
    <message>
        <source>Shows this text, or that of a command.</source>
        <translation>이 도움말 또는 명령의 도움말을 표시합니다.</translation>
    </message>
    <message>
        <source>Shows the version.</source>
        <translation>버전을 표시합니다.</translation>
    </message>
    <message>
        <source>Writes no notes and no progress.</source>
        <translation>참고와 진행 상황을 출력하지 않습니다.</translation>
    </message>
    <message>
        <source>Writes errors as one line of JSON each.</source>
        <translation>오류를 한 줄씩 JSON으로 출력합니다.</translation>
    </message>
    <message>
        <source>&quot;-&quot; as a file name is standard input or output.</source>
        <translation>파일 이름 “-”는 표준 입력 또는 표준 출력입니다.</translation>
    </message>
    <message>
        <source>Exit codes: 0 done, 1 the work failed, 2 wrong usage.</source>
        <translation>종료 코드: 0 완료, 1 작업 실패, 2 잘못된 사용법.</translation>
    </message>
    <message>
        <source>Shows this text.</source>
        <translation>이 도움말을 표시합니다.</translation>
    </message>
    <message>
        <source>Measurements: a session of the Measuring Desk.</source>
        <translation>측정 데이터: Measuring Desk의 세션.</translation>
    </message>
    <message>
        <source>Measurements: a table (CSV, TSV, ImageJ results).</source>
        <translation>측정 데이터: 표(CSV, TSV, ImageJ 결과).</translation>
    </message>
    <message>
        <source>Unit of the table&apos;s values that state none, or Name=unit for one value. May be given several times.</source>
        <translation>표에서 단위가 없는 값의 단위. Name=unit 형식으로 쓰면 해당 값에만 적용됩니다. 여러 번 지정할 수 있습니다.</translation>
    </message>
    <message>
        <source>The table&apos;s column with the object types.</source>
        <translation>개체 유형이 있는 표의 열.</translation>
    </message>
    <message>
        <source>The table&apos;s column with the object names.</source>
        <translation>개체 이름이 있는 표의 열.</translation>
    </message>
    <message>
        <source>Decimal mark of the table: point or comma.</source>
        <translation>표의 소수점 기호: point 또는 comma.</translation>
    </message>
    <message>
        <source>Significant digits of measured values; 0 is automatic.</source>
        <translation>측정값의 유효 자릿수. 0은 자동.</translation>
    </message>
    <message>
        <source>Output: text, csv or json.</source>
        <translation>출력: text, csv 또는 json.</translation>
    </message>
    <message>
        <source>Output: text or json.</source>
        <translation>출력: text 또는 json.</translation>
    </message>
    <message>
        <source>The report template.</source>
        <translation>보고서 템플릿.</translation>
    </message>
    <message>
        <source>The image that was measured.</source>
        <translation>측정한 이미지.</translation>
    </message>
    <message>
        <source>The PDF file to write.</source>
        <translation>출력할 PDF 파일.</translation>
    </message>
    <message>
        <source>Groups: object (type and value) or measurement.</source>
        <translation>그룹: object(유형과 값) 또는 measurement.</translation>
    </message>
    <message>
        <source>--format must be %1, not &quot;%2&quot;</source>
        <translation>--format은 %1이어야 합니다(“%2”은(는) 사용할 수 없음)</translation>
    </message>
    <message>
        <source>text, csv or json</source>
        <translation>text, csv 또는 json</translation>
    </message>
    <message>
        <source>text or json</source>
        <translation>text 또는 json</translation>
    </message>
    <message>
        <source>--group-by must be object or measurement, not &quot;%1&quot;</source>
        <translation>--group-by는 object 또는 measurement여야 합니다(“%1”은(는) 사용할 수 없음)</translation>
    </message>
    <message>
        <source>--digits must be a number from 0 to 15, not &quot;%1&quot;</source>
        <translation>--digits는 0에서 15까지의 숫자여야 합니다(“%1”은(는) 사용할 수 없음)</translation>
    </message>
    <message>
        <source>give the measurements: either --session or --table</source>
        <translation>측정 데이터를 --session 또는 --table로 지정하세요</translation>
    </message>
    <message>
        <source>--decimal must be point or comma, not &quot;%1&quot;</source>
        <translation>--decimal은 point 또는 comma여야 합니다(“%1”은(는) 사용할 수 없음)</translation>
    </message>
    <message>
        <source>the template is missing</source>
        <translation>템플릿이 지정되지 않았습니다</translation>
    </message>
    <message>
        <source>unexpected argument &quot;%1&quot;</source>
        <translation>예상하지 못한 인수 “%1”</translation>
    </message>
    <message>
        <source>the file to write is missing: -o OUT.pdf</source>
        <translation>출력 파일이 지정되지 않았습니다: -o OUT.pdf</translation>
    </message>
    <message>
        <source>only one file can be read from standard input</source>
        <translation>표준 입력에서는 파일을 하나만 읽을 수 있습니다</translation>
    </message>
    <message>
        <source>--language must be one of %1, not &quot;%2&quot;</source>
        <translation>--language는 %1 중 하나여야 합니다(“%2”은(는) 사용할 수 없음)</translation>
    </message>
    <message>
        <source>a command is missing: render, stats, check or blocks</source>
        <translation>명령이 지정되지 않았습니다: render, stats, check 또는 blocks</translation>
    </message>
    <message>
        <source>unknown command &quot;%1&quot;; it must be render, stats, check or blocks</source>
        <translation>알 수 없는 명령 “%1”. render, stats, check 또는 blocks여야 합니다</translation>
    </message>
    <message>
        <source>%1 (statreport --help tells more)</source>
        <translation>%1(자세한 내용: statreport --help)</translation>
    </message>
</context>
<context>
    <name>KvCliSource</name>
    <message>
        <source>&lt;standard input&gt;</source>
        <translation>&lt;표준 입력&gt;</translation>
    </message>
    <message>
        <source>cannot be read</source>
        <translation>읽을 수 없습니다</translation>
    </message>
</context>
<context>
    <name>KvRenderCommand</name>
    <message>
        <source>is a directory</source>
        <translation>폴더입니다</translation>
    </message>
    <message>
        <source>the file could not be written completely</source>
        <translation>파일을 끝까지 쓰지 못했습니다</translation>
    </message>
    <message>
        <source>cannot be written: %1</source>
        <translation>쓸 수 없습니다: %1</translation>
    </message>
</context>
<context>
    <name>KvStatsReport</name>
    <message>
        <source>Object Type</source>
        <translation>개체 유형</translation>
    </message>
    <message>
        <source>Measurement Type</source>
        <translation>측정 항목</translation>
    </message>
    <message>
        <source>Unit</source>
        <translation>단위</translation>
    </message>
    <message>
        <source>Count</source>
        <translation>개수</translation>
    </message>
    <message>
        <source>Min</source>
        <translation>최소</translation>
    </message>
    <message>
        <source>Max</source>
        <translation>최대</translation>
    </message>
    <message>
        <source>Average</source>
        <translation>평균</translation>
    </message>
    <message>
        <source>Sigma</source>
        <translation>시그마</translation>
    </message>
    <message>
        <source>3 Sigma</source>
        <translation>3시그마</translation>
    </message>
    <message>
        <source>6 Sigma</source>
        <translation>6시그마</translation>
    </message>
</context>
<context>
    <name>KvTemplateCheck</name>
    <message>
        <source>a boolean</source>
        <translation>논리값</translation>
    </message>
    <message>
        <source>a number</source>
        <translation>숫자</translation>
    </message>
    <message>
        <source>a string</source>
        <translation>문자열</translation>
    </message>
    <message>
        <source>an array</source>
        <translation>배열</translation>
    </message>
    <message>
        <source>an object</source>
        <translation>JSON 객체</translation>
    </message>
    <message>
        <source>missing</source>
        <translation>없음</translation>
    </message>
    <message>
        <source>&quot;%1&quot; is missing</source>
        <translation>“%1”이(가) 없습니다</translation>
    </message>
    <message>
        <source>&quot;%1&quot; is %2, not %3</source>
        <translation>“%1”의 형식: %2, 필요한 형식: %3</translation>
    </message>
    <message>
        <source>&quot;%1&quot; has a value that the block refuses</source>
        <translation>“%1”의 값을 블록에 사용할 수 없습니다</translation>
    </message>
    <message>
        <source>the block refuses its settings</source>
        <translation>이 설정을 블록에 사용할 수 없습니다</translation>
    </message>
    <message>
        <source>cannot be opened: %1</source>
        <translation>열 수 없습니다: %1</translation>
    </message>
    <message>
        <source>cannot be read: %1</source>
        <translation>읽을 수 없습니다: %1</translation>
    </message>
    <message>
        <source>is larger than 256 MB</source>
        <translation>256MB보다 큽니다</translation>
    </message>
    <message>
        <source>is no JSON: %1</source>
        <translation>JSON이 아닙니다: %1</translation>
    </message>
    <message>
        <source>is no template: the JSON document is no object</source>
        <translation>템플릿이 아닙니다: 최상위 요소가 JSON 객체가 아닙니다</translation>
    </message>
    <message>
        <source>is %1; the page keeps its defaults</source>
        <translation>실제 형식: %1. 페이지는 기본값을 유지합니다</translation>
    </message>
    <message>
        <source>is no whole number of pixels above 0</source>
        <translation>0보다 큰 정수 픽셀 수가 아닙니다</translation>
    </message>
    <message>
        <source>page width %1 px</source>
        <translation>페이지 너비 %1px</translation>
    </message>
    <message>
        <source>is no fraction of the page width from 0 to 0.5</source>
        <translation>페이지 너비에 대한 0에서 0.5까지의 비율이 아닙니다</translation>
    </message>
    <message>
        <source>is %1, not an object; it is off</source>
        <translation>실제 형식: %1, 필요한 형식: JSON 객체. 사용되지 않습니다</translation>
    </message>
    <message>
        <source>is %1, not a boolean; it is off</source>
        <translation>실제 형식: %1, 필요한 형식: 논리값. 사용되지 않습니다</translation>
    </message>
    <message>
        <source>is %1, not a string; the section is off</source>
        <translation>실제 형식: %1, 필요한 형식: 문자열. 이 구역은 사용되지 않습니다</translation>
    </message>
    <message>
        <source>is %1, not an array; there are no blocks</source>
        <translation>실제 형식: %1, 필요한 형식: 배열. 블록이 없습니다</translation>
    </message>
    <message>
        <source>is %1, not a string; the block is skipped</source>
        <translation>실제 형식: %1, 필요한 형식: 문자열. 블록을 건너뜁니다</translation>
    </message>
    <message>
        <source>there is no block type &quot;%1&quot;; the block is skipped</source>
        <translation>블록 유형 “%1”이(가) 없습니다. 블록을 건너뜁니다</translation>
    </message>
    <message>
        <source>is %1, not an object</source>
        <translation>실제 형식: %1, 필요한 형식: JSON 객체</translation>
    </message>
    <message>
        <source>block &quot;%1&quot;</source>
        <translation>블록 “%1”</translation>
    </message>
    <message>
        <source>is %1, not %2; it is ignored</source>
        <translation>실제 형식: %1, 필요한 형식: %2. 무시됩니다</translation>
    </message>
    <message>
        <source>unknown keyword %1; it stays as it is</source>
        <translation>알 수 없는 태그 %1은(는) 그대로 남습니다</translation>
    </message>
</context>
<context>
    <name>KvTemplateCommands</name>
    <message>
        <source>warning: %1</source>
        <translation>경고: %1</translation>
    </message>
</context>
<context>
    <name>KvTerminalProgress</name>
    <message>
        <source>page %1 of %2</source>
        <translation>%1/%2페이지</translation>
    </message>
</context>
<context>
    <name>QCommandLineParser</name>
    <message>
        <source>Usage: %1</source>
        <translation>사용법: %1</translation>
    </message>
    <message>
        <source>[options]</source>
        <translation>[옵션]</translation>
    </message>
    <message>
        <source>Options:</source>
        <translation>옵션:</translation>
    </message>
    <message>
        <source>Arguments:</source>
        <translation>인수:</translation>
    </message>
    <message>
        <source>Unknown option &apos;%1&apos;.</source>
        <translation>알 수 없는 옵션 “%1”입니다.</translation>
    </message>
    <message>
        <source>Unknown options: %1.</source>
        <translation>알 수 없는 옵션: %1.</translation>
    </message>
    <message>
        <source>Missing value after &apos;%1&apos;.</source>
        <translation>“%1” 뒤에 값이 없습니다.</translation>
    </message>
    <message>
        <source>Unexpected value after &apos;%1&apos;.</source>
        <translation>“%1” 뒤의 값은 필요 없습니다.</translation>
    </message>
</context>
</TS>
