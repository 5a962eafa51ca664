// The help page within the page of the game, whose policy lets no style of another page in: its rules and its styles are
// taken over by script.

/** @param {string} page */
export function showHelp(page) {
  const help = new DOMParser().parseFromString(page.replaceAll(' style="', ' data-style="'), 'text/html');
  const sheet = new CSSStyleSheet();
  sheet.replaceSync([...help.querySelectorAll('style')].map((style) => style.textContent).join('\n'));
  for (const element of /** @type {NodeListOf<HTMLElement>} */ (help.querySelectorAll('[data-style]')))
    element.style.cssText = element.dataset.style ?? '';
  for (const link of help.querySelectorAll('a')) link.rel = 'noopener';
  document.title = help.title;
  document.adoptedStyleSheets = [sheet];
  for (const style of document.querySelectorAll('style')) style.remove();
  document.body.replaceChildren(...help.body.childNodes);
}
