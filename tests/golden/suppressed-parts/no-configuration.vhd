
library ieee;
use ieee.std_logic_1164.ALL;
use ieee.numeric_std.ALL;
library KORBAL;
use KORBAL.Kelements.ALL;

entity lean is
   port ( A : in    std_logic; 
          Y : out   std_logic);
end lean;

architecture BEHAVIORAL of lean is
   signal N : std_logic;
   component AND2
      port ( I0 : in    std_logic; 
             I1 : in    std_logic; 
             O  : out   std_logic);
   end component;
   
begin
   U1 : AND2
      port map (I0=>A,
                I1=>N,
                O=>Y);
   
end BEHAVIORAL;


