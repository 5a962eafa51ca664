// What the build puts in: a name for this version of the site, and what it consists of.
declare const VERSION: string;
declare const FILES: string[];
