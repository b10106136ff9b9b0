////////////////////////////////////////////////////////////////////////////////
// Copyright (c) Orvane. All rights reserved.
////////////////////////////////////////////////////////////////////////////////
//##          ##
//###        ###
// ###      ###   Vendor: Orvane 
//  ###    ###    Version : 0.1.0
//   ###  ###     Application : Demo
//    ######      Filename : all-fields.v
//     ####       Timestamp : MM/DD/YYYY hh:mm:ss
//  ===========
// =============
//
//Command: run it a  b
//Design Name: headed
//Device: K7 484
//Purpose:
//    aaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaa eightchr 
//    next 
//    bbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbb 
//    end 
//Reference
//    
//    ccccccccccccccccccccccccccccccccccccccccccccccccccccccccccccccccccccccccc 
//    see a b 
//
`timescale 1ns / 1ps

module headed(A);

    input A;
   
   
endmodule
