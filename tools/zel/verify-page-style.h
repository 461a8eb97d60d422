#pragma once
// The fixed parts of the verification's page. Their SHA-256 sums stand in the page's security policy, which lets
// nothing else run or style it; tests/page checks that they fit.

#include <string_view>

namespace zel_command {

inline constexpr std::string_view kPageStyle = R"css(
:root { color-scheme: light dark; --bg: #fff; --fg: #1c2024; --dim: #5a636d; --line: #d5dae0; --card: #f5f7f9;
  --bad: #b3141f; --bad-bg: #fdebec; --good: #146c2e; --good-bg: #e6f4ea; --bar: #2f6fb5; }
@media (prefers-color-scheme: dark) { :root { --bg: #14171a; --fg: #e4e8ec; --dim: #a0aab4; --line: #363d44;
  --card: #1d2226; --bad: #ff9a9a; --bad-bg: #43191c; --good: #8fd6a2; --good-bg: #17351f; --bar: #6aa8e8; } }
* { box-sizing: border-box; }
body { margin: 0 auto; padding: 1rem; max-width: 64rem; background: var(--bg); color: var(--fg);
  font: 1rem/1.5 system-ui, sans-serif; overflow-wrap: anywhere; }
h1 { font-size: 1.4rem; margin: 0 0 .5rem; }
h2 { font-size: 1.15rem; margin: 2rem 0 .5rem; }
h3 { font-size: 1rem; margin: 1.25rem 0 .25rem; }
h3 small { color: var(--dim); font-weight: normal; }
.verdict { display: inline-block; margin: .25rem 0 .75rem; padding: .3rem .8rem; border-radius: .4rem;
  font-weight: 600; }
.ok { color: var(--good); background: var(--good-bg); }
.not-ok { color: var(--bad); background: var(--bad-bg); }
dl { display: grid; grid-template-columns: max-content 1fr; gap: .15rem 1rem; margin: 0; }
dt { color: var(--dim); }
dd { margin: 0; }
dd.bad { color: var(--bad); font-weight: 600; }
.problems { margin: 0 0 1rem; padding: .5rem .8rem .5rem 1.8rem; border-left: .3rem solid var(--bad);
  background: var(--bad-bg); }
.filter { position: sticky; top: 0; display: flex; flex-wrap: wrap; gap: .5rem 1rem; align-items: center;
  padding: .5rem 0; background: var(--bg); border-bottom: 1px solid var(--line); }
.filter input[type=search] { flex: 1 1 12rem; min-width: 0; padding: .4rem .6rem; font: inherit; color: inherit;
  background: var(--card); border: 1px solid var(--line); border-radius: .4rem; }
.filter input::placeholder { color: var(--dim); opacity: 1; }
.filter input[type=checkbox] { width: 1.1rem; height: 1.1rem; vertical-align: -.2rem; }
.filter output { color: var(--dim); font-variant-numeric: tabular-nums; }
.value { display: grid; grid-template-columns: 4.5rem minmax(8rem, 1fr) minmax(0, 1fr) minmax(0, 1fr);
  gap: 0 1rem; padding: .3rem .5rem; border-bottom: 1px solid var(--line); }
.value.failed { background: var(--bad-bg); }
.value b { color: var(--good); }
.value.failed b { color: var(--bad); }
.value i, .value u { font-style: normal; text-decoration: none; }
.value i:last-child { grid-column: 3 / -1; }
.value [data-is]::before { content: attr(data-is) ": "; color: var(--dim); }
.wide { overflow-x: auto; }
table { border-collapse: collapse; width: 100%; overflow-wrap: normal; }
th, td { padding: .25rem .5rem; text-align: right; border-bottom: 1px solid var(--line); }
th:first-child { text-align: left; }
th { font-weight: normal; }
th[scope=col] { color: var(--dim); vertical-align: bottom; }
td.changed { color: var(--bad); background: var(--bad-bg); font-weight: 600; }
.lap { display: grid; grid-template-columns: 12rem 1fr 5.5rem; gap: 0 .75rem; align-items: center;
  padding: .15rem 0; }
.lap span:last-child { text-align: right; font-variant-numeric: tabular-nums; }
.lap svg { width: 100%; height: .9rem; display: block; background: var(--card); }
.lap rect { fill: var(--bar); }
[hidden] { display: none !important; }
@media (max-width: 40rem) {
  .value { grid-template-columns: 4.5rem 1fr; }
  .value i, .value u { grid-column: 2 / -1; }
  .value i:last-child { grid-column: 2 / -1; }
  table { font-size: .9rem; }
  th, td { padding-inline: .25rem; }
  .lap { grid-template-columns: 1fr 5.5rem; }
  .lap svg { grid-row: 2; grid-column: 1 / -1; }
}
)css";

inline constexpr std::string_view kPageScript = R"js(
'use strict';
const words = document.getElementById('words');
const failures = document.getElementById('failures');
const count = document.getElementById('count');
function filter() {
  const wanted = words.value.toLowerCase().split(/\s+/).filter(Boolean);
  let found = 0, all = 0;
  for (const group of document.querySelectorAll('.group')) {
    let shown = 0;
    for (const value of group.querySelectorAll('.value')) {
      const text = (group.dataset.name + ' ' + value.textContent).toLowerCase();
      const fits = wanted.every(word => text.includes(word)) &&
        (!failures.checked || value.classList.contains('failed'));
      value.hidden = !fits;
      shown += fits;
      all += 1;
    }
    group.hidden = shown === 0;
    found += shown;
  }
  count.textContent = found + ' of ' + all + ' values';
}
words.addEventListener('input', filter);
failures.addEventListener('change', filter);
document.querySelector('.filter').hidden = false;
filter();
)js";

inline constexpr std::string_view kPageStyleSum = "8K/vmXGx8pybrM7W1+Sr8ChTtpolGK6pErBx+v2687E=";
inline constexpr std::string_view kPageScriptSum = "FV0eXpYF4Lc+sL0Jpt8CrWTVk6NLQkjqPFdyMQf7A6A=";

} // namespace zel_command
