// The help page within the page of the game, whose policy lets no style of another page in: its rules and its styles are
// taken over by script.

/** @param {string} page */
export function showHelp(page) {
  let rules = '';
  const plain = page.replaceAll(' style="', ' data-style="').replace(/<style>(.*?)<\/style>/gs, (_, inside) => {
    rules += inside;
    return '';
  });
  const help = new DOMParser().parseFromString(plain, 'text/html'); // under the same policy
  const sheet = new CSSStyleSheet();
  sheet.replaceSync(rules);
  for (const element of /** @type {NodeListOf<HTMLElement>} */ (help.querySelectorAll('[data-style]')))
    element.style.cssText = element.dataset.style ?? '';
  for (const link of help.querySelectorAll('a')) link.rel = 'noopener';
  document.title = help.title;
  document.adoptedStyleSheets = [sheet];
  for (const style of document.querySelectorAll('style')) style.remove();
  document.body.replaceChildren(...help.body.childNodes);
}
